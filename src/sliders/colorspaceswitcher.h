#pragma once

#include "service/colorpickerstate.h"

#include <QPointer>
#include <QStringList>

namespace favrin::sliders {

/** What the color space button says and does: the space in which the current color is held, and the way to another. */
class ColorSpaceSwitcher : public QObject
{
    Q_OBJECT
    QML_ELEMENT
    Q_PROPERTY(favrin::service::ColorPickerState *colorPickerState READ colorPickerState WRITE setColorPickerState
                   NOTIFY colorPickerStateChanged REQUIRED FINAL)
    Q_PROPERTY(QString label READ label NOTIFY currentChanged FINAL)
    Q_PROPERTY(QString menuTitle READ menuTitle NOTIFY namesChanged FINAL)
    /** The names of all spaces, in the order in which they are offered. */
    Q_PROPERTY(QStringList names READ names NOTIFY namesChanged FINAL)
    Q_PROPERTY(int current READ current NOTIFY currentChanged FINAL)

public:
    explicit ColorSpaceSwitcher(QObject *parent = nullptr);

    service::ColorPickerState *colorPickerState() const { return m_state; }
    void setColorPickerState(service::ColorPickerState *state);
    QString label() const;
    QString menuTitle() const;
    QStringList names() const;
    int current() const;

    /** Holds the same color in another space, clipped to it. Choosing the current space does nothing at all. */
    Q_INVOKABLE void choose(int index);

Q_SIGNALS:
    void colorPickerStateChanged();
    void namesChanged();
    void currentChanged();

private:
    model::SomeColor::ColorSpace space() const;

    QPointer<service::ColorPickerState> m_state;
};

} // namespace favrin::sliders
