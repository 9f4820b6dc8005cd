#pragma once

#include <functional>

namespace favrin::platform {

/** A queue of work. async() may be called on any thread and never runs the work before it returns. */
class Queue
{
public:
    virtual ~Queue() = default;
    virtual void async(std::function<void()> work) = 0;
};

/**
 * Runs work on the thread of the application object, in the order it was given, through the event loop. Work given
 * before there is an application waits for it; work given after it is gone, or not yet run then, is dropped.
 */
Queue &mainQueue();

/** The shared concurrent queue of default priority: Qt's global thread pool. Dropped once the application is gone. */
Queue &backgroundQueue();

} // namespace favrin::platform
