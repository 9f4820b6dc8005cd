#include "host/session/remoteviewsession.h"

#include "host/session/hostkeymap.h"
#include "host/session/hostlog.h"
#include "host/session/serviceprocess.h"

#include <QGuiApplication>
#include <QSocketNotifier>
#include <QStyleHints>

#include <cstring>

namespace favrin::host {

using namespace std::chrono_literals;

namespace {

/** A service that lost its host leaves within milliseconds; one that does not is stuck. */
constexpr auto timeToLeave = 1000ms;
/**
 * The picker gets its keyboard, which takes either process longer than anything else here, when its first frame is on
 * the display; a picker that was started ahead, when its start is surely over. What is typed meanwhile waits.
 */
constexpr auto firstFrameToKeyboard = 20ms;
constexpr auto readyToKeyboard = 1000ms;

QString closeText(server::CloseReason reason, const std::string &detail)
{
    const auto text = QString::fromStdString(detail);
    switch (reason) {
    case server::CloseReason::ServiceGone:
        return QStringLiteral("The color picker's process ended.");
    case server::CloseReason::ProtocolError:
        return QStringLiteral("The color picker broke a rule of the protocol: %1").arg(text);
    case server::CloseReason::LimitExceeded:
        return QStringLiteral("The color picker exceeded a limit: %1").arg(text);
    }
    return text;
}

} // namespace

/** Turns the server's calls into signals of the session. */
class RemoteViewSession::Delegate : public server::RemoteViewServerDelegate
{
public:
    explicit Delegate(RemoteViewSession &session) : m_session(session) {}

    void frameDidArrive(const server::Frame &frame) override
    {
        m_session.m_surface.update(frame);
        Q_EMIT m_session.frameArrived();
    }
    void surfaceDidUnmap() override { m_session.m_surface.clear(); }
    void serviceIsReady() override
    {
        m_session.m_ready = true;
        m_session.m_keyboardTimer.start(readyToKeyboard);
        Q_EMIT m_session.ready();
    }
    void serviceDidPrepare(std::uint32_t serial) override { Q_EMIT m_session.prepared(serial); }
    void pickerDidSelectColor(const std::optional<platform::Color> &color, const std::optional<std::string> &colorspace,
                              bool isVolatile) override
    {
        Q_EMIT m_session.pickerDidSelectColor(color, colorspace, isVolatile);
    }
    void pickerDidShowEyedropper() override { Q_EMIT m_session.pickerDidShowEyedropper(); }
    void pickerDidFloatEyedropper() override { Q_EMIT m_session.pickerDidFloatEyedropper(); }
    void pickerDidDismissEyedropper() override { Q_EMIT m_session.pickerDidDismissEyedropper(); }
    void colorPickerDidFinish() override { Q_EMIT m_session.colorPickerDidFinish(); }
    void preferredContentSizeDidChange(double width, double height) override
    {
        m_session.m_preferredContentSize = QSizeF(width, height);
        Q_EMIT m_session.preferredContentSizeDidChange();
    }
    void backgroundEffectDidChange(remote::BackgroundEffect effect) override
    {
        m_session.m_backgroundEffect = effect;
        Q_EMIT m_session.backgroundEffectDidChange();
    }
    void focusDidLeave(remote::FocusDirection direction) override { Q_EMIT m_session.focusDidLeave(direction); }
    void textInputDidChange(const server::TextInputState &state) override
    {
        m_session.m_textInput = state;
        Q_EMIT m_session.textInputDidChange();
    }
    void serviceDidOfferClipboard(const std::vector<std::string> &mimeTypes) override
    {
        Q_EMIT m_session.clipboardOffered(mimeTypes);
    }
    void serviceWantsClipboard(const std::string &mimeType, int descriptor) override
    {
        Q_EMIT m_session.clipboardWanted(mimeType, descriptor);
    }
    void cursorDidChange(const std::string &name) override
    {
        Q_EMIT m_session.cursorDidChange(QString::fromStdString(name));
    }
    void serviceResponsivenessDidChange(bool responsive) override
    {
        Q_EMIT m_session.responsivenessDidChange(responsive);
    }
    void serverDidWarn(const std::string &message) override { qCWarning(hostLog).noquote() << message.c_str(); }
    void connectionDidClose(server::CloseReason reason, const std::string &detail) override
    {
        m_session.finish(closeText(reason, detail));
    }

private:
    RemoteViewSession &m_session;
};

RemoteViewSession::RemoteViewSession(QObject *parent)
    : QObject(parent)
    , m_delegate(std::make_unique<Delegate>(*this))
    , m_server(std::make_unique<server::RemoteViewServer>(*m_delegate))
    , m_process(std::make_unique<ServiceProcess>())
{
    m_clock.start();
    m_keyboardTimer.setSingleShot(true);
    connect(&m_keyboardTimer, &QTimer::timeout, this, &RemoteViewSession::offerKeyboard);
}

RemoteViewSession::~RemoteViewSession()
{
    end();
}

void RemoteViewSession::flush()
{
    m_server->flush();
    Q_EMIT told();
}

void RemoteViewSession::frameWasShown()
{
    m_server->frameWasShown(now());
    flush();
    if (!std::exchange(m_wasShown, true) && m_keyboardTimer.isActive())
        m_keyboardTimer.start(firstFrameToKeyboard);
}

QString RemoteViewSession::adopt(LaunchedService service)
{
    if (service.process == 0)
        return QString::fromLocal8Bit(service.error.c_str());
    m_process->adopt(service.process);
    connect(m_process.get(), &ServiceProcess::ended, this, [this](const QString &description) {
        // What the service still said before it ended is on the socket; the end of the connection comes behind it.
        dispatch();
        finish(QStringLiteral("The color picker's process ended: %1.").arg(description));
    });
    if (m_server->adoptConnection(service.socket))
        return {};
    return QStringLiteral("No connection could be made: %1").arg(QString::fromLocal8Bit(std::strerror(errno)));
}

void RemoteViewSession::attend()
{
    m_notifier = std::make_unique<QSocketNotifier>(m_server->fileDescriptor(), QSocketNotifier::Read);
    connect(m_notifier.get(), &QSocketNotifier::activated, this, &RemoteViewSession::dispatch);
    m_process->watch();
}

void RemoteViewSession::offerKeyboard()
{
    if (m_ended)
        return;
    m_server->setKeymap(hostKeymap());
    const auto *hints = QGuiApplication::styleHints();
    m_server->setRepeat(static_cast<int>(hints->keyboardAutoRepeatRate()), hints->keyboardInputInterval());
    m_server->flush();
}

QString RemoteViewSession::start()
{
    const QString error = adopt(launchService(servicePath()));
    if (error.isEmpty())
        attend();
    return error;
}

void RemoteViewSession::end()
{
    if (!std::exchange(m_ended, true))
        m_server->closeConnection();
    m_notifier.reset();
    if (m_process->processIdentifier() == 0)
        return;
    auto ending = std::exchange(m_process, std::make_unique<ServiceProcess>());
    auto *application = QCoreApplication::instance();
    // While the app itself goes, there is nobody left to wait, and no need: what does not leave by itself goes with it.
    if (!application)
        return;
    // The process object stays behind to reap what leaves, and to end what does not; at the latest it goes with the
    // app.
    auto *process = ending.release();
    process->setParent(application);
    process->disconnect(this);
    connect(process, &ServiceProcess::ended, process, &QObject::deleteLater);
    process->awaitEnd();
    QTimer::singleShot(timeToLeave, process, &ServiceProcess::kill);
}

void RemoteViewSession::abandon()
{
    end();
    m_abandoned = true;
    // A loop that an app runs inside of one of our calls must not delete what that call still uses.
    if (!m_telling)
        deleteLater();
}

void RemoteViewSession::giveUp()
{
    finish(QStringLiteral("The color picker's process does not answer."));
    m_server->closeConnection();
}

qint64 RemoteViewSession::processIdentifier() const
{
    return m_process->processIdentifier();
}

void RemoteViewSession::dispatch()
{
    if (m_ended)
        return;
    if (m_telling) {
        // An app runs a dialog inside a slot, say. What comes meanwhile waits, and must not keep its loop busy.
        if (m_notifier)
            m_notifier->setEnabled(false);
        return;
    }
    m_telling = true;
    m_server->dispatch();
    m_telling = false;
    if (m_abandoned)
        deleteLater();
    if (m_ended)
        return;
    if (m_notifier)
        m_notifier->setEnabled(true);
    m_server->flush();
}

void RemoteViewSession::finish(const QString &error)
{
    if (m_ended)
        return;
    m_ended = true;
    if (m_notifier)
        m_notifier->setEnabled(false);
    // Disconnected for its faults, it may still be running.
    m_process->kill();
    qCWarning(hostLog).noquote() << error << "The color picker is no longer shown.";
    Q_EMIT ended(error);
}

} // namespace favrin::host
