#pragma once

#include "host/server/output.h"

#include <memory>
#include <vector>

namespace favrin::host::server {

/**
 * The screens between which the picker moves when the host's scale changes: one for each scale there has been.
 *
 * A screen that changes its scale would say the same, but Qt's client draws with a new scale only on another screen.
 */
class Screens
{
public:
    explicit Screens(Connection &connection);

    /** Clamped to 1 … remote::limits::largestScale. */
    void setScale(int scale);
    /** The surface that is to be on the screen of the current scale. */
    void setSurface(wl_resource *surface);

private:
    Output &outputOf(int scale);
    void moveSurface();

    Connection &m_connection;
    std::vector<std::unique_ptr<Output>> m_outputs;
    Output *m_current;
    /** Where the service believes its surface to be. */
    Output *m_entered = nullptr;
    WeakResource m_surface;
};

} // namespace favrin::host::server
