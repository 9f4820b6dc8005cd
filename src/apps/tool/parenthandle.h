#pragma once

#include <QString>

#include <optional>
#include <variant>

#include <cstdint>

namespace favrin::tool {

/** A window of the X server, by its number. */
struct X11Window
{
    std::uint32_t identifier = 0;

    bool operator==(const X11Window &) const = default;
};

/** A window that another client exported by xdg-foreign. */
struct WaylandHandle
{
    QString text;

    bool operator==(const WaylandHandle &) const = default;
};

/** The window that the picker's window belongs to. */
using ParentHandle = std::variant<std::monostate, X11Window, WaylandHandle>;

/** What "x11:<number in hexadecimal>" or "wayland:<handle>" means; none for any other text. */
std::optional<ParentHandle> parsedParentHandle(const QString &text);

} // namespace favrin::tool
