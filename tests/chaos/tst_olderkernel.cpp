#include "../road/roadtest.h"

#include <cerrno>

#include <seccomp.h>
#include <sys/wait.h>

/** Where the system has no descriptors of processes, as in some containers, nothing stays behind all the same. */
class OlderKernelTest : public RoadTest
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        static const bool forbidden = [] {
            scmp_filter_ctx rules = seccomp_init(SCMP_ACT_ALLOW);
            const bool loaded = seccomp_rule_add(rules, SCMP_ACT_ERRNO(ENOSYS), SCMP_SYS(pidfd_open), 0) == 0 &&
                                seccomp_load(rules) == 0;
            seccomp_release(rules);
            return loaded;
        }();
        QVERIFY(forbidden);
    }

    void endedPickersAreReaped_data()
    {
        QTest::addColumn<QString>("end");
        for (const char *end : {"dismissed", "killed", "gone with its controller"})
            QTest::newRow(end) << QString::fromLatin1(end);
    }

    void endedPickersAreReaped()
    {
        QFETCH(QString, end);
        auto host = std::make_unique<RoadHost>();
        QVERIFY(host->present());
        if (end == u"dismissed") {
            host->picker.dismiss();
        } else if (end == u"killed") {
            ::kill(servicesOf(getpid()).at(0), SIGKILL);
            QTRY_COMPARE(host->terminated.size(), 1);
        } else {
            host.reset();
        }
        // Neither running nor ended and unreaped.
        QTRY_VERIFY(::waitid(P_ALL, 0, nullptr, WEXITED | WNOHANG | WNOWAIT) == -1 && errno == ECHILD);
    }
};

QTEST_MAIN(OlderKernelTest)
#include "tst_olderkernel.moc"
