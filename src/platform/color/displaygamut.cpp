#include "platform/color/displaygamut.h"

#include <atomic>

namespace favrin::platform {

namespace {
std::atomic<DisplayGamut> currentGamut = DisplayGamut::SRGB;
} // namespace

DisplayGamut displayGamut()
{
    return currentGamut;
}

void setDisplayGamut(DisplayGamut gamut)
{
    currentGamut = gamut;
}

} // namespace favrin::platform
