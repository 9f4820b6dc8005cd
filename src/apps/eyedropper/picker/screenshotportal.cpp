#include "apps/eyedropper/picker/screenshotportal.h"

#include <QDBusMessage>
#include <QDBusPendingCallWatcher>
#include <QDBusPendingReply>
#include <QDBusVariant>

namespace favrin::eyedropper {

ScreenshotPortal::ScreenshotPortal(const QDBusConnection &bus, QObject *parent) : QObject(parent), m_bus(bus) {}

ScreenshotPortal::~ScreenshotPortal() = default;

void ScreenshotPortal::ask()
{
    auto question = QDBusMessage::createMethodCall(
        portal::serviceName, portal::path, QStringLiteral("org.freedesktop.DBus.Properties"), QStringLiteral("Get"));
    question.setArguments({QString(portal::screenshotInterface), QStringLiteral("version")});
    auto *answer = new QDBusPendingCallWatcher(m_bus.asyncCall(question), this);
    connect(answer, &QDBusPendingCallWatcher::finished, this, [this, answer] {
        const QDBusPendingReply<QDBusVariant> reply = *answer;
        answer->deleteLater();
        if (!reply.isError()) {
            m_owner = reply.reply().service();
            m_version = reply.value().variant().toUInt();
        }
        Q_EMIT answered();
    });
}

} // namespace favrin::eyedropper
