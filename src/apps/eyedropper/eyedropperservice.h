#pragma once

#include "apps/eyedropper/pickerprocess.h"

#include <QDBusConnection>
#include <QDBusContext>
#include <QDBusServiceWatcher>

#include <memory>

namespace favrin::eyedropper {

/**
 * The eyedropper service: owns the bus name, starts a process for each use and reports what becomes of it. It does no
 * picking itself, so that it lives to report the dismissal, without which the picker could not be touched any more,
 * even when the picking crashes.
 *
 * One eyedropper is shown at a time. Another client's request ends the one before it; the same client's second request
 * is the one that is being answered. A client that leaves the bus ends its eyedropper.
 */
class EyedropperService : public QObject, protected QDBusContext
{
    Q_OBJECT

public:
    /** @p pickerProgram shows the eyedropper and samples. */
    EyedropperService(const QDBusConnection &bus, QString pickerProgram, QObject *parent = nullptr);
    ~EyedropperService() override;

    /** Takes the service's place on the bus; false when another has it. */
    bool start();

    // From the bus.
    void beginShowingEyeDropper(const QString &displayIdentifier);
    void floatEyeDropper();
    void cancelShowingEyeDropper();
    bool eyedropperIsAvailable();

private:
    bool isShownByCaller() const;
    void show(const QString &client, const QString &displayIdentifier);
    /** Ends what is shown, at once, and says so to its client. */
    void dismiss();
    void report(const QString &client, const QString &member, const QVariantList &arguments = {});

    QDBusConnection m_bus;
    QString m_pickerProgram;
    QDBusServiceWatcher m_clientWatcher;
    /** Whose eyedropper is shown; empty when none is. */
    QString m_client;
    std::unique_ptr<PickerProcess> m_picker;
};

} // namespace favrin::eyedropper
