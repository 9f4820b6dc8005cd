#include "chaoshost.h"

using namespace std::chrono_literals;
using State = FVColorPickerViewController::State;

enum class During { Start, Drag, Saves, End };

/** The picker's process is killed at any moment: the app hears of it once, goes on, and no favorite is torn. */
class KilledServiceTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void atAnyMoment_data()
    {
        QTest::addColumn<During>("moment");
        QTest::newRow("start") << During::Start;
        QTest::newRow("drag") << During::Drag;
        QTest::newRow("saves") << During::Saves;
        QTest::newRow("end") << During::End;
    }

    void atAnyMoment()
    {
        QFETCH(During, moment);
        ChaosHost host;
        const int rounds = chaosRounds(32) / 4;
        for (int round = 0; round < rounds && !QTest::currentTestFailed(); ++round)
            killOnce(host, moment);
    }

private:
    void killOnce(ChaosHost &host, During moment)
    {
        m_settings.clear();
        host.terminated.clear();
        host.finished.clear();
        host.picker.present(&host.window);
        const auto services = servicesOf(getpid());
        QCOMPARE(services.size(), std::size_t(1));
        if (moment != During::Start)
            QTRY_VERIFY(host.isReady());
        {
            // A process takes about 200 ms to start, a save a few; each way has its own spread.
            const auto spread = moment == During::Start ? 250ms : moment == During::Saves ? 60ms : 25ms;
            const auto delay = std::chrono::microseconds(m_random() % std::chrono::microseconds(spread).count());
            const SignalSoon killer(services[0], SIGKILL, delay);
            act(host, moment);
        }
        QTRY_COMPARE(host.terminated.size() + host.finished.size(), 1);
        QVERIFY(moment == During::End || host.terminated.size() == 1);
        QCOMPARE(host.picker.state(), host.terminated.isEmpty() ? State::NotRunning : State::Failed);
        QVERIFY(!host.picker.view());
        QTest::mouseRelease(&host.window, Qt::LeftButton, {}, QPoint(1, 1));
        QTRY_VERIFY(servicesOf(getpid()).empty());

        QVERIFY2(wasShown(m_settings.favorites()), qPrintable(m_settings.favorites().join(u' ')));
        QVERIFY2(!m_settings.entries().join(u' ').contains(u"damaged"), qPrintable(m_settings.entries().join(u' ')));
    }

    void act(ChaosHost &host, During moment)
    {
        if (moment == During::Drag)
            QTest::mousePress(&host.window, Qt::LeftButton, {}, host.swatch(0, 0));
        if (moment == During::End)
            host.picker.dismiss();
        for (int step = 0; host.picker.isPresented() && step < 4000; ++step) {
            if (moment == During::Drag)
                host.dragStep(step);
            else if (moment == During::Saves && step < 3)
                host.addFavorite(gray(100 + step), 5 + step);
            QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents | QEventLoop::AllEvents, 5);
        }
    }

    Settings m_settings;
    std::mt19937 m_random{20261123};
};

QTEST_MAIN(KilledServiceTest)
#include "tst_killedservice.moc"
