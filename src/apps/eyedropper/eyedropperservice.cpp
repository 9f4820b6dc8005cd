#include "apps/eyedropper/eyedropperservice.h"

#include "eyedropper/eyedroppercolor.h"
#include "eyedropper/wirenames.h"

#include "edserviceserveradaptor.h"
#include "eyedropperavailabilityadaptor.h"

#include <QDBusMessage>

#include <utility>

namespace favrin::eyedropper {

EyedropperService::EyedropperService(const QDBusConnection &bus, QString pickerProgram, QObject *parent)
    : QObject(parent), m_bus(bus), m_pickerProgram(std::move(pickerProgram))
{
    new EDServiceServerAdaptor(this);
    new EyedropperAvailabilityAdaptor(this);
    m_clientWatcher.setConnection(m_bus);
    m_clientWatcher.setWatchMode(QDBusServiceWatcher::WatchForUnregistration);
    connect(&m_clientWatcher, &QDBusServiceWatcher::serviceUnregistered, this, [this](const QString &name) {
        if (name == m_client)
            dismiss();
    });
}

EyedropperService::~EyedropperService()
{
    dismiss();
}

bool EyedropperService::start()
{
    // The object first: whoever sees the name may call at once.
    return m_bus.registerObject(servicePath, this) && m_bus.registerService(serviceName);
}

bool EyedropperService::isShownByCaller() const
{
    return m_picker && m_client == message().service();
}

void EyedropperService::beginShowingEyeDropper(const QString &displayIdentifier)
{
    if (isShownByCaller())
        return;
    dismiss();
    show(message().service(), displayIdentifier);
}

void EyedropperService::show(const QString &client, const QString &displayIdentifier)
{
    m_client = client;
    m_clientWatcher.addWatchedService(client);
    m_picker = std::make_unique<PickerProcess>(m_pickerProgram);
    connect(m_picker.get(), &PickerProcess::floated, this,
            [this] { report(m_client, QStringLiteral("eyedropperDidFloat")); });
    connect(m_picker.get(), &PickerProcess::picked, this, [this](const platform::Color &color) {
        if (const auto arguments = encodeColor(color))
            report(m_client, QStringLiteral("eyedropperDidSelectColor"),
                   {arguments->colorspace, QVariant::fromValue(arguments->components)});
    });
    connect(m_picker.get(), &PickerProcess::ended, this, &EyedropperService::dismiss);
    m_picker->start(displayIdentifier);
}

void EyedropperService::floatEyeDropper()
{
    if (isShownByCaller())
        m_picker->floatPicker();
    else
        // Nothing will ever end what this client waits for.
        report(message().service(), QStringLiteral("eyedropperDidDismiss"));
}

void EyedropperService::cancelShowingEyeDropper()
{
    if (isShownByCaller())
        m_picker->cancel();
    else
        report(message().service(), QStringLiteral("eyedropperDidDismiss"));
}

void EyedropperService::dismiss()
{
    if (!m_picker)
        return;
    m_picker->abandon();
    // It may be the one that has just said that it ended.
    m_picker.release()->deleteLater();
    const QString client = std::exchange(m_client, {});
    m_clientWatcher.removeWatchedService(client);
    report(client, QStringLiteral("eyedropperDidDismiss"));
}

bool EyedropperService::eyedropperIsAvailable()
{
    // The picking process is the one that knows; the answer follows when it has said so.
    setDelayedReply(true);
    auto *check = new QProcess(this);
    const auto answer = [bus = m_bus, question = message(), check](bool available) {
        bus.send(question.createReply(available));
        check->deleteLater();
    };
    connect(check, &QProcess::finished, this, [answer](int exitCode, QProcess::ExitStatus status) {
        answer(status == QProcess::NormalExit && exitCode == 0);
    });
    connect(check, &QProcess::errorOccurred, this, [answer](QProcess::ProcessError error) {
        if (error == QProcess::FailedToStart)
            answer(false);
    });
    check->setProcessChannelMode(QProcess::ForwardedErrorChannel);
    check->start(m_pickerProgram, {QStringLiteral("--check")});
    return false;
}

void EyedropperService::report(const QString &client, const QString &member, const QVariantList &arguments)
{
    auto call = QDBusMessage::createMethodCall(client, clientPath, clientInterface, member);
    call.setArguments(arguments);
    m_bus.send(call);
}

} // namespace favrin::eyedropper
