#include "platform/observation/publisher.h"

#include <QStringList>
#include <QtTest>

using namespace favrin::platform;

namespace {

using MaybeInt = std::optional<int>;

QString text(const MaybeInt &value)
{
    return value ? QString::number(*value) : QStringLiteral("none");
}

} // namespace

Q_DECLARE_METATYPE(MaybeInt)

/** The operators: map, duplicate removal, latest of two. */
class PublisherTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void removeDuplicatesDropsOnlyRepetitions_data()
    {
        QTest::addColumn<QList<MaybeInt>>("sent");
        QTest::addColumn<QString>("received");
        QTest::addRow("none first") << QList<MaybeInt>{{}, {}, 1} << QStringLiteral("none 1");
        QTest::addRow("repetitions") << QList<MaybeInt>{1, 1, 2, 2, 1} << QStringLiteral("1 2 1");
        QTest::addRow("back to none") << QList<MaybeInt>{1, {}, {}, 1} << QStringLiteral("1 none 1");
    }
    void removeDuplicatesDropsOnlyRepetitions()
    {
        QFETCH(const QList<MaybeInt>, sent);
        QFETCH(const QString, received);
        Subject<MaybeInt> subject;
        QStringList log;
        const auto subscription =
            subject.publisher().removeDuplicates().sink([&](const MaybeInt &value) { log << text(value); });
        for (const auto &value : sent)
            subject.send(value);
        QCOMPARE(log.join(u' '), received);
    }

    void eachSubscriptionRemembersItsOwnLastValue()
    {
        Subject<int> subject;
        const auto distinct = subject.publisher().removeDuplicates();
        int first = 0;
        int second = 0;
        const auto one = distinct.sink([&](int) { ++first; });
        subject.send(7);
        const auto two = distinct.sink([&](int) { ++second; });
        subject.send(7);
        QCOMPARE(first, 1);
        QCOMPARE(second, 1);
    }

    void aRepetitionSentFromWithinIsDropped()
    {
        Subject<int> subject;
        QStringList log;
        const auto subscription = subject.publisher().removeDuplicates().sink([&](int value) {
            log << QString::number(value);
            subject.send(value);
        });
        subject.send(1);
        subject.send(2);
        QCOMPARE(log.join(u' '), QStringLiteral("1 2"));
    }

    void latestOfTwo_data()
    {
        QTest::addColumn<QString>("sent");
        QTest::addColumn<QString>("received");
        QTest::addRow("one side alone says nothing") << QStringLiteral("a1 a2") << QString();
        QTest::addRow("complete with the second") << QStringLiteral("a1 b1") << QStringLiteral("1,1");
        QTest::addRow("complete with the first") << QStringLiteral("b1 a1") << QStringLiteral("1,1");
        QTest::addRow("earlier values are gone") << QStringLiteral("a1 a2 b1") << QStringLiteral("2,1");
        QTest::addRow("either side emits") << QStringLiteral("a1 b1 a2 b2 b2") << QStringLiteral("1,1 2,1 2,2 2,2");
    }
    void latestOfTwo()
    {
        QFETCH(const QString, sent);
        QFETCH(const QString, received);
        Subject<int> a;
        Subject<int> b;
        QStringList log;
        const auto subscription =
            combineLatest(a.publisher(), b.publisher()).sink([&](const std::pair<int, int> &pair) {
                log << QStringLiteral("%1,%2").arg(pair.first).arg(pair.second);
            });
        for (const auto &step : sent.split(u' '))
            (step.startsWith(u'a') ? a : b).send(step.mid(1).toInt());
        QCOMPARE(log.join(u' '), received);
    }

    void latestOfTwoEndsOnBothSides()
    {
        Subject<int> a;
        Subject<int> b;
        const auto token = std::make_shared<int>(0);
        Subscription subscription;
        int received = 0;
        subscription = combineLatest(a.publisher(), b.publisher()).sink([&, token](const auto &) {
            ++received;
            subscription.cancel();
        });
        a.send(1);
        b.send(1);
        a.send(2);
        b.send(2);
        QCOMPARE(received, 1);
        QCOMPARE(token.use_count(), 1L);
    }

    void latestOfTwoSurvivesTheEndOfOneSide()
    {
        auto a = std::make_unique<Subject<int>>();
        Subject<int> b;
        QStringList log;
        const auto joined = combineLatest(a->publisher(), b.publisher());
        const auto subscription =
            joined.sink([&](const auto &pair) { log << QString::number(pair.first * 10 + pair.second); });
        a->send(1);
        a.reset();
        b.send(2);
        b.send(3);
        QCOMPARE(log.join(u' '), QStringLiteral("12 13"));
    }
};

QTEST_APPLESS_MAIN(PublisherTest)
#include "tst_publisher.moc"
