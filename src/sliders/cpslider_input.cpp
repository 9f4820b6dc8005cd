// What a drag and the keyboard do to a slider.

#include "sliders/cpslider.h"

#include "sliders/sliderkeys.h"
#include "sliders/sliderrules.h"
#include "theme/theme.h"

#include <QKeyEvent>

namespace favrin::sliders {

using theme::Theme;

void CPSlider::drag(QPointF location)
{
    setValue(valueAt(location.x(), size(), Theme::instance().layoutDirection()));
    // After the value: the first value of a drag is still a final one.
    if (m_state)
        m_state->isVolatile.set(true);
}

void CPSlider::endDrag()
{
    if (m_state)
        m_state->isVolatile.set(false);
}

void CPSlider::keyPressEvent(QKeyEvent *event)
{
    const auto key = valueForKey(event->key(), event->modifiers(), value(), shownSteps(sliders::component(m_component)),
                                 Theme::instance().layoutDirection());
    if (!key) {
        event->ignore();
        return;
    }
    m_focusVisibility.keyUsed();
    if (*key != value())
        setValue(*key);
}

} // namespace favrin::sliders
