#include "apps/eyedropper/eyedropperservice.h"
#include "apps/eyedropper/pickerlines.h"
#include "eyedropper/wirenames.h"

#include "privatebus.h"

#include <QDBusConnectionInterface>
#include <QDBusMessage>
#include <QDBusPendingReply>
#include <QDBusVirtualObject>
#include <QFile>

#include <csignal>
#include <limits>

using namespace favrin;
using namespace favrin::eyedropper;

namespace {

/** A picker that writes down what the service reports. */
class RecordingClient : public QDBusVirtualObject
{
public:
    explicit RecordingClient(const QDBusConnection &bus) : m_bus(bus) { m_bus.registerVirtualObject(clientPath, this); }
    ~RecordingClient() override { leave(); }
    void leave()
    {
        QDBusConnection::disconnectFromBus(m_bus.name());
        // The last one that knows the connection closes it.
        m_bus = QDBusConnection(QString());
    }

    void ask(const QString &member, const QVariantList &arguments = {})
    {
        auto call = QDBusMessage::createMethodCall(serviceName, servicePath, serverInterface, member);
        call.setArguments(arguments);
        m_bus.send(call);
    }
    void begin() { ask(QStringLiteral("beginShowingEyeDropper"), {QStringLiteral("display 7")}); }
    void floatIt() { ask(QStringLiteral("floatEyeDropper")); }
    void cancel() { ask(QStringLiteral("cancelShowingEyeDropper")); }
    QDBusConnection &bus() { return m_bus; }

    QString introspect(const QString &) const override { return {}; }
    bool handleMessage(const QDBusMessage &message, const QDBusConnection &) override
    {
        QString line = message.member();
        line.remove(QStringLiteral("eyedropperDid"));
        if (message.arguments().size() == 2) {
            line += u' ' + message.arguments()[0].toString();
            for (const double number : qdbus_cast<QList<double>>(message.arguments()[1]))
                line += u' ' + QString::number(number);
        }
        heard << line;
        return true;
    }

    QStringList heard;

private:
    QDBusConnection m_bus;
};

const QString dismissed = QStringLiteral("Dismiss");
const QString floated = QStringLiteral("Float");
const QString picked = QStringLiteral("SelectColor kTQColorSpaceSRGB 0.25 0.5 0.75 1");

} // namespace

/** The service with picking processes that are shell scripts. */
class TestEyedropperService : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        m_folder = std::make_unique<QTemporaryDir>();
        m_bus = std::make_unique<PrivateBus>();
        QVERIFY(m_bus->start());
        m_client = std::make_unique<RecordingClient>(m_bus->connection());
    }

    void cleanup()
    {
        m_service.reset();
        m_client.reset();
        m_bus.reset();
    }

    void linesKeepColorsExactly_data()
    {
        QTest::addColumn<double>("value");
        QTest::newRow("whole") << 1.0;
        QTest::newRow("a third") << 1.0 / 3;
        QTest::newRow("odd bits") << 0.1 + 0.2;
        QTest::newRow("smallest") << std::numeric_limits<double>::denorm_min();
    }

    void linesKeepColorsExactly()
    {
        QFETCH(double, value);
        const std::array components = {value, 0.5, 0.0};
        const platform::Color color(platform::ColorSpace::displayP3(), components, 1.0);
        const auto line = pickerlines::colorLine(color);
        QVERIFY(line);
        QVERIFY(pickerlines::colorFromLine(*line) == color);
    }

    void linesThatAreNoColors_data()
    {
        QTest::addColumn<QByteArray>("line");
        QTest::newRow("empty") << QByteArray();
        QTest::newRow("word only") << QByteArray("color");
        QTest::newRow("space only") << QByteArray("color kTQColorSpaceSRGB");
        QTest::newRow("too few") << QByteArray("color kTQColorSpaceSRGB 0 0 1");
        QTest::newRow("too many") << QByteArray("color kTQColorSpaceSRGB 0 0 0 0 1");
        QTest::newRow("no number") << QByteArray("color kTQColorSpaceSRGB 0 x 0 1");
        QTest::newRow("comma") << QByteArray("color kTQColorSpaceSRGB 0,5 0 0 1");
        QTest::newRow("not finite") << QByteArray("color kTQColorSpaceSRGB nan 0 0 1");
        QTest::newRow("unknown space") << QByteArray("color sRGB 0 0 0 1");
        QTest::newRow("too long") << QByteArray("color kTQColorSpaceSRGB 0 0 0 1").append(300, '0');
    }

    void linesThatAreNoColors()
    {
        QFETCH(QByteArray, line);
        QVERIFY(!pickerlines::colorFromLine(line));
    }

    void everyEndingIsADismissal_data()
    {
        QTest::addColumn<QString>("script");
        QTest::addColumn<QStringList>("heard");
        const QString pick = QStringLiteral("echo color kTQColorSpaceSRGB 0.25 0.5 0.75 1\n");
        QTest::newRow("picked") << pick << QStringList{picked, dismissed};
        QTest::newRow("cancelled") << QStringLiteral("exit 0") << QStringList{dismissed};
        QTest::newRow("failed") << QStringLiteral("exit 1") << QStringList{dismissed};
        QTest::newRow("crashed") << QStringLiteral("kill -SEGV $$") << QStringList{dismissed};
        QTest::newRow("killed") << QStringLiteral("kill -KILL $$") << QStringList{dismissed};
        QTest::newRow("crashed after the pick")
            << pick + QStringLiteral("kill -ABRT $$") << QStringList{picked, dismissed};
        QTest::newRow("picked twice") << pick + pick << QStringList{picked, dismissed};
        QTest::newRow("nonsense") << QStringLiteral("echo hello; echo color red; printf '\\0\\377'")
                                  << QStringList{dismissed};
        QTest::newRow("endless line") << QStringLiteral("cat /dev/zero") << QStringList{dismissed};
        QTest::newRow("floated by itself") << QStringLiteral("echo floated") << QStringList{floated, dismissed};
    }

    void everyEndingIsADismissal()
    {
        QFETCH(QString, script);
        QFETCH(QStringList, heard);
        serve(script);
        for (int use = 1; use <= 2; ++use) {
            m_client->heard.clear();
            m_client->begin();
            QTRY_COMPARE(m_client->heard, heard);
        }
    }

    void aPickerThatCannotBeStartedIsADismissal()
    {
        m_service =
            std::make_unique<EyedropperService>(m_bus->connection(), m_folder->filePath(QStringLiteral("nothing")));
        QVERIFY(m_service->start());
        m_client->begin();
        QTRY_COMPARE(m_client->heard, QStringList{dismissed});
    }

    void floatAndCancelReachThePicker()
    {
        serve(QStringLiteral("echo \"$@\" >trace; read line; echo $line >>trace; echo floated; read line; echo $line "
                             ">>trace"));
        m_client->begin();
        m_client->floatIt();
        QTRY_COMPARE(m_client->heard, QStringList{floated});
        m_client->cancel();
        QTRY_COMPARE(m_client->heard, (QStringList{floated, dismissed}));
        QCOMPARE(trace(), QStringLiteral("--pick display 7\nfloat\ncancel"));
    }

    void aPickerThatDoesNotListenIsEnded()
    {
        serve(QStringLiteral("exec sleep 1000"));
        m_client->begin();
        m_client->cancel();
        QTRY_COMPARE(m_client->heard, QStringList{dismissed});
    }

    void anotherClientTakesOver()
    {
        serve(QStringLiteral("echo begin >>trace; cat >/dev/null"));
        m_client->begin();
        QTRY_COMPARE(trace(), QStringLiteral("begin"));
        RecordingClient other(m_bus->connection());
        other.begin();
        QTRY_COMPARE(m_client->heard, QStringList{dismissed});
        QTRY_COMPARE(trace(), QStringLiteral("begin\nbegin"));
        QVERIFY(other.heard.isEmpty());
        // The first has no say any more.
        m_client->cancel();
        QTRY_COMPARE(m_client->heard.size(), 2);
        QVERIFY(other.heard.isEmpty());
        other.cancel();
        QTRY_COMPARE(other.heard, QStringList{dismissed});
    }

    void aSecondBeginOfTheSameClientIsTheSameUse()
    {
        serve(QStringLiteral("echo begin >>trace; read line; echo floated; cat >/dev/null"));
        m_client->begin();
        m_client->begin();
        m_client->floatIt();
        QTRY_COMPARE(m_client->heard, QStringList{floated});
        QCOMPARE(trace(), QStringLiteral("begin"));
    }

    void aClientThatLeavesEndsItsPicker()
    {
        serve(QStringLiteral("echo $$ >trace; exec sleep 1000"));
        m_client->begin();
        QTRY_VERIFY(trace().toInt() > 0);
        m_client->leave();
        QTRY_VERIFY(::kill(trace().toInt(), 0) != 0);
        // And the next one is served.
        RecordingClient next(m_bus->connection());
        next.begin();
        next.cancel();
        QTRY_COMPARE(next.heard, QStringList{dismissed});
    }

    void requestsWithoutAPickerAreDismissed()
    {
        // As when the service was started anew between a client's requests.
        serve(QStringLiteral("exit 0"));
        m_client->floatIt();
        QTRY_COMPARE(m_client->heard, QStringList{dismissed});
        m_client->cancel();
        QTRY_COMPARE(m_client->heard, (QStringList{dismissed, dismissed}));
    }

    void theServicesEndIsThePickers()
    {
        serve(QStringLiteral("echo $$ >trace; exec sleep 1000"));
        m_client->begin();
        QTRY_VERIFY(trace().toInt() > 0);
        m_service.reset();
        QTRY_VERIFY(::kill(trace().toInt(), 0) != 0);
        QTRY_COMPARE(m_client->heard, QStringList{dismissed});
    }

    void availabilityIsThePickersExitStatus_data()
    {
        QTest::addColumn<QString>("script");
        QTest::addColumn<bool>("available");
        QTest::newRow("yes") << QStringLiteral("[ \"$*\" = --check ]") << true;
        QTest::newRow("no") << QStringLiteral("exit 1") << false;
        QTest::newRow("crashed") << QStringLiteral("kill -SEGV $$") << false;
    }

    void availabilityIsThePickersExitStatus()
    {
        QFETCH(QString, script);
        QFETCH(bool, available);
        serve(script);
        const auto question = QDBusMessage::createMethodCall(serviceName, servicePath, availabilityInterface,
                                                             QStringLiteral("eyedropperIsAvailable"));
        const QDBusPendingReply<bool> answer = m_client->bus().asyncCall(question);
        QTRY_VERIFY(answer.isFinished());
        QVERIFY2(!answer.isError(), qPrintable(answer.error().message()));
        QCOMPARE(answer.value(), available);
    }

    void thereIsOneServiceOnly()
    {
        serve(QStringLiteral("exit 0"));
        EyedropperService second(m_bus->connection(), QStringLiteral("/bin/false"));
        QVERIFY(!second.start());
    }

private:
    /** Starts the service with a picker of these lines of shell; "$1" and "$2" are its arguments. */
    void serve(const QString &script)
    {
        const QString program = m_folder->filePath(QStringLiteral("picker"));
        QFile file(program);
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write(QStringLiteral("#!/bin/sh\ncd '%1'\n%2\n").arg(m_folder->path(), script).toUtf8());
        file.close();
        QVERIFY(file.setPermissions(QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
        m_service = std::make_unique<EyedropperService>(m_bus->connection(), program);
        QVERIFY(m_service->start());
    }

    /** What the scripts left in the file "trace". */
    QString trace() const
    {
        QFile file(m_folder->filePath(QStringLiteral("trace")));
        return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()).trimmed() : QString();
    }

    std::unique_ptr<QTemporaryDir> m_folder;
    std::unique_ptr<PrivateBus> m_bus;
    std::unique_ptr<EyedropperService> m_service;
    std::unique_ptr<RecordingClient> m_client;
};

QTEST_GUILESS_MAIN(TestEyedropperService)
#include "tst_eyedropperservice.moc"
