#pragma once

#include "host/server/resource.h"

#include <map>

namespace favrin::host::server {

class Connection;
class Surface;

/** wl_touch. Positions in points of the surface; motion is held back as the pointer's is. */
class Touch
{
public:
    explicit Touch(Connection &connection);

    void bind(wl_client *client, int version, std::uint32_t id);
    void setSurface(Surface *surface);

    void down(std::uint32_t time, int finger, double x, double y);
    void move(std::uint32_t time, int finger, double x, double y);
    void up(std::uint32_t time, int finger);
    void endFrame();
    void cancel();
    void sendHeldMotion();

private:
    struct Finger
    {
        std::uint32_t time = 0;
        double x = 0.0;
        double y = 0.0;
        bool isMotionHeld = false;
    };

    static const void *requests();
    void sendMotion(int id, Finger &finger);

    Connection &m_connection;
    ResourceList m_resources;
    WeakResource m_surface;
    /** The fingers that the service knows of. */
    std::map<int, Finger> m_fingers;
    bool m_isFrameOpen = false;
};

} // namespace favrin::host::server
