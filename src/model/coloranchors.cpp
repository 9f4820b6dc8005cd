#include "model/coloranchors.h"

#include <algorithm>
#include <array>

namespace favrin::model {

namespace {

struct Anchor
{
    ColorTerm term;
    Oklab place;
};

// Checked by the agreement test against the survey: move an anchor only with an eye on its result.
constexpr auto anchors = std::to_array<Anchor>({
    {ColorTerm::Beige, {0.911, -0.022, 0.089}},
    {ColorTerm::Beige, {0.922, 0.012, 0.021}},
    {ColorTerm::Beige, {0.957, -0.008, 0.034}},
    {ColorTerm::Black, {0.154, -0.029, -0.015}},
    {ColorTerm::Blue, {0.403, -0.004, -0.074}},
    {ColorTerm::Blue, {0.475, 0.035, -0.235}},
    {ColorTerm::Blue, {0.545, -0.056, -0.069}},
    {ColorTerm::Blue, {0.613, -0.041, -0.057}},
    {ColorTerm::Blue, {0.659, -0.004, -0.149}},
    {ColorTerm::Blue, {0.835, -0.021, -0.076}},
    {ColorTerm::Blue, {0.911, -0.023, -0.037}},
    {ColorTerm::Blue, {0.958, -0.032, -0.017}},
    {ColorTerm::BluishGreen, {0.526, -0.102, 0.001}},
    {ColorTerm::BluishGreen, {0.790, -0.153, 0.056}},
    {ColorTerm::BluishPurple, {0.153, 0.063, -0.109}},
    {ColorTerm::BluishPurple, {0.496, 0.065, -0.206}},
    {ColorTerm::Brown, {0.273, 0.052, 0.049}},
    {ColorTerm::Brown, {0.311, 0.041, 0.008}},
    {ColorTerm::Brown, {0.390, 0.043, 0.081}},
    {ColorTerm::Brown, {0.522, 0.010, 0.090}},
    {ColorTerm::Brown, {0.566, 0.063, 0.090}},
    {ColorTerm::Cyan, {0.896, -0.136, -0.053}},
    {ColorTerm::Cyan, {0.924, -0.098, -0.011}},
    {ColorTerm::Gray, {0.311, -0.015, -0.000}},
    {ColorTerm::Gray, {0.580, -0.008, -0.004}},
    {ColorTerm::Gray, {0.678, -0.023, 0.024}},
    {ColorTerm::Gray, {0.690, -0.003, 0.001}},
    {ColorTerm::Gray, {0.929, -0.006, 0.007}},
    {ColorTerm::GrayishBlue, {0.616, -0.033, -0.040}},
    {ColorTerm::GrayishGreen, {0.719, -0.055, 0.047}},
    {ColorTerm::Green, {0.324, -0.077, 0.023}},
    {ColorTerm::Green, {0.550, -0.067, 0.078}},
    {ColorTerm::Green, {0.606, -0.089, 0.056}},
    {ColorTerm::Green, {0.708, -0.073, 0.138}},
    {ColorTerm::Green, {0.763, -0.174, 0.079}},
    {ColorTerm::Green, {0.847, -0.091, 0.043}},
    {ColorTerm::Green, {0.855, -0.135, 0.140}},
    {ColorTerm::Green, {0.886, -0.099, 0.055}},
    {ColorTerm::Green, {0.889, -0.069, 0.059}},
    {ColorTerm::Green, {0.962, -0.018, 0.034}},
    {ColorTerm::Lavender, {0.620, 0.038, -0.096}},
    {ColorTerm::Lavender, {0.889, 0.083, -0.063}},
    {ColorTerm::Magenta, {0.501, 0.203, -0.032}},
    {ColorTerm::Magenta, {0.630, 0.252, -0.132}},
    {ColorTerm::Maroon, {0.285, 0.102, 0.019}},
    {ColorTerm::Maroon, {0.401, 0.133, 0.043}},
    {ColorTerm::NavyBlue, {0.198, -0.013, -0.053}},
    {ColorTerm::NavyBlue, {0.203, -0.046, -0.157}},
    {ColorTerm::OliveGreen, {0.566, -0.044, 0.086}},
    {ColorTerm::Orange, {0.517, 0.088, 0.138}},
    {ColorTerm::Orange, {0.650, 0.154, 0.118}},
    {ColorTerm::Orange, {0.651, 0.055, 0.141}},
    {ColorTerm::Orange, {0.767, 0.066, 0.126}},
    {ColorTerm::Orange, {0.774, 0.058, 0.141}},
    {ColorTerm::Orange, {0.860, 0.034, 0.105}},
    {ColorTerm::Peach, {0.768, 0.066, 0.094}},
    {ColorTerm::Peach, {0.925, 0.020, 0.030}},
    {ColorTerm::Peach, {0.976, 0.024, 0.078}},
    {ColorTerm::Pink, {0.566, 0.194, 0.004}},
    {ColorTerm::Pink, {0.721, 0.239, -0.118}},
    {ColorTerm::Pink, {0.735, 0.091, 0.022}},
    {ColorTerm::Pink, {0.758, 0.192, 0.014}},
    {ColorTerm::Pink, {0.848, 0.098, 0.005}},
    {ColorTerm::Pink, {0.953, 0.032, 0.002}},
    {ColorTerm::Purple, {0.231, 0.082, -0.075}},
    {ColorTerm::Purple, {0.395, 0.108, -0.026}},
    {ColorTerm::Purple, {0.531, 0.166, -0.145}},
    {ColorTerm::Purple, {0.558, 0.083, -0.043}},
    {ColorTerm::Purple, {0.690, 0.190, -0.152}},
    {ColorTerm::PurplishBlue, {0.487, 0.053, -0.248}},
    {ColorTerm::PurplishPink, {0.664, 0.189, -0.096}},
    {ColorTerm::PurplishPink, {0.706, 0.070, -0.015}},
    {ColorTerm::Red, {0.227, 0.092, 0.048}},
    {ColorTerm::Red, {0.431, 0.144, 0.072}},
    {ColorTerm::Red, {0.479, 0.196, 0.036}},
    {ColorTerm::Red, {0.545, 0.215, 0.149}},
    {ColorTerm::Red, {0.638, 0.185, 0.095}},
    {ColorTerm::ReddishBrown, {0.406, 0.092, 0.056}},
    {ColorTerm::Salmon, {0.771, 0.059, 0.085}},
    {ColorTerm::SkyBlue, {0.632, -0.148, -0.094}},
    {ColorTerm::SkyBlue, {0.787, -0.048, -0.073}},
    {ColorTerm::SkyBlue, {0.889, -0.064, -0.037}},
    {ColorTerm::SkyBlue, {0.889, -0.105, -0.060}},
    {ColorTerm::SkyBlue, {0.948, -0.036, -0.031}},
    {ColorTerm::Tan, {0.749, 0.038, 0.068}},
    {ColorTerm::Teal, {0.337, -0.083, -0.041}},
    {ColorTerm::Teal, {0.526, -0.094, -0.028}},
    {ColorTerm::Teal, {0.551, -0.124, -0.025}},
    {ColorTerm::Teal, {0.612, -0.069, -0.008}},
    {ColorTerm::Teal, {0.771, -0.071, 0.010}},
    {ColorTerm::Teal, {0.865, -0.085, 0.034}},
    {ColorTerm::Turquoise, {0.826, -0.147, 0.016}},
    {ColorTerm::Turquoise, {0.837, -0.124, 0.019}},
    {ColorTerm::Yellow, {0.721, -0.008, 0.160}},
    {ColorTerm::Yellow, {0.756, -0.052, 0.154}},
    {ColorTerm::Yellow, {0.877, 0.001, 0.163}},
    {ColorTerm::Yellow, {0.898, -0.087, 0.185}},
    {ColorTerm::Yellow, {0.904, -0.020, 0.130}},
    {ColorTerm::Yellow, {0.910, -0.049, 0.148}},
    {ColorTerm::Yellow, {0.948, -0.019, 0.056}},
    {ColorTerm::Yellow, {0.972, -0.012, 0.036}},
    {ColorTerm::YellowishBrown, {0.559, 0.008, 0.103}},
    {ColorTerm::YellowishBrown, {0.653, 0.012, 0.129}},
    {ColorTerm::YellowishGreen, {0.718, -0.062, 0.136}},
    {ColorTerm::YellowishGreen, {0.820, -0.075, 0.144}},
    {ColorTerm::YellowishGreen, {0.880, -0.121, 0.156}},
});

// Lightness tells colors apart less than hue and chroma do.
constexpr double lightnessWeight = 0.45;

double squaredDistance(const Oklab &left, const Oklab &right)
{
    const double lightness = lightnessWeight * (left.lightness - right.lightness);
    const double a = left.a - right.a;
    const double b = left.b - right.b;
    return lightness * lightness + a * a + b * b;
}

} // namespace

ColorTerm nearestColorTerm(const Oklab &color)
{
    const auto isNearer = [&color](const Anchor &left, const Anchor &right) {
        return squaredDistance(left.place, color) < squaredDistance(right.place, color);
    };
    return std::min_element(anchors.begin(), anchors.end(), isNearer)->term;
}

} // namespace favrin::model
