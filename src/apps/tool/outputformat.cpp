#include "apps/tool/outputformat.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <utility>

namespace favrin::tool {

using model::SomeColor;
using Component = SomeColor::Component;

namespace {

std::string writeHex(const Choice &color, std::string_view)
{
    return hexText(color);
}

std::string writeHexWithOpacity(const Choice &color, std::string_view)
{
    return hexWithOpacityText(color);
}

std::string writeCss(const Choice &color, std::string_view)
{
    return cssText(color);
}

std::string writeSpace(const Choice &color, std::string_view)
{
    return color ? std::string(spaceText(color->colorSpace)) : "none";
}

std::string writeName(const Choice &, std::string_view name)
{
    return std::string(name);
}

template<Component component>
std::string writeNumber(const Choice &color, std::string_view)
{
    return color ? numberText((*color)[component]) : "none";
}

template<Component component>
std::string writeByte(const Choice &color, std::string_view)
{
    if (!color)
        return "none";
    return std::to_string(std::lround(std::clamp(color->inSRGB()[component], 0.0, 1.0) * 255.0));
}

} // namespace

OutputFormat::Writer OutputFormat::writer(std::string_view placeholder)
{
    static constexpr std::array<std::pair<std::string_view, Writer>, 14> writers = {{
        {"hex", writeHex},
        {"hex8", writeHexWithOpacity},
        {"css", writeCss},
        {"json", jsonText},
        {"space", writeSpace},
        {"name", writeName},
        {"red", writeNumber<Component::r>},
        {"green", writeNumber<Component::g>},
        {"blue", writeNumber<Component::b>},
        {"alpha", writeNumber<Component::a>},
        {"red8", writeByte<Component::r>},
        {"green8", writeByte<Component::g>},
        {"blue8", writeByte<Component::b>},
        {"alpha8", writeByte<Component::a>},
    }};
    const auto *found = std::ranges::find(writers, placeholder, &std::pair<std::string_view, Writer>::first);
    return found == writers.end() ? nullptr : found->second;
}

OutputFormat OutputFormat::hex()
{
    return OutputFormat({&writeHex});
}

OutputFormat OutputFormat::hexWithOpacity()
{
    return OutputFormat({&writeHexWithOpacity});
}

std::optional<OutputFormat> OutputFormat::parsed(std::string_view text)
{
    constexpr std::array<std::string_view, 4> named = {"hex", "hex8", "css", "json"};
    if (std::ranges::find(named, text) != named.end())
        return OutputFormat({writer(text)});
    if (text.find('{') == std::string_view::npos)
        return std::nullopt;

    std::vector<Piece> pieces;
    std::string literal;
    while (!text.empty()) {
        const char c = text.front();
        text.remove_prefix(1);
        if (c != '{' && c != '}') {
            literal += c;
            continue;
        }
        if (text.starts_with(c)) {
            literal += c;
            text.remove_prefix(1);
            continue;
        }
        const auto end = text.find('}');
        const Writer placeholder = c == '{' && end != std::string_view::npos ? writer(text.substr(0, end)) : nullptr;
        if (!placeholder)
            return std::nullopt;
        pieces.emplace_back(std::exchange(literal, {}));
        pieces.emplace_back(placeholder);
        text.remove_prefix(end + 1);
    }
    pieces.emplace_back(std::move(literal));
    return OutputFormat(std::move(pieces));
}

std::string OutputFormat::text(const Choice &color, std::string_view name) const
{
    std::string text;
    for (const auto &piece : m_pieces) {
        if (const auto *literal = std::get_if<std::string>(&piece))
            text += *literal;
        else
            text += std::get<Writer>(piece)(color, name);
    }
    return text;
}

} // namespace favrin::tool
