#include "host/server/remoteviewserver.h"

#include "host/server/clipboard.h"
#include "host/server/compositor.h"
#include "host/server/connection.h"
#include "host/server/remoteview.h"
#include "host/server/screens.h"
#include "host/server/seat.h"
#include "host/server/surface.h"
#include "host/server/textinputmanager.h"
#include "host/server/xdgshell.h"

namespace favrin::host::server {

struct RemoteViewServer::Private
{
    explicit Private(RemoteViewServerDelegate &delegate) : connection(delegate)
    {
        shell.onMappedSurfaceChanged([this] { mappedSurfaceDidChange(); });
    }
    // The client's objects use all that follows the connection.
    ~Private() { connection.close(); }

    void mappedSurfaceDidChange()
    {
        Surface *surface = shell.mappedSurface();
        seat.setSurface(surface);
        isFrameAwaited = false;
        if (!surface && connection.isUsable())
            connection.delegate().surfaceDidUnmap();
    }

    void showFrame()
    {
        Surface *surface = shell.mappedSurface();
        compositor.settleAllBut(surface);
        if (!surface)
            return;
        surface->takeFrame([this](const Frame &frame) {
            isFrameAwaited = true;
            connection.delegate().frameDidArrive(frame);
        });
        // A commit that changed nothing on screen has nothing to wait for.
        if (!isFrameAwaited)
            surface->answerFrameCallbacks(Connection::now());
    }

    void endTurn()
    {
        if (connection.isUsable())
            showFrame();
        if (connection.isUsable())
            textInput.settle();
        connection.endTurn();
        settle();
        connection.reap();
        if (const auto end = connection.takeEnd())
            connection.delegate().connectionDidClose(end->reason, end->detail);
    }

    void settle()
    {
        if (!connection.isUsable())
            return;
        view.settle();
        seat.settle();
        clipboard.settle();
        connection.flush();
    }

    Connection connection;
    Compositor compositor{connection};
    Screens screens{connection};
    XdgShell shell{connection, screens};
    Seat seat{connection};
    TextInputManager textInput{connection};
    Clipboard clipboard{connection};
    RemoteView view{connection};
    /** A frame was handed out and frameWasShown() has not been called since. */
    bool isFrameAwaited = false;
};

RemoteViewServer::RemoteViewServer(RemoteViewServerDelegate &delegate) : d(std::make_unique<Private>(delegate)) {}

RemoteViewServer::~RemoteViewServer() = default;

int RemoteViewServer::openConnection()
{
    return d->connection.open();
}

bool RemoteViewServer::adoptConnection(int socket)
{
    return d->connection.adopt(socket);
}

int RemoteViewServer::fileDescriptor() const
{
    return d->connection.fileDescriptor();
}

void RemoteViewServer::dispatch()
{
    if (!d->connection.beginTurn())
        return;
    d->connection.readOnce();
    d->endTurn();
}

void RemoteViewServer::flush()
{
    // What is said in the middle of a turn goes out at its end.
    if (!d->connection.isInTurn())
        d->settle();
}

void RemoteViewServer::configure(int width, int height, int scale)
{
    d->screens.setScale(scale);
    d->shell.configure(width, height);
}

void RemoteViewServer::frameWasShown(std::uint32_t milliseconds)
{
    d->isFrameAwaited = false;
    if (Surface *surface = d->shell.mappedSurface())
        surface->answerFrameCallbacks(milliseconds);
}

void RemoteViewServer::sendTraits(const remote::Traits &traits)
{
    d->view.sendTraits(traits);
}

void RemoteViewServer::sendConfiguration(const remote::Configuration &configuration)
{
    d->view.sendConfiguration(configuration);
}

void RemoteViewServer::sendSelectedColor(const std::optional<platform::Color> &color,
                                         const std::optional<std::string> &colorspace)
{
    d->view.sendSelectedColor(color, colorspace);
}

void RemoteViewServer::sendPrepareForDisplay(std::uint32_t serial)
{
    d->view.sendPrepareForDisplay(serial);
}

void RemoteViewServer::sendPresent()
{
    d->view.sendPresent();
}

void RemoteViewServer::sendFocusWillEnter(remote::FocusDirection direction)
{
    d->view.sendFocusWillEnter(direction);
}

void RemoteViewServer::sendColorPickerDidFinish()
{
    d->view.sendColorPickerDidFinish();
}

void RemoteViewServer::pointerEnter(double x, double y)
{
    d->seat.pointer().enter(x, y);
}

void RemoteViewServer::pointerLeave()
{
    d->seat.pointer().leave();
}

void RemoteViewServer::pointerMotion(std::uint32_t time, double x, double y)
{
    d->seat.pointer().move(time, x, y);
}

void RemoteViewServer::pointerButton(std::uint32_t time, std::uint32_t button, bool pressed)
{
    d->seat.pointer().press(time, button, pressed);
}

void RemoteViewServer::pointerAxis(std::uint32_t time, double horizontal, double vertical, int horizontalDiscrete,
                                   int verticalDiscrete)
{
    d->seat.pointer().scroll(time, horizontal, vertical, horizontalDiscrete, verticalDiscrete);
}

void RemoteViewServer::pointerFrame()
{
    d->seat.pointer().endFrame();
}

void RemoteViewServer::touchDown(std::uint32_t time, int id, double x, double y)
{
    d->seat.touch().down(time, id, x, y);
}

void RemoteViewServer::touchMotion(std::uint32_t time, int id, double x, double y)
{
    d->seat.touch().move(time, id, x, y);
}

void RemoteViewServer::touchUp(std::uint32_t time, int id)
{
    d->seat.touch().up(time, id);
}

void RemoteViewServer::touchFrame()
{
    d->seat.touch().endFrame();
}

void RemoteViewServer::touchCancel()
{
    d->seat.touch().cancel();
}

void RemoteViewServer::setKeymap(const std::string &keymap)
{
    d->seat.keyboard().setKeymap(keymap);
    d->seat.offerKeyboard();
}

void RemoteViewServer::setKeymapFromNames(const std::string &rules, const std::string &model, const std::string &layout,
                                          const std::string &variant, const std::string &options)
{
    d->seat.keyboard().setKeymap(Keymap::Names{rules, model, layout, variant, options});
    d->seat.offerKeyboard();
}

void RemoteViewServer::setRepeat(int keysPerSecond, int delayMilliseconds)
{
    d->seat.keyboard().setRepeat(keysPerSecond, delayMilliseconds);
}

void RemoteViewServer::keyboardEnter()
{
    d->seat.keyboard().enter();
    d->shell.setActivated(true);
}

void RemoteViewServer::keyboardLeave()
{
    d->seat.keyboard().leave();
    d->shell.setActivated(false);
}

void RemoteViewServer::keyboardKey(std::uint32_t time, std::uint32_t key, bool pressed)
{
    d->seat.keyboard().press(time, key, pressed);
}

void RemoteViewServer::keyboardModifiers(std::uint32_t depressed, std::uint32_t latched, std::uint32_t locked,
                                         std::uint32_t group)
{
    d->seat.keyboard().setModifiers(depressed, latched, locked, group);
}

std::optional<RemoteViewServer::KeyCode> RemoteViewServer::keyCodeForKeysym(std::uint32_t keysym) const
{
    const Keyboard &keyboard = d->seat.keyboard();
    return keyboard.keymap().keyCodeForKeysym(keysym, keyboard.group());
}

void RemoteViewServer::commitText(const std::string &text)
{
    d->textInput.commit(text);
}

void RemoteViewServer::preeditText(const std::string &text, int cursor)
{
    d->textInput.preedit(text, cursor);
}

void RemoteViewServer::deleteSurroundingText(std::uint32_t before, std::uint32_t after)
{
    d->textInput.deleteSurrounding(before, after);
}

void RemoteViewServer::setClipboard(const std::vector<std::string> &mimeTypes)
{
    d->clipboard.setHostTypes(mimeTypes);
}

void RemoteViewServer::requestServiceClipboard(const std::string &mimeType, int descriptor)
{
    d->clipboard.requestServiceData(mimeType, descriptor);
}

void RemoteViewServer::ping()
{
    d->shell.ping();
}

bool RemoteViewServer::isMapped() const
{
    return d->shell.mappedSurface() != nullptr;
}

void RemoteViewServer::closeConnection()
{
    d->connection.close();
}

} // namespace favrin::host::server
