#pragma once

#include "host/fvcolor.h"

#include <QList>
#include <QString>

#include <optional>

namespace favrin::fake {

/** One message of a picker to its host. */
struct ScriptStep
{
    enum class Kind { Pick, ShowEyedropper, FloatEyedropper, DismissEyedropper, Finish, Terminate };

    Kind kind = Kind::Pick;
    FVColor color = {};
    bool isVolatile = false;
    /** The eyedropper's own report does not name the color's space. */
    bool namesSpace = true;
    QString error = {};
};

using ScriptSteps = QList<ScriptStep>;

/** The script that waits longest, which then waits no more; none when none waits. */
std::optional<ScriptSteps> takeWaitingScript();

} // namespace favrin::fake
