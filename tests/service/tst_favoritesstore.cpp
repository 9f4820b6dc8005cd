// Run twice: for a display with the sRGB gamut and, with FAVRIN_TEST_WIDE_GAMUT set, for one with a wide gamut, which
// is settled once per process.

#include "model/colorcoding.h"
#include "platform/color/displaygamut.h"
#include "service/favoritesmerge.h"
#include "service/favoritesstore.h"

#include "../shared/table.h"

#include <QTemporaryDir>
#include <QTest>

#include <algorithm>
#include <array>
#include <cstring>
#include <random>

using namespace favrin;
using namespace favrin::service;
using model::SomeColor;
using platform::Bytes;
using platform::DefaultsArray;
using platform::DefaultsValue;
using ColorList = FavoritesStore::ColorList;
using namespace Qt::StringLiterals;

namespace {

constexpr auto key = FavoritesStore::favoriteColorsUserDefaultsKey;
constexpr const char *putAsideWarning =
    "The stored favorites cannot be read; they were put aside and the list starts anew";
constexpr auto asideKey = FavoritesStore::undecodableUserDefaultsKey;

Bytes bytes(std::string_view text)
{
    return Bytes(text.begin(), text.end());
}

Bytes encoded(const ColorList &colors)
{
    return bytes(std::get<std::string>(model::encodedColors(colors)));
}

/** One color per letter: lower case opaque, upper case the same translucent. */
ColorList colors(const char *letters)
{
    ColorList list;
    for (const char *letter = letters; *letter; ++letter) {
        const bool opaque = *letter >= 'a';
        const int number = opaque ? *letter - 'a' : *letter - 'A';
        list.emplace_back(number / 26.0, 0.25, 0.5, opaque ? 1.0 : 0.5, SomeColor::ColorSpace::sRGB);
    }
    return list;
}

QString letters(const ColorList &list)
{
    QString text;
    for (const SomeColor &color : list)
        text += QLatin1Char(static_cast<char>((color.a == 1.0 ? 'a' : 'A') + qRound(color.r * 26.0)));
    return text;
}

struct NamedValue
{
    const char *name;
    DefaultsValue value;
};

/** What may lie under the key without being a list in its present form. */
std::vector<NamedValue> unreadableValues()
{
    return {
        {"no JSON", bytes("[{")},
        {"one unknown space among good colors",
         bytes(R"([{"r":0,"g":0,"b":0,"a":1,"colorSpace":{"rawValue":"kTQColorSpaceSRGB"}},)"
               R"({"r":0,"g":0,"b":0,"a":1,"colorSpace":{"rawValue":"sRGB"}}])")},
        {"no bytes at all", Bytes()},
        {"older form", DefaultsArray{bytes("archive"), bytes("archive")}},
        {"older form with a text", DefaultsArray{bytes("archive"), std::string("text")}},
    };
}

bool isWideGamut()
{
    return qEnvironmentVariableIsSet("FAVRIN_TEST_WIDE_GAMUT");
}

bool keepsOrder(const ColorList &part, const ColorList &whole)
{
    auto position = whole.begin();
    return std::ranges::all_of(part, [&](const SomeColor &color) {
        position = std::find(position, whole.end(), color);
        if (position == whole.end())
            return false;
        ++position;
        return true;
    });
}

QString sortedLetters(const ColorList &list)
{
    QString text = letters(list);
    std::ranges::sort(text);
    return text;
}

ColorList translucentColors(const ColorList &list)
{
    ColorList part;
    std::ranges::copy_if(list, std::back_inserter(part), [](const SomeColor &color) { return color.a != 1.0; });
    return part;
}

ColorList randomColors(std::mt19937 &random, const char *alphabet, std::size_t longest)
{
    std::string text(random() % (longest + 1), ' ');
    std::ranges::generate(text, [&] { return alphabet[random() % std::strlen(alphabet)]; });
    return colors(text.c_str());
}

} // namespace

class TestFavoritesStore : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        const QString file = m_folder.filePath(u"%1.sqlite"_s.arg(m_files++));
        m_defaults = std::make_unique<platform::UserDefaults>(file.toStdString());
    }
    void cleanup() { m_defaults.reset(); }

    void theFirstRunStoresTheDefaultsOfTheDisplay()
    {
        using Rows = std::array<std::array<int, 3>, 5>;
        constexpr Rows sRGB = {{{0, 0, 0}, {0, 97, 253}, {51, 199, 89}, {255, 204, 1}, {255, 58, 47}}};
        constexpr Rows wide = {{{0, 0, 0}, {40, 95, 244}, {100, 196, 102}, {247, 206, 70}, {235, 77, 61}}};
        const auto space = isWideGamut() ? SomeColor::ColorSpace::displayP3 : SomeColor::ColorSpace::sRGB;
        ColorList expected;
        for (const auto &row : isWideGamut() ? wide : sRGB)
            expected.emplace_back(row[0] / 255.0, row[1] / 255.0, row[2] / 255.0, 1.0, space);
        const FavoritesStore store(*m_defaults);
        QCOMPARE(store.favoriteColors(true), expected);
        QCOMPARE(m_defaults->bytes(key), encoded(expected));
    }

    void anEmptyListStaysEmpty()
    {
        m_defaults->set(key, bytes("[]"));
        FavoritesStore store(*m_defaults);
        QVERIFY(store.favoriteColors(true).empty());
        store.saveFavoriteColors({}, true);
        QVERIFY(!m_defaults->value(asideKey));
    }

    void onlyFullyOpaqueColorsAreShownWithoutAlpha()
    {
        ColorList list = colors("aBc");
        list.push_back(list.front().setting(SomeColor::Component::a, 0.999));
        m_defaults->set(key, encoded(list));
        const FavoritesStore store(*m_defaults);
        QCOMPARE(letters(store.favoriteColors(false)), u"ac"_s);
        QCOMPARE(store.favoriteColors(true), list);
    }

    void editsWithoutAlphaAreMerged_data()
    {
        addRows<QByteArray, QByteArray, QByteArray>({
            {"nothing changed", "aBc", "ac", "aBc"},
            {"one removed and one added", "aBc", "cd", "Bcd"},
            {"an addition comes after the translucent", "aB", "ax", "aBx"},
            {"an addition in front comes last too", "aB", "xa", "aBx"},
            {"the only opaque one removed", "BaC", "", "BC"},
            {"all new", "aBc", "xy", "Bxy"},
            {"one of two equal", "aa", "a", "a"},
            {"a translucent twin is not touched", "aA", "", "A"},
            {"a removed one between two equal others", "abBa", "aa", "aBa"},
            {"stored list empty", "", "ab", "ab"},
            {"both empty", "", "", ""},
        });
    }
    void editsWithoutAlphaAreMerged()
    {
        const auto [stored, edited, merged] = row<QByteArray, QByteArray, QByteArray>();
        m_defaults->set(key, encoded(colors(stored.constData())));
        FavoritesStore store(*m_defaults);
        store.saveFavoriteColors(colors(edited.constData()), false);
        QCOMPARE(letters(store.favoriteColors(true)), QString::fromLatin1(merged));

        store.saveFavoriteColors(colors(edited.constData()), true);
        QCOMPARE(letters(store.favoriteColors(true)), QString::fromLatin1(edited));
    }

    void randomEditsWithoutAlphaKeepWhatTheyDidNotSee()
    {
        std::mt19937 random(77);
        for (int round = 0; round < 3000; ++round) {
            const ColorList stored = randomColors(random, "abcdABCD", 12);
            const ColorList edited = randomColors(random, "abcde", 9);
            const ColorList merged = mergedFavorites(stored, edited);
            QCOMPARE(letters(translucentColors(merged)), letters(translucentColors(stored)));
            QVERIFY(std::ranges::includes(sortedLetters(merged), sortedLetters(edited)));
        }
    }

    void aSingleRemovalOrAdditionHasOneOutcome()
    {
        std::mt19937 random(78);
        for (int round = 0; round < 3000; ++round) {
            const ColorList stored = randomColors(random, "abcABC", 12);
            ColorList visible = opaqueColors(stored);

            ColorList added = visible;
            const auto place = static_cast<std::ptrdiff_t>(random() % (visible.size() + 1));
            added.insert(added.begin() + place, colors("x").front());
            QCOMPARE(letters(mergedFavorites(stored, added)), letters(stored) + u"x"_s);

            if (visible.empty())
                continue;
            visible.erase(visible.begin() + static_cast<std::ptrdiff_t>(random() % visible.size()));
            const ColorList removed = mergedFavorites(stored, visible);
            QCOMPARE(letters(opaqueColors(removed)), letters(visible));
            QCOMPARE(letters(translucentColors(removed)), letters(translucentColors(stored)));
            QVERIFY(keepsOrder(removed, stored));
        }
    }

    void whatCannotBeReadReadsAsNoneAndIsPutAsideOnce_data()
    {
        QTest::addColumn<int>("index");
        int index = 0;
        for (const NamedValue &row : unreadableValues())
            QTest::newRow(row.name) << index++;
    }
    void whatCannotBeReadReadsAsNoneAndIsPutAsideOnce()
    {
        QFETCH(int, index);
        const DefaultsValue stored = unreadableValues()[static_cast<std::size_t>(index)].value;
        FavoritesStore store(*m_defaults);
        for (const bool replacingAll : {true, false}) {
            m_defaults->set(key, stored);
            QVERIFY(store.favoriteColors(true).empty());
            // Nor are the defaults written over it.
            QVERIFY(m_defaults->value(key) == stored);
            QTest::ignoreMessage(QtWarningMsg, putAsideWarning);
            store.saveFavoriteColors(colors("a"), replacingAll);
            QCOMPARE(letters(store.favoriteColors(true)), u"a"_s);
            QVERIFY(m_defaults->array(asideKey) == DefaultsArray{stored});
        }
    }

    void aTextUnderTheKeyGivesWayToTheDefaults()
    {
        m_defaults->set(key, std::string("text"));
        QTest::ignoreMessage(QtWarningMsg, putAsideWarning);
        const FavoritesStore store(*m_defaults);
        QCOMPARE(store.favoriteColors(true).size(), std::size_t(5));
        QVERIFY(m_defaults->array(asideKey) == DefaultsArray{std::string("text")});
    }

    void severalUnreadableValuesAreAllKept()
    {
        FavoritesStore store(*m_defaults);
        DefaultsArray expected;
        for (int number = 0; number < 20; ++number) {
            const Bytes damaged = bytes("damaged " + std::to_string(number));
            expected.push_back(damaged);
            m_defaults->set(key, damaged);
            QTest::ignoreMessage(QtWarningMsg, putAsideWarning);
            store.saveFavoriteColors({}, true);
        }
        expected.erase(expected.begin(), expected.end() - 16);
        QVERIFY(m_defaults->array(asideKey) == expected);
    }

    void mergingSeesWhatAnotherPickerSaved()
    {
        m_defaults->set(key, encoded(colors("aB")));
        FavoritesStore first(*m_defaults);
        FavoritesStore second(*m_defaults);
        second.saveFavoriteColors(colors("aBC"), true);
        first.saveFavoriteColors(colors("ax"), false);
        QCOMPARE(letters(second.favoriteColors(true)), u"aBCx"_s);
    }

    void aListThatCannotBeWrittenLeavesTheStoredOne()
    {
        m_defaults->set(key, encoded(colors("ab")));
        FavoritesStore store(*m_defaults);
        store.saveFavoriteColors({SomeColor(0, 0, 0, qQNaN(), SomeColor::ColorSpace::sRGB)}, true);
        QCOMPARE(letters(store.favoriteColors(true)), u"ab"_s);
    }

private:
    QTemporaryDir m_folder;
    int m_files = 0;
    std::unique_ptr<platform::UserDefaults> m_defaults;
};

int main(int argc, char **argv)
{
    if (isWideGamut())
        platform::setDisplayGamut(platform::DisplayGamut::P3);
    QCoreApplication application(argc, argv);
    TestFavoritesStore test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_favoritesstore.moc"
