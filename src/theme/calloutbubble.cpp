#include "theme/calloutbubble.h"

#include "platform/shapes/continuousroundedrect.h"
#include "platform/shapes/dropshadow.h"
#include "service/displaycolor.h"
#include "theme/theme.h"

#include <QPainter>
#include <QPainterPath>

#include <algorithm>

namespace favrin::theme {
namespace {

constexpr double cornerRadius = 10.0;
constexpr double arrowExtent = 8.0;
constexpr double arrowBase = 18.0;
constexpr double shadowBlurRadius = 16.0;
constexpr double shadowOpacity = 0.28;

/** @param point pixels to a point */
QPainterPath outline(QSizeF size, double arrowX, double point)
{
    const double bottom = size.height() - arrowExtent * point;
    const QPainterPath box =
        platform::continuousRoundedRect(QRectF(0.0, 0.0, size.width(), bottom), cornerRadius * point);
    const double half = arrowBase * point / 2.0;
    const double room = std::min(half + cornerRadius * point, size.width() / 2.0);
    const double tip = std::clamp(arrowX * point, room, size.width() - room);
    QPainterPath arrow(QPointF(tip - half, bottom - point));
    arrow.lineTo(tip, size.height());
    arrow.lineTo(tip + half, bottom - point);
    arrow.closeSubpath();
    return box.united(arrow);
}

} // namespace

CalloutBubble::CalloutBubble(QQuickItem *parent) : CrispPaintedItem(parent)
{
    setOverhang(1.5 * shadowBlurRadius);
    connect(&Theme::instance(), &Theme::colorsChanged, this, [this] { repaint(); });
}

double CalloutBubble::arrowHeight() const
{
    return arrowExtent;
}

void CalloutBubble::setArrowX(double x)
{
    if (x == m_arrowX)
        return;
    m_arrowX = x;
    repaint();
    Q_EMIT arrowXChanged();
}

void CalloutBubble::paint(QPainter &painter, QSize size, double devicePixelRatio)
{
    const Theme &theme = Theme::instance();
    const QPainterPath path = outline(size, m_arrowX, devicePixelRatio);
    const int margin = overhangPixels(devicePixelRatio);
    QImage face(size.grownBy({margin, margin, margin, margin}), QImage::Format_ARGB32_Premultiplied);
    face.fill(Qt::transparent);
    QPainter facePainter(&face);
    facePainter.setRenderHint(QPainter::Antialiasing);
    facePainter.translate(margin, margin);
    facePainter.fillPath(path, theme.systemBackground());
    facePainter.strokePath(path, QPen(theme.separator(), 1.0));
    facePainter.end();

    QColor shadow = service::DisplayColor::instance().interfaceColor(Qt::black);
    shadow.setAlphaF(shadowOpacity);
    painter.drawImage(-margin, -margin, platform::dropShadow(face, shadowBlurRadius * devicePixelRatio, shadow));
    painter.drawImage(-margin, -margin, face);
}

} // namespace favrin::theme
