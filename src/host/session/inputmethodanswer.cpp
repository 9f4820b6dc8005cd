#include "host/session/inputmethodanswer.h"

#include "host/server/remoteviewserver.h"

#include <QRectF>
#include <QString>

#include <array>
#include <utility>

namespace favrin::host {

namespace {

/** Purposes and hints as numbered by text-input-unstable-v1. */
constexpr std::array<std::pair<std::uint32_t, Qt::InputMethodHint>, 5> purposes = {{
    {2, Qt::ImhDigitsOnly},
    {3, Qt::ImhFormattedNumbersOnly},
    {4, Qt::ImhDialableCharactersOnly},
    {5, Qt::ImhUrlCharactersOnly},
    {6, Qt::ImhEmailCharactersOnly},
}};
constexpr std::array<std::pair<std::uint32_t, Qt::InputMethodHint>, 6> hints = {{
    {0x10, Qt::ImhPreferLowercase},
    {0x20, Qt::ImhPreferUppercase},
    {0x40, Qt::ImhHiddenText},
    {0x80, Qt::ImhSensitiveData},
    {0x100, Qt::ImhLatinOnly},
    {0x200, Qt::ImhMultiLine},
}};
constexpr std::uint32_t autoCompletion = 0x1;

Qt::InputMethodHints inputMethodHints(const server::TextInputState &state)
{
    Qt::InputMethodHints result;
    for (const auto &[purpose, hint] : purposes)
        result.setFlag(hint, state.contentPurpose == purpose);
    for (const auto &[bit, hint] : hints)
        result.setFlag(hint, (state.contentHints & bit) != 0);
    result.setFlag(Qt::ImhNoPredictiveText, (state.contentHints & autoCompletion) == 0);
    return result;
}

/** Bytes of the UTF-8 text as UTF-16 units. */
int units(const server::TextInputState &state, std::uint32_t bytes)
{
    const auto text = QByteArray::fromStdString(state.surroundingText);
    return static_cast<int>(QString::fromUtf8(text.left(bytes)).size());
}

} // namespace

QVariant inputMethodAnswer(const server::TextInputState &state, Qt::InputMethodQuery query)
{
    const auto &rectangle = state.cursorRectangle;
    switch (query) {
    case Qt::ImEnabled:
        return state.enabled;
    case Qt::ImHints:
        return QVariant::fromValue(static_cast<int>(inputMethodHints(state)));
    case Qt::ImCursorRectangle:
    case Qt::ImAnchorRectangle:
        return QRectF(rectangle.x, rectangle.y, rectangle.width, rectangle.height);
    case Qt::ImSurroundingText:
        return QString::fromStdString(state.surroundingText);
    case Qt::ImCursorPosition:
    case Qt::ImAbsolutePosition:
        return units(state, state.cursor);
    case Qt::ImAnchorPosition:
        return units(state, state.anchor);
    case Qt::ImCurrentSelection: {
        const auto text = QString::fromStdString(state.surroundingText);
        const int from = units(state, std::min(state.cursor, state.anchor));
        return text.mid(from, units(state, std::max(state.cursor, state.anchor)) - from);
    }
    default:
        return {};
    }
}

} // namespace favrin::host
