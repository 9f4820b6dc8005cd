#pragma once

#include "lens/colorlens.h"
#include "platform/input/focusvisibility.h"
#include "platform/input/onepointerdrag.h"
#include "service/colorpickerstate.h"
#include "spectrum/spectrumrules.h"

#include <QPointer>
#include <QSet>

namespace favrin::spectrum {

class SpectrumView;

/**
 * The content of the spectrum tab: the field of colors, and a lens that marks the selected one. Touching or dragging
 * anywhere picks the color under the finger, or that of the nearest edge; keys move the pick. Picks are volatile until
 * the finger or the key lifts. Assistive technologies see one element with the field's two axes.
 *
 * It is never mirrored. To be seen by assistive technologies it needs an Accessible.role where it is placed.
 */
class Spectrum : public QQuickItem
{
    Q_OBJECT
    QML_ELEMENT
    Q_PROPERTY(favrin::service::ColorPickerState *colorPickerState READ colorPickerState WRITE setColorPickerState
                   NOTIFY colorPickerStateChanged REQUIRED FINAL)
    Q_PROPERTY(double cornerRadius READ cornerRadius CONSTANT FINAL)
    Q_PROPERTY(bool focusVisible READ focusVisible NOTIFY focusVisibleChanged FINAL)

public:
    explicit Spectrum(QQuickItem *parent = nullptr);
    ~Spectrum() override;

    service::ColorPickerState *colorPickerState() const { return m_state; }
    void setColorPickerState(service::ColorPickerState *state);
    /** Of the field's corners, in points. */
    double cornerRadius() const;
    /** The keyboard is here and the user is using it. */
    bool focusVisible() const { return m_focusVisibility.isVisible(); }

    SpectrumView &spectrum() { return *m_spectrum; }
    const lens::ColorLens &lens() const { return *m_lens; }

    /** Where the selected color is, for whoever changes it without touching: a point of the spectrum. */
    QPointF pickPlace() const;
    /** Picks the color at @p location finally. */
    void pickFinally(QPointF location);

Q_SIGNALS:
    void colorPickerStateChanged();
    void focusVisibleChanged();
    /** pickPlace() is another. */
    void pickPlaceChanged();

protected:
    void geometryChange(const QRectF &newGeometry, const QRectF &oldGeometry) override;
    void mousePressEvent(QMouseEvent *event) override { m_pointerDrag.mousePress(*event); }
    void mouseMoveEvent(QMouseEvent *event) override { m_pointerDrag.mouseMove(*event); }
    void mouseReleaseEvent(QMouseEvent *) override { m_pointerDrag.mouseUngrab(); }
    void mouseUngrabEvent() override { m_pointerDrag.mouseUngrab(); }
    void touchEvent(QTouchEvent *event) override { m_pointerDrag.touch(*event); }
    void touchUngrabEvent() override { m_pointerDrag.touchUngrab(); }
    void keyPressEvent(QKeyEvent *event) override;
    void keyReleaseEvent(QKeyEvent *event) override;
    void focusInEvent(QFocusEvent *event) override { m_focusVisibility.focusIn(*event); }
    void focusOutEvent(QFocusEvent *event) override;

private:
    void colorChanged();
    void placeLens();
    void pick(QPointF location);
    void drag(QPointF location);
    void endDrag();
    void pointerMoved(QPointF location);

    QPointer<service::ColorPickerState> m_state;
    SpectrumView *m_spectrum;
    lens::ColorLens *m_lens;
    SpectrumDrag m_drag;
    platform::OnePointerDrag m_pointerDrag;
    platform::FocusVisibility m_focusVisibility;
    QSet<int> m_heldKeys;
};

} // namespace favrin::spectrum
