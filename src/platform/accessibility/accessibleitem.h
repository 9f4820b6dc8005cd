#pragma once

#include <QAccessibleObject>

class QQuickItem;

namespace favrin::platform {

/**
 * A focusable item as assistive technologies see it: where it is, in what, and whether it can be used. It has no
 * children; a view that has some says so itself.
 */
class AccessibleItem : public QAccessibleObject
{
public:
    explicit AccessibleItem(QQuickItem *item);

    QWindow *window() const override;
    /** The nearest item around this one that is seen by assistive technologies, otherwise the window. */
    QAccessibleInterface *parent() const override;
    int childCount() const override { return 0; }
    QAccessibleInterface *child(int) const override { return nullptr; }
    int indexOfChild(const QAccessibleInterface *) const override { return -1; }
    QRect rect() const override;
    QAccessible::State state() const override;

protected:
    QQuickItem *item() const;
};

} // namespace favrin::platform
