#include "spectrum/accessibleaxis.h"

#include "platform/strings/localizedstring.h"
#include "spectrum/spectrum.h"

#include <QQuickWindow>

#include <algorithm>
#include <cmath>

namespace favrin::spectrum {
namespace {

constexpr double wholeCircle = 360.0;
constexpr double wholeLightness = 100.0;
constexpr double stepShare = 0.01;

} // namespace

AccessibleAxis::AccessibleAxis(Spectrum &spectrum, Axis axis) : m_spectrum(&spectrum), m_axis(axis) {}

QWindow *AccessibleAxis::window() const
{
    return m_spectrum ? m_spectrum->window() : nullptr;
}

QAccessibleInterface *AccessibleAxis::parent() const
{
    return QAccessible::queryAccessibleInterface(m_spectrum);
}

QString AccessibleAxis::text(QAccessible::Text kind) const
{
    if (kind != QAccessible::Name)
        return {};
    const std::string name = m_axis == Axis::Hue
                                 ? platform::localizedString("Hue", "Vertical axis of the color spectrum")
                                 : platform::localizedString("Lightness", "Horizontal axis of the color spectrum");
    return QString::fromStdString(name);
}

QRect AccessibleAxis::rect() const
{
    const QAccessibleInterface *spectrum = parent();
    return spectrum ? spectrum->rect() : QRect();
}

QAccessible::State AccessibleAxis::state() const
{
    QAccessible::State state;
    state.invalid = m_spectrum.isNull();
    state.invisible = !m_spectrum || !m_spectrum->isVisible();
    state.disabled = !m_spectrum || !m_spectrum->isEnabled();
    return state;
}

void *AccessibleAxis::interface_cast(QAccessible::InterfaceType type)
{
    if (type == QAccessible::ValueInterface)
        return static_cast<QAccessibleValueInterface *>(this);
    return type == QAccessible::ActionInterface ? static_cast<QAccessibleActionInterface *>(this) : nullptr;
}

QVariant AccessibleAxis::currentValue() const
{
    if (!m_spectrum || m_spectrum->size().isEmpty())
        return 0.0;
    const QPointF place = m_spectrum->pickPlace();
    const double share = m_axis == Axis::Hue ? place.y() / m_spectrum->height() : 1.0 - place.x() / m_spectrum->width();
    return std::round(share * maximumValue().toDouble());
}

void AccessibleAxis::setCurrentValue(const QVariant &value)
{
    const double number = value.toDouble();
    if (!m_spectrum || !m_spectrum->isEnabled() || !std::isfinite(number))
        return;
    const double share = std::clamp(number / maximumValue().toDouble(), 0.0, 1.0);
    QPointF place = m_spectrum->pickPlace();
    if (m_axis == Axis::Hue)
        place.setY(share * m_spectrum->height());
    else
        place.setX((1.0 - share) * m_spectrum->width());
    m_spectrum->pickFinally(place);
}

QVariant AccessibleAxis::maximumValue() const
{
    return m_axis == Axis::Hue ? wholeCircle : wholeLightness;
}

QVariant AccessibleAxis::minimumStepSize() const
{
    return maximumValue().toDouble() * stepShare;
}

QStringList AccessibleAxis::actionNames() const
{
    return {increaseAction(), decreaseAction()};
}

void AccessibleAxis::doAction(const QString &actionName)
{
    const double step = minimumStepSize().toDouble();
    if (actionName == increaseAction())
        setCurrentValue(currentValue().toDouble() + step);
    else if (actionName == decreaseAction())
        setCurrentValue(currentValue().toDouble() - step);
}

} // namespace favrin::spectrum
