#pragma once

#include <QColor>

namespace favrin::host {

/**
 * What lies behind a picker that has a panel or a window of its own. Opaque, with the material that a picker may want
 * and without: nothing behind it is blurred, and what showed through would only look like dirt. The picker's fields
 * stand out from it.
 */
constexpr QColor panelColor(bool dark)
{
    return dark ? QColor(0x26, 0x26, 0x29) : QColor(0xf2, 0xf2, 0xf6);
}

} // namespace favrin::host
