#include "spectrum/accessiblespectrum.h"

#include "model/axcolordescription.h"
#include "platform/accessibility/accessibleitem.h"
#include "platform/queue/queue.h"
#include "platform/strings/localizedstring.h"
#include "spectrum/accessibleaxis.h"
#include "spectrum/spectrum.h"

#include <QScopedValueRollback>

#include <array>

namespace favrin::spectrum {
namespace {

constexpr std::array axes = {AccessibleAxis::Axis::Hue, AccessibleAxis::Axis::Lightness};

class AccessibleSpectrum : public platform::AccessibleItem
{
public:
    explicit AccessibleSpectrum(Spectrum *spectrum)
        : AccessibleItem(spectrum), m_description(platform::backgroundQueue(), platform::mainQueue(), [this] {
            notify(QAccessible::DescriptionChanged);
        })
    {
        m_pickPlaceChanged =
            QObject::connect(spectrum, &Spectrum::pickPlaceChanged, spectrum, [this] { notifyAxes(); });
    }

    ~AccessibleSpectrum() override
    {
        QObject::disconnect(m_pickPlaceChanged);
        for (const QAccessible::Id axis : m_axes) {
            if (axis)
                QAccessible::deleteAccessibleInterface(axis);
        }
    }

    int childCount() const override { return static_cast<int>(axes.size()); }

    QAccessibleInterface *child(int index) const override
    {
        if (index < 0 || index >= childCount())
            return nullptr;
        const auto position = static_cast<std::size_t>(index);
        if (!m_axes[position])
            m_axes[position] =
                QAccessible::registerAccessibleInterface(new AccessibleAxis(*spectrum(), axes[position]));
        return QAccessible::accessibleInterface(m_axes[position]);
    }

    int indexOfChild(const QAccessibleInterface *child) const override
    {
        const auto *axis = dynamic_cast<const AccessibleAxis *>(child);
        return axis ? static_cast<int>(axis->axis()) : -1;
    }

    // The axes fill the whole element: what is touched is the element itself.
    QAccessibleInterface *childAt(int, int) const override { return nullptr; }

    QString text(QAccessible::Text kind) const override
    {
        switch (kind) {
        case QAccessible::Name:
            return QString::fromStdString(platform::localizedString("Color Spectrum", "Color spectrum control"));
        case QAccessible::Value:
            return colorName();
        // Where only numbers travel as values, the description is what people hear.
        case QAccessible::Description:
            return m_announcement.isNull() ? colorName() : m_announcement;
        default:
            return {};
        }
    }

    QAccessible::Role role() const override { return QAccessible::ColorChooser; }

    void announce(const QString &text)
    {
#if QT_VERSION >= QT_VERSION_CHECK(6, 8, 0)
        QAccessibleAnnouncementEvent event(spectrum(), text);
        QAccessible::updateAccessibility(&event);
#else
        // A changed description of what has the focus is spoken, too.
        const QScopedValueRollback said(m_announcement, text);
        notify(QAccessible::DescriptionChanged);
#endif
    }

private:
    Spectrum *spectrum() const
    {
        return static_cast<Spectrum *>(item());
    }

    QString colorName() const
    {
        const auto *state = spectrum()->colorPickerState();
        return state ? QString::fromStdString(m_description.evaluate(state->colorBinding())) : QString();
    }

    void notify(QAccessible::Event type)
    {
        QAccessibleEvent event(this, type);
        QAccessible::updateAccessibility(&event);
    }

    // Only axes that somebody asked for have somebody to hear of them.
    void notifyAxes() const
    {
        for (std::size_t index = 0; index < m_axes.size(); ++index) {
            if (!m_axes[index])
                continue;
            QAccessibleInterface *axis = child(static_cast<int>(index));
            QAccessibleValueChangeEvent event(axis, axis->valueInterface()->currentValue());
            QAccessible::updateAccessibility(&event);
        }
    }

    QMetaObject::Connection m_pickPlaceChanged;
    mutable std::array<QAccessible::Id, axes.size()> m_axes = {};
    mutable model::AXColorDescription m_description;
    QString m_announcement;
};

QAccessibleInterface *makeAccessibleSpectrum(const QString &, QObject *object)
{
    auto *spectrum = qobject_cast<Spectrum *>(object);
    return spectrum ? new AccessibleSpectrum(spectrum) : nullptr;
}

} // namespace

void installAccessibleSpectrum()
{
    // Installing the same factory again replaces nothing and adds nothing.
    QAccessible::installFactory(makeAccessibleSpectrum);
}

void announce(Spectrum &spectrum, const QString &text)
{
    if (auto *accessible = dynamic_cast<AccessibleSpectrum *>(QAccessible::queryAccessibleInterface(&spectrum)))
        accessible->announce(text);
}

} // namespace favrin::spectrum
