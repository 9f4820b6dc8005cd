#include "apps/eyedropper/picker/portalcolor.h"
#include "apps/eyedropper/picker/portalpicking.h"

#include "privatebus.h"
#include "scriptedportal.h"

#include <QProcess>
#include <QRegularExpression>
#include <QSignalSpy>

#include <cmath>
#include <limits>

using namespace favrin;
using namespace favrin::eyedropper;

namespace {

const QString pickColor = QStringLiteral("PickColor");
constexpr auto notANumber = std::numeric_limits<double>::quiet_NaN();

} // namespace

/** The desktop picks, or does not. */
class TestPortalPicking : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        m_bus = std::make_unique<PrivateBus>();
        QVERIFY(m_bus->start());
        m_said.clear();
        m_colors.clear();
    }

    void cleanup()
    {
        m_picking.reset();
        QDBusConnection::disconnectFromBus(m_connection);
        m_portal.reset();
        m_bus.reset();
    }

    void answersAreKeptApart_data()
    {
        QTest::addColumn<uint>("version");
        QTest::addColumn<uint>("response");
        QTest::addColumn<QVariantMap>("results");
        QTest::addColumn<QStringList>("said");
        const QStringList picked = {QStringLiteral("floated"), QStringLiteral("color"), QStringLiteral("picked")};
        const QStringList failed = {QStringLiteral("floated"), QStringLiteral("failed")};
        const QStringList cancelled = {QStringLiteral("floated"), QStringLiteral("cancelled")};
        const QVariantMap red = ScriptedPortal::color(1, 0, 0);
        QTest::newRow("picked") << 2U << 0U << red << picked;
        QTest::newRow("picked, version 3") << 3U << 0U << red << picked;
        QTest::newRow("cancelled") << 2U << 1U << QVariantMap() << cancelled;
        QTest::newRow("cancelled with a color") << 2U << 1U << red << cancelled;
        QTest::newRow("failed") << 2U << 2U << QVariantMap() << failed;
        QTest::newRow("unknown answer") << 2U << 77U << red << failed;
        QTest::newRow("no color") << 2U << 0U << QVariantMap() << failed;
        QTest::newRow("not a number") << 2U << 0U << ScriptedPortal::color(1, notANumber, 0) << failed;
        QTest::newRow("infinite") << 2U << 0U << ScriptedPortal::color(HUGE_VAL, 0, 0) << failed;
        QTest::newRow("text") << 2U << 0U << QVariantMap{{QStringLiteral("color"), QStringLiteral("red")}} << failed;
        QTest::newRow("array") << 2U << 0U
                               << QVariantMap{{QStringLiteral("color"), QVariant::fromValue(QList<double>{1, 0, 0})}}
                               << failed;
    }

    void answersAreKeptApart()
    {
        QFETCH(uint, version);
        QFETCH(uint, response);
        QFETCH(QVariantMap, results);
        QFETCH(QStringList, said);
        answerVersion(version);
        start();
        m_picking->floatPicking();
        QTRY_VERIFY(!m_portal->requestPath.isEmpty());
        if (said.contains(QStringLiteral("failed")))
            QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("No color can be picked")));
        m_portal->respond(response, results);
        QTRY_COMPARE(m_said, said);
        // A second answer is none.
        m_portal->respond(0, ScriptedPortal::color(0, 1, 0));
        QCoreApplication::processEvents();
        QCOMPARE(m_said, said);
    }

    void theFastestAnswerIsHeard()
    {
        answerVersion(2);
        m_portal->answersAtOnce = [this] { m_portal->respond(0, ScriptedPortal::color(0.2, 0.4, 0.6)); };
        start();
        m_picking->floatPicking();
        QTRY_COMPARE(m_said.size(), 3);
        const std::array components = {51 / 255.0, 102 / 255.0, 153 / 255.0};
        QVERIFY(m_colors.at(0) == platform::Color(platform::ColorSpace::sRGB(), components, 1.0));
    }

    void anotherRequestPathIsHeard()
    {
        answerVersion(2);
        m_portal->choosesPath = true;
        start();
        m_picking->floatPicking();
        QTRY_VERIFY(!m_portal->requestPath.isEmpty());
        // The reply that names the path is on its way already; what follows it is heard.
        QTRY_VERIFY((m_portal->respond(1, {}), m_said.contains(QStringLiteral("cancelled"))));
    }

    void nothingIsAskedBeforeTheFingerIsLifted()
    {
        answerVersion(2);
        start();
        QTRY_VERIFY(m_portal->calls.contains(QStringLiteral("Get")));
        QCoreApplication::processEvents();
        QVERIFY(!m_portal->calls.contains(pickColor));
        m_picking->floatPicking();
        m_picking->floatPicking();
        QTRY_VERIFY(m_portal->calls.contains(pickColor));
        QCOMPARE(m_portal->calls.count(pickColor), 1);
        QCOMPARE(m_said, QStringList{QStringLiteral("floated")});
    }

    void onlyTheDesktopIsHeard()
    {
        answerVersion(2);
        start();
        m_picking->floatPicking();
        QTRY_VERIFY(!m_portal->requestPath.isEmpty());
        const QDBusConnection stranger = m_bus->connection();
        m_portal->respondFrom(stranger, 0, ScriptedPortal::color(1, 0, 0));
        // Its message is ahead of one that is heard.
        QDBusConnection(stranger).call(
            QDBusMessage::createMethodCall(QStringLiteral("org.freedesktop.DBus"), QStringLiteral("/"),
                                           QStringLiteral("org.freedesktop.DBus"), QStringLiteral("GetId")));
        m_portal->respond(1, {});
        QTRY_COMPARE(m_said, (QStringList{QStringLiteral("floated"), QStringLiteral("cancelled")}));
        QDBusConnection::disconnectFromBus(stranger.name());
    }

    void desktopsThatCannotPick_data()
    {
        QTest::addColumn<int>("version");
        QTest::newRow("none") << -1;
        QTest::newRow("version 0") << 0;
        QTest::newRow("version 1") << 1;
    }

    void desktopsThatCannotPick()
    {
        QFETCH(int, version);
        if (version >= 0)
            answerVersion(static_cast<uint>(version));
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("No color can be picked")));
        start();
        QTRY_COMPARE(m_said, QStringList{QStringLiteral("failed")});
        m_picking->floatPicking();
        QCOMPARE(m_said.size(), 1);
    }

    void aCallThatIsRefusedFails()
    {
        answerVersion(2);
        m_portal->refuses = true;
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("no backend")));
        start();
        m_picking->floatPicking();
        QTRY_VERIFY(m_said.contains(QStringLiteral("failed")));
    }

    void aDesktopThatGoesFails()
    {
        answerVersion(2);
        start();
        m_picking->floatPicking();
        QTRY_VERIFY(!m_portal->requestPath.isEmpty());
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("No color can be picked")));
        m_portal.reset();
        QTRY_VERIFY(m_said.contains(QStringLiteral("failed")));
    }

    void cancellingTakesTheRequestBack()
    {
        answerVersion(2);
        start();
        m_picking->floatPicking();
        QTRY_VERIFY(!m_portal->requestPath.isEmpty());
        m_picking->cancel();
        QCOMPARE(m_said, (QStringList{QStringLiteral("floated"), QStringLiteral("cancelled")}));
        QTRY_COMPARE(m_portal->closed, m_portal->requestPath);
    }

    void numbersAreRounded_data()
    {
        QTest::addColumn<double>("sent");
        QTest::addColumn<double>("color");
        for (const int step : {0, 1, 50, 127, 128, 254, 255}) {
            const double exact = step / 255.0;
            QTest::addRow("%d of 255", step) << exact << exact;
            QTest::addRow("%d of 255 in single precision", step) << double(float(exact)) << exact;
        }
        QTest::newRow("below a step") << 32767.6 / 65535 << 32768.0 / 65535;
        QTest::newRow("below 0") << -0.5 << 0.0;
        QTest::newRow("beyond 1") << 1.5 << 1.0;
    }

    void numbersAreRounded()
    {
        QFETCH(double, sent);
        QFETCH(double, color);
        QCOMPARE(std::abs(roundedComponent(sent) - color) < 1e-15, true);
    }

    void theCheckOfThePickingProcess_data()
    {
        QTest::addColumn<int>("version");
        QTest::addColumn<int>("exitCode");
        QTest::newRow("no portal") << -1 << 1;
        QTest::newRow("version 1") << 1 << 1;
        QTest::newRow("version 2") << 2 << 0;
        QTest::newRow("version 3") << 3 << 0;
    }

    void theCheckOfThePickingProcess()
    {
        QFETCH(int, version);
        QFETCH(int, exitCode);
        if (version >= 0)
            answerVersion(static_cast<uint>(version));
        QProcess check;
        auto environment = QProcessEnvironment::systemEnvironment();
        environment.remove(QStringLiteral("DISPLAY"));
        environment.insert(QStringLiteral("DBUS_SESSION_BUS_ADDRESS"), m_bus->address());
        check.setProcessEnvironment(environment);
        QSignalSpy finished(&check, &QProcess::finished);
        check.start(QStringLiteral(FAVRIN_EYEDROPPER_PICKER), {QStringLiteral("--check")});
        QVERIFY(finished.wait());
        QCOMPARE(check.exitStatus(), QProcess::NormalExit);
        QCOMPARE(check.exitCode(), exitCode);
    }

private:
    void start()
    {
        const QDBusConnection bus = m_bus->connection();
        m_connection = bus.name();
        m_picking = std::make_unique<PortalPicking>(bus);
        connect(m_picking.get(), &Picking::floated, this, [this] { m_said << QStringLiteral("floated"); });
        connect(m_picking.get(), &Picking::picked, this, [this](const platform::Color &color) {
            m_said << QStringLiteral("color");
            m_colors.push_back(color);
        });
        connect(m_picking.get(), &Picking::ended, this, [this](PickingEnd how) {
            m_said << (how == PickingEnd::Picked      ? QStringLiteral("picked")
                       : how == PickingEnd::Cancelled ? QStringLiteral("cancelled")
                                                      : QStringLiteral("failed"));
        });
        m_picking->start();
    }

    void answerVersion(uint version) { m_portal = std::make_unique<ScriptedPortal>(m_bus->connection(), version); }

    std::unique_ptr<PrivateBus> m_bus;
    std::unique_ptr<ScriptedPortal> m_portal;
    std::unique_ptr<PortalPicking> m_picking;
    QString m_connection;
    /** What the picking said, in order. */
    QStringList m_said;
    std::vector<platform::Color> m_colors;
};

QTEST_GUILESS_MAIN(TestPortalPicking)
#include "tst_portalpicking.moc"
