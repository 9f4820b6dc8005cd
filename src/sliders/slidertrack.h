#pragma once

#include "platform/shapes/crisppainteditem.h"
#include "service/colorpickerstate.h"
#include "sliders/capsule.h"
#include "sliders/colorcomponent.h"

#include <QLinearGradient>
#include <QPointer>

namespace favrin::sliders {

/**
 * What a slider's thumb runs along: a capsule with every color that the component can give the selected color, from 0
 * at the leading end to 1 at the trailing end. The track of the opacity lies over a checkerboard and has an outline.
 */
class SliderTrack : public favrin::platform::CrispPaintedItem
{
    Q_OBJECT
    QML_ELEMENT
    Q_PROPERTY(favrin::service::ColorPickerState *colorPickerState READ colorPickerState WRITE setColorPickerState
                   NOTIFY colorPickerStateChanged REQUIRED FINAL)
    Q_PROPERTY(favrin::sliders::ColorComponent::Name component READ component WRITE setComponent NOTIFY componentChanged
                   REQUIRED FINAL)

public:
    explicit SliderTrack(QQuickItem *parent = nullptr);

    service::ColorPickerState *colorPickerState() const { return m_state; }
    void setColorPickerState(service::ColorPickerState *state);
    ColorComponent::Name component() const { return m_component; }
    void setComponent(ColorComponent::Name component);

Q_SIGNALS:
    void colorPickerStateChanged();
    void componentChanged();

protected:
    void paint(QPainter &painter, QSize size, double devicePixelRatio) override;

private:
    using Stops = std::pair<model::SomeColor, model::SomeColor>;

    Stops stops() const;
    void updateStops();
    QLinearGradient gradient(int width) const;
    /** All rows of the track are alike. */
    QImage row(int width) const;
    /** What lies behind the opacity. Kept, since no color changes it. */
    QImage background(QSize size, double devicePixelRatio);

    QPointer<service::ColorPickerState> m_state;
    ColorComponent::Name m_component = ColorComponent::Red;
    Stops m_stops;
    Capsule m_capsule;
    QImage m_checkerboard;
};

} // namespace favrin::sliders
