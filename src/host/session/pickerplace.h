#pragma once

#include <QObject>
#include <QRectF>
#include <QSizeF>

class QWindow;

namespace favrin::host {

class RemoteViewSession;

/** Where a picker stands in its window. */
enum class PresentationStyle {
    /** Over the content: a sheet at the bottom of a narrow window, a card in the middle of a wide one; or all of it. */
    Presented,
    /** In a popover that points at an item. */
    Popover,
    /** Inside an item of the app, which it fills. */
    Embedded,
};

/**
 * The place of one picker on the screen: items in a scene of the app, or a window of its own. It shows the surface of a
 * session and passes the user's input on to it. GUI thread.
 */
class PickerPlace : public QObject
{
    Q_OBJECT

public:
    using QObject::QObject;

    virtual PresentationStyle style() const = 0;
    /** Null when it has gone. */
    virtual QWindow *window() const = 0;
    /** What the picker adapts its layout to, in points: the container that it fills, otherwise the window. */
    virtual QSizeF surroundingSize() const = 0;
    /** The picker in its window's coordinates, in points. */
    virtual QRectF rectangle() const = 0;

    /** Shows another session, or nothing. */
    virtual void setSession(RemoteViewSession *session) = 0;
    virtual void takeFocus() = 0;
    /** Points; empty while the picker has not said. */
    virtual void setPreferredContentSize(QSizeF size) = 0;
    virtual void setAppearance(bool dark) = 0;
    /** Shows what was hidden so far; the picker has drawn. */
    virtual void reveal(bool animated) = 0;

Q_SIGNALS:
    /** The user touched or clicked outside of a popover. */
    void dismissRequested();
    /** The app took away the place where the picker stands. */
    void wasLost();
    /** The size or the screen is another one. */
    void changed();
};

} // namespace favrin::host
