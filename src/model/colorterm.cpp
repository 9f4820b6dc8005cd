#include "model/colorterm.h"

#include "platform/strings/localizedstring.h"

#include <array>
#include <string_view>

namespace favrin::model {

namespace {

constexpr double never = 9.0;

// Below veryDark and dark, from light and veryLight on, and from bright on by chroma, a color gets the word.
struct Limits
{
    double veryDark;
    double dark;
    double light;
    double veryLight;
    double bright;
};

struct TermEntry
{
    ColorTerm term;
    std::string_view key;
    Limits limits;
};

constexpr Limits grayLimits = {0.34, 0.52, 0.71, 0.91, never};
constexpr Limits blueLimits = {0.17, 0.40, 0.70, 0.88, 0.19};
constexpr Limits greenLimits = {0.22, 0.46, 0.79, 0.93, 0.225};
constexpr Limits purpleLimits = {0.20, 0.38, 0.65, 0.83, 0.22};
constexpr Limits brownLimits = {0.22, 0.37, 0.57, 0.75, never};
constexpr Limits pinkLimits = {0.40, 0.61, 0.80, 0.91, 0.20};

constexpr auto entries = std::to_array<TermEntry>({
    {ColorTerm::Beige, "beige", {0.50, 0.78, 0.90, 0.97, never}},
    {ColorTerm::Black, "black", grayLimits},
    {ColorTerm::Blue, "blue", blueLimits},
    {ColorTerm::BluishGray, "bluish gray", grayLimits},
    {ColorTerm::BluishGreen, "bluish green", {0.25, 0.55, 0.77, 0.91, 0.16}},
    {ColorTerm::BluishPurple, "bluish purple", purpleLimits},
    {ColorTerm::Brown, "brown", brownLimits},
    {ColorTerm::BrownishGray, "brownish gray", grayLimits},
    {ColorTerm::Cyan, "cyan", {0.40, 0.65, 0.90, 0.95, 0.12}},
    {ColorTerm::Gray, "gray", grayLimits},
    {ColorTerm::GrayishBlue, "grayish blue", {0.25, 0.50, 0.70, 0.88, never}},
    {ColorTerm::GrayishGreen, "grayish green", {0.25, 0.52, 0.75, 0.90, never}},
    {ColorTerm::Green, "green", greenLimits},
    {ColorTerm::GreenishGray, "greenish gray", grayLimits},
    {ColorTerm::Lavender, "lavender", {0.40, 0.63, 0.80, 0.92, never}},
    {ColorTerm::LimeGreen, "lime green", {0.40, 0.74, 0.88, 0.95, 0.19}},
    {ColorTerm::Magenta, "magenta", {0.30, 0.49, 0.74, 0.88, 0.23}},
    {ColorTerm::Maroon, "maroon", {0.24, 0.40, 0.50, 0.65, never}},
    {ColorTerm::MintGreen, "mint green", {0.50, 0.78, 0.89, 0.96, never}},
    {ColorTerm::NavyBlue, "navy blue", {0.19, 0.42, 0.50, 0.70, never}},
    {ColorTerm::OliveGreen, "olive green", {0.28, 0.48, 0.68, 0.86, never}},
    {ColorTerm::Orange, "orange", {0.45, 0.63, 0.79, 0.90, 0.175}},
    {ColorTerm::Peach, "peach", {0.50, 0.75, 0.87, 0.95, never}},
    {ColorTerm::Pink, "pink", pinkLimits},
    {ColorTerm::PinkishGray, "pinkish gray", grayLimits},
    {ColorTerm::Purple, "purple", purpleLimits},
    {ColorTerm::PurplishBlue, "purplish blue", blueLimits},
    {ColorTerm::PurplishGray, "purplish gray", grayLimits},
    {ColorTerm::PurplishPink, "purplish pink", pinkLimits},
    {ColorTerm::Red, "red", {0.26, 0.50, 0.66, 0.80, 0.21}},
    {ColorTerm::ReddishBrown, "reddish brown", brownLimits},
    {ColorTerm::Salmon, "salmon", {0.45, 0.66, 0.78, 0.90, never}},
    {ColorTerm::SkyBlue, "sky blue", {0.40, 0.68, 0.78, 0.90, never}},
    {ColorTerm::Tan, "tan", {0.45, 0.70, 0.82, 0.93, never}},
    {ColorTerm::Teal, "teal", {0.30, 0.53, 0.73, 0.88, 0.14}},
    {ColorTerm::Turquoise, "turquoise", {0.40, 0.62, 0.86, 0.94, 0.13}},
    {ColorTerm::White, "white", grayLimits},
    {ColorTerm::Yellow, "yellow", {0.55, 0.84, 0.87, 0.975, 0.168}},
    {ColorTerm::YellowishBrown, "yellowish brown", {0.28, 0.45, 0.65, 0.80, never}},
    {ColorTerm::YellowishGray, "yellowish gray", grayLimits},
    {ColorTerm::YellowishGreen, "yellowish green", {0.30, 0.60, 0.80, 0.94, 0.205}},
});

constexpr bool isInOrderOfTerms()
{
    for (std::size_t i = 0; i < entries.size(); ++i) {
        if (entries[i].term != static_cast<ColorTerm>(i))
            return false;
    }
    return true;
}
static_assert(isInOrderOfTerms());

const TermEntry &entryOf(ColorTerm term)
{
    return entries[static_cast<std::size_t>(term)];
}

} // namespace

LightnessTerm lightnessTerm(ColorTerm term, double lightness, double chroma)
{
    const Limits &limits = entryOf(term).limits;
    if (lightness < limits.veryDark)
        return LightnessTerm::VeryDark;
    if (lightness < limits.dark)
        return LightnessTerm::Dark;
    if (chroma >= limits.bright)
        return LightnessTerm::Bright;
    if (lightness >= limits.veryLight)
        return LightnessTerm::VeryLight;
    return lightness >= limits.light ? LightnessTerm::Light : LightnessTerm::Medium;
}

std::string localizedName(ColorTerm term)
{
    return platform::localizedString(entryOf(term).key, "Name of a color, spoken after a lightness word.");
}

std::string localizedName(LightnessTerm term)
{
    constexpr std::array<std::string_view, 6> keys = {"very dark", "dark", "medium", "bright", "light", "very light"};
    return platform::localizedString(keys[static_cast<std::size_t>(term)],
                                     "Lightness of a color, spoken before the color's name.");
}

} // namespace favrin::model
