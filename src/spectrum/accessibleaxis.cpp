#include "spectrum/accessibleaxis.h"

#include "platform/strings/localizedstring.h"
#include "spectrum/spectrum.h"

#include <algorithm>
#include <cmath>

namespace favrin::spectrum {
namespace {

constexpr double wholeCircle = 360.0;
constexpr double wholeLightness = 100.0;
constexpr double stepShare = 0.01;

} // namespace

AccessibleAxis::AccessibleAxis(Spectrum &spectrum, Axis axis) : AccessiblePart(spectrum), m_axis(axis) {}

Spectrum *AccessibleAxis::spectrum() const
{
    return static_cast<Spectrum *>(item());
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

void *AccessibleAxis::interface_cast(QAccessible::InterfaceType type)
{
    if (type == QAccessible::ValueInterface)
        return static_cast<QAccessibleValueInterface *>(this);
    return AccessiblePart::interface_cast(type);
}

QVariant AccessibleAxis::currentValue() const
{
    if (!spectrum() || spectrum()->size().isEmpty())
        return 0.0;
    const QPointF place = spectrum()->pickPlace();
    const double share = m_axis == Axis::Hue ? place.y() / spectrum()->height() : 1.0 - place.x() / spectrum()->width();
    return std::round(share * maximumValue().toDouble());
}

void AccessibleAxis::setCurrentValue(const QVariant &value)
{
    const double number = value.toDouble();
    if (!spectrum() || !spectrum()->isEnabled() || !std::isfinite(number))
        return;
    const double share = std::clamp(number / maximumValue().toDouble(), 0.0, 1.0);
    QPointF place = spectrum()->pickPlace();
    if (m_axis == Axis::Hue)
        place.setY(share * spectrum()->height());
    else
        place.setX((1.0 - share) * spectrum()->width());
    spectrum()->pickFinally(place);
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
