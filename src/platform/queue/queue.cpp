#include "platform/queue/queue.h"

#include <QCoreApplication>
#include <QEvent>
#include <QThreadPool>

#include <cstddef>
#include <deque>
#include <memory>
#include <mutex>
#include <utility>

namespace favrin::platform {

namespace {

using Work = std::function<void()>;

/**
 * Work on its way to another thread. It lies behind a lock of its own, and only the word that there is some travels
 * through the toolkit: tools that look for races know this lock, and not those of the toolkit.
 */
class WaitingWork
{
public:
    void add(Work work)
    {
        const std::lock_guard guard(m_mutex);
        m_work.push_back(std::move(work));
    }

    void runNext()
    {
        if (const Work work = next())
            work();
    }

    void drop()
    {
        std::deque<Work> dropped;
        const std::lock_guard guard(m_mutex);
        // What is dropped goes after the lock: it may give more work when it goes.
        dropped.swap(m_work);
    }

    std::size_t size()
    {
        const std::lock_guard guard(m_mutex);
        return m_work.size();
    }

private:
    Work next()
    {
        const std::lock_guard guard(m_mutex);
        if (m_work.empty())
            return {};
        Work work = std::move(m_work.front());
        m_work.pop_front();
        return work;
    }

    std::mutex m_mutex;
    std::deque<Work> m_work;
};

// Whoever runs work finds the queue by these, which order its making before its use.
void runNextOnMainThread();
void runNextInBackground();

/** Lives on the main thread. Of the events it looks only at their number, since they are made on other threads. */
class MainThread : public QObject
{
public:
    MainThread() { moveToThread(QCoreApplication::instance()->thread()); }

protected:
    void customEvent(QEvent *) override { runNextOnMainThread(); }
};

class MainQueue : public Queue
{
public:
    void async(Work work) override
    {
        const std::lock_guard guard(m_mutex);
        if (m_phase == Phase::AfterApplication)
            return;
        m_waiting.add(std::move(work));
        if (m_phase == Phase::Running)
            post();
    }

    void applicationStarted()
    {
        const std::lock_guard guard(m_mutex);
        m_phase = Phase::Running;
        m_mainThread = std::make_unique<MainThread>();
        for (std::size_t waiting = m_waiting.size(); waiting > 0; --waiting)
            post();
    }

    void applicationEnds()
    {
        {
            const std::lock_guard guard(m_mutex);
            m_phase = Phase::AfterApplication;
            m_mainThread.reset();
        }
        m_waiting.drop();
    }

    void runNext() { m_waiting.runNext(); }

private:
    enum class Phase { BeforeApplication, Running, AfterApplication };

    // One receiver keeps the order.
    void post() { QCoreApplication::postEvent(m_mainThread.get(), new QEvent(QEvent::User)); }

    // Held while posting, so that the application cannot go away in between.
    std::mutex m_mutex;
    Phase m_phase = Phase::BeforeApplication;
    WaitingWork m_waiting;
    std::unique_ptr<MainThread> m_mainThread;
};

class BackgroundQueue : public Queue
{
public:
    void async(Work work) override
    {
        auto *pool = QThreadPool::globalInstance();
        if (!pool)
            return;
        m_waiting.add(std::move(work));
        pool->start([] { runNextInBackground(); });
    }

    void runNext() { m_waiting.runNext(); }

private:
    WaitingWork m_waiting;
};

// Neither queue is ever destroyed: threads may still give work while the process ends.
MainQueue &theMainQueue()
{
    static auto *const queue = new MainQueue;
    return *queue;
}

BackgroundQueue &theBackgroundQueue()
{
    static auto *const queue = new BackgroundQueue;
    return *queue;
}

void runNextOnMainThread()
{
    theMainQueue().runNext();
}

void runNextInBackground()
{
    theBackgroundQueue().runNext();
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
    return theBackgroundQueue();
}

} // namespace favrin::platform
