#include "platform/color/color.h"

#include <algorithm>

namespace favrin::platform {

Color::Color(std::optional<ColorSpace> space, std::span<const double> components, double alpha)
    : m_space(std::move(space)), m_alpha(alpha)
{
    const std::size_t count = std::min(components.size(), this->components().size());
    std::copy_n(components.begin(), count, m_components.begin());
}

Color Color::black()
{
    const double white = 0.0;
    return Color(ColorSpace::gray(), std::span(&white, 1), 1.0);
}

std::span<const double> Color::components() const
{
    return std::span(m_components).first(m_space ? m_space->componentCount() : m_components.size());
}

bool Color::operator==(const Color &other) const
{
    return m_space == other.m_space && m_components == other.m_components && m_alpha == other.m_alpha;
}

} // namespace favrin::platform
