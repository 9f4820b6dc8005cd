// Times converting sRGB to Display P3 per color, alone and 120 at a time, beside other libraries and the plain formula,
// and the largest error of each against long double. Fills memory for comparison too. One JSON object is printed.

#include "platform/color/rgbconversion.h"

#include <QColor>
#include <QColorSpace>
#include <QColorTransform>
#include <lcms2.h>

#include <algorithm>
#include <array>
#include <chrono>
#include <cmath>
#include <cstdio>
#include <cstring>
#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace {

using favrin::platform::Triple;
using Clock = std::chrono::steady_clock;

constexpr std::size_t batchSize = 120;
constexpr int repetitions = 2000;
constexpr int rounds = 15;

std::vector<Triple> colors()
{
    std::vector<Triple> list;
    for (std::size_t i = 0; i < batchSize; ++i) {
        const auto part = [i](double step) { return 0.06 + 0.9 * (double(i) * step - std::floor(double(i) * step)); };
        list.push_back({part(0.61803), part(0.41421), part(0.73205)});
    }
    return list;
}

template<class Number>
Number decoded(Number value)
{
    return value <= Number(0.04045L) ? value / Number(12.92L)
                                     : std::pow((value + Number(0.055L)) / Number(1.055L), Number(2.4L));
}

template<class Number>
Number encoded(Number value)
{
    value = std::clamp(value, Number(0), Number(1));
    return value <= Number(0.0031308L) ? Number(12.92L) * value
                                       : Number(1.055L) * std::pow(value, Number(1) / Number(2.4L)) - Number(0.055L);
}

/** Follows exactly from the primaries and the white point that the standards give. */
constexpr long double matrix[3][3] = {
    {2442703.0L / 2969989.0L, 527286.0L / 2969989.0L, 0.0L},
    {621563.0L / 18725049.0L, 18103486.0L / 18725049.0L, 0.0L},
    {281089.0L / 16454667.0L, 10721482.0L / 148092003.0L, 134840720.0L / 148092003.0L}};

template<class Number>
std::array<Number, 3> plain(const std::array<Number, 3> &color)
{
    std::array<Number, 3> linear;
    std::array<Number, 3> result;
    for (std::size_t i = 0; i < 3; ++i)
        linear[i] = decoded(color[i]);
    for (std::size_t i = 0; i < 3; ++i)
        result[i] = encoded(Number(matrix[i][0]) * linear[0] + Number(matrix[i][1]) * linear[1] +
                            Number(matrix[i][2]) * linear[2]);
    return result;
}

double largestError(const std::vector<Triple> &from, const std::vector<Triple> &to)
{
    long double error = 0;
    for (std::size_t i = 0; i < from.size(); ++i) {
        const auto exact = plain<long double>({from[i][0], from[i][1], from[i][2]});
        for (std::size_t c = 0; c < 3; ++c)
            error = std::max(error, std::abs(exact[c] - static_cast<long double>(to[i][c])));
    }
    return double(error);
}

struct Variant
{
    std::string name;
    std::function<void(const std::vector<Triple> &, std::vector<Triple> &)> convert;
    std::vector<double> times = {};
    double error = 0;
};

cmsHTRANSFORM littleTransform()
{
    cmsCIExyY white = {0.3127, 0.3290, 1.0};
    const cmsCIExyYTRIPLE p3 = {{0.680, 0.320, 1.0}, {0.265, 0.690, 1.0}, {0.150, 0.060, 1.0}};
    const cmsFloat64Number parameters[5] = {2.4, 1.0 / 1.055, 0.055 / 1.055, 1.0 / 12.92, 0.04045};
    cmsToneCurve *curve = cmsBuildParametricToneCurve(nullptr, 4, parameters);
    cmsToneCurve *curves[3] = {curve, curve, curve};
    cmsHPROFILE source = cmsCreate_sRGBProfile();
    cmsHPROFILE target = cmsCreateRGBProfile(&white, &p3, curves);
    return cmsCreateTransform(source, TYPE_RGB_DBL, target, TYPE_RGB_DBL, INTENT_RELATIVE_COLORIMETRIC, 0);
}

std::vector<Variant> variants()
{
    static const auto little = littleTransform();
    static const QColorTransform qt =
        QColorSpace(QColorSpace::SRgb).transformationToColorSpace(QColorSpace(QColorSpace::DisplayP3));
    const auto each = [](auto convert) {
        return [convert](const std::vector<Triple> &from, std::vector<Triple> &to) {
            for (std::size_t i = 0; i < from.size(); ++i)
                to[i] = convert(from[i]);
        };
    };
    return {
        {"plain formula in double", each(plain<double>)},
        {"the picker's, alone", each(favrin::platform::convertedSRGBToDisplayP3)},
        // Many are converted one by one; it is a row of its own because it has an aim of its own.
        {"the picker's, 120 at a time", each(favrin::platform::convertedSRGBToDisplayP3)},
        {"lcms2, doubles, alone", each([](const Triple &color) {
             Triple result;
             cmsDoTransform(little, color.data(), result.data(), 1);
             return result;
         })},
        {"lcms2, doubles, 120 at a time",
         [](const std::vector<Triple> &from, std::vector<Triple> &to) {
             cmsDoTransform(little, from.data(), to.data(), static_cast<cmsUInt32Number>(from.size()));
         }},
        {"QColorTransform, QColor", each([](const Triple &color) {
             const QColor result = qt.map(QColor::fromRgbF(float(color[0]), float(color[1]), float(color[2])));
             return Triple{result.redF(), result.greenF(), result.blueF()};
         })},
    };
}

void measure(std::vector<Variant> &list, const std::vector<Triple> &from)
{
    std::vector<Triple> to(from.size());
    for (int round = 0; round < rounds; ++round) {
        for (auto &variant : list) {
            const auto start = Clock::now();
            for (int i = 0; i < repetitions; ++i) {
                variant.convert(from, to);
                asm volatile("" : : "r"(to.data()) : "memory");
            }
            const std::chrono::duration<double, std::nano> time = Clock::now() - start;
            variant.times.push_back(time.count() / repetitions / double(from.size()));
            variant.error = largestError(from, to);
        }
    }
}

} // namespace

int main()
{
    const auto from = colors();
    auto list = variants();
    measure(list, from);
    std::printf("[");
    const char *separator = "";
    for (auto &variant : list) {
        std::sort(variant.times.begin(), variant.times.end());
        std::printf("%s{\"name\": \"%s\", \"ns\": %.2f, \"min\": %.2f, \"max\": %.2f, \"error\": %.3g}", separator,
                    variant.name.c_str(), variant.times[rounds / 2], variant.times.front(), variant.times.back(),
                    variant.error);
        separator = ", ";
    }
    std::printf("]\n");
    return 0;
}
