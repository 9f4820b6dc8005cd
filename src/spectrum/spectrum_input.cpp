// What a drag and the keyboard do to the spectrum.

#include "spectrum/spectrum.h"

#include "spectrum/spectrumkeys.h"

#include <QKeyEvent>

namespace favrin::spectrum {

void Spectrum::pointerMoved(QPointF location)
{
    // A finger takes over from held keys; their release ends nothing any more.
    m_heldKeys.clear();
    drag(location);
}

void Spectrum::keyPressEvent(QKeyEvent *event)
{
    const auto point =
        size().isEmpty() ? std::nullopt : pointForKey(event->key(), event->modifiers(), pickPlace(), size());
    if (!point) {
        event->ignore();
        return;
    }
    m_focusVisibility.keyUsed();
    if (m_pointerDrag.isActive())
        return;
    // A held key repeats: its picks are a drag that ends when the key lifts.
    m_heldKeys.insert(event->key());
    drag(*point);
}

void Spectrum::keyReleaseEvent(QKeyEvent *event)
{
    if (event->isAutoRepeat())
        return;
    if (!m_heldKeys.remove(event->key())) {
        event->ignore();
        return;
    }
    if (m_heldKeys.isEmpty())
        endDrag();
}

void Spectrum::focusOutEvent(QFocusEvent *event)
{
    // The release of a held key will go elsewhere.
    if (!m_heldKeys.isEmpty()) {
        m_heldKeys.clear();
        endDrag();
    }
    m_focusVisibility.focusOut(*event);
}

} // namespace favrin::spectrum
