#pragma once

#include "platform/shapes/crisppainteditem.h"

#include <QPainterPath>
#include <QString>

namespace favrin::favorites {

/** The mask of a cell: its disc; of a selected one a ring, a gap in which nothing shows, and a disc. */
QPainterPath circularMask(const QRectF &bounds, bool selected, double point);

/** A cell of the strip: what it looks like, and what assistive technologies say about it. */
class FavoriteCell : public favrin::platform::CrispPaintedItem
{
    Q_OBJECT

public:
    explicit FavoriteCell(QQuickItem *parent = nullptr);

    bool isSelected() const { return m_selected; }
    void setSelected(bool selected);

    /** Whether assistive technologies see the cell. */
    virtual bool isAccessibilityElement() const { return true; }
    virtual QString accessibilityLabel() const = 0;
    /** Whether the cell says when it is selected. */
    virtual bool saysSelected() const { return true; }

private:
    bool m_selected = false;
};

/** An empty place: nothing is drawn, nothing is said. */
class FillerCell : public FavoriteCell
{
    Q_OBJECT

public:
    using FavoriteCell::FavoriteCell;

    bool isAccessibilityElement() const override { return false; }
    QString accessibilityLabel() const override { return {}; }

protected:
    void paint(QPainter &, QSize, double) override {}
};

} // namespace favrin::favorites
