#include "apps/eyedropper/picker/portalpicking.h"

#include "apps/eyedropper/picker/portalcolor.h"

#include <QDBusMessage>
#include <QDBusPendingCallWatcher>
#include <QDBusPendingReply>
#include <QDBusServiceWatcher>
#include <QRandomGenerator>

#include <utility>

namespace favrin::eyedropper {

namespace {

/** A name for the request that nobody can guess. */
QString newToken()
{
    auto *random = QRandomGenerator::system();
    return QStringLiteral("favrin%1%2").arg(random->generate64(), 0, 16).arg(random->generate64(), 0, 16);
}

/** Where the desktop puts a request with this token of this caller. */
QString requestPathOf(const QDBusConnection &bus, const QString &token)
{
    const QString caller = bus.baseService().mid(1).replace(u'.', u'_');
    return QStringLiteral("%1/request/%2/%3").arg(portal::path, caller, token);
}

} // namespace

PortalPicking::PortalPicking(const QDBusConnection &bus, QObject *parent) : Picking(parent), m_bus(bus), m_portal(bus)
{
}

PortalPicking::~PortalPicking() = default;

void PortalPicking::start()
{
    connect(&m_portal, &ScreenshotPortal::answered, this, [this] {
        m_hasAnswered = true;
        proceed();
    });
    m_portal.ask();
}

void PortalPicking::floatPicking()
{
    if (std::exchange(m_isFloating, true) || m_hasEnded)
        return;
    Q_EMIT floated();
    proceed();
}

void PortalPicking::proceed()
{
    if (!m_hasAnswered || m_hasEnded)
        return;
    if (!m_portal.canPickColor())
        fail(QStringLiteral("the desktop offers none"));
    else if (m_isFloating)
        requestColor();
}

void PortalPicking::requestColor()
{
    const QString token = newToken();
    // Before the call: a fast answer would be missed otherwise.
    listenAt(requestPathOf(m_bus, token));
    auto *watcher = new QDBusServiceWatcher(m_portal.owner(), m_bus, QDBusServiceWatcher::WatchForUnregistration, this);
    connect(watcher, &QDBusServiceWatcher::serviceUnregistered, this,
            [this] { fail(QStringLiteral("the desktop's part has gone")); });

    auto request = QDBusMessage::createMethodCall(m_portal.owner(), portal::path, portal::screenshotInterface,
                                                  QStringLiteral("PickColor"));
    request.setArguments({QString(), QVariantMap{{QStringLiteral("handle_token"), token}}});
    auto *answer = new QDBusPendingCallWatcher(m_bus.asyncCall(request), this);
    connect(answer, &QDBusPendingCallWatcher::finished, this, [this, answer] {
        const QDBusPendingReply<QDBusObjectPath> reply = *answer;
        answer->deleteLater();
        if (m_hasEnded)
            return;
        if (reply.isError())
            fail(reply.error().message());
        else if (reply.value().path() != m_requestPath)
            // Desktops from before the token chose the place themselves.
            listenAt(reply.value().path());
    });
}

void PortalPicking::listenAt(const QString &requestPath)
{
    m_requestPath = requestPath;
    m_bus.connect(m_portal.owner(), requestPath, portal::requestInterface, QStringLiteral("Response"), this,
                  SLOT(takeResponse(uint, QVariantMap))); // clazy:exclude=connect-not-normalized
}

void PortalPicking::takeResponse(uint response, const QVariantMap &results)
{
    if (m_hasEnded)
        return;
    if (response == static_cast<uint>(PortalResponse::Cancelled)) {
        end(PickingEnd::Cancelled);
        return;
    }
    const auto color = response == static_cast<uint>(PortalResponse::Success) ? colorOfPortal(results) : std::nullopt;
    if (!color) {
        fail(QStringLiteral("the desktop answered %1 without a color").arg(response));
        return;
    }
    Q_EMIT picked(*color);
    end(PickingEnd::Picked);
}

void PortalPicking::cancel()
{
    if (m_hasEnded)
        return;
    // Taken back, a request is not answered any more.
    if (!m_requestPath.isEmpty())
        m_bus.send(QDBusMessage::createMethodCall(m_portal.owner(), m_requestPath, portal::requestInterface,
                                                  QStringLiteral("Close")));
    end(PickingEnd::Cancelled);
}

void PortalPicking::fail(const QString &reason)
{
    if (m_hasEnded)
        return;
    qWarning("No color can be picked from the screen: %s", qPrintable(reason));
    end(PickingEnd::Failed);
}

void PortalPicking::end(PickingEnd how)
{
    if (!std::exchange(m_hasEnded, true))
        Q_EMIT ended(how);
}

} // namespace favrin::eyedropper
