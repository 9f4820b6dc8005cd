#include "apps/tool/outputformat.h"
#include "apps/tool/tooloptions.h"

#include <QTest>

using namespace favrin::tool;
using favrin::model::SomeColor;

namespace {

constexpr auto sRGB = SomeColor::ColorSpace::sRGB;
constexpr auto displayP3 = SomeColor::ColorSpace::displayP3;
constexpr auto orangeJson = "{\"space\":\"srgb\",\"components\":[1.0,0.5,0.1],\"alpha\":0.25,\"hex\":\"#ff801a\"}";

QString printed(const std::string &text)
{
    return QString::fromStdString(text);
}

} // namespace

Q_DECLARE_METATYPE(favrin::tool::Choice)

class TestToolFormats : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void writesColors_data()
    {
        QTest::addColumn<QString>("format");
        QTest::addColumn<Choice>("color");
        QTest::addColumn<QString>("expected");
        const Choice orange = SomeColor(1, 0.5, 0.1, 0.25, sRGB);
        const Choice vivid = SomeColor(0, 1, 0, 1, displayP3);
        const Choice third = SomeColor(1.0 / 3, 0.1 + 0.2, 1e-7, 1, sRGB);
        const auto row = [](const char *name, const char *format, const Choice &color, const char *expected) {
            QTest::newRow(name) << QString::fromUtf8(format) << color << QString::fromUtf8(expected);
        };
        row("hex", "hex", orange, "#ff801a");
        row("hex rounds, never truncates", "hex", SomeColor(254.6 / 255, 0.4 / 255, 0.5, 1, sRGB), "#ff0080");
        row("hex of P3 is clipped to sRGB", "hex", vivid, "#00ff00");
        row("hex8", "hex8", orange, "#ff801a40");
        row("css of sRGB", "css", orange, "color(srgb 1 0.5 0.1 / 0.25)");
        row("css of P3", "css", vivid, "color(display-p3 0 1 0)");
        row("css keeps every bit", "css", third, "color(srgb 0.3333333333333333 0.30000000000000004 1e-07)");
        row("json", "json", orange, orangeJson);
        row("no color as hex", "hex", {}, "none");
        row("no color as css", "css", {}, "none");
        row("no color as json", "json", {}, "null");
        row("template", "{red8},{green8},{blue8},{alpha8} {space}", orange, "255,128,26,64 srgb");
        row("template of P3 bytes is sRGB", "{red8} {green8} {blue8}", vivid, "0 255 0");
        row("template in the own space", "{red} {green} {blue} {alpha}", vivid, "0 1 0 1");
        row("template with braces", "{{{hex}}}", orange, "{#ff801a}");
        row("template of no color", "{hex}|{red}|{red8}|{space}", {}, "none|none|none|none");
    }

    void writesColors()
    {
        QFETCH(QString, format);
        QFETCH(Choice, color);
        QFETCH(QString, expected);
        const auto parsed = OutputFormat::parsed(format.toStdString());
        QVERIFY(parsed);
        QCOMPARE(printed(parsed->text(color, {})), expected);
    }

    void namesASuggestion()
    {
        const Choice ink = SomeColor(0, 0, 0, 1, sRGB);
        QCOMPARE(printed(OutputFormat::parsed("{name}: {hex}")->text(ink, "House ink")),
                 QStringLiteral("House ink: #000000"));
        // Braces of a name are no placeholders, and what is not UTF-8 does not end the tool.
        QCOMPARE(printed(OutputFormat::parsed("{name}")->text(ink, "{hex}")), QStringLiteral("{hex}"));
        QVERIFY(printed(pickText(ink, "a\"\xff", true)).contains(QStringLiteral("\"name\":\"a\\\"\uFFFD\"")));
    }

    void refusesWhatIsNoFormat_data()
    {
        QTest::addColumn<QString>("format");
        for (const char *format : {"", "rgb", "HEX", "{}", "{hue}", "{hex", "hex}", "{hex}}", "a{b", "{ hex }"})
            QTest::newRow(format) << QString::fromUtf8(format);
    }

    void refusesWhatIsNoFormat()
    {
        QFETCH(QString, format);
        QVERIFY(!OutputFormat::parsed(format.toStdString()));
    }

    void readsParentWindows_data()
    {
        QTest::addColumn<QString>("text");
        QTest::addColumn<bool>("isParent");
        QTest::newRow("x11") << "x11:3a00007" << true;
        QTest::newRow("x11 with 0x") << "x11:0x3a00007" << true;
        QTest::newRow("wayland") << "wayland:b6a5-4f" << true;
        QTest::newRow("handle with a colon") << "wayland:a:b" << true;
        for (const char *text : {"", "x11", "x11:", "x11:0", "x11:zz", "x11:123456789", "x11:-1", "x11: 1",
                                 "wayland:", "wayland:a b", "mir:1", "3a00007"})
            QTest::newRow(text) << QString::fromUtf8(text) << false;
        QTest::newRow("a handle beyond reason") << QStringLiteral("wayland:") + QString(300, u'a') << false;
    }

    void readsParentWindows()
    {
        QFETCH(QString, text);
        QFETCH(bool, isParent);
        QCOMPARE(parsedParentHandle(text).has_value(), isParent);
    }

    void readsOptions()
    {
        const auto parsed = parseOptions({QStringLiteral("tool"), QStringLiteral("-c"),
                                          QStringLiteral("color(display-p3 1 0.2 0 / 50%)"), QStringLiteral("-s"),
                                          QStringLiteral("a=b=#123"), QStringLiteral("--suggest=red"),
                                          QStringLiteral("--timeout"), QStringLiteral("1.5")});
        QVERIFY2(parsed.options, qPrintable(parsed.text));
        QCOMPARE(*parsed.options->color, Choice(SomeColor(1, 0.2, 0, 0.5, displayP3)));
        QCOMPARE(parsed.options->suggestions.size(), std::size_t(2));
        QCOMPARE(printed(parsed.options->suggestions[0].name), QStringLiteral("a=b"));
        QCOMPARE(parsed.options->suggestions[0].color, SomeColor(17 / 255.0, 34 / 255.0, 51 / 255.0, 1, sRGB));
        QCOMPARE(printed(parsed.options->suggestions[1].name), QString());
        QCOMPARE(*parsed.options->timeout, std::chrono::milliseconds(1500));
    }

    void leavesTheOpacityOutWithoutIt()
    {
        const Choice gray = SomeColor(0.5, 0.5, 0.5, 1, sRGB);
        const auto with = parseOptions({QStringLiteral("tool")});
        const auto without = parseOptions({QStringLiteral("tool"), QStringLiteral("--no-opacity")});
        QCOMPARE(printed(with.options->format.text(gray, {})), QStringLiteral("#808080ff"));
        QCOMPARE(printed(without.options->format.text(gray, {})), QStringLiteral("#808080"));
    }
};

QTEST_GUILESS_MAIN(TestToolFormats)
#include "tst_toolformats.moc"
