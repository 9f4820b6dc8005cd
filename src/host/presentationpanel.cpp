#include "host/presentationpanel.h"

#include "host/session/panelcolor.h"
#include "platform/shapes/dropshadow.h"

#include <QMouseEvent>
#include <QPainter>
#include <QPainterPath>
#include <QQuickWindow>
#include <QSGRectangleNode>
#include <QWheelEvent>

#include <algorithm>
#include <array>
#include <cmath>

namespace favrin::host {

namespace {

/** Points around the panel that its shadow and arrow may cover. */
constexpr double surround = 44;
constexpr double shadowRadius = 40;
constexpr double shadowDrop = 6;
constexpr QColor shadowColor(0, 0, 0, 64);
constexpr double arrowHalfWidth = 13;

QColor edgeColor(bool dark)
{
    return dark ? QColor(255, 255, 255, 32) : QColor(0, 0, 0, 22);
}

/** One end of the arrow's base to the other over its tip; @p halfWidth is negative where the outline runs leftwards. */
void addArrow(QPainterPath &path, const QPointF &tip, double base, double halfWidth)
{
    const double blunt = std::copysign(3.0, halfWidth);
    path.lineTo(tip.x() - halfWidth, base);
    path.cubicTo(tip.x() - halfWidth / 2, base, tip.x() - blunt, tip.y(), tip.x(), tip.y());
    path.cubicTo(tip.x() + blunt, tip.y(), tip.x() + halfWidth / 2, base, tip.x() + halfWidth, base);
}

/** The shadow of a small panel: its corners are those of any panel, its middle can be stretched. */
const QImage &shadowTile()
{
    static const QImage tile = [] {
        const int side = static_cast<int>(4 * shadowRadius) + 1;
        QImage shape(side, side, QImage::Format_ARGB32_Premultiplied);
        shape.fill(Qt::transparent);
        QPainter painter(&shape);
        painter.setRenderHint(QPainter::Antialiasing);
        painter.setPen(Qt::NoPen);
        painter.setBrush(Qt::black);
        painter.drawRoundedRect(QRectF(shape.rect()).adjusted(shadowRadius, shadowRadius, -shadowRadius, -shadowRadius),
                                14, 14);
        painter.end();
        return platform::dropShadow(shape, shadowRadius, shadowColor);
    }();
    return tile;
}

void paintShadow(QPainter &painter, const QRectF &panel)
{
    const QImage &tile = shadowTile();
    const double half = 2 * shadowRadius;
    const QRectF place = panel.adjusted(-shadowRadius, -shadowRadius, shadowRadius, shadowRadius);
    const std::array<double, 4> sourceEdges = {0, half, half + 1, tile.width() * 1.0};
    const std::array<double, 4> columns = {place.left(), place.left() + half, place.right() - half, place.right()};
    const std::array<double, 4> rows = {place.top(), place.top() + half, place.bottom() - half, place.bottom()};
    for (std::size_t row = 0; row < 3; ++row) {
        for (std::size_t column = 0; column < 3; ++column) {
            if (row == 1 && column == 1)
                continue;
            painter.drawImage(QRectF(QPointF(columns[column], rows[row]), QPointF(columns[column + 1], rows[row + 1])),
                              tile,
                              QRectF(QPointF(sourceEdges[column], sourceEdges[row]),
                                     QPointF(sourceEdges[column + 1], sourceEdges[row + 1])));
        }
    }
}

} // namespace

/**
 * What of the panel has neither corners nor edges, as a rectangle that the scene graph knows to be opaque: what lies
 * below it, panel, scrim and the app's own picture, is then not painted again with every step of a drag.
 */
class PresentationPanel::Middle : public QQuickItem
{
public:
    explicit Middle(QQuickItem *parent) : QQuickItem(parent) { setFlag(ItemHasContents); }

    void setColor(const QColor &color)
    {
        m_color = color;
        update();
    }

protected:
    QSGNode *updatePaintNode(QSGNode *oldNode, UpdatePaintNodeData *) override
    {
        auto *node = oldNode ? static_cast<QSGRectangleNode *>(oldNode) : window()->createRectangleNode();
        node->setRect(boundingRect());
        node->setColor(m_color);
        return node;
    }

private:
    QColor m_color = panelColor(false);
};

PresentationPanel::PresentationPanel(QQuickItem *parent) : QQuickPaintedItem(parent), m_middle(new Middle(this))
{
    setAntialiasing(true);
    setAcceptedMouseButtons(Qt::AllButtons);
    // While the panel fades in, two layers of it would be seen as such.
    const auto showMiddle = [this] { m_middle->setVisible(opacity() == 1.0); };
    connect(this, &QQuickItem::opacityChanged, this, showMiddle);
    showMiddle();
}

void PresentationPanel::setLayout(const PresentationLayout &layout)
{
    m_layout = layout;
    const QRectF place = layout.panel.adjusted(-surround, -surround, surround, surround);
    setPosition(place.topLeft());
    setSize(place.size());
    // The hairline around the panel reaches half a point into it.
    const QRectF middle =
        contentRectangle().adjusted(1, std::max(layout.topRadius, 1.0), -1, -std::max(layout.bottomRadius, 1.0));
    m_middle->setPosition(middle.topLeft());
    m_middle->setSize(middle.size().expandedTo(QSizeF(0, 0)));
    update();
}

void PresentationPanel::setAppearance(bool dark)
{
    if (m_dark == dark)
        return;
    m_dark = dark;
    m_middle->setColor(panelColor(dark));
    update();
}

QRectF PresentationPanel::contentRectangle() const
{
    return {QPointF(surround, surround), m_layout.panel.size()};
}

QPainterPath PresentationPanel::outline() const
{
    const QRectF box = contentRectangle();
    const double top = m_layout.topRadius;
    const double bottom = m_layout.bottomRadius;
    const QPointF tip = m_layout.arrowTip - m_layout.panel.topLeft() + box.topLeft();
    QPainterPath path(QPointF(box.left() + top, box.top()));
    if (m_layout.arrowEdge == ArrowEdge::Top)
        addArrow(path, tip, box.top(), arrowHalfWidth);
    path.lineTo(box.right() - top, box.top());
    path.arcTo(QRectF(box.right() - 2 * top, box.top(), 2 * top, 2 * top), 90, -90);
    path.lineTo(box.right(), box.bottom() - bottom);
    path.arcTo(QRectF(box.right() - 2 * bottom, box.bottom() - 2 * bottom, 2 * bottom, 2 * bottom), 0, -90);
    if (m_layout.arrowEdge == ArrowEdge::Bottom)
        addArrow(path, tip, box.bottom(), -arrowHalfWidth);
    path.lineTo(box.left() + bottom, box.bottom());
    path.arcTo(QRectF(box.left(), box.bottom() - 2 * bottom, 2 * bottom, 2 * bottom), 270, -90);
    path.lineTo(box.left(), box.top() + top);
    path.arcTo(QRectF(box.left(), box.top(), 2 * top, 2 * top), 180, -90);
    path.closeSubpath();
    return path;
}

void PresentationPanel::paint(QPainter *painter)
{
    const QPainterPath path = outline();
    paintShadow(*painter, contentRectangle().translated(0, shadowDrop));
    painter->setRenderHint(QPainter::Antialiasing);
    // In place of the shadow, not over it: the panel may be translucent, and a clip would cost more than all the rest.
    painter->setCompositionMode(QPainter::CompositionMode_Source);
    painter->fillPath(path, panelColor(m_dark));
    painter->setCompositionMode(QPainter::CompositionMode_SourceOver);
    painter->strokePath(path, QPen(edgeColor(m_dark), 1));
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
