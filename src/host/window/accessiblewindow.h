#pragma once

#include <QAccessibleObject>

namespace favrin::host {

/** The window of a picker for assistive technology, under its title; what is in it, the picker's process tells itself.
 */
class AccessibleWindow : public QAccessibleObject
{
public:
    explicit AccessibleWindow(QObject *window);

    /** Once: every window of this kind is told of so. */
    static void install();

    QAccessible::Role role() const override;
    QAccessible::State state() const override;
    QString text(QAccessible::Text kind) const override;
    QRect rect() const override;
    QWindow *window() const override;
    QAccessibleInterface *parent() const override;
    QAccessibleInterface *child(int) const override { return nullptr; }
    int childCount() const override { return 0; }
    int indexOfChild(const QAccessibleInterface *) const override { return -1; }
};

} // namespace favrin::host
