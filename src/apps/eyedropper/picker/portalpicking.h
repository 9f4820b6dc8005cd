#pragma once

#include "apps/eyedropper/picker/picking.h"
#include "apps/eyedropper/picker/screenshotportal.h"

#include <QVariantMap>

namespace favrin::eyedropper {

/**
 * Lets the desktop pick the color. The desktop is asked when the finger is lifted: it would take the lifting for the
 * choice of what lies below.
 */
class PortalPicking : public Picking
{
    Q_OBJECT

public:
    explicit PortalPicking(const QDBusConnection &bus, QObject *parent = nullptr);
    ~PortalPicking() override;

    void start() override;
    void floatPicking() override;
    /** Takes the request back. */
    void cancel() override;

private Q_SLOTS:
    void takeResponse(uint response, const QVariantMap &results);

private:
    void proceed();
    void requestColor();
    void listenAt(const QString &requestPath);
    void fail(const QString &reason);
    void end(PickingEnd how);

    QDBusConnection m_bus;
    ScreenshotPortal m_portal;
    QString m_requestPath;
    bool m_isFloating = false;
    bool m_hasAnswered = false;
    bool m_hasEnded = false;
};

} // namespace favrin::eyedropper
