#include <QDir>
#include <QProcess>
#include <QProcessEnvironment>
#include <QTest>

namespace {

const QString prefix = QStringLiteral(FAVRIN_PREFIX);
const QString consumer = QStringLiteral(FAVRIN_CONSUMER);

QString built(const char *name)
{
    return consumer + QStringLiteral("/bin/") + QString::fromUtf8(name);
}

} // namespace

/** What a stranger gets who installs the package, builds against it and runs it, with no help from the environment. */
class TestInstalled : public QObject
{
    Q_OBJECT

private:
    static void prepare(QProcess &process)
    {
        auto variables = QProcessEnvironment::systemEnvironment();
        for (const char *name :
             {"FAVRIN_COLOR_PICKER_SERVICE", "LD_LIBRARY_PATH", "QML_IMPORT_PATH", "QML2_IMPORT_PATH"})
            variables.remove(QString::fromUtf8(name));
        process.setProcessEnvironment(variables);
    }

private Q_SLOTS:
    void presentsWithTheInstalledService_data()
    {
        QTest::addColumn<QString>("program");
        QTest::newRow("by CMake") << built("present");
        QTest::newRow("by pkg-config") << built("presentbypkgconfig");
    }

    void presentsWithTheInstalledService()
    {
        QFETCH(QString, program);
        QProcess process;
        prepare(process);
        process.start(program, {});
        QVERIFY(process.waitForFinished());
        QVERIFY2(process.exitCode() == 0, process.readAllStandardError());
        QCOMPARE(QString::fromUtf8(process.readAllStandardOutput()).trimmed(),
                 prefix + QStringLiteral("/" FAVRIN_LIBEXECDIR "/favrin-color-picker-service"));
    }

    void showsTheExample()
    {
        QProcess process;
        prepare(process);
        process.start(built("paper"), {});
        QVERIFY(process.waitForStarted());
        QByteArray said;
        QTRY_VERIFY2((said += process.readAllStandardError()).contains("The picker is on screen."), said);
        process.terminate();
        QVERIFY(process.waitForFinished());
    }

    void loadsTheModuleAlone()
    {
        QStringList arguments = {prefix + QStringLiteral("/" FAVRIN_QMLDIR)};
        const QDir code(consumer + QStringLiteral("/code"));
        for (const QString &name : code.entryList({QStringLiteral("*.qml")}))
            arguments.append(code.filePath(name));
        QVERIFY(arguments.size() > 2);
        QProcess process;
        prepare(process);
        process.start(built("load"), arguments);
        QVERIFY(process.waitForFinished());
        const QByteArray errors = process.readAllStandardError();
        QVERIFY2(process.exitCode() == 0, errors);
        QVERIFY2(!errors.contains("qml"), errors);
    }

    void playsTheDocumentedTest()
    {
        QProcess process;
        prepare(process);
        process.start(built("documentationtest"), {});
        QVERIFY(process.waitForFinished());
        QVERIFY2(process.exitCode() == 0, process.readAllStandardOutput());
    }

    void worksAfterTheTreeHasMoved()
    {
        const QString elsewhere = prefix + QStringLiteral("-elsewhere");
        QDir(elsewhere).removeRecursively();
        QVERIFY(QDir().rename(prefix, elsewhere));
        QProcess process;
        prepare(process);
        process.start(elsewhere + QStringLiteral("/" FAVRIN_BINDIR "/favrin-color-picker"),
                      {QStringLiteral("--timeout"), QStringLiteral("0.3")});
        const bool finished = process.waitForFinished();
        QVERIFY(QDir().rename(elsewhere, prefix));
        QVERIFY(finished);
        QVERIFY2(process.exitCode() == 5, process.readAllStandardError());
    }
};

QTEST_GUILESS_MAIN(TestInstalled)
#include "tst_installed.moc"
