#pragma once

#include <cstddef>
#include <functional>
#include <memory>
#include <optional>
#include <type_traits>
#include <utility>
#include <vector>

namespace favrin::platform {

/** The value of a stream that only says that something happens. */
struct Nothing
{
    bool operator==(const Nothing &) const = default;
};

/** Keeps a subscription alive; dropping it (or cancel()) ends the subscription, also in the middle of a delivery. */
class Subscription
{
public:
    Subscription() = default;
    explicit Subscription(std::function<void()> cancel) : m_cancel(std::move(cancel)) {}
    Subscription(Subscription &&other) noexcept : m_cancel(std::exchange(other.m_cancel, nullptr)) {}
    Subscription &operator=(Subscription &&other) noexcept
    {
        if (this != &other) {
            cancel();
            m_cancel = std::exchange(other.m_cancel, nullptr);
        }
        return *this;
    }
    ~Subscription() { cancel(); }

    void cancel()
    {
        if (const auto action = std::exchange(m_cancel, nullptr))
            action();
    }
    explicit operator bool() const { return static_cast<bool>(m_cancel); }

private:
    std::function<void()> m_cancel;
};

/**
 * A stream of values. Delivery is synchronous, on the thread and within the call that sends the value. A publisher is a
 * recipe: nothing happens before sink(). It may outlive the subject or property it comes from; sink() then delivers
 * nothing and returns an empty handle. Confined to the thread of its source.
 */
template<class Value>
class Publisher
{
public:
    using Receive = std::function<void(const Value &)>;
    explicit Publisher(std::function<Subscription(Receive)> subscribe) : m_subscribe(std::move(subscribe)) {}

    /** Subscribes; the subscription lasts as long as the returned handle. */
    [[nodiscard]] Subscription sink(Receive receive) const { return m_subscribe(std::move(receive)); }

    /** Each value passed through @p transform. */
    template<class Transform>
    auto map(Transform transform) const
    {
        using Result = std::decay_t<std::invoke_result_t<Transform, const Value &>>;
        return Publisher<Result>([source = *this, transform](typename Publisher<Result>::Receive receive) {
            return source.sink(
                [transform, receive = std::move(receive)](const Value &value) { receive(transform(value)); });
        });
    }

    /** Drops a value that equals the one before it; each subscription remembers its own. */
    Publisher removeDuplicates() const
    {
        return Publisher([source = *this](Receive receive) {
            auto last = std::make_shared<std::optional<Value>>();
            return source.sink([last, receive = std::move(receive)](const Value &value) {
                // Not "*last == value": when values are optionals themselves, a first "none" would look like no value.
                if (last->has_value() && **last == value)
                    return;
                last->emplace(value);
                receive(value);
            });
        });
    }

private:
    std::function<Subscription(Receive)> m_subscribe;
};

/**
 * A stream that is fed by hand. Sends to its subscribers in the order they subscribed. One that subscribes during a
 * delivery hears that value in its turn; one that is cancelled before its turn does not. A subscriber may send another
 * value (it is delivered to all before the outer delivery goes on) or destroy the subject (the rest hear nothing).
 */
template<class Value>
class Subject
{
public:
    Subject() = default;
    ~Subject() { end(); }
    Subject(const Subject &) = delete;
    Subject &operator=(const Subject &) = delete;

    void send(const Value &value);
    Publisher<Value> publisher() const;

    /** Nothing is delivered from now on, not even the rest of a delivery in progress. */
    void end();
    bool hasEnded() const;

private:
    struct Subscribers;
    std::shared_ptr<Subscribers> m_subscribers = std::make_shared<Subscribers>();
};

/**
 * Joins two streams: once both have sent a value, each further value of either sends the pair of the latest two.
 * The first stream is subscribed first.
 */
template<class First, class Second>
Publisher<std::pair<First, Second>> combineLatest(const Publisher<First> &first, const Publisher<Second> &second);

} // namespace favrin::platform

#include "platform/observation/publisher_impl.h"
