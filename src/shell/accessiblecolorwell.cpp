#include "shell/accessiblecolorwell.h"

#include "model/axcolordescription.h"
#include "platform/accessibility/accessibleitem.h"
#include "platform/queue/queue.h"
#include "shell/colorwell.h"
#include "shell/shellstrings.h"

namespace favrin::shell {
namespace {

using service::ColorPickerState;

class AccessibleColorWell : public platform::AccessibleItem
{
public:
    explicit AccessibleColorWell(ColorWell *well)
        : AccessibleItem(well), m_description(platform::backgroundQueue(), platform::mainQueue(), [this] { notify(); })
    {
        if (well->colorPickerState())
            m_colorChanged = QObject::connect(well->colorPickerState(), &ColorPickerState::selectedColorChanged, well,
                                              [this] { notify(); });
    }

    ~AccessibleColorWell() override { QObject::disconnect(m_colorChanged); }

    QString text(QAccessible::Text kind) const override
    {
        switch (kind) {
        case QAccessible::Name:
            return ShellStrings::selectedColor();
        // Where only numbers travel as values, the description is what people hear.
        case QAccessible::Value:
        case QAccessible::Description:
            return colorName();
        default:
            return {};
        }
    }

    QAccessible::Role role() const override { return QAccessible::Graphic; }
    QAccessibleInterface *childAt(int, int) const override { return nullptr; }

private:
    QString colorName() const
    {
        const auto *state = static_cast<ColorWell *>(item())->colorPickerState();
        return state ? QString::fromStdString(m_description.evaluate(state->selectedColor())) : QString();
    }

    void notify()
    {
        QAccessibleEvent event(this, QAccessible::DescriptionChanged);
        QAccessible::updateAccessibility(&event);
    }

    QMetaObject::Connection m_colorChanged;
    mutable model::AXColorDescription m_description;
};

QAccessibleInterface *makeAccessibleColorWell(const QString &, QObject *object)
{
    auto *well = qobject_cast<ColorWell *>(object);
    return well ? new AccessibleColorWell(well) : nullptr;
}

} // namespace

void installAccessibleColorWell()
{
    // Installing the same factory again replaces nothing and adds nothing.
    QAccessible::installFactory(makeAccessibleColorWell);
}

} // namespace favrin::shell
