#include "apps/eyedropper/picker/loupepicking.h"

#include "apps/eyedropper/picker/screenpicture.h"
#include "eyedropper/displayidentifier.h"

#include <QGuiApplication>
#include <QScreen>

#include <chrono>
#include <cstdlib>
#include <memory>
#include <optional>
#include <utility>

#include <xcb/xcb.h>

namespace favrin::eyedropper {

namespace {

using namespace std::chrono_literals;

constexpr auto frame = 16ms;
/** Between attempts to get the input, which another app may still have. */
constexpr auto inputPatience = 30ms;

xcb_connection_t *xConnection()
{
    auto *x11 = qGuiApp->nativeInterface<QNativeInterface::QX11Application>();
    return x11 ? x11->connection() : nullptr;
}

struct Pointer
{
    QPoint position;
    bool isPressed = false;
};

std::optional<Pointer> currentPointer()
{
    auto *connection = xConnection();
    const auto root = xcb_setup_roots_iterator(xcb_get_setup(connection)).data->root;
    const std::unique_ptr<xcb_query_pointer_reply_t, decltype(&std::free)> reply(
        xcb_query_pointer_reply(connection, xcb_query_pointer(connection, root), nullptr), &std::free);
    if (!reply)
        return std::nullopt;
    return Pointer{QPoint(reply->root_x, reply->root_y), (reply->mask & XCB_BUTTON_MASK_1) != 0};
}

QList<QRect> displays()
{
    QList<QRect> rects;
    for (const QScreen *screen : QGuiApplication::screens())
        rects << screen->geometry();
    return rects;
}

} // namespace

LoupePicking::LoupePicking(QString displayIdentifier, double scale, QObject *parent)
    : Picking(parent), m_displayIdentifier(std::move(displayIdentifier)), m_scale(scale)
{
    m_follow.setInterval(frame);
    connect(&m_follow, &QTimer::timeout, this, &LoupePicking::followPointer);
    m_takeInput.setInterval(inputPatience);
    connect(&m_takeInput, &QTimer::timeout, this, &LoupePicking::takeInput);
}

LoupePicking::~LoupePicking() = default;

void LoupePicking::start()
{
    auto *connection = xConnection();
    auto picture = connection ? pictureOfScreen(connection) : std::nullopt;
    if (!picture) {
        qWarning("The screen cannot be read");
        end(PickingEnd::Failed);
        return;
    }
    showWindow(*std::move(picture));
    m_follow.start();
}

void LoupePicking::showWindow(QImage picture)
{
    m_window = std::make_unique<LoupeWindow>(std::move(picture), displays(), m_scale);
    connect(m_window.get(), &LoupeWindow::picked, this, [this](const platform::Color &color) {
        if (m_hasEnded)
            return;
        Q_EMIT picked(color);
        end(PickingEnd::Picked);
    });
    connect(m_window.get(), &LoupeWindow::cancelled, this, &LoupePicking::cancel);
    // The picture would no longer be that of the screen.
    for (const QScreen *screen : QGuiApplication::screens())
        connect(screen, &QScreen::geometryChanged, this, &LoupePicking::cancel);
    connect(qGuiApp, &QGuiApplication::screenAdded, this, &LoupePicking::cancel);
    connect(qGuiApp, &QGuiApplication::screenRemoved, this, &LoupePicking::cancel);
    startOnDisplay();
    m_window->show();
}

void LoupePicking::startOnDisplay()
{
    const Pointer pointer = currentPointer().value_or(Pointer());
    const QScreen *display = displayWithIdentifier(m_displayIdentifier);
    m_pointer = pointer.position;
    if (display && !display->geometry().contains(pointer.position))
        m_window->setCrosshair(display->geometry().center(), LoupePlacement::Around);
    else
        m_window->setCrosshair(pointer.position, pointer.isPressed ? LoupePlacement::Around : LoupePlacement::Above);
}

void LoupePicking::followPointer()
{
    const auto pointer = currentPointer();
    if (!pointer || std::exchange(m_pointer, pointer->position) == pointer->position)
        return;
    // A finger moves the pointer too, but without pressing its button.
    m_window->setCrosshair(pointer->position, pointer->isPressed ? LoupePlacement::Around : LoupePlacement::Above);
}

void LoupePicking::floatPicking()
{
    if (m_hasEnded || !m_follow.isActive() || m_takeInput.isActive())
        return;
    m_takeInput.start();
    takeInput();
}

void LoupePicking::takeInput()
{
    // Neither can be had before the window is on the screen, nor while another app has it.
    const bool hasPointer = m_window->setMouseGrabEnabled(true);
    const bool hasKeys = m_window->setKeyboardGrabEnabled(true);
    if (hasPointer && m_follow.isActive())
        startListening();
    if (hasPointer && hasKeys)
        m_takeInput.stop();
}

void LoupePicking::startListening()
{
    // From here on the pointer tells of its moves itself; the last one before may have been missed.
    m_follow.stop();
    followPointer();
    m_window->setListening(true);
    Q_EMIT floated();
}

void LoupePicking::cancel()
{
    end(PickingEnd::Cancelled);
}

void LoupePicking::end(PickingEnd how)
{
    if (std::exchange(m_hasEnded, true))
        return;
    m_follow.stop();
    m_takeInput.stop();
    Q_EMIT ended(how);
}

} // namespace favrin::eyedropper
