#include <QProcess>
#include <QProcessEnvironment>
#include <QTest>

/** The real program: what it refuses, and how it leaves. */
class TestToolProcess : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void leaves_data()
    {
        QTest::addColumn<QStringList>("arguments");
        QTest::addColumn<QString>("environment");
        QTest::addColumn<int>("status");
        const auto row = [](const char *name, const QStringList &arguments, int status, const char *environment = "") {
            QTest::newRow(name) << arguments << QString::fromUtf8(environment) << status;
        };
        const auto argument = [](const char *text) { return QString::fromUtf8(text); };
        row("help", {argument("--help")}, 0);
        row("version", {argument("-v")}, 0);
        row("unknown option", {argument("--colour=red")}, 2);
        row("argument", {argument("red")}, 2);
        row("bad color", {argument("--color=reddish")}, 2);
        row("empty color", {argument("--color=")}, 2);
        row("none that is not allowed", {argument("--color=none")}, 2);
        row("bad suggestion", {argument("--suggest=Ink=inky")}, 2);
        row("suggested none", {argument("--allow-none"), argument("--suggest=none")}, 2);
        row("bad format", {argument("--format=rgb")}, 2);
        row("bad template", {argument("--format={colour}")}, 2);
        row("live with a format", {argument("--live"), argument("--format=hex")}, 2);
        row("bad parent", {argument("--parent=0x12")}, 2);
        row("no time", {argument("--timeout=0")}, 2);
        row("endless time", {argument("--timeout=inf")}, 2);
        row("not a time", {argument("--timeout=nan")}, 2);
        row("time of day", {argument("--timeout=1,5")}, 2);
        row("value is missing", {argument("--color")}, 2);
        row("refused before a display is looked for", {argument("--color=reddish")}, 2, "QT_QPA_PLATFORM=");
        row("no display", {}, 3, "QT_QPA_PLATFORM=");
        row("a display that does not answer", {}, 3, "QT_QPA_PLATFORM= DISPLAY=:7077");
        row("a desktop that does not answer", {}, 3, "QT_QPA_PLATFORM= WAYLAND_DISPLAY=nowhere-7077");
        row("a platform that was asked for and is not there", {}, 3, "QT_QPA_PLATFORM=xcb DISPLAY=:7077");
        row("no service", {}, 3, "FAVRIN_COLOR_PICKER_SERVICE=/nowhere/service");
        row("a service that is none", {}, 3, "FAVRIN_COLOR_PICKER_SERVICE=/bin/false");
        row("time is up", {argument("--timeout=0.4")}, 5);
        row("a parent that cannot be", {argument("--timeout=0.4"), argument("--parent=x11:12")}, 5);
        row("a locale of its own", {argument("--timeout=0.4")}, 5, "LC_ALL=de_DE.UTF-8");
    }

    void leaves()
    {
        QFETCH(QStringList, arguments);
        QFETCH(QString, environment);
        QFETCH(int, status);
        QProcess process;
        auto variables = QProcessEnvironment::systemEnvironment();
        for (const char *display : {"DISPLAY", "WAYLAND_DISPLAY"})
            variables.remove(QString::fromUtf8(display));
        for (const QString &setting : environment.split(u' ', Qt::SkipEmptyParts))
            variables.insert(setting.section(u'=', 0, 0), setting.section(u'=', 1));
        process.setProcessEnvironment(variables);
        process.start(QStringLiteral(FAVRIN_TOOL), arguments);
        QVERIFY(process.waitForFinished());
        const QByteArray errors = process.readAllStandardError();
        QVERIFY2(process.exitStatus() == QProcess::NormalExit, errors);
        QVERIFY2(process.exitCode() == status, errors);
        // Scripts read the one, people the other.
        QCOMPARE(process.readAllStandardOutput().isEmpty(), status != 0);
        if (status == 2 || status == 3)
            QVERIFY(errors.contains("favrin-color-picker: "));
    }

    void saysThatItCannotWrite()
    {
        QProcess process;
        process.setStandardOutputFile(QStringLiteral("/dev/full"));
        process.start(QStringLiteral(FAVRIN_TOOL), {QStringLiteral("--version")});
        QVERIFY(process.waitForFinished());
        QCOMPARE(process.exitCode(), 3);
    }
};

QTEST_GUILESS_MAIN(TestToolProcess)
#include "tst_toolprocess.moc"
