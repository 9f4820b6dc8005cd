#include "platform/observation/published.h"

#include <QStringList>
#include <QtTest>

using namespace favrin::platform;

namespace {

struct Owner : ObservableObject
{
    Published<int> number{*this, 1};
    Published<std::string> text{*this, "a"};
};

} // namespace

/** The order of an assignment, and what subscribers may do in the middle of it. */
class PublishedTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        m_owner = std::make_unique<Owner>();
        m_log.clear();
        m_kept.clear();
    }

    void assignmentAnnouncesDeliversThenStores_data()
    {
        QTest::addColumn<int>("assigned");
        QTest::addRow("another value") << 2;
        QTest::addRow("an equal value") << 1;
    }
    void assignmentAnnouncesDeliversThenStores()
    {
        QFETCH(const int, assigned);
        keep(m_owner->objectWillChange().sink([this](Nothing) { note("will", m_owner->number()); }));
        keep(m_owner->number.publisher().sink([this](int value) {
            note("first", value);
            note("stored", m_owner->number());
        }));
        keep(m_owner->number.publisher().sink([this](int value) { note("second", value); }));
        m_owner->number.onStored([this] { note("hook", m_owner->number()); });
        QCOMPARE(takeLog(), QStringLiteral("first 1, stored 1, second 1"));

        m_owner->number.set(assigned);
        QCOMPARE(takeLog(), QStringLiteral("will 1, first %1, stored 1, second %1, hook %1").arg(assigned));
    }

    void innerAssignmentIsCompleteBeforeTheOuterGoesOn()
    {
        keep(m_owner->number.publisher().sink([this](int value) {
            note("a", value);
            if (value == 2)
                m_owner->number.set(3);
        }));
        keep(m_owner->number.publisher().sink([this](int value) { note("b", value); }));
        m_owner->number.onStored([this] { note("hook", m_owner->number()); });
        takeLog();
        m_owner->number.set(2);
        QCOMPARE(takeLog(), QStringLiteral("a 2, a 3, b 3, hook 3, b 2, hook 2"));
        QCOMPARE(m_owner->number(), 2);
    }

    void assigningWhileTheCurrentValueIsDeliveredIsNotMissed()
    {
        keep(m_owner->number.publisher().sink([this](const int &value) {
            const int before = value;
            if (value == 1)
                m_owner->number.set(5);
            note("got", before);
            // The value given must not change under the subscriber.
            QCOMPARE(value, before);
        }));
        QCOMPARE(takeLog(), QStringLiteral("got 5, got 1"));
        QCOMPARE(m_owner->number(), 5);
    }

    void whoSubscribesDuringADeliveryEndsWithTheStoredValue()
    {
        keep(m_owner->number.publisher().sink([this](int value) {
            if (value == 2)
                keep(m_owner->number.publisher().sink([this](int late) { note("late", late); }));
        }));
        m_owner->number.set(2);
        QCOMPARE(takeLog(), QStringLiteral("late 1, late 2"));
    }

    void cancelDuringADelivery_data()
    {
        QTest::addColumn<QList<int>>("cancelled");
        QTest::addColumn<QString>("delivered");
        QTest::addRow("itself") << QList<int>{1} << QStringLiteral("0 2, 1 2, 2 2, 0 3, 2 3");
        QTest::addRow("one before") << QList<int>{0} << QStringLiteral("0 2, 1 2, 2 2, 1 3, 2 3");
        QTest::addRow("one after") << QList<int>{2} << QStringLiteral("0 2, 1 2, 0 3, 1 3");
        QTest::addRow("all") << QList<int>{0, 1, 2} << QStringLiteral("0 2, 1 2");
    }
    void cancelDuringADelivery()
    {
        QFETCH(const QList<int>, cancelled);
        QFETCH(const QString, delivered);
        for (int index = 0; index < 3; ++index) {
            keep(m_owner->number.publisher().sink([this, index, cancelled](int value) {
                note(QByteArray::number(index), value);
                for (const int other : index == 1 && value == 2 ? cancelled : QList<int>())
                    m_kept[static_cast<std::size_t>(other)].cancel();
            }));
        }
        takeLog();
        m_owner->number.set(2);
        m_owner->number.set(3);
        QCOMPARE(takeLog(), delivered);
    }

    void destroyingTheOwnerDuringAnAssignment_data()
    {
        QTest::addColumn<bool>("inAnnouncement");
        QTest::addColumn<bool>("nested");
        QTest::addColumn<QString>("delivered");
        QTest::addRow("announcement") << true << false << QString();
        QTest::addRow("delivery") << false << false << QStringLiteral("first 2");
        QTest::addRow("inner delivery") << false << true << QStringLiteral("first 2, first 3");
    }
    void destroyingTheOwnerDuringAnAssignment()
    {
        QFETCH(const bool, inAnnouncement);
        QFETCH(const bool, nested);
        QFETCH(const QString, delivered);
        keep(m_owner->number.publisher().sink([=, this](int value) {
            note("first", value);
            if (nested && value == 2)
                m_owner->number.set(3);
            else if (value != 1)
                m_owner.reset();
        }));
        keep(m_owner->number.publisher().sink([this](int value) { note("second", value); }));
        m_owner->number.onStored([this] { note("hook", 0); });
        if (inAnnouncement)
            keep(m_owner->objectWillChange().sink([this](Nothing) { m_owner.reset(); }));
        takeLog();
        m_owner->number.set(2);
        QCOMPARE(takeLog(), delivered);
        QVERIFY(!m_owner);
    }

    void publishersAndHandlesOutliveTheProperty()
    {
        const auto numbers = m_owner->number.publisher();
        const auto announcements = m_owner->objectWillChange();
        keep(numbers.sink([](int) {}));
        m_owner.reset();
        int received = 0;
        QVERIFY(!numbers.sink([&](int) { ++received; }));
        QVERIFY(!announcements.sink([&](Nothing) { ++received; }));
        m_kept.front().cancel();
        QCOMPARE(received, 0);
    }

    void droppingTheHandleFreesTheReceiver()
    {
        const auto token = std::make_shared<int>(0);
        auto subscription = m_owner->number.publisher().sink([token](int) {});
        QVERIFY(token.use_count() > 1);
        auto moved = std::move(subscription);
        QVERIFY(moved && !subscription);
        moved = Subscription();
        QCOMPARE(token.use_count(), 1L);
    }

    void aReceiverMayOwnOtherSubscriptionsOfTheSameProperty()
    {
        auto inner = std::make_shared<Subscription>(
            m_owner->number.publisher().sink([this](int value) { note("inner", value); }));
        keep(m_owner->number.publisher().sink([this, owned = inner](int value) {
            if (value == 2)
                m_kept.front().cancel();
        }));
        const std::weak_ptr<Subscription> watch = inner;
        inner.reset();
        takeLog();
        m_owner->number.set(2);
        m_owner->number.set(3);
        QCOMPARE(takeLog(), QStringLiteral("inner 2"));
        QVERIFY(watch.expired());
    }

private:
    void keep(Subscription subscription) { m_kept.push_back(std::move(subscription)); }
    void note(const QByteArray &who, int value)
    {
        m_log << QStringLiteral("%1 %2").arg(QString::fromLatin1(who)).arg(value);
    }
    QString takeLog() { return std::exchange(m_log, {}).join(QStringLiteral(", ")); }

    std::unique_ptr<Owner> m_owner;
    QStringList m_log;
    std::vector<Subscription> m_kept;
};

QTEST_APPLESS_MAIN(PublishedTest)
#include "tst_published.moc"
