#pragma once

#include "platform/color/color.h"

#include <QVariantMap>

#include <optional>

namespace favrin::eyedropper {

/** What the desktop answered to the request for a color. */
enum class PortalResponse : unsigned { Success = 0, Cancelled = 1, Failed = 2 };

/**
 * The color in the results of the desktop's pick, three numbers in sRGB; none when they are missing, of another type,
 * or not all finite. Each is brought into 0…1 and rounded to the nearest of 65,535 steps, which undoes the traces of
 * single precision that desktops leave, and keeps eight bits exactly.
 */
std::optional<platform::Color> colorOfPortal(const QVariantMap &results);

/** One number of such a color. */
double roundedComponent(double value);

} // namespace favrin::eyedropper
