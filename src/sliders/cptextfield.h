#pragma once

#include "sliders/slidercontrolstyle.h"
#include "sliders/textedit.h"

#include <functional>
#include <optional>
#include <utility>

namespace favrin::sliders {

/** Reads and writes a value that somebody else keeps. */
template<class Value>
struct Binding
{
    std::function<Value()> read;
    std::function<void(const Value &)> write;
};

/** Which keys an on-screen keyboard offers. */
enum class KeyboardType { DecimalPad, AsciiCapable };

/** A text field for a value of any type: what it edits, how the value is shown, and what may be typed. */
template<class Value>
struct CPTextField
{
    Binding<Value> value;
    /** Whether a change of the value replaces the text while the user is editing it. */
    bool allowUpdatesWhileEditing = false;
    /** Whether the caret is kept at the number in the text. */
    bool selectionOnNumber = false;
    KeyboardType keyboardType = KeyboardType::DecimalPad;
    std::function<QString(const Value &)> conversionToStringBlock;
    /** None for a text that is no value. */
    std::function<std::optional<Value>(const QString &)> conversionToTypeBlock;
    EditFilter shouldChangeCharacters;
    /** What an edit becomes before the filter judges it; unset, it stays as it is. */
    std::function<TextEdit(const QString &text, const TextEdit &edit)> editBeforeFilter = nullptr;
};

/** A CPTextField whose value's type has been forgotten. */
class AnyTextField
{
public:
    template<class Value>
    AnyTextField(CPTextField<Value> field) // NOLINT(google-explicit-constructor): it is meant to convert
        : allowUpdatesWhileEditing(field.allowUpdatesWhileEditing)
        , selectionOnNumber(field.selectionOnNumber)
        , keyboardType(field.keyboardType)
        , shouldChangeCharacters(std::move(field.shouldChangeCharacters))
        , editBeforeFilter(std::move(field.editBeforeFilter))
        , text([read = field.value.read, toString = field.conversionToStringBlock] { return toString(read()); })
        , commit([write = field.value.write, toType = field.conversionToTypeBlock](const QString &typed) {
            if (const auto value = toType(typed))
                write(*value);
        })
    {
    }

    bool allowUpdatesWhileEditing;
    bool selectionOnNumber;
    KeyboardType keyboardType;
    EditFilter shouldChangeCharacters;
    std::function<TextEdit(const QString &, const TextEdit &)> editBeforeFilter;
    /** The value as it is shown. */
    std::function<QString()> text;
    /** Writes the value that a text means, if it means one. */
    std::function<void(const QString &)> commit;
};

} // namespace favrin::sliders
