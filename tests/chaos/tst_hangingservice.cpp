#include "chaoshost.h"

#include <QFile>
#include <QProcess>

/** A process that does not answer is noticed and can be replaced; one that is slow is left alone. */
class HangingServiceTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void itIsNoticedReplacedAndGivenUp()
    {
        // All at once: most of this is waiting.
        ChaosHost replaced;
        ChaosHost givenUp;
        ChaosHost slow;
        const pid_t ofReplaced = presented(replaced);
        const pid_t ofGivenUp = presented(givenUp);
        const pid_t ofSlow = presented(slow);
        QSignalSpy slowReports(&slow.picker, &FVColorPickerViewController::respondingChanged);
        QSignalSpy reports(&replaced.picker, &FVColorPickerViewController::respondingChanged);
        for (const pid_t process : {ofReplaced, ofGivenUp, ofSlow})
            QCOMPARE(kill(process, SIGSTOP), 0);
        const SignalSoon wakesUp(ofSlow, SIGCONT, std::chrono::milliseconds(1200));

        QTRY_VERIFY_WITH_TIMEOUT(!replaced.picker.isResponding(), patience);
        QCOMPARE(reports.size(), 1);
        QVERIFY(replaced.picker.isPresented());
        replaced.picker.dismiss();
        QTRY_COMPARE(replaced.finished.size(), 1);
        QVERIFY(replaced.picker.isResponding());
        const pid_t replacement = presented(replaced);
        QVERIFY(replacement != ofReplaced);
        QVERIFY(replaced.picksAt(replaced.swatch(0, 11)));
        // Nobody waits for the one that was left behind.
        QTRY_VERIFY(!QFileInfo::exists(QStringLiteral("/proc/%1/exe").arg(ofReplaced)));

        QTRY_COMPARE_WITH_TIMEOUT(givenUp.terminated.size(), 1, patience);
        QVERIFY(givenUp.terminated[0][0].toString().contains(u"does not answer"));
        QVERIFY(givenUp.picker.isResponding());
        QTRY_VERIFY(!QFileInfo::exists(QStringLiteral("/proc/%1/exe").arg(ofGivenUp)));

        QVERIFY(slowReports.isEmpty());
        QVERIFY(slow.picksAt(slow.swatch(0, 0)));
    }

    void oneThatStopsInTheMiddleOfADragGoesOn_data()
    {
        QTest::addColumn<int>("standstill");
        // What happens meanwhile waits in the host, or is left out. The last one is noticed.
        for (const int milliseconds : {100, 500, 1500, 5000})
            QTest::addRow("%d ms", milliseconds) << milliseconds;
    }

    void oneThatStopsInTheMiddleOfADragGoesOn()
    {
        QFETCH(int, standstill);
        ChaosHost host;
        const pid_t process = presented(host);
        QVERIFY(host.picksAt(host.swatch(9, 3)));
        const FVColor expected = host.picks.back().color;
        QTest::mousePress(&host.window, Qt::LeftButton, {}, host.swatch(0, 0));
        QTRY_VERIFY(host.picks.back().isVolatile);
        QCOMPARE(kill(process, SIGSTOP), 0);
        const auto reported = host.picks.size();
        {
            const SignalSoon wakesUp(process, SIGCONT, std::chrono::milliseconds(standstill));
            QElapsedTimer time;
            time.start();
            for (int step = 0; time.elapsed() < standstill; ++step) {
                host.dragStep(step);
                QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents | QEventLoop::AllEvents, 1);
            }
        }
        QTRY_VERIFY(host.picks.size() > reported);
        QTest::mouseMove(&host.window, host.swatch(9, 3));
        QTest::mouseRelease(&host.window, Qt::LeftButton, {}, host.swatch(9, 3));
        QTRY_VERIFY(host.hasFinalPick());
        QCOMPARE(host.picks.back().color, expected);
        QVERIFY(host.isUnharmed());
        QTRY_VERIFY(host.picker.isResponding());
    }

    void nobodyIsBlamedForAStandstillOfTheApp()
    {
        ChaosHost host;
        QVERIFY(host.present());
        QSignalSpy reports(&host.picker, &FVColorPickerViewController::respondingChanged);
        QTest::mousePress(&host.window, Qt::LeftButton, {}, host.swatch(0, 0));
        host.dragStep(1);
        // Longer than the watch waits for an answer.
        QProcess stopper;
        stopper.startCommand(QStringLiteral("sh -c \"kill -STOP $PPID; sleep 5; kill -CONT $PPID\""));
        QVERIFY(stopper.waitForFinished(patience));
        host.dragStep(2);
        QTest::mouseRelease(&host.window, Qt::LeftButton, {}, host.swatch(9, 3));
        QTRY_VERIFY(host.hasFinalPick());
        QVERIFY(reports.isEmpty() && host.terminated.isEmpty());
    }

    void oneThatHangsAtItsStartIsNoticed()
    {
        QTemporaryDir folder;
        QFile program(folder.path() + QStringLiteral("/service"));
        QVERIFY(program.open(QIODevice::WriteOnly));
        program.write("#!/bin/sh\nexec sleep 60 >/dev/null 2>&1\n");
        program.close();
        QVERIFY(program.setPermissions(QFile::ReadUser | QFile::ExeUser));
        qputenv("FAVRIN_COLOR_PICKER_SERVICE", QFile::encodeName(program.fileName()));
        ChaosHost host;
        host.picker.present(&host.window);
        QTRY_VERIFY_WITH_TIMEOUT(!host.picker.isResponding(), patience);
        host.picker.dismiss();
        QTRY_COMPARE(host.finished.size(), 1);
        qunsetenv("FAVRIN_COLOR_PICKER_SERVICE");
        QVERIFY(presented(host) > 0);
    }

private:
    static constexpr int patience = 60'000;

    pid_t presented(ChaosHost &host)
    {
        const auto before = servicesOf(getpid());
        host.picker.present(&host.window);
        if (!QTest::qWaitFor([&] { return host.isReady(); }, patience))
            return 0;
        const auto now = servicesOf(getpid());
        const auto added =
            std::ranges::find_if(now, [&](pid_t service) { return !std::ranges::count(before, service); });
        return added == now.end() ? 0 : *added;
    }

    Settings m_settings;
};

QTEST_MAIN(HangingServiceTest)
#include "tst_hangingservice.moc"
