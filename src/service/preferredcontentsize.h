#pragma once

#include <QSizeF>

namespace favrin::service::preferredcontentsize {

enum class Presentation { Popover, Other };

/** Whether the picker lies on its side in a host window of this size. */
bool isLandscape(QSizeF hostWindow, Presentation presentation);

/**
 * How large the picker would like to be.
 * @param intrinsic the intrinsic size of the hosted picker's view; a width of 0 or less when it has none
 * @param hostWindow gives the height of a view without intrinsic size
 */
QSizeF wanted(bool landscape, QSizeF intrinsic, QSizeF hostWindow);

/** Whether @p wanted is far enough from @p current to be worth a change of the host's layout. */
bool isWorthChanging(QSizeF current, QSizeF wanted);

/** A length from outside as a layout can bear it: what is not a number or negative is 0, and there is a largest one. */
double saneLength(double length);

} // namespace favrin::service::preferredcontentsize
