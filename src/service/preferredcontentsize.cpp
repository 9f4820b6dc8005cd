#include "service/preferredcontentsize.h"

#include "remote/limits.h"

#include <algorithm>
#include <cmath>

namespace favrin::service::preferredcontentsize {

namespace {

constexpr double portraitWidth = 360.0;
constexpr double landscapeWidth = 568.0;
constexpr double widestPortraitWindow = 450.0;
/** Smaller changes are not worth the host's animation. */
constexpr double smallestChange = 15.0;

} // namespace

bool isLandscape(QSizeF hostWindow, Presentation presentation)
{
    return hostWindow.height() < hostWindow.width() && presentation != Presentation::Popover &&
           hostWindow.width() > widestPortraitWindow;
}

QSizeF wanted(bool landscape, QSizeF intrinsic, QSizeF hostWindow)
{
    const double height = intrinsic.width() > 0.0 ? intrinsic.height() : hostWindow.height();
    return {landscape ? landscapeWidth : portraitWidth, saneLength(height)};
}

bool isWorthChanging(QSizeF current, QSizeF wanted)
{
    return std::abs(current.height() - wanted.height()) >= smallestChange ||
           std::abs(current.width() - wanted.width()) >= smallestChange;
}

double saneLength(double length)
{
    return std::isfinite(length) ? std::clamp(length, 0.0, remote::limits::largestSize) : 0.0;
}

} // namespace favrin::service::preferredcontentsize
