#pragma once

#include <QPointer>
#include <QQuickItem>
#include <QtQmlIntegration/qqmlintegration.h>

namespace favrin::shell {

/** Says where something that scrolls must be for the user to see what has the keyboard. Lengths in points. */
class FocusReveal : public QObject
{
    Q_OBJECT
    QML_ELEMENT
    /** What scrolls. */
    Q_PROPERTY(QQuickItem *content READ content WRITE setContent NOTIFY contentChanged REQUIRED FINAL)

public:
    using QObject::QObject;

    QQuickItem *content() const { return m_content; }
    void setContent(QQuickItem *content);

    /**
     * The position that is next to @p current and shows the item. It is @p current itself where all can be seen, and
     * where a pointer brought the focus to an item: nothing moves under a finger, except for a text field, which the
     * keyboard would cover.
     */
    Q_INVOKABLE double position(double current, double viewHeight, double contentHeight) const;

Q_SIGNALS:
    void contentChanged();

private:
    QPointer<QQuickItem> m_content;
};

} // namespace favrin::shell
