#include "chaoshost.h"

#include <QProcess>
#include <QTimer>

#include <cstdio>

/** The app is killed at any moment: nothing of the picker stays, and no favorite is torn. */
class KilledHostTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void noServiceRemains_data()
    {
        QTest::addColumn<bool>("isStopped");
        QTest::newRow("in the middle of work") << false;
        QTest::newRow("while the picker's process is stopped") << true;
    }

    void noServiceRemains()
    {
        QFETCH(bool, isStopped);
        const int rounds = isStopped ? 1 : chaosRounds(6);
        for (int round = 0; round < rounds && !QTest::currentTestFailed(); ++round)
            killOnce(isStopped);
    }

private:
    void killOnce(bool isStopped)
    {
        m_settings.clear();
        QProcess host;
        host.setProcessChannelMode(QProcess::ForwardedErrorChannel);
        host.start(QCoreApplication::applicationFilePath(), {QStringLiteral("--host")});
        QByteArray output;
        QTRY_VERIFY((output += host.readAllStandardOutput()).contains("ready"));
        const auto parent = static_cast<pid_t>(host.processId());
        const auto services = servicesOf(parent);
        QCOMPARE(services.size(), std::size_t(1));
        if (isStopped)
            kill(services[0], SIGSTOP);
        {
            const SignalSoon killer(parent, SIGKILL, std::chrono::microseconds(m_random() % 60'000));
            QVERIFY(host.waitForFinished());
        }
        QTRY_VERIFY(!QFileInfo::exists(QStringLiteral("/proc/%1/exe").arg(services[0])));
        QVERIFY2(wasShown(m_settings.favorites()), qPrintable(m_settings.favorites().join(u' ')));
    }

    Settings m_settings;
    std::mt19937 m_random{7};
};

/** Presents a picker, keeps favorites and then drags for ever. */
int runAsHost(int argc, char *argv[])
{
    QGuiApplication application(argc, argv);
    ChaosHost host;
    host.picker.present(&host.window);
    QTimer work;
    int step = 0;
    QObject::connect(&work, &QTimer::timeout, &host.window, [&] {
        if (!host.isReady())
            return;
        if (step == 0) {
            std::puts("ready");
            std::fflush(stdout);
        }
        if (step < 3)
            host.addFavorite(gray(100 + step), 5 + step);
        else if (step == 3)
            QTest::mousePress(&host.window, Qt::LeftButton, {}, host.swatch(0, 0));
        else
            host.dragStep(step);
        ++step;
    });
    work.start(1);
    return QGuiApplication::exec();
}

int main(int argc, char *argv[])
{
    QQuickWindow::setGraphicsApi(QSGRendererInterface::Software);
    if (argc > 1 && qstrcmp(argv[1], "--host") == 0)
        return runAsHost(argc, argv);
    QGuiApplication application(argc, argv);
    KilledHostTest test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_killedhost.moc"
