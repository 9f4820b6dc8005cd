#include "favorites/removecolorcell.h"

#include "platform/shapes/continuousroundedrect.h"
#include "platform/shapes/shapeview.h"
#include "platform/strings/localizedstring.h"
#include "theme/theme.h"

#include <QPainter>
#include <QTransform>

#include <algorithm>
#include <numbers>

namespace favrin::favorites {
namespace {

constexpr double barWidth = 3.0;
constexpr double barCornerRadius = 1.5;
constexpr double barAngle = std::numbers::pi / 4.0;

} // namespace

double slashLength(double cellHeight, bool selected)
{
    return std::max(cellHeight - (selected ? 18.0 : 8.0), 0.0);
}

QString RemoveColorCell::accessibilityLabel() const
{
    return QString::fromStdString(platform::localizedString("Remove color", "Label to clear color selection"));
}

void RemoveColorCell::paint(QPainter &painter, QSize size, double devicePixelRatio)
{
    const theme::Theme &theme = theme::Theme::instance();
    const QRect bounds(QPoint(), size);
    painter.fillRect(bounds, theme.systemGray5());

    const double length = slashLength(size.height() / devicePixelRatio, isSelected()) * devicePixelRatio;
    const double width = barWidth * devicePixelRatio;
    const QPainterPath bar = platform::continuousRoundedRect(QRectF(-width / 2.0, -length / 2.0, width, length),
                                                             barCornerRadius * devicePixelRatio);
    const QPointF center = QRectF(bounds).center();
    const QTransform turned = QTransform::fromTranslate(center.x(), center.y()).rotateRadians(barAngle);
    platform::ShapeView{turned.map(bar), theme.systemRed()}.draw(painter);
    platform::ShapeView{circularMask(bounds, isSelected(), devicePixelRatio)}.mask(painter, bounds);
}

} // namespace favrin::favorites
