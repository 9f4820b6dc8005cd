#include "lens/colorlens.h"

#include "platform/shapes/dropshadow.h"
#include "service/displaycolor.h"
#include "theme/theme.h"

#include <QPainter>

#include <algorithm>

namespace favrin::lens {

using service::DisplayColor;
using theme::Theme;

namespace {

constexpr double padding = 2.0;
constexpr double ringWidth = 3.0;
constexpr double shadowBlurRadius = 2.0;
constexpr double shadowOpacity = 0.33;
/** How far the shadow can be seen beyond the ring, less the padding. */
constexpr double reach = 1.5 * shadowBlurRadius - padding;

QImage disc(QSize imageSize, const QRectF &circle, const QColor &color)
{
    QImage image(imageSize, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(color);
    painter.drawEllipse(circle);
    return image;
}

} // namespace

ColorLens::ColorLens(QQuickItem *parent) : CrispPaintedItem(parent)
{
    setOverhang(reach);
    connect(&Theme::instance(), &Theme::colorsChanged, this, [this] { repaint(); });
}

void ColorLens::setColor(const model::SomeColor &color)
{
    if (color == m_color)
        return;
    m_color = color;
    repaint();
    Q_EMIT colorChanged();
}

void ColorLens::paint(QPainter &painter, QSize size, double devicePixelRatio)
{
    const double diameter = std::min(size.width(), size.height()) - 2.0 * padding * devicePixelRatio;
    if (diameter <= 0.0)
        return;
    const int margin = overhangPixels(devicePixelRatio);
    const double inset = ringWidth * devicePixelRatio;
    QRectF circle(0.0, 0.0, diameter, diameter);
    circle.moveCenter(QRectF(QPointF(margin, margin), QSizeF(size)).center());

    const QImage ring =
        disc(size.grownBy({margin, margin, margin, margin}), circle, Theme::instance().systemBackground());
    QColor shadow = DisplayColor::instance().interfaceColor(Qt::black);
    shadow.setAlphaF(shadowOpacity);
    painter.drawImage(-margin, -margin, platform::dropShadow(ring, shadowBlurRadius * devicePixelRatio, shadow));
    painter.drawImage(-margin, -margin, ring);
    painter.setPen(Qt::NoPen);
    painter.setBrush(DisplayColor::instance().color(m_color));
    painter.drawEllipse(circle.translated(-margin, -margin).adjusted(inset, inset, -inset, -inset));
}

} // namespace favrin::lens
