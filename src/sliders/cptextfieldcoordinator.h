#pragma once

#include "service/colorpickerstate.h"
#include "sliders/cptextfield.h"

#include <QPointer>
#include <QQuickItem>
#include <QValidator>

namespace favrin::sliders {

class EditQuestion;

/**
 * Stands between a Qt Quick text input and the state: shows the value, asks before each edit, writes what the text
 * means after each edit, and keeps the caret where it belongs. Subclasses say what is edited.
 */
class CPTextFieldCoordinator : public QObject
{
    Q_OBJECT
    QML_ELEMENT
    QML_UNCREATABLE("There is one for each kind of value")
    Q_PROPERTY(favrin::service::ColorPickerState *colorPickerState READ colorPickerState WRITE setColorPickerState
                   NOTIFY colorPickerStateChanged REQUIRED FINAL)
    /** The text input that this serves. */
    Q_PROPERTY(QQuickItem *field READ field WRITE setField NOTIFY fieldChanged FINAL)
    /** To be the input's validator. */
    Q_PROPERTY(QValidator *editQuestion READ editQuestion CONSTANT FINAL)
    Q_PROPERTY(Qt::InputMethodHints inputMethodHints READ inputMethodHints NOTIFY textFieldChanged FINAL)
    Q_PROPERTY(bool isDecimalPad READ isDecimalPad NOTIFY textFieldChanged FINAL)
    /** The scroll view around the input, or the content of its window. */
    Q_PROPERTY(QQuickItem *viewport READ viewport NOTIFY fieldChanged FINAL)
    /** The on-screen keyboard is here. */
    Q_PROPERTY(bool isKeyboardVisible READ isKeyboardVisible NOTIFY keyboardVisibleChanged FINAL)
    Q_PROPERTY(QString doneLabel READ doneLabel NOTIFY nameChanged FINAL)
    /** What assistive technologies call the field. */
    Q_PROPERTY(QString name READ name NOTIFY nameChanged FINAL)

public:
    service::ColorPickerState *colorPickerState() const { return m_state; }
    void setColorPickerState(service::ColorPickerState *state);
    QQuickItem *field() const { return m_input; }
    void setField(QQuickItem *input);
    QValidator *editQuestion() const;
    Qt::InputMethodHints inputMethodHints() const;
    bool isDecimalPad() const;
    QQuickItem *viewport() const;
    bool isKeyboardVisible() const;
    QString doneLabel() const;
    virtual QString name() const = 0;

    bool eventFilter(QObject *watched, QEvent *event) override;

public Q_SLOTS:
    /** The user changed the text. */
    void textFieldValueChanged();
    /** The keyboard came to the field, or left it. */
    void setEditing(bool isEditing);
    /** The caret or the selection moved. */
    void selectionChanged();
    /** Lets the keyboard go, to the item that holds the input. */
    void endEditing();

Q_SIGNALS:
    void colorPickerStateChanged();
    void fieldChanged();
    void keyboardVisibleChanged();
    void nameChanged();
    void textFieldChanged();

protected:
    explicit CPTextFieldCoordinator(QObject *parent);

    /** What is edited and how. Its functions are called only while there is a state. */
    void setTextField(AnyTextField field);

    /** Shows the value, unless the user is editing the text and must not be disturbed. */
    void update();
    /** Handles a key before the text input does; true if it is done with. */
    virtual bool handleKey(QKeyEvent &event);
    QString inputText() const;
    TextRange inputSelection() const;

private:
    std::optional<TextEdit> answer(const QString &text, const TextEdit &edit) const;
    void setInputText(const QString &text);
    void confineCaret();

    /** None until the subclass knows what is edited. */
    std::optional<AnyTextField> m_field;
    EditQuestion *m_editQuestion;
    QPointer<service::ColorPickerState> m_state;
    QPointer<QQuickItem> m_input;
    bool m_isEditing = false;
};

} // namespace favrin::sliders
