#include "grid/colorswatchcrosshairview.h"

#include "grid/roundedrectshape.h"
#include "platform/shapes/dropshadow.h"
#include "service/displaycolor.h"
#include "theme/theme.h"

#include <QPainter>

namespace favrin::grid {
namespace {

constexpr double defaultRadius = 1.0;
constexpr double maskedRadius = 8.0;
constexpr double lineWidth = 2.5;
constexpr double shadowBlurRadius = 4.0;
constexpr double shadowOpacity = 0.2;
/** Half the line and what is left of the shadow to see. */
constexpr double reach = lineWidth / 2.0 + 1.5 * shadowBlurRadius;

QImage strokedFrame(QSize imageSize, int margin, const QPainterPath &outline, const QPen &pen)
{
    QImage frame(imageSize, QImage::Format_ARGB32_Premultiplied);
    frame.fill(Qt::transparent);
    QPainter painter(&frame);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(margin, margin);
    painter.strokePath(outline, pen);
    return frame;
}

} // namespace

ColorSwatchCrosshairView::ColorSwatchCrosshairView(QQuickItem *parent) : CrispPaintedItem(parent)
{
    setOverhang(reach);
    connect(&theme::Theme::instance(), &theme::Theme::colorsChanged, this, [this] { repaint(); });
}

void ColorSwatchCrosshairView::setMaskedCorner(RectCorners corner)
{
    if (corner == m_maskedCorner)
        return;
    m_maskedCorner = corner;
    repaint();
}

void ColorSwatchCrosshairView::paint(QPainter &painter, QSize size, double devicePixelRatio)
{
    const RoundedRectShape shape = {
        .defaultRadius = defaultRadius * devicePixelRatio,
        .maskedRadius = maskedRadius * devicePixelRatio,
        .maskedCorners = m_maskedCorner,
    };
    QPen pen(theme::Theme::instance().systemBackground(), lineWidth * devicePixelRatio, Qt::SolidLine, Qt::FlatCap,
             Qt::MiterJoin);
    pen.setMiterLimit(10.0);

    const int margin = overhangPixels(devicePixelRatio);
    const QImage frame =
        strokedFrame(size.grownBy({margin, margin, margin, margin}), margin, shape.path(QRectF(QPointF(), size)), pen);
    QColor shadow = service::DisplayColor::instance().interfaceColor(Qt::black);
    shadow.setAlphaF(shadowOpacity);
    painter.drawImage(-margin, -margin, platform::dropShadow(frame, shadowBlurRadius * devicePixelRatio, shadow));
    painter.drawImage(-margin, -margin, frame);
}

} // namespace favrin::grid
