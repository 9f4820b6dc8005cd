#pragma once

#include <QPointF>

#include <functional>
#include <optional>

class QEventPoint;
class QMouseEvent;
class QQuickItem;
class QTouchEvent;

namespace favrin::platform {

/**
 * A drag of an item by exactly one pointer: the left mouse button or one finger, whichever comes first. Other pointers
 * are ignored until it is gone. The item's event handlers call those of the same names here; hiding or disabling the
 * item takes the pointer away from it and so ends the drag.
 */
class OnePointerDrag
{
public:
    /** Where the pointer is, in the item's coordinates; called at the press and at every motion. */
    using Moved = std::function<void(QPointF location)>;
    /** The pointer lifted, or was taken away. */
    using Ended = std::function<void()>;

    /** Makes @p item accept the pointers. It must outlive this, as the owner of a member does. */
    OnePointerDrag(QQuickItem &item, Moved moved, Ended ended);

    bool isActive() const { return m_pointer.has_value(); }

    void mousePress(const QMouseEvent &event);
    void mouseMove(const QMouseEvent &event);
    /** For the release of the button, too. */
    void mouseUngrab();
    void touch(QTouchEvent &event);
    void touchUngrab();

private:
    /** The mouse, or a touch point by its id. */
    struct Pointer
    {
        enum class Device { Mouse, Touch } device = Device::Mouse;
        int id = 0;

        bool operator==(const Pointer &) const = default;
    };

    void handlePoint(const QEventPoint &point);
    void begin(Pointer pointer, QPointF location);
    void end();

    QQuickItem &m_item;
    Moved m_moved;
    Ended m_ended;
    std::optional<Pointer> m_pointer;
};

} // namespace favrin::platform
