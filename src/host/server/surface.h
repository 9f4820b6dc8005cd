#pragma once

#include "host/server/damage.h"
#include "host/server/resource.h"

#include <functional>

namespace favrin::host::server {

class Compositor;
class Surface;
struct ShmPixels;

/** What a surface is used for; it never changes. */
enum class SurfaceRole { None, Toplevel, Popup, Cursor, DragIcon };

/** Told what its surface does. */
class SurfaceObserver
{
public:
    virtual ~SurfaceObserver() = default;
    /** Before anything of a commit takes effect; false, with an error posted, refuses it. */
    virtual bool surfaceMayCommit(bool withBuffer) = 0;
    virtual void surfaceDidCommit() = 0;
    virtual void surfaceWillGo() = 0;
};

/** wl_surface: what is attached and damaged takes effect at a commit; the newest commit of a turn is shown. */
class Surface : public Resource
{
public:
    Surface(wl_resource *handle, Compositor &compositor);
    ~Surface() override;

    SurfaceRole role() const { return m_role; }
    /** False when it has another role already. */
    bool takeRole(SurfaceRole role);
    void setObserver(SurfaceObserver *observer) { m_observer = observer; }
    bool hasObserver() const { return m_observer != nullptr; }

    /** Something is attached; the newest content may still wait to be taken. */
    bool hasContent() const { return m_hasContent; }
    /** Shows what changed since the last time to @p take, if anything did, and lets the buffer go. */
    void takeFrame(const std::function<void(const Frame &)> &take);
    /** Lets the buffer go without looking at it. */
    void dropFrame();

    bool hasFrameCallbacks() const { return !m_frameCallbacks.isEmpty(); }
    /** Answers the frame callbacks of all commits so far. */
    void answerFrameCallbacks(std::uint32_t milliseconds);

private:
    struct Pending
    {
        bool isAttached = false;
        WeakResource buffer;
        Damage damageInPoints;
        Damage damageInPixels;
        int scale = 1;
        ResourceList frameCallbacks;
    };

    static const void *requests();
    void attach(wl_resource *buffer);
    void setScale(std::int32_t scale);
    void setTransform(std::int32_t transform);
    void requestFrame(wl_client *client, std::uint32_t id);
    void commit();
    void commitBuffer();
    Frame frameOf(const ShmPixels &pixels) const;

    Compositor &m_compositor;
    SurfaceRole m_role = SurfaceRole::None;
    SurfaceObserver *m_observer = nullptr;
    Pending m_pending;
    /** Committed, and not shown yet. */
    WeakResource m_buffer;
    Damage m_damage;
    int m_scale = 1;
    bool m_hasContent = false;
    /** Pixels of the last frame taken. */
    int m_takenWidth = 0;
    int m_takenHeight = 0;
    ResourceList m_frameCallbacks;
};

} // namespace favrin::host::server
