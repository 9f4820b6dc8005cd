#pragma once

#include "host/presentationlayout.h"

#include <QColor>
#include <QQuickPaintedItem>

namespace favrin::host {

/** The panel behind a picker: rounded, with its arrow and shadow. Takes what falls on it. */
class PresentationPanel : public QQuickPaintedItem
{
    Q_OBJECT

public:
    explicit PresentationPanel(QQuickItem *parent);

    /** The panel's place in its parent; the item is larger by the shadow and the arrow. */
    void setLayout(const PresentationLayout &layout);
    void setAppearance(bool dark);

    /** Where the picker stands, in this item's coordinates. */
    QRectF contentRectangle() const;

    void paint(QPainter *painter) override;

protected:
    void mousePressEvent(QMouseEvent *event) override;
    void wheelEvent(QWheelEvent *event) override;

private:
    class Middle;

    QPainterPath outline() const;

    Middle *m_middle;
    PresentationLayout m_layout;
    bool m_dark = false;
};

} // namespace favrin::host
