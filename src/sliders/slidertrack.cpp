#include "sliders/slidertrack.h"

#include "service/displaycolor.h"
#include "sliders/opacitybackground.h"
#include "sliders/sliderrules.h"
#include "theme/theme.h"

#include <QImage>
#include <QPainter>
#include <QPainterPath>

namespace favrin::sliders {

using model::SomeColor;
using service::ColorPickerState;
using service::DisplayColor;
using theme::Theme;

namespace {

constexpr double outlineOpacity = 0.2;
/** A straight line in one color space is a curve in another; it is drawn as this many straight pieces. */
constexpr int partsAcrossSpaces = 48;

OpacityBackground checkerboard()
{
    return {.squareSize = 12.0,
            .squareColor = SomeColor(0.851, 0.847, 0.855, 1.0, SomeColor::ColorSpace::displayP3),
            .colorScheme = Theme::instance().colorScheme()};
}

QPainterPath capsule(const QRectF &rect)
{
    QPainterPath path;
    path.addRoundedRect(rect, rect.height() / 2.0, rect.height() / 2.0);
    return path;
}

/** One pixel wide, inside the edge. */
void strokeCapsule(QPainter &painter, const QRectF &rect)
{
    QColor outline = Theme::instance().systemGray();
    outline.setAlphaF(outlineOpacity);
    painter.strokePath(capsule(rect.adjusted(0.5, 0.5, -0.5, -0.5)), QPen(outline, 1.0));
}

} // namespace

SliderTrack::SliderTrack(QQuickItem *parent) : CrispPaintedItem(parent), m_stops(stops())
{
    // Comes with a change of the surface's color space too.
    connect(&Theme::instance(), &Theme::colorsChanged, this, [this] { repaint(); });
    connect(&Theme::instance(), &Theme::layoutDirectionChanged, this, [this] { repaint(); });
}

void SliderTrack::setColorPickerState(ColorPickerState *state)
{
    if (state == m_state)
        return;
    if (m_state)
        m_state->disconnect(this);
    m_state = state;
    if (state)
        connect(state, &ColorPickerState::selectedColorChanged, this, &SliderTrack::updateStops);
    updateStops();
    Q_EMIT colorPickerStateChanged();
}

void SliderTrack::setComponent(ColorComponent::Name component)
{
    if (component == m_component)
        return;
    m_component = component;
    updateStops();
    Q_EMIT componentChanged();
}

SliderTrack::Stops SliderTrack::stops() const
{
    return gradientStops(m_state ? m_state->selectedColor() : std::nullopt, sliders::component(m_component));
}

void SliderTrack::updateStops()
{
    // A drag of the component itself changes nothing here.
    const Stops updated = stops();
    if (updated == m_stops)
        return;
    m_stops = updated;
    repaint();
}

QLinearGradient SliderTrack::gradient(int width) const
{
    const bool isMirrored = Theme::instance().isMirrored();
    QLinearGradient gradient(isMirrored ? width : 0.0, 0.0, isMirrored ? 0.0 : width, 0.0);
    const bool isStraight = m_stops.first.colorSpace == DisplayColor::instance().surfaceColorSpace();
    const int parts = isStraight ? 1 : partsAcrossSpaces;
    for (int i = 0; i <= parts; ++i) {
        const double value = double(i) / parts;
        gradient.setColorAt(
            value, DisplayColor::instance().color(m_stops.first.setting(sliders::component(m_component), value)));
    }
    return gradient;
}

void SliderTrack::paint(QPainter &painter, QSize size, double devicePixelRatio)
{
    const QRect rect(QPoint(), size);
    if (m_component != ColorComponent::Opacity) {
        painter.fillPath(capsule(rect), gradient(size.width()));
        return;
    }
    // Both layers are cut as one; cut apart, the lower one would shine through at the edge.
    QImage layers(size, QImage::Format_ARGB32_Premultiplied);
    QPainter layerPainter(&layers);
    checkerboard().paint(layerPainter, size, devicePixelRatio, Theme::instance().layoutDirection());
    layerPainter.fillRect(rect, gradient(size.width()));
    layerPainter.end();
    painter.fillPath(capsule(rect), QBrush(layers));
    strokeCapsule(painter, rect);
}

} // namespace favrin::sliders
