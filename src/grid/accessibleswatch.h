#pragma once

#include "grid/gridrules.h"
#include "model/axcolordescription.h"
#include "platform/accessibility/accessiblepart.h"

namespace favrin::grid {

class ColorSwatchPickerView;

/** One cell as assistive technologies see it. Named when its name is first asked for. */
class AccessibleSwatch : public platform::AccessiblePart
{
public:
    AccessibleSwatch(ColorSwatchPickerView &view, CellPosition cell);

    CellPosition cell() const { return m_cell; }

    QString text(QAccessible::Text kind) const override;
    QAccessible::Role role() const override { return QAccessible::ListItem; }
    QAccessible::State state() const override;

    QStringList actionNames() const override;
    void doAction(const QString &actionName) override;

private:
    ColorSwatchPickerView *view() const;
    QRectF area() const override;
    void announceName();

    CellPosition m_cell;
    mutable model::AXColorDescription m_description;
};

} // namespace favrin::grid
