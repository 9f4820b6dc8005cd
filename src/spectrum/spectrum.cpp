#include "spectrum/spectrum.h"

#include "model/colordescription.h"
#include "spectrum/accessiblespectrum.h"
#include "spectrum/spectrumview.h"

namespace favrin::spectrum {

using model::SomeColor;
using service::ColorPickerState;

Spectrum::Spectrum(QQuickItem *parent)
    : QQuickItem(parent)
    , m_spectrum(new SpectrumView(this))
    , m_lens(new lens::ColorLens(this))
    , m_pointerDrag(
          *this, [this](QPointF location) { pointerMoved(location); }, [this] { endDrag(); })
    , m_focusVisibility([this] { Q_EMIT focusVisibleChanged(); })
{
    installAccessibleSpectrum();
    m_lens->setSize({lensExtent, lensExtent});
    m_lens->setVisible(false);
    // Over whatever is placed in the spectrum, such as a focus ring.
    m_lens->setZ(1.0);
    setActiveFocusOnTab(true);
}

Spectrum::~Spectrum() = default;

void Spectrum::setColorPickerState(ColorPickerState *state)
{
    if (state == m_state)
        return;
    if (m_state)
        m_state->disconnect(this);
    m_state = state;
    if (state) {
        connect(state, &ColorPickerState::selectedColorChanged, this, &Spectrum::colorChanged);
        connect(state, &ColorPickerState::fallbackColorChanged, this, &Spectrum::colorChanged);
    }
    colorChanged();
    Q_EMIT colorPickerStateChanged();
}

double Spectrum::cornerRadius() const
{
    return SpectrumView::cornerRadius();
}

QPointF Spectrum::pickPlace() const
{
    if (!m_state || !m_state->hasSelectedColor())
        return {width() / 2.0, height() / 2.0};
    return startingPlace(m_state->colorBinding(), size(), m_drag);
}

void Spectrum::pickFinally(QPointF location)
{
    if (!m_state || size().isEmpty())
        return;
    m_drag.location = location;
    pick(location);
    placeLens();
}

void Spectrum::geometryChange(const QRectF &newGeometry, const QRectF &oldGeometry)
{
    QQuickItem::geometryChange(newGeometry, oldGeometry);
    m_spectrum->setSize(newGeometry.size());
    placeLens();
}

void Spectrum::colorChanged()
{
    placeLens();
    Q_EMIT pickPlaceChanged();
}

void Spectrum::placeLens()
{
    const bool selected = m_state && m_state->hasSelectedColor() && !size().isEmpty();
    const auto place = selected ? lensPlace(m_state->colorBinding(), size(), m_drag) : std::nullopt;
    m_lens->setVisible(place.has_value());
    if (!place)
        return;
    m_lens->setColor(*m_state->selectedColor());
    m_lens->setPosition(lensPosition(*place, size()));
}

void Spectrum::pick(QPointF location)
{
    const SomeColor current = m_state->colorBinding();
    const SomeColor color = pickedColor(location, size(), current);
    if (color == current)
        return;
    if (QAccessible::isActive())
        announce(*this, QString::fromStdString(model::colorDescription(color.platformColor())));
    m_state->setColorBinding(color);
}

void Spectrum::drag(QPointF location)
{
    if (!m_state || size().isEmpty())
        return;
    // The flag first: whoever hears of the color must know that it is not final.
    m_state->isVolatile.set(true);
    m_drag = {location, true};
    pick(location);
    placeLens();
}

void Spectrum::endDrag()
{
    if (!m_drag.isDragging)
        return;
    if (m_state)
        m_state->isVolatile.set(false);
    m_drag.isDragging = false;
    placeLens();
}

} // namespace favrin::spectrum
