#include "favorites/addcolorcell.h"

#include "platform/shapes/shapeview.h"
#include "platform/strings/localizedstring.h"
#include "service/displaycolor.h"

#include <QPainter>

#include <algorithm>
#include <cmath>

namespace favrin::favorites {
namespace {

constexpr double discGray = 0.85;
constexpr double plusGray = 0.29;
/** Of the strokes, as of a bold sign in text of 17 points. */
constexpr double plusExtent = 14.0;
constexpr double plusWidth = 2.5;

QColor gray(double level)
{
    return service::DisplayColor::instance().color({level, level, level, 1.0, model::SomeColor::ColorSpace::sRGB});
}

/** The nearest number of whole pixels that leaves as many on either side: all edges are sharp. */
double sharpExtent(double extent, int available)
{
    const int odd = available % 2;
    return 2.0 * std::round((extent - odd) / 2.0) + odd;
}

/** A bar with round ends across the middle of @p bounds. */
QPainterPath bar(const QRectF &bounds, double width, double height)
{
    QRectF area(0.0, 0.0, width, height);
    area.moveCenter(bounds.center());
    QPainterPath path;
    const double radius = std::min(width, height) / 2.0;
    path.addRoundedRect(area, radius, radius);
    return path;
}

} // namespace

QString AddColorCell::accessibilityLabel() const
{
    return QString::fromStdString(platform::localizedString(
        "Add selected color to favorites", "This button adds the currently selected color to the list of favorites"));
}

void AddColorCell::paint(QPainter &painter, QSize size, double devicePixelRatio)
{
    const QRect bounds(QPoint(), size);
    painter.fillRect(bounds, gray(discGray));
    const double extent = sharpExtent(plusExtent * devicePixelRatio, size.width());
    const double width = sharpExtent(plusWidth * devicePixelRatio, size.width());
    const QRectF area(bounds);
    platform::ShapeView{bar(area, extent, width).united(bar(area, width, extent)), gray(plusGray)}.draw(painter);
    const int diameter = std::min(size.width(), size.height());
    platform::ShapeView{circularMask(QRectF(0.0, 0.0, diameter, diameter), false, devicePixelRatio)}.mask(painter,
                                                                                                          bounds);
}

} // namespace favrin::favorites
