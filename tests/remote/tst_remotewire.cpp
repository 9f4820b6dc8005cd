#include "remote/limits.h"
#include "remote/sanitized.h"
#include "remote/wirecolor.h"
#include "remote/wireoptions.h"
#include "remote/wiretext.h"

#include "../shared/table.h"

#include <QtTest>

#include <bit>
#include <cmath>
#include <limits>

using namespace favrin;
using namespace favrin::remote;

namespace {

constexpr double notANumber = std::numeric_limits<double>::quiet_NaN();
constexpr double infinite = std::numeric_limits<double>::infinity();

std::span<const std::byte> bytesOf(const std::vector<double> &numbers)
{
    return std::as_bytes(std::span(numbers));
}

Color rgb(double red, double green, double blue, double alpha)
{
    return Color(platform::ColorSpace::sRGB(), std::array{red, green, blue}, alpha);
}

double squared(double encoded, double)
{
    return encoded * encoded;
}

/** Linear sRGB with another curve, and no name. */
platform::ColorSpace namelessSpace()
{
    return platform::ColorSpace::unnamed({{{1, 0, 0}, {0, 1, 0}, {0, 0, 1}}}, squared, 0.0);
}

} // namespace

class RemoteWireTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void textIsWellFormed_data()
    {
        addRows<QByteArray, bool>({
            {"empty", "", true},
            {"each length", "a\xc3\xa9\xe2\x82\xac\xf0\x9f\x8e\xa8", true},
            {"last character there is", "\xf4\x8f\xbf\xbf", true},
            {"one beyond it", "\xf4\x90\x80\x80", false},
            {"overlong slash", "\xc0\xaf", false},
            {"overlong in three", "\xe0\x9f\xbf", false},
            {"overlong in four", "\xf0\x8f\xbf\xbf", false},
            {"surrogate", "\xed\xa0\x80", false},
            {"follower alone", "\x80", false},
            {"cut short", "ab\xe2\x82", false},
            {"follower missing", "\xe2\x82z", false},
            {"zero inside", QByteArray("a\0b", 3), false},
            {"not a lead byte", "\xff", false},
        });
    }
    void textIsWellFormed()
    {
        const auto [text, isWellFormed] = row<QByteArray, bool>();
        QCOMPARE(isWireText(text.toStdString()), isWellFormed);
        QCOMPARE(sendableText(text.toStdString(), 100).has_value(), isWellFormed);
    }

    void cuttingKeepsCharactersWhole()
    {
        const std::string text = "a\xc3\xa9\xf0\x9f\x8e\xa8z";
        const std::array<std::size_t, 9> lengths = {0, 1, 1, 3, 3, 3, 3, 7, 8};
        for (std::size_t limit = 0; limit < lengths.size(); ++limit)
            QCOMPARE(cutToBytes(text, limit).size(), lengths[limit]);
        QVERIFY(isWireText(text, 8));
        QVERIFY(!isWireText(text, 7));
    }

    void aColorComesBackBitForBit_data()
    {
        constexpr double tiny = std::numeric_limits<double>::denorm_min();
        addRows<QByteArray, std::vector<double>>({
            {"Display P3", "kTQColorSpaceDisplayP3", {0.1 + 0.2, 1.0 / 3, tiny}},
            {"extended, negative", "kTQColorSpaceExtendedSRGB", {-1.5, -0.0, 1.0e300}},
            {"gray", "kTQColorSpaceGray", {0.7}},
        });
    }
    void aColorComesBackBitForBit()
    {
        const auto [space, components] = row<QByteArray, std::vector<double>>();
        const Color color(platform::ColorSpace::named(space.toStdString()), components, 0.1);
        const auto wire = encodeColor(color);
        QCOMPARE(wire->numbers.size(), components.size() + 1);
        const auto back = decodeColor(bytesOf(wire->numbers), wire->space);
        QVERIFY(back && *back);
        QVERIFY(**back == color);
        QVERIFY(std::ranges::equal((*back)->components(), components, [](double a, double b) {
            return std::bit_cast<std::uint64_t>(a) == std::bit_cast<std::uint64_t>(b);
        }));
    }

    void noColorAndNoSpaceAreNotErrors()
    {
        QVERIFY(encodeColor(std::nullopt)->numbers.empty());
        const auto nothing = decodeColor({}, "kTQColorSpaceSRGB");
        QVERIFY(nothing && !*nothing);
        const Color spaceless(std::nullopt, std::array{0.1, 0.2, 0.3}, 0.4);
        const auto wire = encodeColor(spaceless);
        QVERIFY(!wire->space);
        QVERIFY(**decodeColor(bytesOf(wire->numbers), std::nullopt) == spaceless);
        QVERIFY(**decodeColor(bytesOf(wire->numbers), "noSuchSpace") == spaceless);
    }

    void aSpaceWithoutANameTravelsAsLinearSRGB()
    {
        const auto wire = encodeColor(Color(namelessSpace(), std::array{0.5, 1.0, 0.0}, 0.25));
        QCOMPARE(wire->space, std::optional<std::string>("kTQColorSpaceLinearSRGB"));
        QVERIFY(std::abs(wire->numbers[0] - 0.25) < 1e-12);
        QCOMPARE(wire->numbers[3], 0.25);
    }

    void malformedArraysAreRefused_data()
    {
        addRows<std::vector<double>, QByteArray>({
            {"too short", {0.0, 0.0, 1.0}, "kTQColorSpaceSRGB"},
            {"too long", {0.0, 0.0, 0.0, 0.0, 1.0}, "kTQColorSpaceSRGB"},
            {"too long for gray", {0.0, 0.0, 1.0}, "kTQColorSpaceGray"},
            {"too short for an unknown space", {0.0, 1.0}, "noSuchSpace"},
            {"NaN", {0.0, notANumber, 0.0, 1.0}, "kTQColorSpaceSRGB"},
            {"infinite alpha", {0.0, 0.0, 0.0, infinite}, "kTQColorSpaceSRGB"},
        });
    }
    void malformedArraysAreRefused()
    {
        const auto [numbers, space] = row<std::vector<double>, QByteArray>();
        QVERIFY(!decodeColor(bytesOf(numbers), space.toStdString()));
        QVERIFY(!decodeColorRun(bytesOf(numbers), space.toStdString()));
    }

    void numbersMayLieAnywhere()
    {
        std::array<std::byte, 17> bytes = {};
        const std::array numbers = {1.5, -2.5};
        std::memcpy(bytes.data() + 1, numbers.data(), 16);
        QCOMPARE(*decodeNumbers(std::span(bytes).subspan(1), 2), (std::vector{1.5, -2.5}));
        QVERIFY(!decodeNumbers(bytes, 2));
    }

    void colorRunsKeepTheOrderAndTheLimits()
    {
        std::vector<Color> colors(200, rgb(0.1, 0.2, 0.3, 1.0));
        colors[100] = rgb(notANumber, 0, 0, 1);
        colors.insert(colors.begin() + 150, Color(std::nullopt, std::array{0.5, 0.5, 0.5}, 1.0));
        colors.push_back(Color::black());
        std::vector<std::pair<std::string, std::size_t>> shape;
        std::vector<Color> back;
        for (const WireColorRun &run : encodeColorRuns(colors)) {
            shape.emplace_back(run.space, run.numbers.size());
            const auto decoded = decodeColorRun(bytesOf(run.numbers), run.space);
            back.insert(back.end(), decoded->begin(), decoded->end());
        }
        const std::string sRGB = "kTQColorSpaceSRGB";
        const std::vector<std::pair<std::string, std::size_t>> expected = {
            {sRGB, 96 * 4}, {sRGB, 53 * 4}, {"", 4}, {sRGB, 50 * 4}, {"kTQColorSpaceGray", 2}};
        QCOMPARE(shape, expected);
        colors.erase(colors.begin() + 100);
        QVERIFY(back == colors);

        std::size_t count = 0;
        for (const WireColorRun &run : encodeColorRuns(std::vector<Color>(3000, Color::black())))
            count += run.numbers.size() / 2;
        QCOMPARE(count, limits::suggestedColors);
        QVERIFY(decodeColorRun(bytesOf(std::vector<double>(96 * 4)), "kTQColorSpaceSRGB"));
        QVERIFY(!decodeColorRun(bytesOf(std::vector<double>(97 * 4)), "kTQColorSpaceSRGB"));
    }

    void everyFlagTravelsAlone()
    {
        for (std::uint32_t bit = 0; bit < 7; ++bit) {
            Configuration configuration;
            applyOptionBits(1u << bit | 0xffffff80u, configuration);
            QCOMPARE(optionBits(configuration), 1u << bit);
        }
        QCOMPARE(optionBits(Configuration()), 1u | 4u);
        Configuration titled{.title = "kept", .suggestedColors = std::vector{Color::black()}};
        applyOptionBits(optionBits(titled), titled);
        QCOMPARE(titled.title, std::optional<std::string>("kept"));
        QCOMPARE(titled.suggestedColors->size(), std::size_t(1));
        for (std::uint32_t bits = 0; bits < 4; ++bits) {
            Traits traits;
            applyAccessibilityBits(bits | ~3u, traits);
            QCOMPARE(accessibilityBits(traits), bits);
        }
    }

    void lengthsAreMadeSane_data()
    {
        addRows<double, double>({
            {"usual", 1024.5, 1024.5},
            {"largest", 16384.0, 16384.0},
            {"beyond", 16384.5, 16384.0},
            {"infinite", infinite, 16384.0},
            {"NaN", notANumber, 0.0},
            {"negative", -1.0, 0.0},
            {"negative infinite", -infinite, 0.0},
        });
    }
    void lengthsAreMadeSane()
    {
        const auto [length, expected] = row<double, double>();
        const Configuration sane =
            sanitized(Configuration{.hostWindowWidth = length, .hostWindowHeight = length, .keyboardSpace = length});
        QCOMPARE(sane.hostWindowWidth, expected);
        QCOMPARE(sane.hostWindowHeight, expected);
        QCOMPARE(sane.keyboardSpace, expected);
    }

    void recordsAreMadeSane()
    {
        Traits wild;
        wild.presentationContext = PresentationContext(4);
        wild.appearance = Appearance(99);
        wild.layoutDirection = LayoutDirection(2);
        wild.textSizeCategory = TextSizeCategory(12);
        wild.displayGamut = DisplayGamut(2);
        wild.displayIdentifier = std::string(257, 'x');
        wild.locale = "\xff";
        QVERIFY(sanitized(wild) == Traits());

        Traits sane;
        sane.presentationContext = PresentationContext::Popover;
        sane.appearance = Appearance::Dark;
        sane.layoutDirection = LayoutDirection::RightToLeft;
        sane.textSizeCategory = TextSizeCategory::AccessibilityExtraExtraExtraLarge;
        sane.displayGamut = DisplayGamut::P3;
        sane.displayIdentifier = std::string(256, 'x');
        sane.locale = "cs-CZ";
        QVERIFY(sanitized(sane) == sane);

        QVERIFY(!sanitized(Configuration{.title = "\xc3"}).title);
        QCOMPARE(sanitized(Configuration{.title = std::string(1023, 'x') + "\xc3\xa9"}).title->size(),
                 std::size_t(1023));
        const Configuration colors{.suggestedColors =
                                       std::vector{rgb(notANumber, 0, 0, 1), rgb(0, 0, 0, infinite), rgb(-3, 0, 0, 1)}};
        QCOMPARE(sanitized(colors).suggestedColors->size(), std::size_t(1));
        const Configuration many{.suggestedColors = std::vector(2049, Color::black()), .userInterfaceStyleForGrid = -9};
        QCOMPARE(sanitized(many).suggestedColors->size(), limits::suggestedColors);
        QCOMPARE(sanitized(many).userInterfaceStyleForGrid, -9);
    }
};

QTEST_APPLESS_MAIN(RemoteWireTest)
#include "tst_remotewire.moc"
