#include "platform/queue/queue.h"

#include <QCoreApplication>
#include <QSemaphore>
#include <QThread>
#include <QtTest>

#include <algorithm>
#include <atomic>
#include <memory>
#include <numeric>
#include <thread>
#include <vector>

using namespace favrin::platform;

/** Each case runs with an application object of its own, because the main queue follows its life. */
class QueueTest : public QObject
{
    Q_OBJECT

public:
    static inline int s_early = 0;

private Q_SLOTS:
    void cleanup() { m_application.reset(); }

    void mainQueueRunsInOrderOnTheMainThread()
    {
        start();
        QList<int> order;
        bool elsewhere = false;
        const auto append = [&](int number) {
            mainQueue().async([&, number] {
                order << number;
                elsewhere = elsewhere || QThread::currentThread() != qApp->thread();
            });
        };
        append(1);
        mainQueue().async([&] { append(4); });
        std::thread([&] { append(2); }).join();
        append(3);
        QVERIFY(order.isEmpty());
        QTRY_COMPARE(order, (QList<int>{1, 2, 3, 4}));
        QVERIFY(!elsewhere);
    }

    void workFromManyThreadsIsAllRunInEachThreadsOrder()
    {
        start();
        constexpr int threads = 4;
        constexpr int each = 500;
        std::array<QList<int>, threads> received;
        std::vector<std::thread> givers;
        for (int thread = 0; thread < threads; ++thread) {
            givers.emplace_back([thread, &received] {
                for (int number = 0; number < each; ++number)
                    mainQueue().async([thread, number, &received] { received[std::size_t(thread)] << number; });
            });
        }
        for (auto &giver : givers)
            giver.join();
        for (const auto &numbers : received) {
            QTRY_COMPARE(numbers.size(), qsizetype(each));
            QVERIFY(std::is_sorted(numbers.begin(), numbers.end()));
        }
    }

    void workGivenBeforeTheFirstApplicationWaitsForIt() { QCOMPARE(s_early, 1); }

    void workThatTheApplicationLeavesBehindIsDropped()
    {
        start();
        const auto token = std::make_shared<int>(0);
        mainQueue().async([token] { ++*token; });
        m_application.reset();
        mainQueue().async([token] { ++*token; });
        QCOMPARE(token.use_count(), 1L);
        start();
        QCoreApplication::processEvents();
        QCOMPARE(*token, 0);
    }

    void backgroundQueueRunsElsewhereAndComesBack()
    {
        start();
        std::atomic<QThread *> worker = nullptr;
        QThread *back = nullptr;
        backgroundQueue().async([&] {
            worker = QThread::currentThread();
            mainQueue().async([&] { back = QThread::currentThread(); });
        });
        QTRY_COMPARE(back, qApp->thread());
        QVERIFY(worker.load() && worker.load() != back);
    }

    /** More work than threads: most of it is taken up by a thread that was busy when it was given. */
    void whatWorkCarriesIsSeenByWhoeverRunsIt()
    {
        start();
        constexpr int works = 200;
        int returned = 0;
        for (int number = 0; number < works; ++number) {
            backgroundQueue().async([carried = std::vector<int>(16, number), &returned] {
                const int sum = std::accumulate(carried.begin(), carried.end(), 0);
                mainQueue().async([answer = std::vector<int>(16, sum), expected = 16 * carried.front(), &returned] {
                    returned += std::ranges::count(answer, expected) == 16 ? 1 : 0;
                });
            });
        }
        QTRY_COMPARE(returned, works);
    }

    void workStillRunningWhenTheApplicationEndsDoesNoHarm()
    {
        start();
        QSemaphore started;
        QSemaphore proceed;
        std::atomic<bool> finished = false;
        backgroundQueue().async([&] {
            started.release();
            proceed.acquire();
            for (int number = 0; number < 1000; ++number)
                mainQueue().async([] {});
            finished = true;
        });
        started.acquire();
        proceed.release();
        m_application.reset();
        // The application's end has waited for the work; more of it is dropped.
        QVERIFY(finished);
        backgroundQueue().async([] { QFAIL("run without an application"); });
    }

private:
    void start() { m_application = std::make_unique<QCoreApplication>(m_argumentCount, m_arguments); }

    int m_argumentCount = 1;
    char m_name[5] = "test";
    char *m_arguments[2] = {m_name, nullptr};
    std::unique_ptr<QCoreApplication> m_application;
};

int main(int argumentCount, char **arguments)
{
    mainQueue().async([] { ++QueueTest::s_early; });
    {
        QCoreApplication application(argumentCount, arguments);
        QCoreApplication::processEvents();
    }
    QueueTest test;
    return QTest::qExec(&test, argumentCount, arguments);
}

#include "tst_queue.moc"
