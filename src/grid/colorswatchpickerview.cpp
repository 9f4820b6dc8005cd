#include "grid/colorswatchpickerview.h"

#include "grid/accessibleswatchgrid.h"
#include "grid/colorswatchcrosshairview.h"
#include "platform/shapes/continuousroundedrect.h"
#include "service/displaycolor.h"
#include "theme/theme.h"

#include <QPainter>
#include <QQuickWindow>

#include <utility>

namespace favrin::grid {

using service::ColorPickerState;
using service::DisplayColor;
using theme::Theme;

namespace {

constexpr double outerCornerRadius = 8.0;

/** Everything of @p size that lies outside the rounded outline. */
QPainterPath outsideOfOutline(QSize size, double radius)
{
    QPainterPath path;
    path.addRect(QRectF(QPointF(), size));
    path.addPath(platform::continuousRoundedRect(QRectF(QPointF(), size), radius));
    path.setFillRule(Qt::OddEvenFill);
    return path;
}

} // namespace

ColorSwatchPickerView::ColorSwatchPickerView(QQuickItem *parent)
    : CrispPaintedItem(parent)
    , m_marker(new ColorSwatchCrosshairView(this))
    , m_pointerDrag(
          *this, [this](QPointF location) { drag(location); }, [this] { endDrag(); })
    , m_focusVisibility([this] { Q_EMIT focusVisibleChanged(); })
{
    installAccessibleSwatchGrid();
    m_marker->setVisible(false);
    setActiveFocusOnTab(true);
    // Comes with a change of the surface's color space too.
    connect(&Theme::instance(), &Theme::colorsChanged, this, &ColorSwatchPickerView::updatePalette);
}

void ColorSwatchPickerView::setColorPickerState(ColorPickerState *state)
{
    if (state == m_state)
        return;
    if (m_state)
        m_state->disconnect(this);
    m_state = state;
    if (state) {
        connect(state, &ColorPickerState::selectedColorChanged, this, &ColorSwatchPickerView::updateMarker);
        connect(state, &ColorPickerState::enableDarkGridChanged, this, &ColorSwatchPickerView::updatePalette);
        connect(state, &ColorPickerState::overrideColorSchemeChanged, this, &ColorSwatchPickerView::updatePalette);
    }
    updatePalette();
    Q_EMIT colorPickerStateChanged();
}

double ColorSwatchPickerView::cornerRadius() const
{
    return outerCornerRadius;
}

const ColorMatrix &ColorSwatchPickerView::palette() const
{
    return m_state ? activePalette(*m_state, Theme::instance().colorScheme()) : defaultColorMatrix();
}

const model::SomeColor &ColorSwatchPickerView::color(CellPosition cell) const
{
    return palette()[static_cast<std::size_t>(cell.row)][static_cast<std::size_t>(cell.column)];
}

bool ColorSwatchPickerView::isSelected(CellPosition cell) const
{
    return m_state && grid::isSelected(m_state->selectedColor(), color(cell));
}

QRectF ColorSwatchPickerView::cellRect(CellPosition cell) const
{
    const double ratio = devicePixelRatio();
    const QRectF pixels = cellPixels(cell, pixelSize(ratio));
    return {pixels.topLeft() / ratio, pixels.size() / ratio};
}

void ColorSwatchPickerView::pick(CellPosition cell)
{
    if (m_state)
        m_state->selectedColor.set(picked(color(cell), m_state->colorBinding()));
}

void ColorSwatchPickerView::paint(QPainter &painter, QSize size, double devicePixelRatio)
{
    const auto [rows, columns] = gridDimensions();
    for (int row = 0; row < rows; ++row) {
        for (int column = 0; column < columns; ++column) {
            const CellPosition cell = {row, column};
            painter.fillRect(cellPixels(cell, size), DisplayColor::instance().color(color(cell)));
        }
    }
    painter.setCompositionMode(QPainter::CompositionMode_DestinationOut);
    painter.fillPath(outsideOfOutline(size, outerCornerRadius * devicePixelRatio), Qt::black);
}

void ColorSwatchPickerView::geometryChange(const QRectF &newGeometry, const QRectF &oldGeometry)
{
    CrispPaintedItem::geometryChange(newGeometry, oldGeometry);
    placeMarker();
}

void ColorSwatchPickerView::itemChange(ItemChange change, const ItemChangeData &value)
{
    CrispPaintedItem::itemChange(change, value);
    if (change == ItemDevicePixelRatioHasChanged || change == ItemSceneChange)
        placeMarker();
}

double ColorSwatchPickerView::devicePixelRatio() const
{
    return window() ? window()->effectiveDevicePixelRatio() : 1.0;
}

void ColorSwatchPickerView::updatePalette()
{
    repaint();
    updateMarker();
}

void ColorSwatchPickerView::updateMarker()
{
    const auto marked = m_state ? grid::markedCell(m_state->selectedColor(), palette()) : std::nullopt;
    const auto previous = std::exchange(m_markedCell, marked);
    placeMarker();
    Q_EMIT markedCellChanged(previous);
}

void ColorSwatchPickerView::placeMarker()
{
    m_marker->setVisible(m_markedCell.has_value());
    if (!m_markedCell)
        return;
    const QRectF rect = cellRect(*m_markedCell);
    m_marker->setPosition(rect.topLeft());
    m_marker->setSize(rect.size());
    m_marker->setMaskedCorner(maskedCorner(*m_markedCell));
}

} // namespace favrin::grid
