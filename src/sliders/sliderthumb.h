#pragma once

#include "lens/colorlens.h"
#include "service/colorpickerstate.h"

#include <QPointer>

namespace favrin::sliders {

/** The thumb of a track: a lens with the whole selected color, its opacity included. Hidden while none is selected. */
class SliderThumb : public favrin::lens::ColorLens
{
    Q_OBJECT
    QML_ELEMENT
    Q_PROPERTY(favrin::service::ColorPickerState *colorPickerState READ colorPickerState WRITE setColorPickerState
                   NOTIFY colorPickerStateChanged REQUIRED FINAL)

public:
    explicit SliderThumb(QQuickItem *parent = nullptr);

    service::ColorPickerState *colorPickerState() const { return m_state; }
    void setColorPickerState(service::ColorPickerState *state);

Q_SIGNALS:
    void colorPickerStateChanged();

private:
    void followSelectedColor();

    QPointer<service::ColorPickerState> m_state;
};

} // namespace favrin::sliders
