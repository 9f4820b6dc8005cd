#pragma once

#include "service/colorpickerstate.h"

#include <QPointer>
#include <QStringList>

namespace favrin::shell {

/** The segments of the tab picker: the titles of the tabs that can be shown, and which of them is. */
class TabSegments : public QObject
{
    Q_OBJECT
    QML_ELEMENT
    Q_PROPERTY(favrin::service::ColorPickerState *colorPickerState READ colorPickerState WRITE setColorPickerState
                   NOTIFY colorPickerStateChanged REQUIRED FINAL)
    Q_PROPERTY(QStringList titles READ titles NOTIFY titlesChanged FINAL)
    Q_PROPERTY(int current READ current WRITE setCurrent NOTIFY currentChanged FINAL)

public:
    explicit TabSegments(QObject *parent = nullptr);

    service::ColorPickerState *colorPickerState() const { return m_state; }
    void setColorPickerState(service::ColorPickerState *state);
    /** In the order of the tabs and in the user's language. */
    QStringList titles() const;
    /** The position of the selected tab; the first one for a tab that cannot be shown. */
    int current() const;
    /** Selects a tab; positions that do not exist change nothing. */
    void setCurrent(int position);

Q_SIGNALS:
    void colorPickerStateChanged();
    void titlesChanged();
    void currentChanged();

private:
    QPointer<service::ColorPickerState> m_state;
};

} // namespace favrin::shell
