#include "host/session/picker.h"

#include <utility>

namespace favrin::host {

void Picker::setState(State state)
{
    if (std::exchange(m_state, state) != state)
        Q_EMIT stateChanged();
}

} // namespace favrin::host
