#include "sliders/colormimedata.h"

#include "remote/clipboardtypes.h"

#include <QColor>

#include <algorithm>
#include <array>
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
    const std::array components = {sixteenBits(sRGB.r), sixteenBits(sRGB.g), sixteenBits(sRGB.b), sixteenBits(sRGB.a)};
    data->setColorData(QColor::fromRgba64(components[0], components[1], components[2], components[3]));
    data->setData(QLatin1String(remote::colorClipboardType),
                  QByteArray(reinterpret_cast<const char *>(components.data()), sizeof components));
    return data;
}

} // namespace favrin::sliders
