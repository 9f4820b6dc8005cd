#pragma once

#include "grid/gridrules.h"
#include "platform/input/focusvisibility.h"
#include "platform/input/onepointerdrag.h"
#include "platform/shapes/crisppainteditem.h"
#include "service/colorpickerstate.h"

#include <QPointer>

namespace favrin::grid {

class ColorSwatchCrosshairView;

/**
 * The content of the grid tab: the active palette as a seamless grid with rounded outer corners, and a marker around
 * the cell that shows the selected color. Touching or dragging picks the cell under the finger, as volatile picks until
 * the finger lifts; keys and assistive technologies pick finally.
 *
 * One item paints all cells; assistive technologies see one child per cell. It is never mirrored. To be seen by them it
 * needs an Accessible.role where it is placed, as any item does that is no control.
 */
class ColorSwatchPickerView : public favrin::platform::CrispPaintedItem
{
    Q_OBJECT
    QML_ELEMENT
    Q_PROPERTY(favrin::service::ColorPickerState *colorPickerState READ colorPickerState WRITE setColorPickerState
                   NOTIFY colorPickerStateChanged REQUIRED FINAL)
    Q_PROPERTY(double cornerRadius READ cornerRadius CONSTANT FINAL)
    Q_PROPERTY(bool focusVisible READ focusVisible NOTIFY focusVisibleChanged FINAL)

public:
    explicit ColorSwatchPickerView(QQuickItem *parent = nullptr);

    service::ColorPickerState *colorPickerState() const { return m_state; }
    void setColorPickerState(service::ColorPickerState *state);

    /** Of the four outer corners, in points. */
    double cornerRadius() const;
    /** The keyboard is here and the user is using it. */
    bool focusVisible() const { return m_focusVisibility.isVisible(); }

    const ColorMatrix &palette() const;
    const model::SomeColor &color(CellPosition cell) const;
    std::optional<CellPosition> markedCell() const { return m_markedCell; }
    bool isSelected(CellPosition cell) const;
    /** The cell's area in the item's coordinates, on whole pixels. */
    QRectF cellRect(CellPosition cell) const;
    /** Picks the cell finally, as a key does. */
    void pick(CellPosition cell);

Q_SIGNALS:
    void colorPickerStateChanged();
    void focusVisibleChanged();
    /** The mark moved, came or went. */
    void markedCellChanged(std::optional<favrin::grid::CellPosition> previous);

protected:
    void paint(QPainter &painter, QSize size, double devicePixelRatio) override;
    void geometryChange(const QRectF &newGeometry, const QRectF &oldGeometry) override;
    void itemChange(ItemChange change, const ItemChangeData &value) override;

    void mousePressEvent(QMouseEvent *event) override { m_pointerDrag.mousePress(*event); }
    void mouseMoveEvent(QMouseEvent *event) override { m_pointerDrag.mouseMove(*event); }
    void mouseReleaseEvent(QMouseEvent *) override { m_pointerDrag.mouseUngrab(); }
    void mouseUngrabEvent() override { m_pointerDrag.mouseUngrab(); }
    void touchEvent(QTouchEvent *event) override { m_pointerDrag.touch(*event); }
    void touchUngrabEvent() override { m_pointerDrag.touchUngrab(); }
    void keyPressEvent(QKeyEvent *event) override;
    void focusInEvent(QFocusEvent *event) override { m_focusVisibility.focusIn(*event); }
    void focusOutEvent(QFocusEvent *event) override { m_focusVisibility.focusOut(*event); }

private:
    double devicePixelRatio() const;
    void updatePalette();
    void updateMarker();
    void placeMarker();
    void drag(QPointF location);
    void endDrag();

    QPointer<service::ColorPickerState> m_state;
    ColorSwatchCrosshairView *m_marker;
    std::optional<CellPosition> m_markedCell;
    platform::OnePointerDrag m_pointerDrag;
    platform::FocusVisibility m_focusVisibility;
};

} // namespace favrin::grid
