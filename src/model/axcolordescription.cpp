#include "model/axcolordescription.h"

#include "model/colordescription.h"
#include "platform/strings/localizedstring.h"

#include <utility>

namespace favrin::model {

// The subscriber is read and cleared on the main thread only; other threads merely pass the subscription on.
struct AXColorDescription::Subscription
{
    AXColorDescription *subscriber;
};

ColorNamingReadiness &ColorNamingReadiness::process()
{
    static ColorNamingReadiness readiness;
    return readiness;
}

AXColorDescription::AXColorDescription(platform::Queue &backgroundQueue, platform::Queue &mainQueue,
                                       std::function<void()> changed, ColorNamingReadiness &readiness)
    : m_backgroundQueue(backgroundQueue), m_mainQueue(mainQueue), m_changed(std::move(changed)), m_readiness(readiness)
{
}

AXColorDescription::~AXColorDescription()
{
    endSubscription();
}

std::string AXColorDescription::evaluate(const std::optional<SomeColor> &color)
{
    if (!color || m_readiness.isReady())
        endSubscription();
    if (!color)
        return platform::localizedString("No color selected", "Label when no color is selected");
    if (m_readiness.isReady())
        return colorDescription(color->platformColor());
    subscribe(*color);
    return m_published;
}

void AXColorDescription::subscribe(const SomeColor &color)
{
    endSubscription();
    m_subscription = std::make_shared<Subscription>(Subscription{this});
    m_backgroundQueue.async([color, subscription = m_subscription, &mainQueue = m_mainQueue] {
        std::string name = colorDescription(color.platformColor());
        mainQueue.async([subscription, name = std::move(name)] {
            if (subscription->subscriber)
                subscription->subscriber->receive(name);
        });
    });
}

void AXColorDescription::endSubscription()
{
    if (!m_subscription)
        return;
    m_subscription->subscriber = nullptr;
    m_subscription.reset();
}

void AXColorDescription::receive(std::string name)
{
    m_readiness.becomeReady();
    endSubscription();
    m_published = std::move(name);
    if (m_changed)
        m_changed();
}

} // namespace favrin::model
