#pragma once

#include "host/fvcolorpickerviewcontroller.h"

#include <QObject>
#include <QPointer>
#include <QQuickItem>
#include <QQuickWindow>
#include <QtQmlIntegration/qqmlintegration.h>

namespace favrin::gallery {

/**
 * Shows one picker in one of three ways. Asking for another way ends the present one first, and the new one follows
 * when the picker has said that it finished.
 */
class PickerPresenter : public QObject
{
    Q_OBJECT
    QML_ELEMENT
    QML_UNCREATABLE("The gallery owns the presenter")

    Q_PROPERTY(Presentation presentation READ presentation NOTIFY presentationChanged)
    Q_PROPERTY(bool ready READ isReady NOTIFY readyChanged)
    Q_PROPERTY(QSizeF preferredContentSize READ preferredContentSize NOTIFY preferredContentSizeChanged)

public:
    enum class Presentation { None, Presented, Popover, Embedded };
    Q_ENUM(Presentation)

    explicit PickerPresenter(FVColorPickerViewController *picker, QObject *parent = nullptr);

    /** The way that is shown or asked for. */
    Presentation presentation() const { return m_presentation; }
    /** The picker is on screen in that way. */
    bool isReady() const;
    QSizeF preferredContentSize() const { return m_picker->preferredContentSize(); }

    Q_INVOKABLE void present(QQuickWindow *window);
    Q_INVOKABLE void presentPopover(QQuickItem *anchor);
    Q_INVOKABLE void embed(QQuickItem *container);
    Q_INVOKABLE void dismiss();

Q_SIGNALS:
    void presentationChanged();
    void readyChanged();
    void preferredContentSizeChanged();

private:
    void request(Presentation presentation, QObject *place);
    void start();
    void ended();

    FVColorPickerViewController *m_picker;
    Presentation m_presentation = Presentation::None;
    /** The window, anchor or container; it may go at any time. */
    QPointer<QObject> m_place;
    bool m_switching = false;
};

} // namespace favrin::gallery
