#include "platform/observation/publisher.h"

#include "../../shared/table.h"

#include <QStringList>
#include <QtTest>

using namespace favrin::platform;

namespace {

using MaybeInt = std::optional<int>;
using namespace Qt::StringLiterals;

QString text(const MaybeInt &value)
{
    return value ? QString::number(*value) : u"none"_s;
}

} // namespace

/** The operators: map, duplicate removal, latest of two. */
class PublisherTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void removeDuplicatesDropsOnlyRepetitions_data()
    {
        addRows<QList<MaybeInt>, QString>({
            {"none first", {{}, {}, 1}, u"none 1"_s},
            {"repetitions", {1, 1, 2, 2, 1}, u"1 2 1"_s},
            {"back to none", {1, {}, {}, 1}, u"1 none 1"_s},
        });
    }
    void removeDuplicatesDropsOnlyRepetitions()
    {
        const auto [sent, received] = row<QList<MaybeInt>, QString>();
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
        QCOMPARE(log.join(u' '), u"1 2"_s);
    }

    void latestOfTwo_data()
    {
        addRows<QString, QString>({
            {"one side alone says nothing", u"a1 a2"_s, {}},
            {"complete with the second", u"a1 b1"_s, u"1,1"_s},
            {"complete with the first", u"b1 a1"_s, u"1,1"_s},
            {"earlier values are gone", u"a1 a2 b1"_s, u"2,1"_s},
            {"either side emits", u"a1 b1 a2 b2 b2"_s, u"1,1 2,1 2,2 2,2"_s},
        });
    }
    void latestOfTwo()
    {
        const auto [sent, received] = row<QString, QString>();
        Subject<int> a;
        Subject<int> b;
        QStringList log;
        const auto subscription =
            combineLatest(a.publisher(), b.publisher()).sink([&](const std::pair<int, int> &pair) {
                log << u"%1,%2"_s.arg(pair.first).arg(pair.second);
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
        QCOMPARE(log.join(u' '), u"12 13"_s);
    }
};

QTEST_APPLESS_MAIN(PublisherTest)
#include "tst_publisher.moc"
