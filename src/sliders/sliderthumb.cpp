#include "sliders/sliderthumb.h"

namespace favrin::sliders {

using service::ColorPickerState;

SliderThumb::SliderThumb(QQuickItem *parent) : ColorLens(parent)
{
    setVisible(false);
}

void SliderThumb::setColorPickerState(ColorPickerState *state)
{
    if (state == m_state)
        return;
    if (m_state)
        m_state->disconnect(this);
    m_state = state;
    if (state)
        connect(state, &ColorPickerState::selectedColorChanged, this, &SliderThumb::followSelectedColor);
    followSelectedColor();
    Q_EMIT colorPickerStateChanged();
}

void SliderThumb::followSelectedColor()
{
    const bool hasColor = m_state && m_state->hasSelectedColor();
    setVisible(hasColor);
    if (hasColor)
        setColor(*m_state->selectedColor());
}

} // namespace favrin::sliders
