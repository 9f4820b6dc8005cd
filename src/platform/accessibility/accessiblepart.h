#pragma once

#include <QAccessibleInterface>
#include <QPointer>
#include <QQuickItem>

namespace favrin::platform {

/**
 * A part of an item as assistive technologies see it, where the part is no object of its own: a childless child of the
 * item with actions. It may outlive the item, and then says that it is invalid.
 */
class AccessiblePart : public QAccessibleInterface, public QAccessibleActionInterface
{
public:
    explicit AccessiblePart(QQuickItem &item);

    bool isValid() const override { return !m_item.isNull(); }
    QObject *object() const override { return nullptr; }
    QWindow *window() const override;
    QAccessibleInterface *parent() const override;
    QAccessibleInterface *child(int) const override { return nullptr; }
    QAccessibleInterface *childAt(int, int) const override { return nullptr; }
    int childCount() const override { return 0; }
    int indexOfChild(const QAccessibleInterface *) const override { return -1; }
    void setText(QAccessible::Text, const QString &) override {}
    QRect rect() const override;
    QAccessible::State state() const override;
    void *interface_cast(QAccessible::InterfaceType type) override;

    QStringList keyBindingsForAction(const QString &) const override { return {}; }

protected:
    /** None when it is gone. */
    QQuickItem *item() const { return m_item; }

private:
    /** The part's area in the coordinates of the item, which is there when this is called. */
    virtual QRectF area() const;

    QPointer<QQuickItem> m_item;
};

} // namespace favrin::platform
