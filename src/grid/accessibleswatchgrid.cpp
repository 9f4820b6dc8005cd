#include "grid/accessibleswatchgrid.h"

#include "grid/accessibleswatch.h"
#include "grid/colorswatchpickerview.h"
#include "platform/accessibility/accessibleitem.h"
#include "platform/strings/localizedstring.h"

#include <QQuickWindow>

#include <vector>

namespace favrin::grid {
namespace {

class AccessibleSwatchGrid : public platform::AccessibleItem
{
public:
    explicit AccessibleSwatchGrid(ColorSwatchPickerView *view)
        : AccessibleItem(view), m_cells(static_cast<std::size_t>(gridDimensions().rows * gridDimensions().columns))
    {
        m_markedCellChanged =
            QObject::connect(view, &ColorSwatchPickerView::markedCellChanged, view,
                             [this](std::optional<CellPosition> previous) { announceMarkedCell(previous); });
    }

    ~AccessibleSwatchGrid() override
    {
        QObject::disconnect(m_markedCellChanged);
        for (const QAccessible::Id cell : m_cells) {
            if (cell)
                QAccessible::deleteAccessibleInterface(cell);
        }
    }

    int childCount() const override { return static_cast<int>(m_cells.size()); }

    QAccessibleInterface *child(int index) const override
    {
        if (index < 0 || index >= childCount())
            return nullptr;
        QAccessible::Id &cell = m_cells[static_cast<std::size_t>(index)];
        if (!cell) {
            const int columns = gridDimensions().columns;
            cell = QAccessible::registerAccessibleInterface(
                new AccessibleSwatch(*view(), {index / columns, index % columns}));
        }
        return QAccessible::accessibleInterface(cell);
    }

    int indexOfChild(const QAccessibleInterface *child) const override
    {
        const auto *swatch = dynamic_cast<const AccessibleSwatch *>(child);
        return swatch ? indexOf(swatch->cell()) : -1;
    }

    QAccessibleInterface *childAt(int x, int y) const override
    {
        if (!window() || !rect().contains(x, y))
            return nullptr;
        const QPointF inWindow = window()->mapFromGlobal(QPointF(x, y));
        const auto cell = cellAt(view()->mapFromScene(inWindow), view()->size());
        return cell ? child(indexOf(*cell)) : nullptr;
    }

    QAccessibleInterface *focusChild() const override
    {
        const auto marked = view()->markedCell();
        return view()->hasActiveFocus() && marked ? child(indexOf(*marked)) : nullptr;
    }

    QString text(QAccessible::Text kind) const override
    {
        if (kind != QAccessible::Name)
            return {};
        return QString::fromStdString(platform::localizedString("Grid", "Title of the tab."));
    }

    QAccessible::Role role() const override { return QAccessible::List; }

private:
    ColorSwatchPickerView *view() const { return static_cast<ColorSwatchPickerView *>(item()); }
    static int indexOf(CellPosition cell) { return cell.row * gridDimensions().columns + cell.column; }

    // This object exists only where somebody asked for it, so there is somebody to hear.
    void announceMarkedCell(std::optional<CellPosition> previous)
    {
        const auto marked = view()->markedCell();
        for (const auto &cell : {previous, marked}) {
            if (cell)
                announce(QAccessible::Selection, *cell);
        }
        if (marked && marked != previous && view()->hasActiveFocus())
            announce(QAccessible::Focus, *marked);
    }

    void announce(QAccessible::Event type, CellPosition cell) const
    {
        QAccessibleEvent event(child(indexOf(cell)), type);
        QAccessible::updateAccessibility(&event);
    }

    QMetaObject::Connection m_markedCellChanged;
    mutable std::vector<QAccessible::Id> m_cells;
};

QAccessibleInterface *makeAccessibleSwatchGrid(const QString &, QObject *object)
{
    auto *view = qobject_cast<ColorSwatchPickerView *>(object);
    return view ? new AccessibleSwatchGrid(view) : nullptr;
}

} // namespace

void installAccessibleSwatchGrid()
{
    // Installing the same factory again replaces nothing and adds nothing.
    QAccessible::installFactory(makeAccessibleSwatchGrid);
}

} // namespace favrin::grid
