#include "chaoshost.h"

#include <malloc.h>

namespace {

/** Bytes of this process's own in memory, without what it shares with others. */
long ownMemory()
{
    ::malloc_trim(0);
    QFile file(QStringLiteral("/proc/self/smaps_rollup"));
    if (!file.open(QIODevice::ReadOnly))
        return 0;
    long sum = 0;
    for (const auto &line : file.readAll().split('\n')) {
        if (line.startsWith("Private_"))
            sum += line.simplified().split(' ').value(1).toLong() * 1024;
    }
    return sum;
}

uint openFiles()
{
    return QDir(QStringLiteral("/proc/self/fd")).count();
}

uint threads()
{
    return QDir(QStringLiteral("/proc/self/task")).count();
}

} // namespace

/** What an app holds does not grow with what its user does. */
class SteadyHostTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void presentationsLeaveNothingBehind()
    {
        ChaosHost host;
        const int rounds = chaosRounds(30);
        // The first ones load what stays.
        for (int round = 0; round < 10; ++round)
            presentOnce(host);
        const long memory = ownMemory();
        const uint files = openFiles();
        const uint before = threads();
        for (int round = 0; round < rounds && !QTest::currentTestFailed(); ++round)
            presentOnce(host);
        // What is left of a process goes with a later turn of the event loop.
        QTRY_VERIFY(openFiles() <= files);
        QCOMPARE(threads(), before);
        checkGrowth(memory, rounds, "presentation");
    }

    void dragsLeaveNothingBehind()
    {
        ChaosHost host;
        QVERIFY(host.present());
        const int steps = chaosRounds(20) * 100;
        drag(host, 500);
        const long memory = ownMemory();
        const uint files = openFiles();
        drag(host, steps);
        QCOMPARE(openFiles(), files);
        checkGrowth(memory, steps, "step of a drag");
    }

private:
    /** The first rounds of a short run still touch new pages; a leak of a picture or a process is far above that. */
    static void checkGrowth(long before, int rounds, const char *what)
    {
        QVERIFY(before > 0);
        const long growth = ownMemory() - before;
        const auto text = QStringLiteral("%1 bytes in all, %2 for each %3")
                              .arg(growth)
                              .arg(double(growth) / rounds)
                              .arg(QString::fromLatin1(what));
        qInfo().noquote() << text;
        QVERIFY2(growth < 2'000'000 + rounds * 1024L, qPrintable(text));
    }

    static void presentOnce(ChaosHost &host)
    {
        host.finished.clear();
        QVERIFY(host.present());
        QVERIFY(host.picksAt(host.swatch(3, 3)));
        host.picks.clear();
        host.picker.dismiss();
        QTRY_COMPARE(host.finished.size(), 1);
        QTRY_VERIFY(servicesOf(getpid()).empty());
    }

    static void drag(ChaosHost &host, int steps)
    {
        QTest::mousePress(&host.window, Qt::LeftButton, {}, host.swatch(0, 0));
        for (int step = 0; step < steps; ++step) {
            host.dragStep(step);
            QCoreApplication::processEvents();
            if (step % 100 == 99) {
                // Until the picker has followed; the host keeps no list of what it has not sent.
                const auto reported = host.picks.size();
                host.dragStep(step + 1);
                QTRY_VERIFY(host.picks.size() > reported);
                host.picks.clear();
                host.picks.shrink_to_fit();
            }
        }
        QTest::mouseRelease(&host.window, Qt::LeftButton, {}, host.swatch(0, 0));
        QTRY_VERIFY(host.hasFinalPick());
        host.picks.clear();
    }

    Settings m_settings;
};

QTEST_MAIN(SteadyHostTest)
#include "tst_steadyhost.moc"
