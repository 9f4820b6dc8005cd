#pragma once

#include "host/itemplace.h"

#include <QPointer>
#include <QQuickItem>

namespace favrin::fake {

/** Among the items of a scene: an item without a picture, placed and sized as that of a real picker. */
class ScriptedPlace : public host::ItemPlace
{
    Q_OBJECT

public:
    ScriptedPlace(host::PresentationStyle style, QQuickItem &place);
    ~ScriptedPlace() override;

    host::PresentationStyle style() const override { return m_style; }
    QWindow *window() const override;
    QSizeF surroundingSize() const override;
    QRectF rectangle() const override;
    QQuickItem *view() const override { return m_view; }

    void setSession(host::RemoteViewSession *) override {}
    void takeFocus() override {}
    void setPreferredContentSize(QSizeF size) override;
    void setAppearance(bool) override {}
    void reveal(bool) override {}

private:
    host::PresentationStyle m_style;
    QPointer<QQuickItem> m_place;
    QPointer<QQuickItem> m_view;
};

} // namespace favrin::fake
