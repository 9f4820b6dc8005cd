#include "sliders/colormimedata.h"

#include <QColor>

#include <algorithm>
#include <cmath>

namespace favrin::sliders {
namespace {

quint16 sixteenBits(double component)
{
    return static_cast<quint16>(std::lround(std::clamp(component, 0.0, 1.0) * 0xffff));
}

} // namespace

std::unique_ptr<QMimeData> colorMimeData(const model::SomeColor &color, const QString &text)
{
    const auto sRGB = color.inSRGB();
    auto data = std::make_unique<QMimeData>();
    data->setText(text);
    data->setColorData(
        QColor::fromRgba64(sixteenBits(sRGB.r), sixteenBits(sRGB.g), sixteenBits(sRGB.b), sixteenBits(sRGB.a)));
    return data;
}

} // namespace favrin::sliders
