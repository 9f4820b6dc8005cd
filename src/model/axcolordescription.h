#pragma once

#include "model/somecolor.h"
#include "platform/queue/queue.h"

#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace favrin::model {

/**
 * Whether color naming has completed once, after which names are made at once. One per process, through process();
 * starts false, becomes true, never goes back. Main thread only.
 */
class ColorNamingReadiness
{
public:
    static ColorNamingReadiness &process();

    bool isReady() const { return m_ready; }
    void becomeReady() { m_ready = true; }

private:
    bool m_ready = false;
};

/**
 * The spoken description of a view's color, as its accessibility label or value. Belongs to one view and ends with it.
 *
 * The first descriptions of a process are named on the background queue, so that starting the naming never holds up
 * the interface; until such a name arrives, the view says what it said last. Main thread only.
 */
class AXColorDescription
{
public:
    /** @param changed called when a name has arrived and the description should be evaluated again */
    AXColorDescription(platform::Queue &backgroundQueue, platform::Queue &mainQueue, std::function<void()> changed,
                       ColorNamingReadiness &readiness = ColorNamingReadiness::process());
    ~AXColorDescription();
    AXColorDescription(const AXColorDescription &) = delete;
    AXColorDescription &operator=(const AXColorDescription &) = delete;

    /**
     * What the view says for @p color now: "No color selected" for none, the color's name when naming is ready,
     * otherwise published(), with a new subscription to the color's name in place of the one before.
     */
    std::string evaluate(const std::optional<SomeColor> &color);

    /** The last name that arrived; empty at first. */
    const std::string &published() const { return m_published; }

private:
    struct Subscription;
    void subscribe(const SomeColor &color);
    void endSubscription();
    void receive(std::string name);

    platform::Queue &m_backgroundQueue;
    platform::Queue &m_mainQueue;
    std::function<void()> m_changed;
    ColorNamingReadiness &m_readiness;
    std::shared_ptr<Subscription> m_subscription;
    std::string m_published;
};

} // namespace favrin::model
