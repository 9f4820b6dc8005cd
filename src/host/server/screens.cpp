#include "host/server/screens.h"

#include "remote/limits.h"

#include <algorithm>
#include <utility>

namespace favrin::host::server {

Screens::Screens(Connection &connection) : m_connection(connection), m_current(&outputOf(1)) {}

void Screens::setScale(int scale)
{
    scale = std::clamp(scale, 1, remote::limits::largestScale);
    if (!m_current->isBound() && m_outputs.size() == 1)
        m_current->setScale(scale);
    m_current = &outputOf(scale);
    moveSurface();
}

void Screens::setSurface(wl_resource *surface)
{
    m_surface.reset(surface);
    m_entered = nullptr;
    moveSurface();
}

Output &Screens::outputOf(int scale)
{
    for (const auto &output : m_outputs) {
        if (output->scale() == scale)
            return *output;
    }
    return *m_outputs.emplace_back(std::make_unique<Output>(m_connection, scale, [this] { moveSurface(); }));
}

void Screens::moveSurface()
{
    if (!m_surface.get() || m_current == m_entered || !m_current->isBound())
        return;
    // First the new one: a surface on no screen at all is given the first one there is.
    Output *left = std::exchange(m_entered, m_current);
    m_current->enter(m_surface.get());
    if (left)
        left->leave(m_surface.get());
}

} // namespace favrin::host::server
