#pragma once

#include "sliders/textedit.h"

#include <QValidator>

#include <functional>

namespace favrin::sliders {

/**
 * Puts the question whether an edit may be made, before it is made: Qt Quick's text input asks a validator about the
 * text as it would become, whichever way the edit came (keys, input method, paste, drop), and takes back what is
 * Invalid. Here that text is turned into the edit that leads to it.
 */
class EditQuestion : public QValidator
{
    Q_OBJECT

public:
    /** The edit to make instead of @p edit, or none where nothing may be changed. */
    using Answer = std::function<std::optional<TextEdit>(const QString &text, const TextEdit &edit)>;

    explicit EditQuestion(Answer answer, QObject *parent = nullptr);

    /** The text that is put in by the program; it is not asked about, also when an undo brings it back. */
    void setText(const QString &text);
    /** What is selected now; empty for a caret. */
    void setSelection(TextRange selection) { m_selection = selection; }

    State validate(QString &text, int &caret) const override;

private:
    Answer m_answer;
    mutable QString m_text;
    QString m_givenText;
    TextRange m_selection;
};

} // namespace favrin::sliders
