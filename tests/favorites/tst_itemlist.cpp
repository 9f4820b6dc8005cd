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
    void listHolds_data();
    void listHolds();
    void selectedPlacesAreThoseOfAboutTheColor_data();
    void selectedPlacesAreThoseOfAboutTheColor();
    void changeIsTold_data();
    void changeIsTold();
    void randomEditsMatchASimpleModel();
    void randomListsBecomeEachOther();
};

void ItemListTest::listHolds_data()
{
    QTest::addColumn<bool>("allowsNoColor");
    QTest::addColumn<QString>("suggested");
    QTest::addColumn<QString>("favorites");
    QTest::addColumn<bool>("selected");
    QTest::addColumn<QString>("expected");
    QTest::newRow("nothing") << false << ""
                             << "" << false << "";
    QTest::newRow("favorites and add") << false << ""
                                       << "AB" << true << "A0 B0 +";
    QTest::newRow("remove and favorites") << true << ""
                                          << "AB" << false << "- A0 B0";
    QTest::newRow("suggestions are filled up") << false << "ABC"
                                               << "DE" << true << "sA0 sB1 sC2 .0 D0 E0 +";
    QTest::newRow("exact multiples get a page of fillers") << false << "ABCD"
                                                           << "E" << false << "sA0 sB1 sC2 sD3 .0 .1 .2 .3 E0";
    QTest::newRow("remove does not count") << true << "ABC"
                                           << "D" << true << "- sA0 sB1 sC2 .0 D0 +";
    QTest::newRow("duplicates are numbered") << false << "AA"
                                             << "ABAAB" << false << "sA0 sA1 .0 .1 A0 B0 A1 A2 B1";
    QTest::newRow("opacity and space make a difference")
        << false << "" << QStringLiteral("AaAΑ") << false << QStringLiteral("A0 a0 A1 Α0");
    // C0, C2 and C3 were deleted.
    QTest::newRow("deleted numbers are not given again") << false << "C"
                                                         << "CCACC" << false << "sC0 .0 .1 .2 C1 C4 A0 C5 C6";
}

void ItemListTest::listHolds()
{
    QFETCH(bool, allowsNoColor);
    QFETCH(QString, suggested);
    QFETCH(QString, favorites);
    QFETCH(bool, selected);
    QFETCH(QString, expected);
    service::ColorPickerState state(colors(favorites));
    state.allowsNoColor.set(allowsNoColor);
    state.suggestedColors.set(colors(suggested));
    if (selected)
        state.selectedColor.set(color(u'Z'));
    const DeletedIndexes deleted = {{color(u'C'), {0, 2, 3}}};
    QCOMPARE(written(favorites::itemList(state, 4, deleted), suggested + favorites), expected);
}

void ItemListTest::selectedPlacesAreThoseOfAboutTheColor_data()
{
    QTest::addColumn<double>("shift");
    QTest::addColumn<double>("alpha");
    QTest::addColumn<bool>("selected");
    QTest::addColumn<QList<int>>("places");
    QTest::newRow("exactly, suggested and favorites") << 0.0 << 1.0 << true << QList<int>{1, 5, 7};
    QTest::newRow("about") << 0.0009 << 1.0 << true << QList<int>{1, 5, 7};
    QTest::newRow("not quite") << 0.0011 << 1.0 << true << QList<int>{};
    QTest::newRow("another opacity") << 0.0 << 0.5 << true << QList<int>{8};
    QTest::newRow("none selected") << 0.0 << 1.0 << false << QList<int>{0};
}

void ItemListTest::selectedPlacesAreThoseOfAboutTheColor()
{
    QFETCH(double, shift);
    QFETCH(double, alpha);
    QFETCH(bool, selected);
    QFETCH(QList<int>, places);
    service::ColorPickerState state(colors(QStringLiteral("ABAa")));
    state.allowsNoColor.set(true);
    state.suggestedColors.set(colors(QStringLiteral("A")));
    SomeColor chosen = color(u'A').setting(SomeColor::Component::a, alpha);
    chosen.g += shift;
    state.selectedColor.set(chosen);
    const ItemList items = favorites::itemList(state, 4, {});
    const auto found = favorites::selectedPlaces(items, selected ? std::optional(chosen) : std::nullopt);
    QCOMPARE(QList<int>(found.begin(), found.end()), places);
}

void ItemListTest::changeIsTold_data()
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
    QTest::newRow("all at once") << QList<int>{1, 2, 3, 4} << QList<int>{5, 4, 6, 1} << "out 1-2 move in 0-0 in 2-2";
}

void ItemListTest::changeIsTold()
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

void ItemListTest::randomEditsMatchASimpleModel()
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

void ItemListTest::randomListsBecomeEachOther()
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

QTEST_GUILESS_MAIN(ItemListTest)
#include "tst_itemlist.moc"
