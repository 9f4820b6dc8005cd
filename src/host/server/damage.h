#pragma once

#include "host/server/remoteviewserver.h"

#include <vector>

namespace favrin::host::server {

/** The part of @p rect that lies within a picture of this size; empty (0 × 0) when there is none. Any input is fine. */
PixelRect clipped(const PixelRect &rect, int width, int height);

/** What changed since the last frame: a few rectangles, in points or pixels. */
class Damage
{
public:
    void add(const PixelRect &rect);
    void add(const Damage &other);
    void clear() { m_rects.clear(); }
    /** The same in pixels of @p scale; what would overflow is as large as numbers go. */
    Damage scaledBy(int scale) const;
    /** Clipped to a picture of this size, without empty rectangles. */
    std::vector<PixelRect> within(int width, int height) const;

private:
    std::vector<PixelRect> m_rects;
};

} // namespace favrin::host::server
