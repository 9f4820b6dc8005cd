#include "sliders/cptextfieldcoordinator.h"

#include "platform/strings/localizedstring.h"
#include "sliders/caretconfinement.h"
#include "sliders/editquestion.h"
#include "theme/theme.h"

#include <QGuiApplication>
#include <QInputMethod>
#include <QKeyEvent>

namespace favrin::sliders {

using service::ColorPickerState;

namespace {

// The class of the text input is private to the toolkit; its properties are not.
constexpr const char *textProperty = "text";
constexpr const char *caretProperty = "cursorPosition";
constexpr const char *selectionStartProperty = "selectionStart";
constexpr const char *selectionEndProperty = "selectionEnd";

} // namespace

CPTextFieldCoordinator::CPTextFieldCoordinator(QObject *parent)
    : QObject(parent)
    , m_editQuestion(
          new EditQuestion([this](const QString &text, const TextEdit &edit) { return answer(text, edit); }, this))
{
    connect(QGuiApplication::inputMethod(), &QInputMethod::visibleChanged, this,
            &CPTextFieldCoordinator::keyboardVisibleChanged);
    connect(&theme::Theme::instance(), &theme::Theme::localeChanged, this, [this] {
        update();
        Q_EMIT nameChanged();
    });
}

void CPTextFieldCoordinator::setColorPickerState(ColorPickerState *state)
{
    if (state == m_state)
        return;
    if (m_state)
        m_state->disconnect(this);
    m_state = state;
    if (state) {
        connect(state, &ColorPickerState::selectedColorChanged, this, &CPTextFieldCoordinator::update);
        connect(state, &ColorPickerState::fallbackColorChanged, this, &CPTextFieldCoordinator::update);
    }
    update();
    Q_EMIT colorPickerStateChanged();
}

void CPTextFieldCoordinator::setField(QQuickItem *input)
{
    if (input == m_input)
        return;
    if (m_input)
        m_input->removeEventFilter(this);
    m_input = input;
    if (input)
        input->installEventFilter(this);
    update();
    Q_EMIT fieldChanged();
}

void CPTextFieldCoordinator::setTextField(AnyTextField field)
{
    m_field = std::move(field);
    update();
    Q_EMIT textFieldChanged();
}

QValidator *CPTextFieldCoordinator::editQuestion() const
{
    return m_editQuestion;
}

bool CPTextFieldCoordinator::isDecimalPad() const
{
    return m_field && m_field->keyboardType == KeyboardType::DecimalPad;
}

Qt::InputMethodHints CPTextFieldCoordinator::inputMethodHints() const
{
    if (isDecimalPad())
        return Qt::ImhDigitsOnly | Qt::ImhNoPredictiveText;
    return Qt::ImhLatinOnly | Qt::ImhPreferUppercase | Qt::ImhNoPredictiveText;
}

QQuickItem *CPTextFieldCoordinator::viewport() const
{
    for (QQuickItem *item = m_input; item; item = item->parentItem()) {
        if (item->inherits("QQuickFlickable") || !item->parentItem())
            return item;
    }
    return nullptr;
}

bool CPTextFieldCoordinator::isKeyboardVisible() const
{
    return QGuiApplication::inputMethod()->isVisible();
}

QString CPTextFieldCoordinator::doneLabel() const
{
    return QString::fromStdString(platform::localizedString("Done", "Button that ends editing a number"));
}

void CPTextFieldCoordinator::update()
{
    if (!m_field || !m_state || !m_input || (m_isEditing && !m_field->allowUpdatesWhileEditing))
        return;
    const QString text = m_field->text();
    if (text == inputText())
        return;
    setInputText(text);
    confineCaret();
}

void CPTextFieldCoordinator::textFieldValueChanged()
{
    if (m_field && m_state && m_input)
        m_field->commit(inputText());
}

void CPTextFieldCoordinator::setEditing(bool isEditing)
{
    if (isEditing == m_isEditing)
        return;
    m_isEditing = isEditing;
    if (!isEditing)
        update();
    else if (m_state && !m_state->hasSelectedColor())
        m_state->selectedColor.set(m_state->fallbackColor());
}

void CPTextFieldCoordinator::selectionChanged()
{
    if (!m_input)
        return;
    m_editQuestion->setSelection(inputSelection());
    confineCaret();
}

void CPTextFieldCoordinator::endEditing()
{
    // Not to nobody: from there a key such as Escape would not reach the picker.
    if (m_input && m_input->parentItem())
        m_input->parentItem()->forceActiveFocus();
}

bool CPTextFieldCoordinator::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() == QEvent::KeyPress)
        return handleKey(*static_cast<QKeyEvent *>(event));
    if (event->type() == QEvent::FocusIn) {
        // Coming by the keyboard one types a new value; coming by pointer one has chosen a place in the old one.
        const auto reason = static_cast<QFocusEvent *>(event)->reason();
        if (reason == Qt::TabFocusReason || reason == Qt::BacktabFocusReason)
            QMetaObject::invokeMethod(watched, "selectAll");
    }
    return QObject::eventFilter(watched, event);
}

bool CPTextFieldCoordinator::handleKey(QKeyEvent &)
{
    return false;
}

QString CPTextFieldCoordinator::inputText() const
{
    return m_input->property(textProperty).toString();
}

TextRange CPTextFieldCoordinator::inputSelection() const
{
    const auto start = m_input->property(selectionStartProperty).toInt();
    return {start, m_input->property(selectionEndProperty).toInt() - start};
}

std::optional<TextEdit> CPTextFieldCoordinator::answer(const QString &text, const TextEdit &edit) const
{
    if (!m_field || !m_state)
        return std::nullopt;
    const TextEdit meant = m_field->editBeforeFilter ? m_field->editBeforeFilter(text, edit) : edit;
    return m_field->shouldChangeCharacters(text, meant.range, meant.replacement) ? std::optional(meant) : std::nullopt;
}

void CPTextFieldCoordinator::setInputText(const QString &text)
{
    m_editQuestion->setText(text);
    m_input->setProperty(textProperty, text);
    m_editQuestion->setSelection(inputSelection());
}

void CPTextFieldCoordinator::confineCaret()
{
    if (!m_field || !m_field->selectionOnNumber || inputSelection().length > 0)
        return;
    const auto caret = m_input->property(caretProperty).toLongLong();
    const auto confined = confinedCaret(inputText(), caret);
    if (confined != caret)
        m_input->setProperty(caretProperty, static_cast<int>(confined));
}

} // namespace favrin::sliders
