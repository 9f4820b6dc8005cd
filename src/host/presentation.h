#pragma once

#include "host/itemplace.h"

#include <QPointer>
#include <QQuickItem>

namespace favrin::host {

class PresentationPanel;
class PresentationScrim;
class RemoteViewItem;

/**
 * The place of one picker in a window of the app: over its content, in a popover or inside an item. Owns the items it
 * puts there, follows the window's size, and gives the focus back when it goes.
 */
class Presentation : public ItemPlace
{
    Q_OBJECT

public:
    Presentation(PresentationStyle style, QQuickItem &place);
    ~Presentation() override;

    PresentationStyle style() const override { return m_style; }
    QWindow *window() const override;
    QSizeF surroundingSize() const override;
    QRectF rectangle() const override;
    QQuickItem *view() const override;

    void setSession(RemoteViewSession *session) override;
    void takeFocus() override;
    void setPreferredContentSize(QSizeF size) override;
    void setAppearance(bool dark) override;
    void reveal(bool animated) override;

private:
    void build();
    void follow();
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
