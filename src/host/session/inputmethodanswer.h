#pragma once

#include <QVariant>
#include <qnamespace.h>

namespace favrin::host {

namespace server {
struct TextInputState;
}

/** What the host's input method asks of the focused field, answered from what the service said of it. */
QVariant inputMethodAnswer(const server::TextInputState &state, Qt::InputMethodQuery query);

} // namespace favrin::host
