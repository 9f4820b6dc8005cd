#include "host/session/clipboardbridge.h"

#include "host/session/remoteviewsession.h"
#include "remote/clipboardtypes.h"

#include <QClipboard>
#include <QColor>
#include <QGuiApplication>
#include <QMimeData>
#include <QSocketNotifier>
#include <QThreadPool>

#include <array>
#include <cerrno>
#include <csignal>
#include <cstring>
#include <memory>
#include <utility>

#include <fcntl.h>
#include <poll.h>
#include <unistd.h>

namespace favrin::host {

namespace {

constexpr int mostTypes = 8;
constexpr qsizetype mostBytes = 64 * 1024;
constexpr QLatin1String desktopColorType("application/x-color");
/** A reader that does not read for this long gets no more. */
constexpr int writePatienceMilliseconds = 2000;

/** A reader that went away must not end the host: its signal is held back and taken on this thread. */
class SignalPipeGuard
{
public:
    SignalPipeGuard()
    {
        sigemptyset(&m_pipe);
        sigaddset(&m_pipe, SIGPIPE);
        pthread_sigmask(SIG_BLOCK, &m_pipe, &m_before);
    }
    ~SignalPipeGuard()
    {
        const timespec now = {};
        sigtimedwait(&m_pipe, nullptr, &now);
        pthread_sigmask(SIG_SETMASK, &m_before, nullptr);
    }
    Q_DISABLE_COPY_MOVE(SignalPipeGuard)

private:
    sigset_t m_pipe;
    sigset_t m_before;
};

QColor colorFromBytes(const QByteArray &bytes)
{
    std::array<quint16, 4> components = {};
    if (bytes.size() != static_cast<qsizetype>(sizeof components))
        return {};
    std::memcpy(components.data(), bytes.constData(), sizeof components);
    return QColor(QRgba64::fromRgba64(components[0], components[1], components[2], components[3]));
}

/** Runs on a pool thread: the reader may be slow. Closes the descriptor. */
void writeAll(const QByteArray &data, int descriptor)
{
    const SignalPipeGuard guard;
    qsizetype written = 0;
    while (written < data.size()) {
        pollfd waiting = {.fd = descriptor, .events = POLLOUT, .revents = 0};
        if (poll(&waiting, 1, writePatienceMilliseconds) <= 0 || !(waiting.revents & POLLOUT))
            break;
        const auto count =
            ::write(descriptor, data.constData() + written, static_cast<std::size_t>(data.size() - written));
        if (count < 0 && errno != EINTR && errno != EAGAIN)
            break;
        written += std::max<qsizetype>(count, 0);
    }
    close(descriptor);
}

} // namespace

/** Reads one offered type after the other from the service and puts the result into the host's clipboard. */
class ClipboardBridge::Fetch : public QObject
{
public:
    Fetch(RemoteViewSession &session, std::vector<std::string> types, ClipboardBridge *parent)
        : QObject(parent), m_session(&session), m_types(std::move(types)), m_bridge(parent)
    {
        m_types.resize(std::min<std::size_t>(m_types.size(), mostTypes));
        next();
    }
    ~Fetch() override { closeDescriptor(); }

private:
    void next()
    {
        std::array<int, 2> ends = {};
        if (!m_session || m_index == m_types.size() || pipe2(ends.data(), O_CLOEXEC | O_NONBLOCK) != 0) {
            finish();
            return;
        }
        m_bytes.clear();
        m_descriptor = ends[0];
        m_notifier = std::make_unique<QSocketNotifier>(m_descriptor, QSocketNotifier::Read);
        connect(m_notifier.get(), &QSocketNotifier::activated, this, [this] { read(); });
        m_session->server().requestServiceClipboard(m_types[m_index], ends[1]);
        m_session->flush();
    }

    void read()
    {
        std::array<char, 4096> buffer = {};
        const auto count = ::read(m_descriptor, buffer.data(), buffer.size());
        if (count < 0 && (errno == EAGAIN || errno == EINTR))
            return;
        if (count > 0 && m_bytes.size() + count <= mostBytes) {
            m_bytes.append(buffer.data(), count);
            return;
        }
        if (count == 0)
            take(QString::fromStdString(m_types[m_index]));
        // The notifier is what called; it goes in a later turn.
        m_notifier.release()->deleteLater();
        closeDescriptor();
        ++m_index;
        next();
    }

    void take(const QString &type)
    {
        // The toolkit knows a color only as such, and makes the desktop's bytes of it itself.
        if (type == QLatin1String(remote::colorClipboardType)) {
            if (const QColor color = colorFromBytes(m_bytes); color.isValid())
                m_data->setColorData(color);
        } else if (type != desktopColorType) {
            m_data->setData(type, m_bytes);
        }
    }

    void closeDescriptor()
    {
        m_notifier.reset();
        if (m_descriptor >= 0)
            close(std::exchange(m_descriptor, -1));
    }

    void finish()
    {
        if (!m_data->formats().isEmpty()) {
            m_bridge->m_taking = true;
            QGuiApplication::clipboard()->setMimeData(m_data.release());
            m_bridge->m_taking = false;
        }
        deleteLater();
    }

    QPointer<RemoteViewSession> m_session;
    std::vector<std::string> m_types;
    ClipboardBridge *m_bridge;
    std::size_t m_index = 0;
    int m_descriptor = -1;
    std::unique_ptr<QSocketNotifier> m_notifier;
    QByteArray m_bytes;
    std::unique_ptr<QMimeData> m_data = std::make_unique<QMimeData>();
};

ClipboardBridge::ClipboardBridge(QObject *parent) : QObject(parent)
{
    connect(QGuiApplication::clipboard(), &QClipboard::dataChanged, this, [this] {
        // What came from the service is not offered back to it: it would lose its own selection.
        if (m_active && !m_taking)
            offer();
    });
}

ClipboardBridge::~ClipboardBridge() = default;

void ClipboardBridge::setSession(RemoteViewSession *session)
{
    if (m_session)
        m_session->disconnect(this);
    m_session = session;
    m_active = false;
    if (!session)
        return;
    connect(session, &RemoteViewSession::clipboardOffered, this, &ClipboardBridge::fetch);
    connect(session, &RemoteViewSession::clipboardWanted, this, &ClipboardBridge::write);
}

void ClipboardBridge::setActive(bool active)
{
    m_active = active;
}

void ClipboardBridge::offer()
{
    if (!m_session)
        return;
    std::vector<std::string> types;
    if (const auto *data = QGuiApplication::clipboard()->mimeData()) {
        for (const auto &format : data->formats())
            types.push_back(format.toStdString());
        // Qt's own clipboards name plain text without its encoding; toolkits on the wire ask for both.
        if (data->hasText())
            types.emplace_back("text/plain;charset=utf-8");
    }
    m_session->server().setClipboard(types);
    m_session->flush();
}

void ClipboardBridge::fetch(const std::vector<std::string> &mimeTypes)
{
    // Only a picker that the user works with may change the clipboard.
    if (m_active && m_session && !mimeTypes.empty())
        new Fetch(*m_session, mimeTypes, this);
}

void ClipboardBridge::write(const std::string &mimeType, int descriptor)
{
    const auto *data = QGuiApplication::clipboard()->mimeData();
    QByteArray bytes;
    if (m_active && data) {
        const auto name = QString::fromStdString(mimeType);
        bytes = name.startsWith(u"text/plain") ? data->text().toUtf8() : data->data(name);
    }
    fcntl(descriptor, F_SETFL, O_NONBLOCK);
    QThreadPool::globalInstance()->start([bytes, descriptor] { writeAll(bytes, descriptor); });
}

} // namespace favrin::host
