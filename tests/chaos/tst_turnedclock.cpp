#include "chaoshost.h"
#include "turnedclock.h"

#include <QDateTime>

namespace {

constexpr long long years = 365LL * 24 * 3600;

pid_t onlyChild()
{
    QFile file(QStringLiteral("/proc/self/task/%1/children").arg(::getpid()));
    return file.open(QIODevice::ReadOnly) ? static_cast<pid_t>(file.readAll().trimmed().toInt()) : 0;
}

} // namespace

/** Somebody sets the clock while a picker is shown: nothing waits longer, gives up earlier, or is lost. */
class TurnedClockTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        // The picker's process does not inherit what is loaded before all libraries; so it is started by a script.
        QFile program(m_folder.filePath(QStringLiteral("service")));
        QVERIFY(program.open(QIODevice::WriteOnly));
        program.write("#!/bin/sh\nLD_PRELOAD='" FAVRIN_TURNED_CLOCK "' exec '" FAVRIN_SERVICE "'\n");
        program.close();
        QVERIFY(program.setPermissions(QFile::ReadUser | QFile::ExeUser));
        qputenv("FAVRIN_COLOR_PICKER_SERVICE", QFile::encodeName(program.fileName()));
    }

    void anyTime_data()
    {
        QTest::addColumn<qlonglong>("turn");
        QTest::newRow("an hour back") << qlonglong(-3600);
        QTest::newRow("twenty years on") << qlonglong(20 * years);
        QTest::newRow("back before the time of all clocks") << qlonglong(-80 * years);
    }

    void anyTime()
    {
        QFETCH(qlonglong, turn);
        TurnedClock::turn(0);
        m_settings.clear();
        ChaosHost host;
        QSignalSpy reports(&host.picker, &FVColorPickerViewController::respondingChanged);
        QVERIFY(host.present());
        const auto before = QDateTime::currentSecsSinceEpoch();

        for (int number = 0; number < 3; ++number) {
            TurnedClock::turn(number * turn);
            QVERIFY(std::abs(QDateTime::currentSecsSinceEpoch() - before - number * turn) < 600);
            host.addFavorite(gray(100 + number), 5 + number);
            QTRY_COMPARE(m_settings.favorites().size(), 6 + number);
        }
        TurnedClock::turn(turn);
        QVERIFY(wasShown(m_settings.favorites()));

        QTest::mousePress(&host.window, Qt::LeftButton, {}, host.swatch(0, 0));
        for (int step = 0; step < 200; ++step) {
            TurnedClock::turn(step % 10 < 5 ? turn : 0);
            host.dragStep(step);
            QCoreApplication::processEvents();
        }
        QTest::mouseRelease(&host.window, Qt::LeftButton, {}, host.swatch(0, 11));
        QTRY_VERIFY(host.hasFinalPick());
        QVERIFY(reports.isEmpty());

        // The watch over the process still counts true seconds.
        const pid_t service = onlyChild();
        QVERIFY(service > 0);
        kill(service, SIGSTOP);
        host.dragStep(1);
        TurnedClock::turn(0);
        QTRY_VERIFY_WITH_TIMEOUT(!host.picker.isResponding(), 60'000);
        TurnedClock::turn(turn);
        kill(service, SIGCONT);
        QTRY_VERIFY(host.picker.isResponding());
        QVERIFY(host.isUnharmed());
    }

    void whatIsSetAsideAtAnyTimeKeepsItsName()
    {
        for (const long long turn : {0LL, -80 * years, -80 * years}) {
            TurnedClock::turn(turn);
            // The log of a picker that was cut off would heal the file.
            QTRY_COMPARE(onlyChild(), 0);
            for (const auto &entry : m_settings.entries()) {
                if (!entry.contains(u"damaged"))
                    QFile::remove(m_settings.folder() + u'/' + entry);
            }
            QFile file(m_settings.file());
            QVERIFY(file.open(QIODevice::WriteOnly));
            file.write("no settings");
            file.close();
            ChaosHost host;
            QVERIFY(host.present());
            host.addFavorite(gray(100), 5);
            QTRY_COMPARE(m_settings.favorites().size(), 6);
        }
        QCOMPARE(m_settings.entries().filter(QStringLiteral("damaged")).size(), 3);
    }

private:
    Settings m_settings;
    QTemporaryDir m_folder;
    TurnedClock m_clock{QFile::encodeName(m_folder.filePath(QStringLiteral("clock"))).constData()};
};

QTEST_MAIN(TurnedClockTest)
#include "tst_turnedclock.moc"
