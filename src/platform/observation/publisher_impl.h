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
    // Entries are shared with a delivery in progress, so that a subscriber may cancel itself or another meanwhile.
    std::list<std::shared_ptr<Entry>> entries;
};

template<class Value>
void Subject<Value>::send(const Value &value)
{
    // The list is copied: a subscriber may subscribe, cancel or destroy the subject itself while it is called.
    const auto entries = m_subscribers->entries;
    for (const auto &entry : entries) {
        if (entry->active)
            entry->receive(value);
    }
}

template<class Value>
Publisher<Value> Subject<Value>::publisher()
{
    return Publisher<Value>([weak = std::weak_ptr(m_subscribers)](typename Publisher<Value>::Receive receive) {
        const auto subscribers = weak.lock();
        if (!subscribers)
            return Subscription();
        auto entry = std::make_shared<typename Subscribers::Entry>();
        entry->receive = std::move(receive);
        subscribers->entries.push_back(entry);
        return Subscription([weak, entry] {
            entry->active = false;
            if (const auto owner = weak.lock())
                owner->entries.remove(entry);
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
            latest->first = value;
            latest->sendIfComplete();
        }));
        auto secondSubscription = std::make_shared<Subscription>(second.sink([latest](const Second &value) {
            latest->second = value;
            latest->sendIfComplete();
        }));
        return Subscription([firstSubscription, secondSubscription] {
            firstSubscription->cancel();
            secondSubscription->cancel();
        });
    });
}

} // namespace favrin::platform
