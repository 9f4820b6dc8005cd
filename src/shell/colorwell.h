#pragma once

#include "platform/input/focusvisibility.h"
#include "platform/shapes/crisppainteditem.h"
#include "service/colorpickerstate.h"

#include <QImage>
#include <QPointer>
#include <QtQmlIntegration/qqmlintegration.h>

namespace favrin::shell {

/**
 * The large well with the selected color: over a white and a black half where it is translucent, a red slash on gray
 * where there is none. The copy key copies the color; whoever shows a menu calls copy().
 */
class ColorWell : public favrin::platform::CrispPaintedItem
{
    Q_OBJECT
    QML_NAMED_ELEMENT(ColorWellBridge)
    Q_PROPERTY(favrin::service::ColorPickerState *colorPickerState READ colorPickerState WRITE setColorPickerState
                   NOTIFY colorPickerStateChanged REQUIRED FINAL)
    Q_PROPERTY(double cornerRadius READ cornerRadius CONSTANT FINAL)
    Q_PROPERTY(bool focusVisible READ focusVisible NOTIFY focusVisibleChanged FINAL)

public:
    explicit ColorWell(QQuickItem *parent = nullptr);

    service::ColorPickerState *colorPickerState() const { return m_state; }
    void setColorPickerState(service::ColorPickerState *state);
    /** Points. */
    double cornerRadius() const { return 10.0; }
    /** Whether the keyboard is here and the user is using it. */
    bool focusVisible() const { return m_focusVisibility.isVisible(); }

    /** Puts the selected color on the clipboard, as text and in the desktop's form; without one, does nothing. */
    Q_INVOKABLE void copy() const;

Q_SIGNALS:
    void colorPickerStateChanged();
    void focusVisibleChanged();

protected:
    void paint(QPainter &painter, QSize size, double devicePixelRatio) override;
    void keyPressEvent(QKeyEvent *event) override;
    void focusInEvent(QFocusEvent *event) override;
    void focusOutEvent(QFocusEvent *event) override;

private:
    QPointer<service::ColorPickerState> m_state;
    platform::FocusVisibility m_focusVisibility;
    /** Of the well's present size. */
    QImage m_shape;
};

} // namespace favrin::shell
