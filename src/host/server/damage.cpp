#include "host/server/damage.h"

#include "host/server/serverlimits.h"

#include <algorithm>
#include <cstdint>
#include <limits>

namespace favrin::host::server {

namespace {

int saturated(std::int64_t value)
{
    using Limits = std::numeric_limits<int>;
    return static_cast<int>(std::clamp<std::int64_t>(value, Limits::min(), Limits::max()));
}

std::int64_t rightOf(const PixelRect &rect)
{
    return std::int64_t(rect.x) + rect.width;
}

std::int64_t bottomOf(const PixelRect &rect)
{
    return std::int64_t(rect.y) + rect.height;
}

PixelRect united(const PixelRect &a, const PixelRect &b)
{
    const int x = std::min(a.x, b.x);
    const int y = std::min(a.y, b.y);
    return {x, y, saturated(std::max(rightOf(a), rightOf(b)) - x), saturated(std::max(bottomOf(a), bottomOf(b)) - y)};
}

bool isEmpty(const PixelRect &rect)
{
    return rect.width <= 0 || rect.height <= 0;
}

} // namespace

PixelRect clipped(const PixelRect &rect, int width, int height)
{
    const std::int64_t left = std::max(rect.x, 0);
    const std::int64_t top = std::max(rect.y, 0);
    const std::int64_t right = std::min<std::int64_t>(rightOf(rect), width);
    const std::int64_t bottom = std::min<std::int64_t>(bottomOf(rect), height);
    if (isEmpty(rect) || right <= left || bottom <= top)
        return {};
    return {saturated(left), saturated(top), saturated(right - left), saturated(bottom - top)};
}

void Damage::add(const PixelRect &rect)
{
    if (isEmpty(rect))
        return;
    m_rects.push_back(rect);
    if (m_rects.size() <= limits::damageRectangles)
        return;
    PixelRect box = m_rects.front();
    for (const PixelRect &other : m_rects)
        box = united(box, other);
    m_rects = {box};
}

void Damage::add(const Damage &other)
{
    for (const PixelRect &rect : other.m_rects)
        add(rect);
}

Damage Damage::scaledBy(int scale) const
{
    const auto times = [scale](int value) { return saturated(std::int64_t(value) * scale); };
    Damage result;
    for (const PixelRect &rect : m_rects)
        result.m_rects.push_back({times(rect.x), times(rect.y), times(rect.width), times(rect.height)});
    return result;
}

std::vector<PixelRect> Damage::within(int width, int height) const
{
    std::vector<PixelRect> result;
    for (const PixelRect &rect : m_rects) {
        if (const PixelRect inside = clipped(rect, width, height); !isEmpty(inside))
            result.push_back(inside);
    }
    return result;
}

} // namespace favrin::host::server
