#pragma once

#include "host/server/remoteviewserver.h"
#include "host/session/launchedservice.h"
#include "host/session/remotesurface.h"

#include <QElapsedTimer>
#include <QObject>
#include <QSizeF>
#include <QTimer>

#include <memory>

class QSocketNotifier;

namespace favrin::host {

class ServiceProcess;

/**
 * One picker process and the server it talks to: starts it, keeps its surface, and turns what it says into signals.
 *
 * The session has ended when ended() was sent; it is then of no more use. A session is abandoned by end(): nothing more
 * comes from it, the connection closes, and a process that has not left after a second is killed. GUI thread.
 */
class RemoteViewSession : public QObject
{
    Q_OBJECT

public:
    explicit RemoteViewSession(QObject *parent = nullptr);
    ~RemoteViewSession() override;

    /** Starts the process. An error text when that fails, else empty. */
    QString start();
    /** The two halves of it: a process that was started, for which no application is needed; from then on its server.
     */
    QString adopt(LaunchedService service);
    void attend();
    /** Closes the connection; no signal follows. */
    void end();
    bool hasEnded() const { return m_ended; }
    /** Ends a process that does not answer; ended() says so. */
    void giveUp();
    /** The service has built its views. */
    bool isReady() const { return m_ready; }
    /** For those who must find the process, e.g. a test that kills it; 0 when it does not run. */
    qint64 processIdentifier() const;

    RemoteSurface &surface() { return m_surface; }
    /** Messages and input go to the server directly; call flush() behind them. */
    server::RemoteViewServer &server() { return *m_server; }
    void flush();
    /** The newest frame of the service is on the screen: it may draw the next. */
    void frameWasShown();
    /** Takes in what has arrived, without waiting for the event loop. */
    void receive() { dispatch(); }
    /** end(), and deletes this object when nothing of it is in use any more. */
    void abandon();
    /** In the middle of telling something, perhaps to an app that runs a loop of its own over it. */
    bool isTelling() const { return m_telling; }
    /** Milliseconds on the clock that input events to the service use. */
    std::uint32_t now() const { return static_cast<std::uint32_t>(m_clock.elapsed()); }

    const server::TextInputState &textInput() const { return m_textInput; }
    /** What the service said last, perhaps before anybody listened: it may have been started ahead of time. */
    remote::BackgroundEffect backgroundEffect() const { return m_backgroundEffect; }
    /** Points; 0 × 0 while the service has not said. */
    QSizeF preferredContentSize() const { return m_preferredContentSize; }

Q_SIGNALS:
    /** Something may have been sent to the service. */
    void told();
    void ready();
    void prepared(quint32 serial);
    /** The first and every further frame; the surface holds it already. */
    void frameArrived();
    void pickerDidSelectColor(const std::optional<favrin::platform::Color> &color,
                              const std::optional<std::string> &colorspace, bool isVolatile);
    void pickerDidShowEyedropper();
    void pickerDidFloatEyedropper();
    void pickerDidDismissEyedropper();
    void colorPickerDidFinish();
    void preferredContentSizeDidChange();
    void backgroundEffectDidChange();
    void focusDidLeave(remote::FocusDirection direction);
    void textInputDidChange();
    void clipboardOffered(const std::vector<std::string> &mimeTypes);
    void clipboardWanted(const std::string &mimeType, int descriptor);
    void cursorDidChange(const QString &name);
    void responsivenessDidChange(bool responsive);
    /** The process ended, or it was disconnected; @p error says why. */
    void ended(const QString &error);

private:
    class Delegate;

    void dispatch();
    void offerKeyboard();
    void finish(const QString &error);

    RemoteSurface m_surface;
    std::unique_ptr<Delegate> m_delegate;
    std::unique_ptr<server::RemoteViewServer> m_server;
    std::unique_ptr<ServiceProcess> m_process;
    std::unique_ptr<QSocketNotifier> m_notifier;
    QElapsedTimer m_clock;
    QTimer m_keyboardTimer;
    server::TextInputState m_textInput;
    remote::BackgroundEffect m_backgroundEffect = remote::BackgroundEffect::None;
    QSizeF m_preferredContentSize = QSizeF(0, 0);
    bool m_ready = false;
    bool m_wasShown = false;
    bool m_ended = false;
    bool m_telling = false;
    bool m_abandoned = false;
};

} // namespace favrin::host
