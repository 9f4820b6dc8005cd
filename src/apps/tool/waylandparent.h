#pragma once

class QString;
class QWindow;

namespace favrin::tool {

/** As attach(), by the xdg-foreign handle that the other client was given for its window. */
QString attachToWayland(QWindow &window, const QString &handle);

} // namespace favrin::tool
