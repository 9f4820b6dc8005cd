#include "service/collectiondifference.h"

#include <QTest>

#include <algorithm>
#include <numeric>
#include <random>

using namespace favrin::service;

namespace {

using List = std::vector<std::size_t>;

std::size_t commonLength(const List &a, const List &b)
{
    std::vector<List> table(a.size() + 1, List(b.size() + 1, 0));
    for (std::size_t i = 1; i <= a.size(); ++i) {
        for (std::size_t j = 1; j <= b.size(); ++j)
            table[i][j] = a[i - 1] == b[j - 1] ? table[i - 1][j - 1] + 1 : std::max(table[i - 1][j], table[i][j - 1]);
    }
    return table[a.size()][b.size()];
}

List without(List list, const std::vector<std::size_t> &offsets)
{
    for (auto offset = offsets.rbegin(); offset != offsets.rend(); ++offset)
        list.erase(list.begin() + static_cast<std::ptrdiff_t>(*offset));
    return list;
}

List randomList(std::mt19937 &random, std::size_t longest, std::size_t values)
{
    List list(random() % (longest + 1));
    std::ranges::generate(list, [&] { return random() % values; });
    return list;
}

} // namespace

class TestCollectionDifference : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void theScriptIsRightAndShortest()
    {
        std::mt19937 random(20240817);
        for (int round = 0; round < 20000; ++round) {
            const std::size_t values = 1 + random() % 6;
            const List before = randomList(random, 14, values);
            const List after = randomList(random, 14, values);
            const auto script = differenceOfIdentities(before, after);
            QVERIFY(std::ranges::is_sorted(script.removals) && std::ranges::is_sorted(script.insertions));
            QCOMPARE(without(before, script.removals), without(after, script.insertions));
            QCOMPARE(script.removals.size() + script.insertions.size(),
                     before.size() + after.size() - 2 * commonLength(before, after));
        }
    }

    void longListsNeedNoQuadraticMemory()
    {
        List before(10000);
        std::iota(before.begin(), before.end(), 0);
        List reversed(before.rbegin(), before.rend());
        QCOMPARE(differenceOfIdentities(before, reversed).removals.size(), before.size() - 1);
        List shorter = without(before, {5000});
        QCOMPARE(differenceOfIdentities(before, shorter), (CollectionDifference{{5000}, {}}));
    }
};

QTEST_GUILESS_MAIN(TestCollectionDifference)
#include "tst_collectiondifference.moc"
