#include "model/colordescription.h"
#include "model/somecolor.h"
#include "platform/strings/localizedstring.h"

#include "../shared/table.h"

#include <QFile>
#include <QHash>
#include <QSet>
#include <QTest>

#include <algorithm>
#include <cmath>
#include <set>

using namespace favrin;
using Space = model::SomeColor::ColorSpace;
using namespace Qt::StringLiterals;

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
        u"purple/lavender purple/magenta pink/salmon pink/magenta blue/cyan green/teal red/maroon "
        "brown/tan brown/beige orange/peach yellow/beige"_s.split(u' ');
    return word == basic || kinds.contains(basic + u'/' + word);
}

struct SurveyEntry
{
    QString name;
    QString hex;
};

QList<SurveyEntry> survey()
{
    QFile file(u":/survey.tsv"_s);
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

    void names_data()
    {
        addRows<QString>({
            {"FFFFFF", u"white"_s},          {"EBEBEB", u"very light gray"_s}, {"ADADAD", u"light gray"_s},
            {"858585", u"medium gray"_s},    {"474747", u"dark gray"_s},       {"333333", u"very dark gray"_s},
            {"000000", u"black"_s},          {"FF0000", u"bright red"_s},      {"00FF00", u"bright green"_s},
            {"0000FF", u"bright blue"_s},    {"FFFF00", u"bright yellow"_s},   {"00FFFF", u"bright cyan"_s},
            {"FF00FF", u"bright magenta"_s}, {"FF6A00", u"bright orange"_s},   {"840000", u"dark red"_s},
            {"033500", u"dark green"_s},     {"653700", u"medium brown"_s},    {"7E1E9C", u"medium purple"_s},
            {"FFD1DF", u"light pink"_s},     {"FFD9A8", u"light peach"_s},     {"D1B26F", u"medium tan"_s},
            {"011D57", u"dark navy blue"_s}, {"004D65", u"dark teal"_s},       {"DFEED4", u"very light green"_s},
            {"52D6FC", u"light sky blue"_s}, {"D5B60A", u"dark yellow"_s},     {"66707A", u"medium bluish gray"_s},
        });
    }
    void names()
    {
        const auto [expected] = row<QString>();
        QCOMPARE(nameOf(QString::fromLatin1(QTest::currentDataTag())), expected);
    }

    // The shares are those reached when the anchors were placed: naming must not get worse.
    void agreesWithTheSurvey()
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

    void wideColorsAreNamedFromTheirOwnSpace()
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

    void everyColorHasALightness()
    {
        const QStringList lightness = {u"very dark "_s, u"dark "_s,  u"medium "_s,
                                       u"bright "_s,    u"light "_s, u"very light "_s};
        for (int i = 0; i < 18 * 18 * 18; ++i) {
            const QString name = nameOf(i % 18 / 17.0, i / 18 % 18 / 17.0, i / 324 / 17.0);
            const bool hasLightness = std::any_of(lightness.begin(), lightness.end(),
                                                  [&name](const QString &word) { return name.startsWith(word); });
            QVERIFY2(hasLightness || name == u"black" || name == u"white", qPrintable(name));
        }
    }

    void lighterNeverSoundsDarker()
    {
        const QStringList order = {u"black"_s,      u"very dark gray"_s,  u"dark gray"_s, u"medium gray"_s,
                                   u"light gray"_s, u"very light gray"_s, u"white"_s};
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

    void anyPlatformColorHasAName()
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

    void wordsAndTheirOrderAreTranslated()
    {
        std::set<std::string> asked;
        platform::setStringTable([&asked](std::string_view key) {
            asked.emplace(key);
            if (key == "dark %@")
                return std::string("(%%1 %) %@-dark");
            return key == "red" ? std::string("%@ red") : "<" + std::string(key) + ">";
        });
        // What a name says is never taken for a place to fill.
        QCOMPARE(nameOf(u"840000"_s), u"(%%1 %) %@ red-dark"_s);
        QCOMPARE(nameOf(u"FFFFFF"_s), u"<white>"_s);
        QVERIFY(asked == std::set<std::string>({"dark %@", "red", "white"}));
    }
};

QTEST_APPLESS_MAIN(ColorDescriptionTest)
#include "tst_colordescription.moc"
