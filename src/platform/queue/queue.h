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

/** Runs work on the main thread, in the order it was given, through the event loop. */
Queue &mainQueue();

/** The shared concurrent queue of default priority. */
Queue &backgroundQueue();

} // namespace favrin::platform
