#pragma once

#include <QDBusArgument>
#include <QDBusConnection>
#include <QDBusMessage>
#include <QDBusMetaType>
#include <QDBusObjectPath>
#include <QDBusVariant>
#include <QDBusVirtualObject>
#include <QStringList>

#include <functional>

/** Three numbers as the desktop sends a color. */
struct ColorTriple
{
    double red, green, blue;
};
Q_DECLARE_METATYPE(ColorTriple)

inline QDBusArgument &operator<<(QDBusArgument &argument, const ColorTriple &color)
{
    argument.beginStructure();
    argument << color.red << color.green << color.blue;
    argument.endStructure();
    return argument;
}

inline const QDBusArgument &operator>>(const QDBusArgument &argument, ColorTriple &color)
{
    argument.beginStructure();
    argument >> color.red >> color.green >> color.blue;
    argument.endStructure();
    return argument;
}

/** A desktop's Screenshot portal that answers as a test says. */
class ScriptedPortal : public QDBusVirtualObject
{
public:
    ScriptedPortal(const QDBusConnection &bus, uint version) : m_bus(bus), m_version(version)
    {
        qDBusRegisterMetaType<ColorTriple>();
        m_bus.registerVirtualObject(QStringLiteral("/org/freedesktop/portal/desktop"), this, QDBusConnection::SubPath);
        m_bus.registerService(QStringLiteral("org.freedesktop.portal.Desktop"));
    }
    ~ScriptedPortal() override { QDBusConnection::disconnectFromBus(m_bus.name()); }

    QString introspect(const QString &) const override { return {}; }
    bool handleMessage(const QDBusMessage &message, const QDBusConnection &bus) override
    {
        calls << message.member();
        if (message.member() == u"Get")
            return bus.send(message.createReply(QVariant::fromValue(QDBusVariant(m_version))));
        if (message.member() == u"Close") {
            closed = message.path();
            return bus.send(message.createReply());
        }
        if (message.member() != u"PickColor")
            return false;
        if (refuses)
            return bus.send(message.createErrorReply(QDBusError::Failed, QStringLiteral("no backend")));
        const QString token =
            qdbus_cast<QVariantMap>(message.arguments().value(1)).value(QStringLiteral("handle_token")).toString();
        requestPath =
            QStringLiteral("/org/freedesktop/portal/desktop/request/%1/%2")
                .arg(message.service().mid(1).replace(u'.', u'_'), choosesPath ? QStringLiteral("own") : token);
        client = message.service();
        // As fast as can be: before the reply to the call.
        if (answersAtOnce)
            answersAtOnce();
        return bus.send(message.createReply(QVariant::fromValue(QDBusObjectPath(requestPath))));
    }

    void respond(uint response, const QVariantMap &results) { respondFrom(m_bus, response, results); }
    void respondFrom(const QDBusConnection &bus, uint response, const QVariantMap &results)
    {
        auto signal = QDBusMessage::createTargetedSignal(
            client, requestPath, QStringLiteral("org.freedesktop.portal.Request"), QStringLiteral("Response"));
        signal.setArguments({response, results});
        bus.send(signal);
    }
    static QVariantMap color(double red, double green, double blue)
    {
        return {{QStringLiteral("color"), QVariant::fromValue(ColorTriple{red, green, blue})}};
    }

    bool refuses = false;
    /** The desktop of before the token. */
    bool choosesPath = false;
    std::function<void()> answersAtOnce;
    QStringList calls;
    QString requestPath;
    QString closed;
    QString client;

private:
    QDBusConnection m_bus;
    uint m_version;
};
