#pragma once

#include "platform/input/focusvisibility.h"
#include "platform/input/onepointerdrag.h"
#include "service/colorpickerstate.h"
#include "sliders/colorcomponent.h"

#include <QPointer>
#include <QQuickItem>

namespace favrin::sliders {

/**
 * One draggable track for one component of the selected color. It takes the finger, the mouse and the keys, and says
 * where the thumb stands; what it looks like lies in it as other items.
 *
 * A touch writes the value under it and raises the state's isVolatile, in this order; lifting the finger lowers it.
 * Keys and assistive technologies write final values. To be seen by them it needs an Accessible.role where it is
 * placed, as any item does that is no control.
 */
class CPSlider : public QQuickItem
{
    Q_OBJECT
    QML_ELEMENT
    Q_PROPERTY(favrin::service::ColorPickerState *colorPickerState READ colorPickerState WRITE setColorPickerState
                   NOTIFY colorPickerStateChanged REQUIRED FINAL)
    Q_PROPERTY(favrin::sliders::ColorComponent::Name component READ component WRITE setComponent NOTIFY componentChanged
                   REQUIRED FINAL)
    /** What the component is called, and the same in upper case by the rules of the locale. */
    Q_PROPERTY(QString name READ name NOTIFY componentChanged FINAL)
    Q_PROPERTY(QString title READ title NOTIFY componentChanged FINAL)
    Q_PROPERTY(double value READ value NOTIFY valueChanged FINAL)
    Q_PROPERTY(QPointF thumbCenter READ thumbCenter NOTIFY thumbCenterChanged FINAL)
    Q_PROPERTY(bool focusVisible READ focusVisible NOTIFY focusVisibleChanged FINAL)

public:
    explicit CPSlider(QQuickItem *parent = nullptr);

    service::ColorPickerState *colorPickerState() const { return m_state; }
    void setColorPickerState(service::ColorPickerState *state);
    ColorComponent::Name component() const { return m_component; }
    void setComponent(ColorComponent::Name component);

    QString name() const;
    QString title() const;

    /** 0…1. */
    double value() const;
    /** Writes the component, as one final pick. */
    void setValue(double value);
    /** The value as the text field beside the slider shows it. */
    QString valueText() const;
    /** In the item's coordinates. */
    QPointF thumbCenter() const;
    /** The keyboard is here and the user is using it. */
    bool focusVisible() const { return m_focusVisibility.isVisible(); }

Q_SIGNALS:
    void colorPickerStateChanged();
    void componentChanged();
    void valueChanged();
    void thumbCenterChanged();
    void focusVisibleChanged();

protected:
    void geometryChange(const QRectF &newGeometry, const QRectF &oldGeometry) override;

    void mousePressEvent(QMouseEvent *event) override { m_pointerDrag.mousePress(*event); }
    void mouseMoveEvent(QMouseEvent *event) override { m_pointerDrag.mouseMove(*event); }
    void mouseReleaseEvent(QMouseEvent *) override { m_pointerDrag.mouseUngrab(); }
    void mouseUngrabEvent() override { m_pointerDrag.mouseUngrab(); }
    void touchEvent(QTouchEvent *event) override { m_pointerDrag.touch(*event); }
    void touchUngrabEvent() override { m_pointerDrag.touchUngrab(); }
    void keyPressEvent(QKeyEvent *event) override;
    void focusInEvent(QFocusEvent *event) override { m_focusVisibility.focusIn(*event); }
    void focusOutEvent(QFocusEvent *event) override { m_focusVisibility.focusOut(*event); }

private:
    void announceValue();
    void drag(QPointF location);
    void endDrag();

    QPointer<service::ColorPickerState> m_state;
    ColorComponent::Name m_component = ColorComponent::Red;
    platform::OnePointerDrag m_pointerDrag;
    platform::FocusVisibility m_focusVisibility;
};

} // namespace favrin::sliders
