#include "platform/observation/published.h"

#include "../../shared/table.h"

#include <QStringList>
#include <QtTest>

using namespace favrin::platform;
using namespace Qt::StringLiterals;

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
        addRows<int>({
            {"another value", 2},
            {"an equal value", 1},
        });
    }
    void assignmentAnnouncesDeliversThenStores()
    {
        const auto [assigned] = row<int>();
        keep(m_owner->objectWillChange().sink([this](Nothing) { note("will", m_owner->number()); }));
        keep(m_owner->number.publisher().sink([this](int value) {
            note("first", value);
            note("stored", m_owner->number());
        }));
        keep(m_owner->number.publisher().sink([this](int value) { note("second", value); }));
        m_owner->number.onStored([this] { note("hook", m_owner->number()); });
        QCOMPARE(takeLog(), u"first 1, stored 1, second 1"_s);

        m_owner->number.set(assigned);
        QCOMPARE(takeLog(), u"will 1, first %1, stored 1, second %1, hook %1"_s.arg(assigned));
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
        QCOMPARE(takeLog(), u"a 2, a 3, b 3, hook 3, b 2, hook 2"_s);
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
        QCOMPARE(takeLog(), u"got 5, got 1"_s);
        QCOMPARE(m_owner->number(), 5);
    }

    void whoSubscribesDuringADeliveryEndsWithTheStoredValue()
    {
        keep(m_owner->number.publisher().sink([this](int value) {
            if (value == 2)
                keep(m_owner->number.publisher().sink([this](int late) { note("late", late); }));
        }));
        m_owner->number.set(2);
        QCOMPARE(takeLog(), u"late 1, late 2"_s);
    }

    void cancelDuringADelivery_data()
    {
        addRows<QList<int>, QString>({
            {"itself", {1}, u"0 2, 1 2, 2 2, 0 3, 2 3"_s},
            {"one before", {0}, u"0 2, 1 2, 2 2, 1 3, 2 3"_s},
            {"one after", {2}, u"0 2, 1 2, 0 3, 1 3"_s},
            {"all", {0, 1, 2}, u"0 2, 1 2"_s},
        });
    }
    void cancelDuringADelivery()
    {
        const auto [cancelled, delivered] = row<QList<int>, QString>();
        for (int index = 0; index < 3; ++index) {
            keep(m_owner->number.publisher().sink([this, index, cancelled = cancelled](int value) {
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
        addRows<bool, bool, QString>({
            {"announcement", true, false, {}},
            {"delivery", false, false, u"first 2"_s},
            {"inner delivery", false, true, u"first 2, first 3"_s},
        });
    }
    void destroyingTheOwnerDuringAnAssignment()
    {
        const auto [inAnnouncement, nested, delivered] = row<bool, bool, QString>();
        keep(m_owner->number.publisher().sink([this, nested = nested](int value) {
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
        QCOMPARE(takeLog(), u"inner 2"_s);
        QVERIFY(watch.expired());
    }

private:
    void keep(Subscription subscription) { m_kept.push_back(std::move(subscription)); }
    void note(const QByteArray &who, int value) { m_log << u"%1 %2"_s.arg(QString::fromLatin1(who)).arg(value); }
    QString takeLog() { return std::exchange(m_log, {}).join(u", "_s); }

    std::unique_ptr<Owner> m_owner;
    QStringList m_log;
    std::vector<Subscription> m_kept;
};

QTEST_APPLESS_MAIN(PublishedTest)
#include "tst_published.moc"
