#pragma once

#include "host/server/resource.h"

#include <optional>
#include <string>

namespace favrin::host::server {

class Connection;
class Surface;

/**
 * wl_pointer. Positions in points of the surface.
 *
 * Motion that a service does not read is held back, of which the newest counts; what is not motion is always sent,
 * after the motion that belongs before it.
 */
class Pointer
{
public:
    explicit Pointer(Connection &connection);

    void bind(wl_client *client, int version, std::uint32_t id);
    void setSurface(Surface *surface);

    void enter(double x, double y);
    void leave();
    void move(std::uint32_t time, double x, double y);
    void press(std::uint32_t time, std::uint32_t button, bool pressed);
    void scroll(std::uint32_t time, double horizontal, double vertical, int horizontalDiscrete, int verticalDiscrete);
    void endFrame();
    void sendHeldMotion();

private:
    struct Position
    {
        std::uint32_t time = 0;
        double x = 0.0;
        double y = 0.0;
    };

    static const void *requests();
    void setCursor(wl_resource *pointer, wl_resource *surface);
    void sendEnter();
    void sendEnter(wl_resource *pointer);
    void sendMotion();
    bool admitsButton();
    void sendScroll(wl_resource *pointer, std::uint32_t axis, std::uint32_t time, double distance, int discrete) const;

    Connection &m_connection;
    ResourceList m_resources;
    WeakResource m_surface;
    /** Where the pointer is while it is over the picker, whether the service knows or not. */
    std::optional<Position> m_position;
    bool m_isMotionHeld = false;
    bool m_isFrameOpen = false;
    std::optional<std::string> m_cursor;
};

} // namespace favrin::host::server
