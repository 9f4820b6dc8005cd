#include "sliders/editquestion.h"

namespace favrin::sliders {

EditQuestion::EditQuestion(Answer answer, QObject *parent) : QValidator(parent), m_answer(std::move(answer)) {}

void EditQuestion::setText(const QString &text)
{
    m_text = text;
    m_givenText = text;
}

QValidator::State EditQuestion::validate(QString &text, int &caret) const
{
    if (text == m_text)
        return Acceptable;
    const TextEdit asked = editBetween(m_text, m_selection, text);
    const auto answer = text == m_givenText ? std::optional(asked) : m_answer(m_text, asked);
    if (!answer)
        return Invalid;
    if (answer != asked) {
        text = edited(m_text, *answer);
        caret = static_cast<int>(answer->range.location + answer->replacement.size());
    }
    m_text = text;
    return Acceptable;
}

} // namespace favrin::sliders
