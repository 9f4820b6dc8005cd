#include "platform/shapes/dropshadow.h"

#include <algorithm>
#include <cmath>
#include <vector>

namespace favrin::platform {
namespace {

/** One running mean of @p width values along a line of @p count values that lie @p stride apart; zero beyond the ends.
 */
void boxBlur(float *values, int count, int stride, int width, std::vector<float> &scratch)
{
    const int before = width / 2;
    float sum = 0.0F;
    for (int i = 0; i < std::min(width - before, count); ++i)
        sum += values[i * stride];
    for (int i = 0; i < count; ++i) {
        scratch[static_cast<std::size_t>(i)] = sum / static_cast<float>(width);
        const int entering = i + width - before;
        const int leaving = i - before;
        sum += entering < count ? values[entering * stride] : 0.0F;
        sum -= leaving >= 0 ? values[leaving * stride] : 0.0F;
    }
    for (int i = 0; i < count; ++i)
        values[i * stride] = scratch[static_cast<std::size_t>(i)];
}

/** Three running means come within 3 % of a Gaussian; an odd width keeps the shadow centered. */
int boxWidth(double blurRadius)
{
    const double deviation = blurRadius / 2.0;
    const int width = static_cast<int>(std::lround(std::sqrt(4.0 * deviation * deviation + 1.0)));
    return width | 1;
}

} // namespace

QImage dropShadow(const QImage &shape, double blurRadius, const QColor &color)
{
    const QImage alpha = shape.convertToFormat(QImage::Format_Alpha8);
    const int width = alpha.width();
    const int height = alpha.height();
    std::vector<float> coverage;
    coverage.reserve(static_cast<std::size_t>(width) * static_cast<std::size_t>(height));
    for (int y = 0; y < height; ++y)
        coverage.insert(coverage.end(), alpha.constScanLine(y), alpha.constScanLine(y) + width);

    std::vector<float> scratch(static_cast<std::size_t>(std::max(width, height)));
    const int box = boxWidth(blurRadius);
    for (int pass = 0; pass < 3 && box > 1; ++pass) {
        for (int y = 0; y < height; ++y)
            boxBlur(coverage.data() + static_cast<std::ptrdiff_t>(y) * width, width, 1, box, scratch);
        for (int x = 0; x < width; ++x)
            boxBlur(coverage.data() + x, height, width, box, scratch);
    }

    QImage shadow(shape.size(), QImage::Format_ARGB32_Premultiplied);
    const auto *value = coverage.data();
    for (int y = 0; y < height; ++y) {
        auto *line = reinterpret_cast<QRgb *>(shadow.scanLine(y));
        for (int x = 0; x < width; ++x, ++value) {
            const int opacity = static_cast<int>(std::lround(std::clamp(*value, 0.0F, 255.0F) * color.alphaF()));
            line[x] = qPremultiply(qRgba(color.red(), color.green(), color.blue(), opacity));
        }
    }
    return shadow;
}

} // namespace favrin::platform
