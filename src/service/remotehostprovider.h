#pragma once

#include <functional>

namespace favrin::remote {
class RemoteHost;
}

namespace favrin::service {

/** Asked anew at each send; null while no host is connected. */
using RemoteHostProvider = std::function<remote::RemoteHost *()>;

} // namespace favrin::service
