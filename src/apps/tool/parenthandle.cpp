#include "apps/tool/parenthandle.h"

#include <algorithm>

namespace favrin::tool {

namespace {

/** Handles are some 36 characters long. */
constexpr qsizetype longestHandle = 256;

bool isHandle(const QString &text)
{
    const auto isPrintable = [](QChar c) { return c > u' ' && c.unicode() < 127; };
    return !text.isEmpty() && text.size() <= longestHandle && std::all_of(text.begin(), text.end(), isPrintable);
}

} // namespace

std::optional<ParentHandle> parsedParentHandle(const QString &text)
{
    const auto kind = text.section(u':', 0, 0);
    const auto rest = text.section(u':', 1);
    if (kind == u"x11") {
        bool isNumber = false;
        const auto identifier = rest.toUInt(&isNumber, 16);
        if (isNumber && identifier != 0 && isHandle(rest))
            return X11Window{identifier};
    }
    if (kind == u"wayland" && isHandle(rest))
        return WaylandHandle{rest};
    return std::nullopt;
}

} // namespace favrin::tool
