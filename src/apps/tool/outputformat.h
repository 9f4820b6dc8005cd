#pragma once

#include "apps/tool/colortext.h"

#include <optional>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace favrin::tool {

/** How the chosen color is printed: one of the named forms, or a template with placeholders in braces. */
class OutputFormat
{
public:
    static OutputFormat hex();
    static OutputFormat hexWithOpacity();

    /**
     * The format called "hex", "hex8", "css" or "json", or the template that @p text is when it holds a brace: "{hex}",
     * "{hex8}", "{css}", "{json}", "{space}", "{red}", "{green}", "{blue}", "{alpha}" (0 to 1 in the color's own
     * space),
     * "{red8}", "{green8}", "{blue8}", "{alpha8}" (0 to 255 in sRGB), "{name}"; "{{" and "}}" are the braces
     * themselves. None for anything else.
     */
    static std::optional<OutputFormat> parsed(std::string_view text);

    /** Without a line end. A template's placeholders of a color that is none read "none". */
    std::string text(const Choice &color, std::string_view name) const;

private:
    using Writer = std::string (*)(const Choice &color, std::string_view name);
    using Piece = std::variant<std::string, Writer>;

    static Writer writer(std::string_view placeholder);
    explicit OutputFormat(std::vector<Piece> pieces) : m_pieces(std::move(pieces)) {}

    std::vector<Piece> m_pieces;
};

} // namespace favrin::tool
