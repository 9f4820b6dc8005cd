#include "model/colorcoding.h"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdint>
#include <optional>

namespace favrin::model {

namespace {

using OrderedJson = nlohmann::ordered_json;
// For reading, where the order means nothing: looking a key up in an ordered object walks through all of them.
using Json = nlohmann::json;

constexpr std::size_t longestText = 16U << 20U;
constexpr int deepestNesting = 64;

OrderedJson numberValue(double number)
{
    // A whole number is written without a fraction. Minus zero has to keep its sign, which an integer cannot.
    const bool isSmallWhole = std::abs(number) <= 1e15 && std::trunc(number) == number;
    if (isSmallWhole && !(number == 0.0 && std::signbit(number)))
        return static_cast<std::int64_t>(number);
    return number;
}

std::variant<OrderedJson, CodingError> encodedObject(const SomeColor &color)
{
    const std::array components = {color.r, color.g, color.b, color.a};
    if (!std::all_of(components.begin(), components.end(), [](double component) { return std::isfinite(component); }))
        return CodingError::nonFiniteNumber;
    OrderedJson object = OrderedJson::object();
    object["r"] = numberValue(color.r);
    object["g"] = numberValue(color.g);
    object["b"] = numberValue(color.b);
    object["a"] = numberValue(color.a);
    object["colorSpace"] = OrderedJson::object({{"rawValue", platformName(color.colorSpace)}});
    return object;
}

std::variant<double, CodingError> decodedNumber(const Json &object, const char *key)
{
    const auto found = object.find(key);
    if (found == object.end())
        return CodingError::keyNotFound;
    if (!found->is_number())
        return CodingError::typeMismatch;
    return found->get<double>();
}

std::variant<SomeColor::ColorSpace, CodingError> decodedColorSpace(const Json &object)
{
    const auto space = object.find("colorSpace");
    if (space == object.end())
        return CodingError::keyNotFound;
    if (!space->is_object())
        return CodingError::typeMismatch;
    const auto rawValue = space->find("rawValue");
    if (rawValue == space->end())
        return CodingError::keyNotFound;
    if (!rawValue->is_string())
        return CodingError::typeMismatch;
    const auto known = colorSpaceFromPlatformName(rawValue->get_ref<const std::string &>());
    if (!known)
        return CodingError::unknownRawValue;
    return *known;
}

std::variant<SomeColor, CodingError> decodedObject(const Json &object)
{
    if (!object.is_object())
        return CodingError::typeMismatch;
    std::array<double, 4> components = {};
    for (std::size_t i = 0; i < components.size(); ++i) {
        constexpr std::array keys = {"r", "g", "b", "a"};
        const auto number = decodedNumber(object, keys[i]);
        if (const auto *error = std::get_if<CodingError>(&number))
            return *error;
        components[i] = std::get<double>(number);
    }
    const auto space = decodedColorSpace(object);
    if (const auto *error = std::get_if<CodingError>(&space))
        return *error;
    return SomeColor(components[0], components[1], components[2], components[3],
                     std::get<SomeColor::ColorSpace>(space));
}

// A hostile text could otherwise buy much memory with few bytes.
bool isNestedTooDeeply(std::string_view json)
{
    int depth = 0;
    bool isInString = false;
    for (std::size_t i = 0; i < json.size(); ++i) {
        const char c = json[i];
        if (isInString && c == '\\')
            ++i;
        else if (c == '"')
            isInString = !isInString;
        else if (!isInString && (c == '[' || c == '{') && ++depth > deepestNesting)
            return true;
        else if (!isInString && (c == ']' || c == '}'))
            --depth;
    }
    return false;
}

std::optional<Json> parsed(std::string_view json)
{
    if (json.size() > longestText || isNestedTooDeeply(json))
        return std::nullopt;
    Json value = Json::parse(json, nullptr, false);
    if (value.is_discarded())
        return std::nullopt;
    return value;
}

} // namespace

std::variant<std::string, CodingError> encodedColor(const SomeColor &color)
{
    const auto object = encodedObject(color);
    if (const auto *error = std::get_if<CodingError>(&object))
        return *error;
    return std::get<OrderedJson>(object).dump();
}

std::variant<SomeColor, CodingError> decodedColor(std::string_view json)
{
    const std::optional<Json> value = parsed(json);
    if (!value)
        return CodingError::dataCorrupted;
    return decodedObject(*value);
}

std::variant<std::string, CodingError> encodedColors(std::span<const SomeColor> colors)
{
    OrderedJson list = OrderedJson::array();
    for (const SomeColor &color : colors) {
        auto object = encodedObject(color);
        if (const auto *error = std::get_if<CodingError>(&object))
            return *error;
        list.push_back(std::get<OrderedJson>(std::move(object)));
    }
    return list.dump();
}

std::variant<std::vector<SomeColor>, CodingError> decodedColors(std::string_view json)
{
    const std::optional<Json> list = parsed(json);
    if (!list)
        return CodingError::dataCorrupted;
    if (!list->is_array())
        return CodingError::typeMismatch;
    std::vector<SomeColor> colors;
    for (const Json &object : *list) {
        const auto color = decodedObject(object);
        if (const auto *error = std::get_if<CodingError>(&color))
            return *error;
        colors.push_back(std::get<SomeColor>(color));
    }
    return colors;
}

} // namespace favrin::model
