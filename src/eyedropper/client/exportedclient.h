#pragma once

#include "service/eyedropperclient.h"

#include <QDBusContext>
#include <QObject>
#include <QString>

namespace favrin::eyedropper {

/**
 * The object that the eyedropper service calls. Whoever else calls it is refused; so is everybody while no service is
 * known. Calls arrive on the bus's own thread and are carried out on the thread of this object, in their order.
 */
class ExportedClient : public QObject, protected QDBusContext
{
    Q_OBJECT

public:
    explicit ExportedClient(service::EyedropperClientDelegate &delegate, QObject *parent = nullptr);
    ~ExportedClient() override;

    /** The unique bus name of the service; empty while there is none. */
    void setService(QString uniqueName) { m_service = std::move(uniqueName); }

    // From the bus.
    void eyedropperDidSelectColor(const QString &colorspace, const QList<double> &components);
    void eyedropperDidFloat();
    void eyedropperDidDismiss();

private:
    /** False when somebody else calls, who has then been told. */
    bool isCalledByService();

    service::EyedropperClientDelegate &m_delegate;
    QString m_service;
};

} // namespace favrin::eyedropper
