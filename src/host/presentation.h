#pragma once

#include "host/presentationlayout.h"

#include <QObject>
#include <QPointer>
#include <QSizeF>

#include <memory>

class QQuickItem;
class QQuickWindow;

namespace favrin::host {

class PresentationPanel;
class PresentationScrim;
class RemoteViewItem;

/**
 * The place of one picker in a window of the app: over its content, in a popover or inside an item. Owns the items it
 * puts there, follows the window's size, and gives the focus back when it goes.
 */
class Presentation : public QObject
{
    Q_OBJECT

public:
    /** @p place is the anchor of a popover or the container of an embedded picker, else the window's content. */
    Presentation(PresentationStyle style, QQuickItem &place, QObject *parent = nullptr);
    ~Presentation() override;

    PresentationStyle style() const { return m_style; }
    QQuickWindow *window() const;
    RemoteViewItem *view() const { return m_view.data(); }
    /** What the picker adapts its layout to: the container that it is embedded in, otherwise the window. */
    QSizeF surroundingSize() const;

    void setPreferredContentSize(QSizeF size);
    void setAppearance(bool dark);
    /** Shows what was hidden so far; the picker has drawn. */
    void reveal(bool animated);

Q_SIGNALS:
    /** The user touched or clicked outside of a popover. */
    void dismissRequested();
    /** The app took away the place where the picker stands. */
    void placeWasLost();

private:
    void build();
    void layOut();

    PresentationStyle m_style;
    QPointer<QQuickItem> m_place;
    QPointer<QQuickItem> m_parentItem;
    QPointer<QQuickItem> m_focusBefore;
    QPointer<PresentationScrim> m_scrim;
    QPointer<PresentationPanel> m_panel;
    QPointer<RemoteViewItem> m_view;
    QSizeF m_preferredContentSize;
};

} // namespace favrin::host
