#pragma once

namespace favrin::platform {

template<class Value>
struct Subject<Value>::Subscribers
{
    struct Entry
    {
        typename Publisher<Value>::Receive receive;
        bool active = true;
    };
    // An entry is held while it is called, so that a subscriber may cancel itself or destroy the subject meanwhile.
    std::vector<std::shared_ptr<Entry>> entries;
    int deliveries = 0;
    bool ended = false;

    /** Cancelled entries keep their place until no delivery counts places any more. */
    void dropCancelled()
    {
        if (deliveries > 0)
            return;
        // What a receiver owns may cancel further subscriptions: it is destroyed when the list is in order again.
        std::vector<std::shared_ptr<Entry>> dropped;
        for (const auto &entry : entries) {
            if (!entry->active)
                dropped.push_back(entry);
        }
        std::erase_if(entries, [](const auto &entry) { return !entry->active; });
    }
};

template<class Value>
void Subject<Value>::send(const Value &value)
{
    const auto subscribers = m_subscribers;
    ++subscribers->deliveries;
    // By index: the list may grow, and end() empties it.
    for (std::size_t index = 0; index < subscribers->entries.size(); ++index) {
        const auto entry = subscribers->entries[index];
        if (entry->active)
            entry->receive(value);
    }
    --subscribers->deliveries;
    subscribers->dropCancelled();
}

template<class Value>
void Subject<Value>::end()
{
    m_subscribers->ended = true;
    // The receivers may own things that end their own subscriptions: they go when the list is no longer in use.
    const auto entries = std::exchange(m_subscribers->entries, {});
}

template<class Value>
bool Subject<Value>::hasEnded() const
{
    return m_subscribers->ended;
}

template<class Value>
Publisher<Value> Subject<Value>::publisher() const
{
    return Publisher<Value>([weak = std::weak_ptr(m_subscribers)](typename Publisher<Value>::Receive receive) {
        const auto subscribers = weak.lock();
        if (!subscribers || subscribers->ended)
            return Subscription();
        auto entry = std::make_shared<typename Subscribers::Entry>();
        entry->receive = std::move(receive);
        subscribers->entries.push_back(entry);
        return Subscription([weak, entry] {
            entry->active = false;
            if (const auto owner = weak.lock())
                owner->dropCancelled();
        });
    });
}

template<class First, class Second>
Publisher<std::pair<First, Second>> combineLatest(const Publisher<First> &first, const Publisher<Second> &second)
{
    using Pair = std::pair<First, Second>;
    return Publisher<Pair>([first, second](typename Publisher<Pair>::Receive receive) {
        struct Latest
        {
            std::optional<First> first;
            std::optional<Second> second;
            typename Publisher<Pair>::Receive receive;
            void sendIfComplete() const
            {
                if (first && second)
                    receive(Pair(*first, *second));
            }
        };
        auto latest = std::make_shared<Latest>();
        latest->receive = std::move(receive);
        // Both subscriptions live in one handle; shared because a std::function must be copyable.
        auto firstSubscription = std::make_shared<Subscription>(first.sink([latest](const First &value) {
            latest->first.emplace(value);
            latest->sendIfComplete();
        }));
        auto secondSubscription = std::make_shared<Subscription>(second.sink([latest](const Second &value) {
            latest->second.emplace(value);
            latest->sendIfComplete();
        }));
        return Subscription([firstSubscription, secondSubscription] {
            firstSubscription->cancel();
            secondSubscription->cancel();
        });
    });
}

} // namespace favrin::platform
