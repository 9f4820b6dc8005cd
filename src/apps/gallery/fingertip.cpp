#include "apps/gallery/fingertip.h"

#include <QGuiApplication>
#include <QPointingDevice>
#include <QWindow>
#include <qpa/qwindowsysteminterface.h>

namespace favrin::gallery {

namespace {

constexpr double fingerWidth = 8.0;

const QPointingDevice *touchScreen()
{
    static const QPointingDevice *screen = [] {
        auto *device = new QPointingDevice(
            QStringLiteral("fingertip"), 1, QInputDevice::DeviceType::TouchScreen, QPointingDevice::PointerType::Finger,
            QInputDevice::Capability::Position | QInputDevice::Capability::Area, 1, 0, QString(), {}, qApp);
        QWindowSystemInterface::registerInputDevice(device);
        return device;
    }();
    return screen;
}

} // namespace

Fingertip::Fingertip(QWindow *window) : m_window(window), m_screen(touchScreen()) {}

void Fingertip::press(QPointF position)
{
    send(position, QEventPoint::State::Pressed);
}

void Fingertip::move(QPointF position)
{
    send(position, QEventPoint::State::Updated);
}

void Fingertip::lift()
{
    send(m_position, QEventPoint::State::Released);
}

void Fingertip::tap(QPointF position)
{
    press(position);
    lift();
}

void Fingertip::send(QPointF position, QEventPoint::State state)
{
    m_position = position;
    // The platform speaks of pixels on the screen.
    const double scale = m_window->devicePixelRatio();
    QRectF area(0.0, 0.0, fingerWidth * scale, fingerWidth * scale);
    area.moveCenter(m_window->mapToGlobal(position) * scale);

    QWindowSystemInterface::TouchPoint point;
    point.id = 1;
    point.state = state;
    point.area = area;
    point.pressure = state == QEventPoint::State::Released ? 0.0 : 1.0;
    QWindowSystemInterface::handleTouchEvent(m_window, m_screen, {point});
}

} // namespace favrin::gallery
