#pragma once

#include "apps/tool/parenthandle.h"

class QString;
class QWindow;

namespace favrin::tool {

/**
 * Makes @p window, which is shown, belong to the window of another client: it stays above that one. A text for the log
 * when that cannot be, else an empty one; the window is shown in any case.
 */
QString attach(QWindow &window, const ParentHandle &parent);

} // namespace favrin::tool
