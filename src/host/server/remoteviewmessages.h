#pragma once

#include "remote/records.h"
#include "remote/wirecolor.h"

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

#include <wayland-server-core.h>

/** The host's messages as events of favrin_remote_view_v1. Records must be sane already. */
namespace favrin::host::server {

void postTraits(wl_resource *view, const remote::Traits &traits);
void postSelectedColor(wl_resource *view, const std::optional<platform::Color> &color,
                       const std::optional<std::string> &colorspace);

/** One configuration, which must live as long, as the row of events that it travels in. */
class ConfigurationMessages
{
public:
    explicit ConfigurationMessages(const remote::Configuration &configuration);
    /** What they take on the wire, or a little more. */
    std::size_t bytes() const;
    void post(wl_resource *view) const;

private:
    const remote::Configuration &m_configuration;
    std::vector<remote::WireColorRun> m_runs;
};

} // namespace favrin::host::server
