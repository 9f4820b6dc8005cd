#include "favorites/favoritesdatasource.h"
#include "service/colorpickerstate.h"

#include <QAbstractItemModelTester>
#include <QSignalSpy>
#include <QTest>

#include <algorithm>
#include <numeric>
#include <random>

using namespace favrin;
using favorites::Animation;
using favorites::ColorItem;
using favorites::DeletedIndexes;
using favorites::ItemList;
using model::SomeColor;

namespace {

/** Colors by letters: upper case opaque, lower case half transparent, Greek in the other space. */
SomeColor color(QChar letter)
{
    const double component = (letter.toLower().unicode() % 32) / 32.0;
    const auto space = letter.unicode() > 0x100 ? SomeColor::ColorSpace::displayP3 : SomeColor::ColorSpace::sRGB;
    return {component, 0.25, 0.75, letter.isUpper() ? 1.0 : 0.5, space};
}

std::vector<SomeColor> colors(const QString &letters)
{
    std::vector<SomeColor> list;
    for (const QChar letter : letters)
        list.push_back(color(letter));
    return list;
}

/** The list in writing: - remove, + add, . filler, sA a suggested color, A0 a favorite with its occurrence number. */
QString written(const ItemList &items, const QString &letters)
{
    QStringList words;
    for (const ColorItem &item : items) {
        const auto found =
            std::find_if(letters.begin(), letters.end(), [&item](QChar letter) { return item.color == color(letter); });
        const QString letter = found != letters.end() ? QString(*found) : QStringLiteral("?");
        switch (item.kind) {
        case ColorItem::Kind::removeButton:
            words << QStringLiteral("-");
            break;
        case ColorItem::Kind::addButton:
            words << QStringLiteral("+");
            break;
        case ColorItem::Kind::filler:
            words << QStringLiteral(".%1").arg(item.number);
            break;
        case ColorItem::Kind::suggestedColor:
            words << QStringLiteral("s%1%2").arg(letter).arg(item.number);
            break;
        case ColorItem::Kind::color:
            words << QStringLiteral("%1%2").arg(letter).arg(item.number);
            break;
        }
    }
    return words.join(u' ');
}

ItemList favoriteItems(const std::vector<int> &numbers)
{
    ItemList items;
    for (const int number : numbers)
        items.push_back(ColorItem::favoriteColor(color(u'A'), number));
    return items;
}

} // namespace

class ItemListTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void listHolds()
    {
        enum class Color { None, Selected };
        const auto list = [](bool allowsNoColor, const char *suggested, const char *favorites, Color selected) {
            const auto suggestions = QString::fromUtf8(suggested);
            const auto kept = QString::fromUtf8(favorites);
            service::ColorPickerState state(colors(kept));
            state.allowsNoColor.set(allowsNoColor);
            state.suggestedColors.set(colors(suggestions));
            if (selected == Color::Selected)
                state.selectedColor.set(color(u'Z'));
            const DeletedIndexes deleted = {{color(u'C'), {0, 2, 3}}};
            return written(favorites::itemList(state, 4, deleted), suggestions + kept);
        };
        QCOMPARE(list(false, "", "", Color::None), QString());
        QCOMPARE(list(false, "", "AB", Color::Selected), QStringLiteral("A0 B0 +"));
        QCOMPARE(list(true, "", "AB", Color::None), QStringLiteral("- A0 B0"));
        // Suggestions are filled up, exact multiples with a page; the remove button does not count.
        QCOMPARE(list(false, "ABC", "DE", Color::Selected), QStringLiteral("sA0 sB1 sC2 .0 D0 E0 +"));
        QCOMPARE(list(false, "ABCD", "E", Color::None), QStringLiteral("sA0 sB1 sC2 sD3 .0 .1 .2 .3 E0"));
        QCOMPARE(list(true, "ABC", "D", Color::Selected), QStringLiteral("- sA0 sB1 sC2 .0 D0 +"));
        // Duplicates are numbered; opacity and space make a difference.
        QCOMPARE(list(false, "AA", "ABAAB", Color::None), QStringLiteral("sA0 sA1 .0 .1 A0 B0 A1 A2 B1"));
        QCOMPARE(list(false, "", "AaAΑ", Color::None), QStringLiteral("A0 a0 A1 Α0"));
        // C0, C2 and C3 were deleted, and such numbers are not given again.
        QCOMPARE(list(false, "C", "CCACC", Color::None), QStringLiteral("sC0 .0 .1 .2 C1 C4 A0 C5 C6"));
    }

    void selectedPlacesAreThoseOfAboutTheColor()
    {
        service::ColorPickerState state(colors(QStringLiteral("ABAa")));
        state.allowsNoColor.set(true);
        state.suggestedColors.set(colors(QStringLiteral("A")));
        state.selectedColor.set(color(u'A'));
        const ItemList items = favorites::itemList(state, 4, {});
        const auto places = [&](double shift, double alpha) {
            SomeColor chosen = color(u'A').setting(SomeColor::Component::a, alpha);
            chosen.g += shift;
            return favorites::selectedPlaces(items, chosen);
        };
        QCOMPARE(places(0.0, 1.0), (std::vector{1, 5, 7}));
        QCOMPARE(places(0.0009, 1.0), (std::vector{1, 5, 7}));
        QCOMPARE(places(0.0011, 1.0), std::vector<int>());
        QCOMPARE(places(0.0, 0.5), std::vector{8});
        QCOMPARE(favorites::selectedPlaces(items, std::nullopt), std::vector{0});
    }

    void changeIsTold_data()
    {
        QTest::addColumn<QList<int>>("from");
        QTest::addColumn<QList<int>>("to");
        QTest::addColumn<QString>("told");
        QTest::newRow("nothing") << QList<int>{1, 2, 3} << QList<int>{1, 2, 3} << "";
        QTest::newRow("one comes") << QList<int>{1, 2} << QList<int>{1, 3, 2} << "in 1-1";
        QTest::newRow("one goes") << QList<int>{1, 2, 3} << QList<int>{1, 3} << "out 1-1";
        QTest::newRow("neighbours go together") << QList<int>{1, 2, 3, 4} << QList<int>{4} << "out 0-2";
        QTest::newRow("from nothing") << QList<int>{} << QList<int>{1, 2, 3} << "in 0-2";
        QTest::newRow("all others") << QList<int>{1, 2} << QList<int>{3, 4} << "out 0-1 in 0-1";
        QTest::newRow("two swap") << QList<int>{1, 2, 3, 4} << QList<int>{1, 3, 2, 4} << "move";
        QTest::newRow("all at once") << QList<int>{1, 2, 3, 4} << QList<int>{5, 4, 6, 1}
                                     << "out 1-2 move in 0-0 in 2-2";
    }

    void changeIsTold()
    {
        QFETCH(QList<int>, from);
        QFETCH(QList<int>, to);
        QFETCH(QString, told);
        favorites::FavoritesDataSource source;
        source.apply(favoriteItems({from.begin(), from.end()}), Animation::Immediate);
        QStringList heard;
        connect(&source, &QAbstractItemModel::rowsRemoved, this, [&heard](const QModelIndex &, int first, int last) {
            heard << QStringLiteral("out %1-%2").arg(first).arg(last);
        });
        connect(&source, &QAbstractItemModel::rowsInserted, this, [&heard](const QModelIndex &, int first, int last) {
            heard << QStringLiteral("in %1-%2").arg(first).arg(last);
        });
        connect(&source, &QAbstractItemModel::layoutChanged, this, [&heard] { heard << QStringLiteral("move"); });
        QSignalSpy applied(&source, &favorites::FavoritesDataSource::applied);
        source.apply(favoriteItems({to.begin(), to.end()}), Animation::Animated);
        QCOMPARE(heard.join(u' '), told);
        QCOMPARE(applied.size(), told.isEmpty() ? 0 : 1);
    }

    void randomEditsMatchASimpleModel()
    {
        std::mt19937 random(20240917);
        const auto below = [&random](std::size_t limit) { return static_cast<std::size_t>(random() % limit); };
        const QString letters = QStringLiteral("ABCa");
        for (int sequence = 0; sequence < 50; ++sequence) {
            service::ColorPickerState state({});
            DeletedIndexes deleted;
            // The simple model: a favorite is told from all others by the number it got when it was added.
            std::vector<std::pair<QChar, int>> model;
            int added = 0;
            ItemList before;
            std::vector<int> identitiesBefore;
            for (int step = 0; step < 60; ++step) {
                std::optional<int> goneIdentity;
                if (model.empty() || below(5) < 3) {
                    model.emplace_back(letters[static_cast<qsizetype>(below(4))], added++);
                } else {
                    const std::size_t place = below(model.size());
                    const ColorItem item = before[place];
                    deleted[*item.color].insert(item.number);
                    QCOMPARE(favorites::favoritePlace(before, item), std::optional(place));
                    goneIdentity = model[place].second;
                    model.erase(model.begin() + static_cast<std::ptrdiff_t>(place));
                }
                std::vector<SomeColor> list;
                for (const auto &[letter, identity] : model)
                    list.push_back(color(letter));
                state.favoriteColors.set(list);
                const ItemList items = favorites::itemList(state, 12, deleted);
                QCOMPARE(items.size(), model.size());
                // Between two lists, exactly the deleted item's identity goes and exactly the added one's comes.
                const auto difference = favorites::listDifference(before, items);
                QVERIFY(difference.order.empty());
                QCOMPARE(difference.removals.size(), goneIdentity ? std::size_t(1) : std::size_t(0));
                QCOMPARE(difference.insertions.size(), goneIdentity ? std::size_t(0) : std::size_t(1));
                if (goneIdentity)
                    QCOMPARE(identitiesBefore[static_cast<std::size_t>(difference.removals[0].first)], *goneIdentity);
                before = items;
                identitiesBefore.clear();
                for (const auto &[letter, identity] : model)
                    identitiesBefore.push_back(identity);
            }
        }
    }

    void randomListsBecomeEachOther()
    {
        std::mt19937 random(7);
        favorites::FavoritesDataSource source;
        const QAbstractItemModelTester tester(&source, QAbstractItemModelTester::FailureReportingMode::QtTest);
        for (int round = 0; round < 200; ++round) {
            std::vector<int> numbers(30);
            std::iota(numbers.begin(), numbers.end(), 0);
            std::shuffle(numbers.begin(), numbers.end(), random);
            numbers.resize(random() % 30);
            if (round % 2 == 0)
                std::sort(numbers.begin(), numbers.end());
            const ItemList next = favoriteItems(numbers);
            // What keeps an eye on an item follows it, and sees it go.
            std::vector<std::pair<QPersistentModelIndex, ColorItem>> watched;
            for (int place = 0; place < source.rowCount(); ++place)
                watched.emplace_back(source.index(place), *source.item(place));
            source.apply(next, Animation::Immediate);
            QCOMPARE(source.items(), next);
            for (const auto &[index, item] : watched) {
                const bool stays = std::find(next.begin(), next.end(), item) != next.end();
                QCOMPARE(index.isValid(), stays);
                if (stays)
                    QCOMPARE(index.data(favorites::FavoritesDataSource::ItemRole).value<ColorItem>(), item);
            }
        }
    }
};

QTEST_GUILESS_MAIN(ItemListTest)
#include "tst_itemlist.moc"
