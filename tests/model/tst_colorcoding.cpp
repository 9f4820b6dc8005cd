#include "model/colorcoding.h"

#include <QTest>

#include <cmath>
#include <limits>
#include <random>

using namespace favrin::model;
using Space = SomeColor::ColorSpace;

namespace {

const std::string blue = R"({"r":0,"g":0.3803921568627451,"b":0.9921568627450981,"a":1,)"
                         R"("colorSpace":{"rawValue":"kTQColorSpaceSRGB"}})";
const std::string wideBlue = R"({"r":0.1568627450980392,"g":0.37254901960784315,"b":0.9568627450980393,"a":1,)"
                             R"("colorSpace":{"rawValue":"kTQColorSpaceDisplayP3"}})";

std::string withSpace(const std::string &space)
{
    return R"({"r":0,"g":0,"b":0,"a":1,"colorSpace":)" + space + "}";
}

} // namespace

class ColorCodingTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void writesTheStoredText();
    void comesBackBitForBit();
    void rejects_data();
    void rejects();
    void accepts_data();
    void accepts();
    void oneBadColorFailsTheList();
    void nonFiniteIsNotWritten();
};

void ColorCodingTest::writesTheStoredText()
{
    const std::vector<SomeColor> colors = {
        SomeColor(0, 97 / 255.0, 253 / 255.0, 1, Space::sRGB),
        SomeColor(40 / 255.0, 95 / 255.0, 244 / 255.0, 1, Space::displayP3),
    };
    const std::string text = "[" + blue + "," + wideBlue + "]";
    QCOMPARE(std::get<std::string>(encodedColors(colors)), text);
    QCOMPARE(std::get<std::vector<SomeColor>>(decodedColors(text)), colors);
    QCOMPARE(std::get<std::string>(encodedColor(colors[0])), blue);
    QCOMPARE(std::get<std::string>(encodedColors({})), std::string("[]"));
}

void ColorCodingTest::comesBackBitForBit()
{
    std::mt19937_64 random(20);
    std::vector<double> numbers = {-0.0, 0.0, 1e15, 1e16, -7.0, 5e-324, 2.2250738585072014e-308, 1e300, 0.1};
    for (int i = 0; i < 2000; ++i)
        numbers.push_back(std::uniform_real_distribution<double>(0.0, 1.0)(random));
    for (const double number : numbers) {
        const auto text = encodedColor(SomeColor(number, 0.0, 0.0, 1.0, Space::displayP3));
        const auto color = std::get<SomeColor>(decodedColor(std::get<std::string>(text)));
        QVERIFY(color.r == number && std::signbit(color.r) == std::signbit(number));
    }
}

void ColorCodingTest::rejects_data()
{
    QTest::addColumn<std::string>("json");
    QTest::addColumn<CodingError>("error");
    using enum CodingError;
    QTest::newRow("display name") << withSpace(R"({"rawValue":"sRGB"})") << unknownRawValue;
    QTest::newRow("other case") << withSpace(R"({"rawValue":"kTQColorSpacesRGB"})") << unknownRawValue;
    QTest::newRow("white space") << withSpace(R"({"rawValue":"kTQColorSpaceSRGB "})") << unknownRawValue;
    QTest::newRow("space as a string") << withSpace(R"("kTQColorSpaceSRGB")") << typeMismatch;
    QTest::newRow("raw value as a number") << withSpace(R"({"rawValue":0})") << typeMismatch;
    QTest::newRow("no raw value") << withSpace("{}") << keyNotFound;
    QTest::newRow("no alpha") << std::string(R"({"r":0,"g":0,"b":0,"colorSpace":{"rawValue":"x"}})") << keyNotFound;
    QTest::newRow("no space") << std::string(R"({"r":0,"g":0,"b":0,"a":1})") << keyNotFound;
    QTest::newRow("first failure counts") << std::string(R"({"r":true,"colorSpace":0})") << typeMismatch;
    QTest::newRow("null component") << std::string(R"({"r":null})") << typeMismatch;
    QTest::newRow("a list") << std::string("[]") << typeMismatch;
    QTest::newRow("empty") << std::string() << dataCorrupted;
    QTest::newRow("cut off") << blue.substr(0, 60) << dataCorrupted;
    QTest::newRow("trailing text") << blue + "]" << dataCorrupted;
    QTest::newRow("number out of range") << std::string(R"({"r":1e999})") << dataCorrupted;
    QTest::newRow("not a number") << std::string(R"({"r":NaN})") << dataCorrupted;
    QTest::newRow("invalid UTF-8") << withSpace("{\"rawValue\":\"\xc3\x28\"}") << dataCorrupted;
    QTest::newRow("deep") << std::string(1 << 20, '[') << dataCorrupted;
    QTest::newRow("deep objects") << [] {
        std::string text;
        for (int i = 0; i < 100000; ++i)
            text += R"({"a":)";
        return text;
    }() << dataCorrupted;
    QTest::newRow("long") << std::string((16 << 20) + 1, ' ') << dataCorrupted;
}

void ColorCodingTest::rejects()
{
    QFETCH(std::string, json);
    QFETCH(CodingError, error);
    const auto result = decodedColor(json);
    QVERIFY(std::holds_alternative<CodingError>(result));
    QCOMPARE(std::get<CodingError>(result), error);
}

void ColorCodingTest::accepts_data()
{
    QTest::addColumn<std::string>("json");
    const std::string space = R"("colorSpace":{"rawValue":"kTQColorSpaceSRGB"})";
    QTest::newRow("whole numbers") << std::string(R"({"r":1,"g":0,"b":0,"a":1,)") + space + "}";
    QTest::newRow("any order and spacing") << "{ " + space + R"( , "a":1.0, "b":0e0, "g":-0.0, "r":10E-1})";
    QTest::newRow("further keys") << std::string(R"({"name":"x{[\"","r":1,"g":0,"b":0,"a":1,"1":2,)") + space + "}";
    QTest::newRow("the last of two counts") << std::string(R"({"r":"x","r":1,"g":0,"b":0,"a":1,)") + space + "}";
}

void ColorCodingTest::accepts()
{
    QFETCH(std::string, json);
    const auto result = decodedColor(json);
    QVERIFY(std::holds_alternative<SomeColor>(result));
    QCOMPARE(std::get<SomeColor>(result), SomeColor(1, 0, 0, 1, Space::sRGB));
}

void ColorCodingTest::oneBadColorFailsTheList()
{
    const auto result = decodedColors("[" + blue + "," + withSpace(R"({"rawValue":"x"})") + "]");
    QCOMPARE(std::get<CodingError>(result), CodingError::unknownRawValue);
    QCOMPARE(std::get<CodingError>(decodedColors(blue)), CodingError::typeMismatch);
    QCOMPARE(std::get<CodingError>(decodedColors("[1]")), CodingError::typeMismatch);
}

void ColorCodingTest::nonFiniteIsNotWritten()
{
    for (const double number : {std::numeric_limits<double>::quiet_NaN(), HUGE_VAL, -HUGE_VAL}) {
        const std::vector<SomeColor> colors = {SomeColor(0, 0, 0, number, Space::sRGB)};
        QCOMPARE(std::get<CodingError>(encodedColor(colors[0])), CodingError::nonFiniteNumber);
        QCOMPARE(std::get<CodingError>(encodedColors(colors)), CodingError::nonFiniteNumber);
    }
}

QTEST_APPLESS_MAIN(ColorCodingTest)
#include "tst_colorcoding.moc"
