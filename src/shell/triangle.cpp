#include "shell/triangle.h"

namespace favrin::shell {

QPainterPath triangle(const QRectF &rect)
{
    QPainterPath path(rect.bottomLeft());
    path.lineTo(rect.topRight());
    path.lineTo(rect.topLeft());
    path.lineTo(rect.bottomLeft());
    path.closeSubpath();
    return path;
}

} // namespace favrin::shell
