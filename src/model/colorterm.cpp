#include "model/colorterm.h"

#include "platform/strings/localizedstring.h"

#include <array>
#include <string_view>

namespace favrin::model {

namespace {

using platform::localizable;

constexpr std::string_view termComment =
    "Name of a color, spoken alone or within \"dark %@\" and the like: all names in one form that fits there.";
constexpr std::string_view lightnessComment =
    "Lightness of a color; %@ is its name, such as \"blue\". In one form that fits all the names.";

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
    {ColorTerm::Beige, localizable("beige", termComment), {0.50, 0.78, 0.90, 0.97, never}},
    {ColorTerm::Black, localizable("black", termComment), grayLimits},
    {ColorTerm::Blue, localizable("blue", termComment), blueLimits},
    {ColorTerm::BluishGray, localizable("bluish gray", termComment), grayLimits},
    {ColorTerm::BluishGreen, localizable("bluish green", termComment), {0.25, 0.55, 0.77, 0.91, 0.16}},
    {ColorTerm::BluishPurple, localizable("bluish purple", termComment), purpleLimits},
    {ColorTerm::Brown, localizable("brown", termComment), brownLimits},
    {ColorTerm::BrownishGray, localizable("brownish gray", termComment), grayLimits},
    {ColorTerm::Cyan, localizable("cyan", termComment), {0.40, 0.65, 0.90, 0.95, 0.12}},
    {ColorTerm::Gray, localizable("gray", termComment), grayLimits},
    {ColorTerm::GrayishBlue, localizable("grayish blue", termComment), {0.25, 0.50, 0.70, 0.88, never}},
    {ColorTerm::GrayishGreen, localizable("grayish green", termComment), {0.25, 0.52, 0.75, 0.90, never}},
    {ColorTerm::Green, localizable("green", termComment), greenLimits},
    {ColorTerm::GreenishGray, localizable("greenish gray", termComment), grayLimits},
    {ColorTerm::Lavender, localizable("lavender", termComment), {0.40, 0.63, 0.80, 0.92, never}},
    {ColorTerm::LimeGreen, localizable("lime green", termComment), {0.40, 0.74, 0.88, 0.95, 0.19}},
    {ColorTerm::Magenta, localizable("magenta", termComment), {0.30, 0.49, 0.74, 0.88, 0.23}},
    {ColorTerm::Maroon, localizable("maroon", termComment), {0.24, 0.40, 0.50, 0.65, never}},
    {ColorTerm::MintGreen, localizable("mint green", termComment), {0.50, 0.78, 0.89, 0.96, never}},
    {ColorTerm::NavyBlue, localizable("navy blue", termComment), {0.19, 0.42, 0.50, 0.70, never}},
    {ColorTerm::OliveGreen, localizable("olive green", termComment), {0.28, 0.48, 0.68, 0.86, never}},
    {ColorTerm::Orange, localizable("orange", termComment), {0.45, 0.63, 0.79, 0.90, 0.175}},
    {ColorTerm::Peach, localizable("peach", termComment), {0.50, 0.75, 0.87, 0.95, never}},
    {ColorTerm::Pink, localizable("pink", termComment), pinkLimits},
    {ColorTerm::PinkishGray, localizable("pinkish gray", termComment), grayLimits},
    {ColorTerm::Purple, localizable("purple", termComment), purpleLimits},
    {ColorTerm::PurplishBlue, localizable("purplish blue", termComment), blueLimits},
    {ColorTerm::PurplishGray, localizable("purplish gray", termComment), grayLimits},
    {ColorTerm::PurplishPink, localizable("purplish pink", termComment), pinkLimits},
    {ColorTerm::Red, localizable("red", termComment), {0.26, 0.50, 0.66, 0.80, 0.21}},
    {ColorTerm::ReddishBrown, localizable("reddish brown", termComment), brownLimits},
    {ColorTerm::Salmon, localizable("salmon", termComment), {0.45, 0.66, 0.78, 0.90, never}},
    {ColorTerm::SkyBlue, localizable("sky blue", termComment), {0.40, 0.68, 0.78, 0.90, never}},
    {ColorTerm::Tan, localizable("tan", termComment), {0.45, 0.70, 0.82, 0.93, never}},
    {ColorTerm::Teal, localizable("teal", termComment), {0.30, 0.53, 0.73, 0.88, 0.14}},
    {ColorTerm::Turquoise, localizable("turquoise", termComment), {0.40, 0.62, 0.86, 0.94, 0.13}},
    {ColorTerm::White, localizable("white", termComment), grayLimits},
    {ColorTerm::Yellow, localizable("yellow", termComment), {0.55, 0.84, 0.87, 0.975, 0.168}},
    {ColorTerm::YellowishBrown, localizable("yellowish brown", termComment), {0.28, 0.45, 0.65, 0.80, never}},
    {ColorTerm::YellowishGray, localizable("yellowish gray", termComment), grayLimits},
    {ColorTerm::YellowishGreen, localizable("yellowish green", termComment), {0.30, 0.60, 0.80, 0.94, 0.205}},
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
    return platform::localizedString(entryOf(term).key, termComment);
}

std::string localizedFormat(LightnessTerm term)
{
    constexpr std::array formats = {
        localizable("very dark %@", lightnessComment), localizable("dark %@", lightnessComment),
        localizable("medium %@", lightnessComment),    localizable("bright %@", lightnessComment),
        localizable("light %@", lightnessComment),     localizable("very light %@", lightnessComment),
    };
    return platform::localizedString(formats[static_cast<std::size_t>(term)], lightnessComment);
}

} // namespace favrin::model
