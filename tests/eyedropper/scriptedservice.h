#pragma once

#include "eyedropper/wirenames.h"

#include <QDBusConnection>
#include <QDBusMessage>
#include <QDBusVirtualObject>
#include <QStringList>

/** An eyedropper service that writes down what it is asked, and says what a test tells it to say. */
class ScriptedService : public QDBusVirtualObject
{
public:
    explicit ScriptedService(const QDBusConnection &bus) : m_bus(bus)
    {
        m_bus.registerVirtualObject(favrin::eyedropper::servicePath, this);
        m_bus.registerService(favrin::eyedropper::serviceName);
    }
    ~ScriptedService() override { QDBusConnection::disconnectFromBus(m_bus.name()); }

    /** To the client that called last. */
    void say(const QString &member, const QVariantList &arguments = {}) { sayFrom(m_bus, member, arguments); }
    /** In the place of the service, from another connection. */
    QDBusMessage sayFrom(QDBusConnection bus, const QString &member, const QVariantList &arguments = {})
    {
        auto call = QDBusMessage::createMethodCall(clients.value(clients.size() - 1), favrin::eyedropper::clientPath,
                                                   favrin::eyedropper::clientInterface, member);
        call.setArguments(arguments);
        bus.send(call);
        return call;
    }
    QDBusConnection bus() const { return m_bus; }

    QString introspect(const QString &) const override { return {}; }
    bool handleMessage(const QDBusMessage &message, const QDBusConnection &) override
    {
        if (message.interface() != favrin::eyedropper::serverInterface)
            return false;
        isReplyWanted = isReplyWanted || message.isReplyRequired();
        clients << message.service();
        QStringList words = {message.member()};
        for (const QVariant &argument : message.arguments())
            words << argument.toString();
        messages << words.join(u' ');
        return true;
    }

    QStringList messages;
    /** Who sent them, by unique name. */
    QStringList clients;
    bool isReplyWanted = false;

private:
    QDBusConnection m_bus;
};
