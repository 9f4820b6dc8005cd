#include "host/server/surface.h"

#include "host/server/compositor.h"
#include "host/server/connection.h"
#include "host/server/shmpixels.h"
#include "remote/limits.h"

#include <wayland-server-protocol.h>

namespace favrin::host::server {

namespace {

Surface &surfaceOf(wl_resource *resource)
{
    return *Resource::of<Surface>(resource);
}

void destroyAll(ResourceList &list)
{
    list.forEach([](wl_resource *resource) { wl_resource_destroy(resource); });
}

} // namespace

const void *Surface::requests()
{
    static const struct wl_surface_interface table = [] {
        struct wl_surface_interface requests = {};
        requests.destroy = destroyRequest;
        requests.attach = [](wl_client *, wl_resource *r, wl_resource *buffer, std::int32_t, std::int32_t) {
            surfaceOf(r).attach(buffer);
        };
        requests.damage = [](wl_client *, wl_resource *r, std::int32_t x, std::int32_t y, std::int32_t width,
                             std::int32_t height) {
            surfaceOf(r).m_pending.damageInPoints.add({x, y, width, height});
        };
        requests.frame = [](wl_client *client, wl_resource *r, std::uint32_t id) {
            surfaceOf(r).requestFrame(client, id);
        };
        // What shines through and where input goes is the host's own business: it shows one rectangle.
        requests.set_opaque_region = [](wl_client *, wl_resource *, wl_resource *) {};
        requests.set_input_region = [](wl_client *, wl_resource *, wl_resource *) {};
        requests.commit = [](wl_client *, wl_resource *r) { surfaceOf(r).commit(); };
        requests.set_buffer_transform = [](wl_client *, wl_resource *r, std::int32_t transform) {
            surfaceOf(r).setTransform(transform);
        };
        requests.set_buffer_scale = [](wl_client *, wl_resource *r, std::int32_t scale) {
            surfaceOf(r).setScale(scale);
        };
        requests.damage_buffer = [](wl_client *, wl_resource *r, std::int32_t x, std::int32_t y, std::int32_t width,
                                    std::int32_t height) {
            surfaceOf(r).m_pending.damageInPixels.add({x, y, width, height});
        };
        return requests;
    }();
    return &table;
}

Surface::Surface(wl_resource *handle, Compositor &compositor) : Resource(handle, requests()), m_compositor(compositor)
{
    m_compositor.surfaceWasMade(*this);
}

Surface::~Surface()
{
    if (m_observer)
        m_observer->surfaceWillGo();
    m_compositor.surfaceWillGo(*this);
    destroyAll(m_pending.frameCallbacks);
    destroyAll(m_frameCallbacks);
}

bool Surface::takeRole(SurfaceRole role)
{
    if (m_role != SurfaceRole::None && m_role != role)
        return false;
    m_role = role;
    return true;
}

void Surface::takeFrame(const std::function<void(const Frame &)> &take)
{
    if (!m_buffer.get())
        return;
    readShmBuffer(m_buffer.get(), [&](const ShmPixels &pixels) {
        const Frame frame = frameOf(pixels);
        m_takenWidth = frame.width;
        m_takenHeight = frame.height;
        if (!frame.damage.empty())
            take(frame);
    });
    dropFrame();
}

void Surface::dropFrame()
{
    if (m_buffer.get() && m_compositor.connection().admitsEvent())
        wl_buffer_send_release(m_buffer.get());
    m_buffer.reset();
    m_damage.clear();
}

void Surface::answerFrameCallbacks(std::uint32_t milliseconds)
{
    m_frameCallbacks.forEach([&](wl_resource *callback) {
        if (m_compositor.connection().admitsEvent())
            wl_callback_send_done(callback, milliseconds);
        wl_resource_destroy(callback);
    });
}

void Surface::attach(wl_resource *buffer)
{
    if (buffer && !checkShmBuffer(buffer))
        return;
    m_pending.isAttached = true;
    m_pending.buffer.reset(buffer);
}

void Surface::setScale(std::int32_t scale)
{
    if (scale < 1 || scale > remote::limits::largestScale)
        wl_resource_post_error(handle(), WL_SURFACE_ERROR_INVALID_SCALE, "a scale of %d", scale);
    else
        m_pending.scale = scale;
}

void Surface::setTransform(std::int32_t transform)
{
    // The output is never rotated, so that there is no reason to draw for a rotated one.
    if (transform != WL_OUTPUT_TRANSFORM_NORMAL)
        wl_resource_post_error(handle(), WL_SURFACE_ERROR_INVALID_TRANSFORM, "a transform of %d", transform);
}

void Surface::requestFrame(wl_client *client, std::uint32_t id)
{
    m_pending.frameCallbacks.add(client, wl_callback_interface, 1, id, nullptr, nullptr);
}

void Surface::commit()
{
    const bool withBuffer = m_pending.isAttached && m_pending.buffer.get();
    if (m_observer && !m_observer->surfaceMayCommit(withBuffer))
        return;
    m_scale = m_pending.scale;
    commitBuffer();
    m_frameCallbacks.takeAll(m_pending.frameCallbacks);
    if (m_observer)
        m_observer->surfaceDidCommit();
}

void Surface::commitBuffer()
{
    if (m_pending.isAttached) {
        wl_resource *next = m_pending.buffer.get();
        if (m_buffer.get() && m_buffer.get() != next && m_compositor.connection().admitsEvent())
            wl_buffer_send_release(m_buffer.get());
        m_buffer.reset(next);
        m_hasContent = next != nullptr;
        if (!next)
            m_takenWidth = m_takenHeight = 0;
    }
    m_damage.add(m_pending.damageInPoints.scaledBy(m_scale));
    m_damage.add(m_pending.damageInPixels);
    m_pending.damageInPoints.clear();
    m_pending.damageInPixels.clear();
    m_pending.isAttached = false;
    m_pending.buffer.reset();
}

Frame Surface::frameOf(const ShmPixels &pixels) const
{
    const bool isAllNew = pixels.width != m_takenWidth || pixels.height != m_takenHeight;
    Frame frame = {pixels.data, pixels.width, pixels.height, pixels.stride, m_scale, pixels.opaque, {}};
    if (isAllNew)
        frame.damage = {{0, 0, pixels.width, pixels.height}};
    else
        frame.damage = m_damage.within(pixels.width, pixels.height);
    return frame;
}

} // namespace favrin::host::server
