#include "host/presentationpanel.h"

#include <QMouseEvent>
#include <QPainter>
#include <QPainterPath>
#include <QWheelEvent>

namespace favrin::host {

namespace {

/** Points around the panel that its shadow and arrow may cover. */
constexpr double surround = 28;
constexpr int shadowSteps = 12;
constexpr double shadowOffset = 4;
constexpr double shadowOpacity = 0.14;
constexpr double arrowHalfWidth = 13;
/** Nothing behind the panel is blurred, so the material lets just enough through to tell that something is there. */
constexpr double materialOpacity = 0.965;

QColor panelColor(bool dark)
{
    return dark ? QColor(0x1c, 0x1c, 0x1e) : QColor(0xff, 0xff, 0xff);
}

QColor materialColor(bool dark)
{
    QColor color = dark ? QColor(0x22, 0x22, 0x24) : QColor(0xf9, 0xf9, 0xfa);
    color.setAlphaF(static_cast<float>(materialOpacity));
    return color;
}

QColor edgeColor(bool dark)
{
    return dark ? QColor(255, 255, 255, 32) : QColor(0, 0, 0, 22);
}

} // namespace

PresentationPanel::PresentationPanel(QQuickItem *parent) : QQuickPaintedItem(parent)
{
    setAntialiasing(true);
    setAcceptedMouseButtons(Qt::AllButtons);
}

void PresentationPanel::setLayout(const PresentationLayout &layout)
{
    m_layout = layout;
    const QRectF place = layout.panel.adjusted(-surround, -surround, surround, surround);
    setPosition(place.topLeft());
    setSize(place.size());
    update();
}

void PresentationPanel::setAppearance(bool dark)
{
    if (m_dark == dark)
        return;
    m_dark = dark;
    update();
}

void PresentationPanel::setMaterial(bool material)
{
    if (m_material == material)
        return;
    m_material = material;
    update();
}

QRectF PresentationPanel::contentRectangle() const
{
    return {QPointF(surround, surround), m_layout.panel.size()};
}

QPainterPath PresentationPanel::outline() const
{
    const QRectF content = contentRectangle();
    // Each half is rounded by itself: a sheet has square corners at the bottom.
    QPainterPath top;
    top.addRoundedRect(content, m_layout.topRadius, m_layout.topRadius);
    QPainterPath bottom;
    bottom.addRoundedRect(content, m_layout.bottomRadius, m_layout.bottomRadius);
    QPainterPath upper;
    upper.addRect(QRectF(content.topLeft(), QSizeF(content.width(), content.height() / 2)));
    QPainterPath lower;
    lower.addRect(QRectF(content.left(), content.center().y(), content.width(), content.height() / 2));
    QPainterPath path = top.intersected(upper).united(bottom.intersected(lower));
    if (m_layout.arrowEdge == ArrowEdge::None)
        return path;
    const QPointF tip = m_layout.arrowTip - m_layout.panel.topLeft() + content.topLeft();
    const double base = m_layout.arrowEdge == ArrowEdge::Top ? content.top() : content.bottom();
    // One point into the panel, so that no seam shows between the two.
    const double inside = m_layout.arrowEdge == ArrowEdge::Top ? base + 1 : base - 1;
    QPainterPath arrow;
    arrow.moveTo(tip.x() - arrowHalfWidth, inside);
    arrow.lineTo(tip.x() - arrowHalfWidth, base);
    arrow.cubicTo(tip.x() - arrowHalfWidth / 2, base, tip.x() - 3, tip.y(), tip.x(), tip.y());
    arrow.cubicTo(tip.x() + 3, tip.y(), tip.x() + arrowHalfWidth / 2, base, tip.x() + arrowHalfWidth, base);
    arrow.lineTo(tip.x() + arrowHalfWidth, inside);
    arrow.closeSubpath();
    return path.united(arrow);
}

void PresentationPanel::paint(QPainter *painter)
{
    painter->setRenderHint(QPainter::Antialiasing);
    const QPainterPath path = outline();
    painter->setBrush(Qt::NoBrush);
    // The shadow: ever wider and fainter outlines, only outside of the panel, which may be translucent.
    painter->save();
    QPainterPath outside;
    outside.addRect(boundingRect());
    painter->setClipPath(outside.subtracted(path));
    painter->translate(0, shadowOffset);
    for (int step = shadowSteps; step > 0; --step) {
        QColor color(Qt::black);
        color.setAlphaF(static_cast<float>(shadowOpacity / shadowSteps));
        painter->setPen(
            QPen(color, 2.0 * step * surround / (shadowSteps + 3), Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
        painter->drawPath(path);
    }
    painter->restore();
    painter->setPen(QPen(edgeColor(m_dark), 1));
    painter->setBrush(m_material ? materialColor(m_dark) : panelColor(m_dark));
    painter->drawPath(path);
}

void PresentationPanel::mousePressEvent(QMouseEvent *event)
{
    event->accept();
}

void PresentationPanel::wheelEvent(QWheelEvent *event)
{
    event->accept();
}

} // namespace favrin::host
