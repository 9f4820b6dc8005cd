#include "platform/queue/queue.h"

#include <QCoreApplication>
#include <QThreadPool>

#include <mutex>
#include <utility>
#include <vector>

namespace favrin::platform {

namespace {

class MainQueue : public Queue
{
public:
    void async(std::function<void()> work) override
    {
        const std::lock_guard guard(m_mutex);
        switch (m_phase) {
        case Phase::BeforeApplication:
            m_waiting.push_back(std::move(work));
            break;
        case Phase::Running:
            post(std::move(work));
            break;
        case Phase::AfterApplication:
            break;
        }
    }

    void applicationStarted()
    {
        const std::lock_guard guard(m_mutex);
        m_phase = Phase::Running;
        for (auto &work : std::exchange(m_waiting, {}))
            post(std::move(work));
    }

    void applicationEnds()
    {
        const std::lock_guard guard(m_mutex);
        m_phase = Phase::AfterApplication;
    }

private:
    enum class Phase { BeforeApplication, Running, AfterApplication };

    // The application object is the receiver: its thread is the main thread, and one receiver keeps the order.
    static void post(std::function<void()> work)
    {
        QMetaObject::invokeMethod(QCoreApplication::instance(), std::move(work), Qt::QueuedConnection);
    }

    // Held while posting, so that the application cannot go away in between.
    std::mutex m_mutex;
    Phase m_phase = Phase::BeforeApplication;
    std::vector<std::function<void()>> m_waiting;
};

class BackgroundQueue : public Queue
{
public:
    void async(std::function<void()> work) override
    {
        if (auto *pool = QThreadPool::globalInstance())
            pool->start(std::move(work));
    }
};

// Neither queue is ever destroyed: threads may still give work while the process ends.
MainQueue &theMainQueue()
{
    static auto *const queue = new MainQueue;
    return *queue;
}

void watchApplication()
{
    theMainQueue().applicationStarted();
    qAddPostRoutine([] { theMainQueue().applicationEnds(); });
}

} // namespace

Queue &mainQueue()
{
    static std::once_flag watched;
    // Runs at once when there is an application already, and again for each later one.
    std::call_once(watched, [] { qAddPreRoutine(watchApplication); });
    return theMainQueue();
}

Queue &backgroundQueue()
{
    static auto *const queue = new BackgroundQueue;
    return *queue;
}

} // namespace favrin::platform
