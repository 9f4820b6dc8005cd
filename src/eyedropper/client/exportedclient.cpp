#include "eyedropper/client/exportedclient.h"

#include "eyedropper/eyedroppercolor.h"
#include "service/colorpickerlog.h"

#include "edserverclientadaptor.h"

#include <QDBusMessage>

namespace favrin::eyedropper {

ExportedClient::ExportedClient(service::EyedropperClientDelegate &delegate, QObject *parent)
    : QObject(parent), m_delegate(delegate)
{
    new EDServerClientAdaptor(this);
}

ExportedClient::~ExportedClient() = default;

bool ExportedClient::isCalledByService()
{
    if (!m_service.isEmpty() && message().service() == m_service)
        return true;
    sendErrorReply(QDBusError::AccessDenied, QStringLiteral("Only the eyedropper service may call this object"));
    return false;
}

void ExportedClient::eyedropperDidSelectColor(const QString &colorspace, const QList<double> &components)
{
    if (!isCalledByService())
        return;
    if (const auto color = decodeColor({colorspace, components}))
        m_delegate.eyedropperDidSelectColor(*color);
    else
        service::colorPickerLog().warning("The eyedropper sent a color that cannot be read; nothing is picked");
}

void ExportedClient::eyedropperDidFloat()
{
    if (isCalledByService())
        m_delegate.eyedropperDidFloat();
}

void ExportedClient::eyedropperDidDismiss()
{
    if (isCalledByService())
        m_delegate.eyedropperDidDismiss();
}

} // namespace favrin::eyedropper
