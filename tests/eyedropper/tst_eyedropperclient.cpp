#include "eyedropper/client/dbuseyedropperclient.h"
#include "service/fvcolorpickerservicefront.h"
#include "service/fvcolorpickerserviceviewcontroller.h"

#include "../service/recordedhost.h"
#include "privatebus.h"
#include "scriptedservice.h"

#include <QDBusConnectionInterface>
#include <QDBusPendingCall>
#include <QQuickItem>
#include <QRegularExpression>
#include <QThreadPool>

#include <limits>

using namespace favrin;
using namespace favrin::service;

namespace {

const QString selected = QStringLiteral("eyedropperDidSelectColor");
const QString floated = QStringLiteral("eyedropperDidFloat");
const QString dismissed = QStringLiteral("eyedropperDidDismiss");
const QString sRGB = QStringLiteral("kTQColorSpaceSRGB");
const QString begin = QStringLiteral("beginShowingEyeDropper display 7");
const QString floatIt = QStringLiteral("floatEyeDropper");

QVariantList colorOf(const QString &space, const QList<double> &components)
{
    return {space, QVariant::fromValue(components)};
}

const QVariantList teal = colorOf(sRGB, {0.25, 0.5, 0.75, 1});

QStringList words(const char *text)
{
    return QString::fromLatin1(text).split(QStringLiteral(", "), Qt::SkipEmptyParts);
}

/** Takes what is logged as an error while it lives. */
class LoggedErrors
{
public:
    LoggedErrors() : m_before(qInstallMessageHandler(take)) { logged().clear(); }
    ~LoggedErrors() { qInstallMessageHandler(m_before); }
    static const QStringList &texts() { return logged(); }

private:
    static QStringList &logged()
    {
        static QStringList texts;
        return texts;
    }
    static void take(QtMsgType type, const QMessageLogContext &, const QString &text)
    {
        if (type == QtCriticalMsg)
            logged() << text;
    }
    QtMessageHandler m_before;
};

const QRegularExpression proxyError(QStringLiteral("^Error creating a remoteObjectProxy : .+"));

} // namespace

/** The picker's whole side of the eyedropper, against a service that a test scripts, over a real bus. */
class TestEyedropperClient : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        m_bus = std::make_unique<PrivateBus>();
        QVERIFY(m_bus->start());
        m_defaults = std::make_unique<platform::UserDefaults>(
            m_folder.filePath(QStringLiteral("defaults.sqlite")).toStdString());
        platform::viewcontrollerregistry::registerClass(hostedPickerClassName, [this] {
            return std::make_unique<FVColorPickerServiceViewController>(
                [](ColorPickerState *) { return std::make_unique<QQuickItem>(); }, *m_defaults);
        });
        setUp(m_bus->address());
    }

    void cleanup()
    {
        m_front.reset();
        m_bus.reset();
        m_defaults.reset();
    }

    void aUseGoesItsWayInOrder()
    {
        ScriptedService service(m_bus->connection());
        touchDown();
        QVERIFY(!m_front->isInteractionEnabled());
        QCOMPARE(m_host.messages, words("show"));
        touchUp();
        QTRY_COMPARE(service.messages, (QStringList{begin, floatIt}));
        QVERIFY(!service.isReplyWanted);

        service.say(floated);
        service.say(selected, teal);
        QTRY_COMPARE(m_host.picks.size(), std::size_t(2));
        QVERIFY(!m_front->isInteractionEnabled());
        service.say(dismissed);
        QTRY_VERIFY(m_front->isInteractionEnabled());
        QTRY_VERIFY(!state().eyedropperShowing());
        QCOMPARE(m_host.messages, words("show, float, pick, pick, dismiss"));
        const auto color = model::SomeColor(0.25, 0.5, 0.75, 1, model::SomeColor::ColorSpace::sRGB).platformColor();
        QCOMPARE(m_host.picks,
                 (std::vector<RecordedHost::Pick>{{color, std::nullopt, false}, {color, sRGB.toStdString(), false}}));

        m_front->pickerDidCancelEyeDropper();
        QTRY_COMPARE(service.messages.last(), QStringLiteral("cancelShowingEyeDropper"));
    }

    void answersInAnyOrderReachTheHost_data()
    {
        QTest::addColumn<QStringList>("answers");
        QTest::addColumn<QStringList>("heard");
        // A second "pick" comes from the state, in a later turn, as long as the action is kept.
        QTest::newRow("dismissed before the color") << QStringList{dismissed, selected} << words("show, dismiss, pick");
        QTest::newRow("dismissed only") << QStringList{dismissed} << words("show, dismiss");
        QTest::newRow("dismissed twice") << QStringList{dismissed, dismissed} << words("show, dismiss, dismiss");
        QTest::newRow("color twice") << QStringList{selected, selected, dismissed}
                                     << words("show, pick, pick, dismiss, pick, pick");
    }

    void answersInAnyOrderReachTheHost()
    {
        QFETCH(QStringList, answers);
        QFETCH(QStringList, heard);
        ScriptedService service(m_bus->connection());
        touchDown();
        QTRY_COMPARE(service.messages, QStringList{begin});
        for (const QString &answer : answers)
            service.say(answer, answer == selected ? teal : QVariantList());
        settle(service);
        // Which turn the state's report takes among the others is the event loop's affair.
        m_host.messages.sort();
        heard.sort();
        QTRY_COMPARE(m_host.messages, heard);
        QVERIFY(m_front->isInteractionEnabled());
    }

    void onlyTheServiceIsHeard()
    {
        ScriptedService service(m_bus->connection());
        touchDown();
        QTRY_COMPARE(service.messages, QStringList{begin});

        QDBusConnection stranger = m_bus->connection();
        for (const QString &member : {selected, floated, dismissed}) {
            auto call = service.sayFrom(stranger, member, member == selected ? teal : QVariantList());
            const auto answer = stranger.asyncCall(call);
            QTRY_VERIFY(answer.isFinished());
            QVERIFY(answer.isError());
            QCOMPARE(answer.error().type(), QDBusError::AccessDenied);
        }
        settle(service);
        QCOMPARE(m_host.messages, words("show"));
        QVERIFY(!m_front->isInteractionEnabled());
        QDBusConnection::disconnectFromBus(stranger.name());
    }

    void colorsThatCannotBeReadAreDropped_data()
    {
        const double nan = std::numeric_limits<double>::quiet_NaN();
        const double infinity = std::numeric_limits<double>::infinity();
        QTest::addColumn<QVariantList>("color");
        QTest::newRow("not a number") << colorOf(sRGB, {nan, 0, 0, 1});
        QTest::newRow("infinite opacity") << colorOf(sRGB, {0, 0, 0, infinity});
        QTest::newRow("no opacity") << colorOf(sRGB, {0, 0, 0});
        QTest::newRow("nothing") << colorOf(sRGB, {});
        QTest::newRow("one too many") << colorOf(sRGB, {0, 0, 0, 0, 1});
        QTest::newRow("many too many") << colorOf(sRGB, QList<double>(100000, 0.5));
        QTest::newRow("as many as a message holds") << colorOf(sRGB, QList<double>(4'000'000, 0.5));
        QTest::newRow("a space of a megabyte") << colorOf(QString(1 << 20, u'x'), {0, 0, 0, 1});
        QTest::newRow("unknown space") << colorOf(QStringLiteral("CMYK"), {0, 0, 0, 1});
        QTest::newRow("no space") << colorOf({}, {0, 0, 0, 1});
        QTest::newRow("other arguments") << QVariantList{QStringLiteral("#FF0000")};
        QTest::newRow("no arguments") << QVariantList();
    }

    void colorsThatCannotBeReadAreDropped()
    {
        QFETCH(QVariantList, color);
        ScriptedService service(m_bus->connection());
        touchDown();
        QTRY_COMPARE(service.messages, QStringList{begin});
        if (color.size() == 2)
            QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("a color that cannot be read")));
        service.say(selected, color);
        settle(service);
        QCOMPARE(m_host.messages, words("show"));
    }

    void numbersOutsideOfTheirRangeAreBroughtIntoIt_data()
    {
        QTest::addColumn<double>("component");
        QTest::addColumn<double>("taken");
        QTest::newRow("below") << -1.0 << 0.0;
        QTest::newRow("above") << 2.0 << 1.0;
        QTest::newRow("far above") << 1e308 << 1.0;
        QTest::newRow("far below") << -std::numeric_limits<double>::max() << 0.0;
        QTest::newRow("next to nothing") << std::numeric_limits<double>::denorm_min()
                                         << std::numeric_limits<double>::denorm_min();
    }

    void numbersOutsideOfTheirRangeAreBroughtIntoIt()
    {
        QFETCH(double, component);
        QFETCH(double, taken);
        ScriptedService service(m_bus->connection());
        touchDown();
        QTRY_COMPARE(service.messages, QStringList{begin});
        service.say(selected, colorOf(sRGB, {component, 0.5, 0.5, component}));
        QTRY_VERIFY(!m_host.picks.empty());
        const auto color = model::SomeColor(taken, 0.5, 0.5, taken, model::SomeColor::ColorSpace::sRGB).platformColor();
        QCOMPARE(m_host.picks.front(), (RecordedHost::Pick{color, std::nullopt, false}));
    }

    void answersToWhatWasCancelledChangeNothing()
    {
        ScriptedService service(m_bus->connection());
        touchDown();
        QTRY_COMPARE(service.messages, QStringList{begin});
        m_front->pickerDidCancelEyeDropper();
        QTRY_COMPARE(service.messages.last(), QStringLiteral("cancelShowingEyeDropper"));
        service.say(dismissed);
        QTRY_VERIFY(m_front->isInteractionEnabled());
        // Once more, and late.
        service.say(dismissed);
        settle(service);
        QVERIFY(m_front->isInteractionEnabled());
        QVERIFY(!state().eyedropperShowing());
        QVERIFY(m_host.picks.empty());
        touchDown();
        QTRY_COMPARE(service.messages.count(begin), 2);
    }

    void twoUsesShareOneConnectionThatTheFirstMade()
    {
        ScriptedService service(m_bus->connection());
        const auto namesOnBus = [&] {
            const QDBusMessage reply = service.bus().call(
                QDBusMessage::createMethodCall(QStringLiteral("org.freedesktop.DBus"), QStringLiteral("/"),
                                               QStringLiteral("org.freedesktop.DBus"), QStringLiteral("ListNames")));
            return reply.arguments().value(0).toStringList().size();
        };
        const auto before = namesOnBus();
        state();
        QCoreApplication::processEvents();
        QCOMPARE(namesOnBus(), before);

        for (int use = 1; use <= 2; ++use) {
            touchDown();
            QTRY_COMPARE(service.messages.size(), use);
            service.say(dismissed);
            QTRY_VERIFY(m_front->isInteractionEnabled());
        }
        QCOMPARE(service.clients[0], service.clients[1]);
        QCOMPARE(namesOnBus(), before + 1);
    }

    void aServiceThatDiesLeavesThePickerLockedAndTheNextUseConnectsAnew()
    {
        auto service = std::make_unique<ScriptedService>(m_bus->connection());
        touchDown();
        QTRY_COMPARE(service->messages, QStringList{begin});
        const QString firstClient = service->clients.last();
        service.reset();

        ScriptedService next(m_bus->connection());
        // The old connection is given up as soon as the news of its service is there.
        const auto isGone = [&] { return !next.bus().interface()->isServiceRegistered(firstClient); };
        QTRY_VERIFY(isGone());
        QVERIFY(!m_front->isInteractionEnabled());
        QCOMPARE(m_host.messages, words("show"));

        touchDown();
        QTRY_COMPARE(next.messages, QStringList{begin});
        next.say(dismissed);
        QTRY_COMPARE(m_host.messages, words("show, show, dismiss"));
        QVERIFY(m_front->isInteractionEnabled());
    }

    void aServiceThatTakesTheNameOverIsAnotherOne()
    {
        ScriptedService service(m_bus->connection());
        touchDown();
        QTRY_COMPARE(service.messages, QStringList{begin});
        const QString client = service.clients.last();
        service.bus().unregisterService(eyedropper::serviceName);
        ScriptedService thief(m_bus->connection());
        QTRY_VERIFY(!thief.bus().interface()->isServiceRegistered(client));
        touchDown();
        QTRY_COMPARE(thief.messages, QStringList{begin});
        // The one before knows the new client's name, and is not heard.
        thief.sayFrom(service.bus(), dismissed);
        settle(thief);
        QCOMPARE(m_host.messages, words("show, show"));
    }

    void withoutAServiceTheRequestsAreLostAndLogged()
    {
        const LoggedErrors errors;
        touchDown();
        touchUp();
        QTRY_COMPARE(errors.texts().size(), 1);
        QVERIFY2(proxyError.match(errors.texts().constFirst()).hasMatch(), qPrintable(errors.texts().constFirst()));

        // The next one finds a service, and only itself.
        ScriptedService service(m_bus->connection());
        m_front->pickerDidCancelEyeDropper();
        QTRY_COMPARE(service.messages, words("cancelShowingEyeDropper"));
        QVERIFY(!m_front->isInteractionEnabled());
        QCOMPARE(m_host.messages, words("show"));
        QCOMPARE(errors.texts().size(), 1);
    }

    void withoutABusTheRequestsAreLostAndLogged()
    {
        setUp(QStringLiteral("unix:path=%1/nobody").arg(m_folder.path()));
        const LoggedErrors errors;
        for (int attempt = 1; attempt <= 2; ++attempt) {
            touchDown();
            QTRY_COMPARE(errors.texts().size(), attempt);
            QVERIFY(proxyError.match(errors.texts().constLast()).hasMatch());
        }
        QVERIFY(!m_front->isInteractionEnabled());
        QCOMPARE(m_host.messages, words("show, show"));
    }

    void theBusMayGo()
    {
        ScriptedService service(m_bus->connection());
        touchDown();
        QTRY_COMPARE(service.messages, QStringList{begin});
        m_bus->stop();
        QTRY_VERIFY(!service.bus().isConnected());
        m_front->pickerDidFloatEyeDropper();
        QVERIFY(!m_front->isInteractionEnabled());
        QCOMPARE(m_host.messages, words("show"));
    }

    void thePickerMayGoAtAnyMoment()
    {
        ScriptedService service(m_bus->connection());
        touchDown();
        // While the connection is being made.
        m_front.reset();
        QVERIFY(QThreadPool::globalInstance()->waitForDone());
        QCoreApplication::processEvents();

        setUp(m_bus->address());
        touchDown();
        QTRY_COMPARE(service.messages, QStringList{begin});
        // With a report on its way.
        service.say(dismissed);
        m_front.reset();
        const QString client = service.clients.last();
        QTRY_VERIFY(!service.bus().interface()->isServiceRegistered(client));
        QCOMPARE(m_host.messages, words("show"));
    }

private:
    void setUp(const QString &busAddress)
    {
        m_host = RecordedHost();
        m_front = std::make_unique<FVColorPickerServiceFront>([this] { return &m_host; });
        eyedropper().setClient(std::make_unique<eyedropper::DBusEyedropperClient>(eyedropper(), busAddress));
        eyedropper().setDisplayIdentifier("display 7");
    }

    ColorPickerState &state()
    {
        m_front->view();
        return static_cast<FVColorPickerServiceViewController *>(m_front->childViewController())->colorPickerState();
    }

    EyedropperSession &eyedropper() { return m_front->eyedropper(); }
    void touchDown() { state().eyedropperShowing.set(true); }
    void touchUp() { state().eyedropperIsFloating.set(true); }
    /** What the service says now has been heard. */
    void settle(ScriptedService &service)
    {
        const auto before = m_host.messages.count(QStringLiteral("float"));
        service.say(floated);
        QTRY_COMPARE(m_host.messages.count(QStringLiteral("float")), before + 1);
        m_host.messages.removeAt(m_host.messages.lastIndexOf(QStringLiteral("float")));
    }

    QTemporaryDir m_folder;
    std::unique_ptr<platform::UserDefaults> m_defaults;
    std::unique_ptr<PrivateBus> m_bus;
    RecordedHost m_host;
    std::unique_ptr<FVColorPickerServiceFront> m_front;
};

QTEST_MAIN(TestEyedropperClient)
#include "tst_eyedropperclient.moc"
