#include "apps/eyedropper/picker/loupewindow.h"

#include "apps/eyedropper/picker/screenpicture.h"

#include <QCursor>
#include <QKeyEvent>
#include <QPainter>

#include <algorithm>
#include <optional>
#include <utility>

namespace favrin::eyedropper {

namespace {

/** Points; a finger wanders so far in a tap. */
constexpr double tapSlop = 10;
/** Pixels that an arrow key moves the crosshair with Shift. */
constexpr int longStep = 10;

QPoint pixelOf(QPointF position)
{
    return {qFloor(position.x()), qFloor(position.y())};
}

std::optional<QPoint> wayOfKey(int key)
{
    switch (key) {
    case Qt::Key_Left:
        return QPoint(-1, 0);
    case Qt::Key_Right:
        return QPoint(1, 0);
    case Qt::Key_Up:
        return QPoint(0, -1);
    case Qt::Key_Down:
        return QPoint(0, 1);
    default:
        return std::nullopt;
    }
}

} // namespace

LoupeWindow::LoupeWindow(QImage picture, QList<QRect> displays, double scale)
    : m_picture(std::move(picture))
    , m_displays(std::move(displays))
    , m_painter(scale)
    , m_gesture(qRound(tapSlop * scale))
{
    // No window manager places it, and none keeps it from covering panels.
    setFlags(Qt::Window | Qt::FramelessWindowHint | Qt::BypassWindowManagerHint | Qt::WindowStaysOnTopHint);
    setCursor(Qt::BlankCursor);
    setGeometry(m_picture.rect());
}

LoupeWindow::~LoupeWindow() = default;

QRect LoupeWindow::displayOfCrosshair() const
{
    const auto display =
        std::ranges::find_if(m_displays, [this](const QRect &rect) { return rect.contains(m_crosshair); });
    return display == m_displays.end() ? m_picture.rect() : *display;
}

void LoupeWindow::setCrosshair(QPoint pixel, LoupePlacement placement)
{
    const QRect before = m_geometry.bounds;
    const QPoint onDisplay = nearestPixel(pixel, m_displays);
    m_crosshair = nearestPixel(onDisplay, {m_picture.rect()});
    m_placement = placement;
    m_text = LoupeText::of(colorOfPixel(m_picture, m_crosshair));
    m_geometry =
        loupeGeometry(m_crosshair, displayOfCrosshair(), m_painter.labelSize(m_text), placement, m_painter.metrics());
    update(QRegion(before) + m_geometry.bounds);
}

void LoupeWindow::paintEvent(QPaintEvent *event)
{
    QPainter painter(this);
    for (const QRect &rect : event->region())
        painter.drawImage(rect, m_picture, rect);
    painter.setClipRegion(event->region());
    m_painter.paint(painter, m_geometry, m_picture, m_crosshair, m_text);
}

void LoupeWindow::mouseMoveEvent(QMouseEvent *event)
{
    if (m_isListening)
        setCrosshair(pixelOf(event->position()), LoupePlacement::Around);
}

void LoupeWindow::mousePressEvent(QMouseEvent *event)
{
    if (!m_isListening)
        return;
    if (event->button() == Qt::RightButton) {
        Q_EMIT cancelled();
    } else if (event->button() == Qt::LeftButton) {
        m_isPressed = true;
        setCrosshair(pixelOf(event->position()), LoupePlacement::Around);
    }
}

void LoupeWindow::mouseReleaseEvent(QMouseEvent *event)
{
    if (event->button() == Qt::LeftButton && std::exchange(m_isPressed, false))
        pick();
}

void LoupeWindow::touchEvent(QTouchEvent *event)
{
    event->accept();
    if (event->type() == QEvent::TouchCancel)
        m_gesture.cancel();
    else if (m_isListening)
        followFinger(event->points().constFirst());
}

void LoupeWindow::followFinger(const QEventPoint &finger)
{
    const QPoint pixel = pixelOf(finger.position());
    switch (finger.state()) {
    case QEventPoint::Pressed:
        setCrosshair(m_gesture.press(pixel, m_crosshair, m_geometry.discContains(pixel)), LoupePlacement::Above);
        break;
    case QEventPoint::Updated:
        if (m_gesture.isActive())
            setCrosshair(m_gesture.move(pixel), LoupePlacement::Above);
        break;
    case QEventPoint::Released:
        if (m_gesture.release())
            pick();
        break;
    case QEventPoint::Unknown:
    case QEventPoint::Stationary:
        break;
    }
}

void LoupeWindow::keyPressEvent(QKeyEvent *event)
{
    if (!m_isListening)
        return;
    if (const auto way = wayOfKey(event->key())) {
        step(event->modifiers().testFlag(Qt::ShiftModifier) ? *way * longStep : *way);
        return;
    }
    switch (event->key()) {
    case Qt::Key_Escape:
    case Qt::Key_Back:
    case Qt::Key_Cancel:
        Q_EMIT cancelled();
        break;
    case Qt::Key_Return:
    case Qt::Key_Enter:
    case Qt::Key_Space:
    case Qt::Key_Select:
        if (!event->isAutoRepeat())
            pick();
        break;
    default:
        break;
    }
}

void LoupeWindow::step(QPoint way)
{
    setCrosshair(m_crosshair + way, m_placement);
    QCursor::setPos(m_crosshair);
}

void LoupeWindow::pick()
{
    Q_EMIT picked(colorOfPixel(m_picture, m_crosshair));
}

} // namespace favrin::eyedropper
