#pragma once

#include <QDBusConnection>
#include <QObject>

namespace favrin::eyedropper {

/** The desktop's way of sampling the screen for an app, if there is one. Nothing waits. */
class ScreenshotPortal : public QObject
{
    Q_OBJECT

public:
    explicit ScreenshotPortal(const QDBusConnection &bus, QObject *parent = nullptr);
    ~ScreenshotPortal() override;

    /** Asks for its version; answered() follows. */
    void ask();
    /** It is there, in a version that can pick a color: the second or a later one. */
    bool canPickColor() const { return m_version >= 2; }
    /** Its unique name on the bus, once it has answered. */
    const QString &owner() const { return m_owner; }

Q_SIGNALS:
    void answered();

private:
    QDBusConnection m_bus;
    QString m_owner;
    uint m_version = 0;
};

namespace portal {
inline constexpr QLatin1String serviceName("org.freedesktop.portal.Desktop");
inline constexpr QLatin1String path("/org/freedesktop/portal/desktop");
inline constexpr QLatin1String screenshotInterface("org.freedesktop.portal.Screenshot");
inline constexpr QLatin1String requestInterface("org.freedesktop.portal.Request");
} // namespace portal

} // namespace favrin::eyedropper
