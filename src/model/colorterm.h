#pragma once

#include <string>

namespace favrin::model {

/** The words for colors, without their lightness. */
enum class ColorTerm {
    Beige,
    Black,
    Blue,
    BluishGray,
    BluishGreen,
    BluishPurple,
    Brown,
    BrownishGray,
    Cyan,
    Gray,
    GrayishBlue,
    GrayishGreen,
    Green,
    GreenishGray,
    Lavender,
    LimeGreen,
    Magenta,
    Maroon,
    MintGreen,
    NavyBlue,
    OliveGreen,
    Orange,
    Peach,
    Pink,
    PinkishGray,
    Purple,
    PurplishBlue,
    PurplishGray,
    PurplishPink,
    Red,
    ReddishBrown,
    Salmon,
    SkyBlue,
    Tan,
    Teal,
    Turquoise,
    White,
    Yellow,
    YellowishBrown,
    YellowishGray,
    YellowishGreen,
};

/** How light a color is for its kind: a yellow may be dark at a lightness at which a blue is light. */
enum class LightnessTerm { VeryDark, Dark, Medium, Bright, Light, VeryLight };

/**
 * The lightness word for a color called @p term, of Oklab @p lightness and @p chroma. Bright are strong colors that are
 * not dark.
 */
LightnessTerm lightnessTerm(ColorTerm term, double lightness, double chroma);

/** The word in the user's language. Any thread. */
std::string localizedName(ColorTerm term);

/**
 * What is said of a color, in the user's language, with "%@" where its name goes. One format for each lightness lets a
 * language put it before or after the name, or write both as one word. Any thread.
 */
std::string localizedFormat(LightnessTerm term);

} // namespace favrin::model
