#include "lens/colorlens.h"

#include "lens/lenspicture.h"
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
    QColor shadow = DisplayColor::instance().interfaceColor(Qt::black);
    shadow.setAlphaF(shadowOpacity);

    const LensFrame frame = {.size = size.grownBy({margin, margin, margin, margin}),
                             .circle = circle,
                             .shadowBlurRadius = shadowBlurRadius * devicePixelRatio,
                             .ring = Theme::instance().systemBackground(),
                             .shadow = shadow};
    const QImage picture = image(LensPicture{.frame = frame,
                                             .disc = circle.adjusted(inset, inset, -inset, -inset),
                                             .color = DisplayColor::instance().color(m_color)});
    painter.drawImage(-margin, -margin, picture);
}

} // namespace favrin::lens
