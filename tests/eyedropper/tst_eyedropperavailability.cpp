#include "eyedropper/eyedropperavailability.h"

#include "eyedropper/wirenames.h"
#include "privatebus.h"

#include <QDBusMessage>
#include <QDBusVirtualObject>
#include <QSignalSpy>

using namespace favrin::eyedropper;

namespace {

/** Something that owns the service's name, and answers the question, or not. */
class Answerer : public QDBusVirtualObject
{
public:
    enum class Answer { Yes, No, DoesNotKnow, Error, OtherType };

    Answerer(const QDBusConnection &bus, Answer answer) : m_bus(bus), m_answer(answer)
    {
        m_bus.registerVirtualObject(servicePath, this);
        m_bus.registerService(serviceName);
    }
    ~Answerer() override { QDBusConnection::disconnectFromBus(m_bus.name()); }
    QString introspect(const QString &) const override { return {}; }
    bool handleMessage(const QDBusMessage &message, const QDBusConnection &bus) override
    {
        if (message.interface() != availabilityInterface || m_answer == Answer::DoesNotKnow)
            return false;
        if (m_answer == Answer::Error)
            return bus.send(message.createErrorReply(QDBusError::Failed, QStringLiteral("broken")));
        if (m_answer == Answer::OtherType)
            return bus.send(message.createReply(QStringLiteral("yes")));
        return bus.send(message.createReply(m_answer == Answer::Yes));
    }

private:
    QDBusConnection m_bus;
    Answer m_answer;
};

using Answer = Answerer::Answer;

} // namespace

Q_DECLARE_METATYPE(Answerer::Answer)

class TestEyedropperAvailability : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void theServiceIsAsked_data()
    {
        QTest::addColumn<Answer>("answer");
        QTest::addColumn<bool>("available");
        QTest::newRow("it can work") << Answer::Yes << true;
        QTest::newRow("it cannot work") << Answer::No << false;
        QTest::newRow("it does not know the question") << Answer::DoesNotKnow << true;
        QTest::newRow("it is broken") << Answer::Error << false;
        QTest::newRow("it talks nonsense") << Answer::OtherType << false;
    }

    void theServiceIsAsked()
    {
        QFETCH(Answer, answer);
        QFETCH(bool, available);
        PrivateBus bus;
        QVERIFY(bus.start());
        const Answerer service(bus.connection(), answer);
        EyedropperAvailability availability(bus.address());
        QVERIFY(!availability.isAvailable());
        QSignalSpy changes(&availability, &EyedropperAvailability::changed);
        availability.ask();
        QVERIFY(changes.wait());
        QVERIFY(availability.isKnown());
        QCOMPARE(availability.isAvailable(), available);
    }

    void withoutAServiceThereIsNone()
    {
        PrivateBus bus;
        QVERIFY(bus.start());
        EyedropperAvailability availability(bus.address());
        availability.ask();
        QTRY_VERIFY(availability.isKnown());
        QVERIFY(!availability.isAvailable());
    }

    void withoutABusThereIsNone()
    {
        PrivateBus bus;
        QVERIFY(bus.start());
        bus.stop();
        EyedropperAvailability availability(bus.address());
        availability.ask();
        QTRY_VERIFY(availability.isKnown());
        QVERIFY(!availability.isAvailable());
    }

    void aServiceThatCannotBeStartedIsNone()
    {
        PrivateBus bus;
        bus.addService(serviceName, QStringLiteral("/bin/false"));
        QVERIFY(bus.start());
        EyedropperAvailability availability(bus.address());
        availability.ask();
        QTRY_VERIFY(availability.isKnown());
        QVERIFY(!availability.isAvailable());
    }

    void aServiceMayComeAndGo()
    {
        PrivateBus bus;
        QVERIFY(bus.start());
        EyedropperAvailability availability(bus.address());
        availability.ask();
        QTRY_VERIFY(availability.isKnown());
        QVERIFY(!availability.isAvailable());

        auto service = std::make_unique<Answerer>(bus.connection(), Answer::Yes);
        QTRY_VERIFY(availability.isAvailable());
        service.reset();
        QTRY_VERIFY(!availability.isAvailable());
        service = std::make_unique<Answerer>(bus.connection(), Answer::DoesNotKnow);
        QTRY_VERIFY(availability.isAvailable());
        bus.stop();
        QTRY_VERIFY(!availability.isAvailable());
    }
};

QTEST_GUILESS_MAIN(TestEyedropperAvailability)
#include "tst_eyedropperavailability.moc"
