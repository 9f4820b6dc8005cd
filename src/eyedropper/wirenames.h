#pragma once

#include <QString>

/**
 * The names that the picker and the eyedropper service know each other by on the session bus. A client has no name of
 * its own there: the service answers whoever called, at the client's path.
 */
namespace favrin::eyedropper {

inline constexpr QLatin1String serviceName("com.quenta.favrin.lorvand.service");
inline constexpr QLatin1String servicePath("/com/quenta/favrin/lorvand/service");
inline constexpr QLatin1String clientPath("/com/quenta/favrin/lorvand/client");

inline constexpr QLatin1String serverInterface("com.quenta.favrin.lorvand.EDServiceServer");
inline constexpr QLatin1String clientInterface("com.quenta.favrin.lorvand.EDServerClient");
inline constexpr QLatin1String availabilityInterface("com.quenta.favrin.lorvand.EyedropperAvailability");

} // namespace favrin::eyedropper
