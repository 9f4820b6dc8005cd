#include "sliders/opacitybackground.h"

#include "service/displaycolor.h"

#include <QPainter>

#include <algorithm>
#include <cmath>

namespace favrin::sliders {

using model::SomeColor;

int OpacityBackground::squareCount(double extent) const
{
    return std::max(static_cast<int>(extent / squareSize), 2) + 1;
}

SomeColor OpacityBackground::color(int row, int column) const
{
    if ((row + column) % 2 == 0)
        return squareColor;
    const double tone = colorScheme == service::ColorScheme::Light ? 1.0 : 0.0;
    return {tone, tone, tone, 1.0, SomeColor::ColorSpace::sRGB};
}

void OpacityBackground::paint(QPainter &painter, QSize size, double devicePixelRatio,
                              Qt::LayoutDirection direction) const
{
    const auto edge = [&](int index) { return static_cast<int>(std::round(index * squareSize * devicePixelRatio)); };
    const QColor colors[] = {service::DisplayColor::instance().color(color(0, 0)),
                             service::DisplayColor::instance().color(color(0, 1))};
    for (int row = 0; row < squareCount(size.height() / devicePixelRatio); ++row) {
        for (int column = 0; column < squareCount(size.width() / devicePixelRatio); ++column) {
            QRect square(QPoint(edge(column), edge(row)), QPoint(edge(column + 1) - 1, edge(row + 1) - 1));
            if (direction == Qt::RightToLeft)
                square.moveLeft(size.width() - edge(column + 1));
            painter.fillRect(square, colors[(row + column) % 2]);
        }
    }
}

} // namespace favrin::sliders
