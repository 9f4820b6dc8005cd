#include "sliders/cpslider.h"

#include "sliders/accessibleslider.h"
#include "sliders/sliderrules.h"
#include "theme/theme.h"

#include <QLocale>

namespace favrin::sliders {

using service::ColorPickerState;
using theme::Theme;

CPSlider::CPSlider(QQuickItem *parent)
    : QQuickItem(parent)
    , m_pointerDrag(
          *this, [this](QPointF location) { drag(location); }, [this] { endDrag(); })
    , m_focusVisibility([this] { Q_EMIT focusVisibleChanged(); })
{
    installAccessibleSlider();
    setImplicitHeight(trackHeight);
    setActiveFocusOnTab(true);
    connect(&Theme::instance(), &Theme::layoutDirectionChanged, this, &CPSlider::thumbCenterChanged);
    connect(&Theme::instance(), &Theme::localeChanged, this, &CPSlider::componentChanged);
}

void CPSlider::setColorPickerState(ColorPickerState *state)
{
    if (state == m_state)
        return;
    if (m_state)
        m_state->disconnect(this);
    m_state = state;
    if (state) {
        connect(state, &ColorPickerState::selectedColorChanged, this, &CPSlider::announceValue);
        connect(state, &ColorPickerState::fallbackColorChanged, this, &CPSlider::announceValue);
    }
    Q_EMIT colorPickerStateChanged();
    announceValue();
}

void CPSlider::setComponent(ColorComponent::Name component)
{
    if (component == m_component)
        return;
    m_component = component;
    Q_EMIT componentChanged();
    announceValue();
}

QString CPSlider::name() const
{
    return displayName(m_component);
}

QString CPSlider::title() const
{
    return QLocale().toUpper(name());
}

double CPSlider::value() const
{
    return m_state ? componentValue(*m_state, m_component) : 0.0;
}

void CPSlider::setValue(double value)
{
    if (m_state)
        setComponentValue(*m_state, m_component, value);
}

QString CPSlider::valueText() const
{
    return sliderControlStyle(m_component).floatToTextMapping(value());
}

QPointF CPSlider::thumbCenter() const
{
    return sliders::thumbCenter(value(), size(), Theme::instance().layoutDirection());
}

void CPSlider::geometryChange(const QRectF &newGeometry, const QRectF &oldGeometry)
{
    QQuickItem::geometryChange(newGeometry, oldGeometry);
    if (newGeometry.size() != oldGeometry.size())
        Q_EMIT thumbCenterChanged();
}

void CPSlider::announceValue()
{
    Q_EMIT valueChanged();
    Q_EMIT thumbCenterChanged();
}

} // namespace favrin::sliders
