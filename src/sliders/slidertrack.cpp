#include "sliders/slidertrack.h"

#include "service/displaycolor.h"
#include "sliders/opacitybackground.h"
#include "sliders/sliderrules.h"
#include "theme/theme.h"

#include <QImage>
#include <QPainter>

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

} // namespace

SliderTrack::SliderTrack(QQuickItem *parent) : CrispPaintedItem(parent), m_stops(stops())
{
    // Comes with a change of the surface's color space too.
    const auto startAgain = [this] {
        m_checkerboard = {};
        repaint();
    };
    connect(&Theme::instance(), &Theme::colorsChanged, this, startAgain);
    connect(&Theme::instance(), &Theme::layoutDirectionChanged, this, startAgain);
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

QImage SliderTrack::row(int width) const
{
    QImage row(width, 1, QImage::Format_ARGB32_Premultiplied);
    row.fill(Qt::transparent);
    QPainter(&row).fillRect(row.rect(), gradient(width));
    return row;
}

QImage SliderTrack::background(QSize size, double devicePixelRatio)
{
    if (m_checkerboard.size() != size) {
        m_checkerboard = QImage(size, QImage::Format_ARGB32_Premultiplied);
        QPainter painter(&m_checkerboard);
        checkerboard().paint(painter, size, devicePixelRatio, Theme::instance().layoutDirection());
    }
    return m_checkerboard;
}

void SliderTrack::paint(QPainter &painter, QSize size, double devicePixelRatio)
{
    if (m_capsule.size() != size)
        m_capsule = Capsule(size);
    const bool isOpacity = m_component == ColorComponent::Opacity;
    QImage picture = isOpacity ? background(size, devicePixelRatio) : QImage(size, QImage::Format_ARGB32_Premultiplied);
    QPainter layers(&picture);
    if (!isOpacity)
        layers.setCompositionMode(QPainter::CompositionMode_Source);
    const QImage colors = row(size.width());
    for (int y = 0; y < size.height(); ++y)
        layers.drawImage(0, y, colors);
    // All layers are cut as one; cut apart, the lower one would shine through at the edge.
    m_capsule.cut(layers);
    layers.end();
    painter.drawImage(0, 0, picture);
    if (isOpacity) {
        QColor outline = Theme::instance().systemGray();
        outline.setAlphaF(outlineOpacity);
        m_capsule.outline(painter, outline);
    }
}

} // namespace favrin::sliders
