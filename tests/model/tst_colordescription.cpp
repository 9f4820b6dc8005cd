#include "model/colordescription.h"
#include "model/somecolor.h"
#include "platform/strings/localizedstring.h"

#include <QFile>
#include <QHash>
#include <QSet>
#include <QTest>

#include <algorithm>
#include <cmath>
#include <set>

using namespace favrin;
using Space = model::SomeColor::ColorSpace;

namespace {

QString nameOf(double r, double g, double b, Space space = Space::sRGB)
{
    return QString::fromStdString(model::colorDescription(model::SomeColor(r, g, b, 1.0, space).platformColor()));
}

QString nameOf(const QString &hex, Space space = Space::sRGB)
{
    const uint value = hex.toUInt(nullptr, 16);
    return nameOf((value >> 16) / 255.0, (value >> 8 & 255) / 255.0, (value & 255) / 255.0, space);
}

// The color words of a survey name, each by its plain form: "dusky bluey-grey" speaks of blue and gray.
QStringList colorWords(const QString &surveyName)
{
    static const QHash<QString, QString> plainForms = [] {
        const char *const rows[] = {
            "red reddish reddy orangered darkred",
            "orange orangish orangey orangeish",
            "yellow yellowish yellowy",
            "green greenish greeny lightgreen darkgreen yellowgreen",
            "blue bluish bluey lightblue darkblue",
            "purple purplish purpley purply purpleish",
            "pink pinkish pinky",
            "brown brownish browny",
            "gray grey greyish grayish",
            "black",
            "white",
        };
        QHash<QString, QString> forms;
        for (const char *row : rows) {
            const QStringList words = QString::fromLatin1(row).split(u' ');
            for (const QString &form : words)
                forms.insert(form, words.first());
        }
        return forms;
    }();
    QString spaced = surveyName;
    spaced.replace(u'/', u' ');
    QStringList words;
    for (const QString &word : spaced.split(u' ')) {
        if (const auto form = plainForms.find(word); form != plainForms.end())
            words.append(*form);
    }
    return words;
}

// Words that mean one kind of a basic color.
bool isKindOf(const QString &word, const QString &basic)
{
    static const QStringList kinds =
        QStringLiteral("purple/lavender purple/magenta pink/salmon pink/magenta blue/cyan green/teal red/maroon "
                       "brown/tan brown/beige orange/peach yellow/beige")
            .split(u' ');
    return word == basic || kinds.contains(basic + u'/' + word);
}

struct SurveyEntry
{
    QString name;
    QString hex;
};

QList<SurveyEntry> survey()
{
    QFile file(QStringLiteral(":/survey.tsv"));
    QList<SurveyEntry> entries;
    if (!file.open(QIODevice::ReadOnly))
        return entries;
    for (const QString &line : QString::fromUtf8(file.readAll()).split(u'\n', Qt::SkipEmptyParts)) {
        if (const QStringList fields = line.split(u'\t'); fields.size() == 2)
            entries.append({fields[0], fields[1]});
    }
    return entries;
}

} // namespace

class ColorDescriptionTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup() { platform::setStringTable({}); }
    void names_data();
    void names();
    void agreesWithTheSurvey();
    void wideColorsAreNamedFromTheirOwnSpace();
    void everyColorHasALightness();
    void lighterNeverSoundsDarker();
    void anyPlatformColorHasAName();
    void wordsAndTheirOrderAreTranslated();
};

void ColorDescriptionTest::names_data()
{
    QTest::addColumn<QString>("expected");
    const auto row = [](const char *hex, const QString &expected) { QTest::newRow(hex) << expected; };
    row("FFFFFF", QStringLiteral("white"));
    row("EBEBEB", QStringLiteral("very light gray"));
    row("ADADAD", QStringLiteral("light gray"));
    row("858585", QStringLiteral("medium gray"));
    row("474747", QStringLiteral("dark gray"));
    row("333333", QStringLiteral("very dark gray"));
    row("000000", QStringLiteral("black"));
    row("FF0000", QStringLiteral("bright red"));
    row("00FF00", QStringLiteral("bright green"));
    row("0000FF", QStringLiteral("bright blue"));
    row("FFFF00", QStringLiteral("bright yellow"));
    row("00FFFF", QStringLiteral("bright cyan"));
    row("FF00FF", QStringLiteral("bright magenta"));
    row("FF6A00", QStringLiteral("bright orange"));
    row("840000", QStringLiteral("dark red"));
    row("033500", QStringLiteral("dark green"));
    row("653700", QStringLiteral("medium brown"));
    row("7E1E9C", QStringLiteral("medium purple"));
    row("FFD1DF", QStringLiteral("light pink"));
    row("FFD9A8", QStringLiteral("light peach"));
    row("D1B26F", QStringLiteral("medium tan"));
    row("011D57", QStringLiteral("dark navy blue"));
    row("004D65", QStringLiteral("dark teal"));
    row("DFEED4", QStringLiteral("very light green"));
    row("52D6FC", QStringLiteral("light sky blue"));
    row("D5B60A", QStringLiteral("dark yellow"));
    row("66707A", QStringLiteral("medium bluish gray"));
}

void ColorDescriptionTest::names()
{
    QFETCH(QString, expected);
    QCOMPARE(nameOf(QString::fromLatin1(QTest::currentDataTag())), expected);
}

// The shares are those reached when the anchors were placed: naming must not get worse.
void ColorDescriptionTest::agreesWithTheSurvey()
{
    int asked = 0;
    int saysTheBasicWord = 0;
    int saysOneOfTheWords = 0;
    for (const SurveyEntry &entry : survey()) {
        const QStringList meant = colorWords(entry.name);
        if (meant.isEmpty())
            continue;
        ++asked;
        const QString said = nameOf(entry.hex);
        saysTheBasicWord += said.split(u' ').contains(meant.last());
        QStringList kinds = said.split(u' ') + colorWords(said);
        const bool isAgreed = std::any_of(meant.begin(), meant.end(), [&kinds](const QString &basic) {
            return std::any_of(kinds.begin(), kinds.end(),
                               [&basic](const QString &word) { return isKindOf(word, basic); });
        });
        saysOneOfTheWords += isAgreed;
        if (!isAgreed)
            qInfo().noquote() << entry.name << entry.hex << "is called" << said;
    }
    qInfo("%d names: %.1f %% say the basic word, %.1f %% a word of the name or of its kind", asked,
          100.0 * saysTheBasicWord / asked, 100.0 * saysOneOfTheWords / asked);
    QVERIFY(asked > 500);
    QVERIFY(saysTheBasicWord >= 0.90 * asked);
    QVERIFY(saysOneOfTheWords >= 0.98 * asked);
}

void ColorDescriptionTest::wideColorsAreNamedFromTheirOwnSpace()
{
    // Clipped to sRGB, some colors near the edge of Display P3 would get another name.
    int differing = 0;
    for (int i = 0; i < 11 * 11 * 11; ++i) {
        const model::SomeColor wide(i % 11 / 10.0, i / 11 % 11 / 10.0, i / 121 / 10.0, 1.0, Space::displayP3);
        differing +=
            model::colorDescription(wide.platformColor()) != model::colorDescription(wide.inSRGB().platformColor());
    }
    QVERIFY(differing > 0);
    // The same color, inside both gamuts, has one name in both spaces.
    QCOMPARE(nameOf(0.3, 0.5, 0.7),
             QString::fromStdString(model::colorDescription(
                 model::SomeColor(0.3, 0.5, 0.7, 1.0, Space::sRGB).inDisplayP3().platformColor())));
}

void ColorDescriptionTest::everyColorHasALightness()
{
    const QStringList lightness = {QStringLiteral("very dark "), QStringLiteral("dark "),
                                   QStringLiteral("medium "),    QStringLiteral("bright "),
                                   QStringLiteral("light "),     QStringLiteral("very light ")};
    for (int i = 0; i < 18 * 18 * 18; ++i) {
        const QString name = nameOf(i % 18 / 17.0, i / 18 % 18 / 17.0, i / 324 / 17.0);
        const bool hasLightness = std::any_of(lightness.begin(), lightness.end(),
                                              [&name](const QString &word) { return name.startsWith(word); });
        QVERIFY2(hasLightness || name == u"black" || name == u"white", qPrintable(name));
    }
}

void ColorDescriptionTest::lighterNeverSoundsDarker()
{
    const QStringList order = {QStringLiteral("black"),      QStringLiteral("very dark gray"),
                               QStringLiteral("dark gray"),  QStringLiteral("medium gray"),
                               QStringLiteral("light gray"), QStringLiteral("very light gray"),
                               QStringLiteral("white")};
    qsizetype before = 0;
    QSet<QString> said;
    for (int i = 0; i <= 255; ++i) {
        const QString name = nameOf(i / 255.0, i / 255.0, i / 255.0);
        QVERIFY2(order.indexOf(name) >= before, qPrintable(name));
        before = order.indexOf(name);
        said.insert(name);
    }
    QCOMPARE(said.size(), order.size());
}

void ColorDescriptionTest::anyPlatformColorHasAName()
{
    using platform::Color;
    using platform::ColorSpace;
    const platform::Triple huge = {1e300, -1e300, 0.0};
    const platform::Triple broken = {NAN, 0.5, 0.5};
    const platform::Triple half = {0.5, 0.5, 0.5};
    QCOMPARE(model::colorDescription(Color(std::nullopt, half, 1.0)), std::string("black"));
    QCOMPARE(model::colorDescription(Color(ColorSpace::sRGB(), broken, 1.0)), std::string("black"));
    QCOMPARE(model::colorDescription(Color(ColorSpace::gray(), half, 1.0)), std::string("medium gray"));
    QVERIFY(!model::colorDescription(Color(ColorSpace::extendedSRGB(), huge, 1.0)).empty());
}

void ColorDescriptionTest::wordsAndTheirOrderAreTranslated()
{
    std::set<std::string> asked;
    platform::setStringTable([&asked](std::string_view key) {
        asked.emplace(key);
        if (key == "dark %@")
            return std::string("(%%1 %) %@-dark");
        return key == "red" ? std::string("%@ red") : "<" + std::string(key) + ">";
    });
    // What a name says is never taken for a place to fill.
    QCOMPARE(nameOf(QStringLiteral("840000")), QStringLiteral("(%%1 %) %@ red-dark"));
    QCOMPARE(nameOf(QStringLiteral("FFFFFF")), QStringLiteral("<white>"));
    QVERIFY(asked == std::set<std::string>({"dark %@", "red", "white"}));
}

QTEST_APPLESS_MAIN(ColorDescriptionTest)
#include "tst_colordescription.moc"
