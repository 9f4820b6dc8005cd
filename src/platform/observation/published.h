#pragma once

#include "platform/observation/publisher.h"

#include <functional>
#include <memory>
#include <utility>

namespace favrin::platform {

/** An object whose assignments are announced: one event per assignment, before anything else happens. */
class ObservableObject
{
public:
    ObservableObject() = default;
    ObservableObject(const ObservableObject &) = delete;
    ObservableObject &operator=(const ObservableObject &) = delete;

    /** One event, without a value, per assignment of any published property of this object. */
    Publisher<Nothing> objectWillChange() { return m_willChange.publisher(); }

    /** For Published: announces that a property is about to change. */
    void announceWillChange() { m_willChange.send({}); }

private:
    Subject<Nothing> m_willChange;
};

/**
 * An observable property. Every assignment, of an equal value too, first announces a will-change event on the owner,
 * then delivers the new value to the property's own subscribers, and only then stores it; so a subscriber still reads
 * the old value. When the value is stored, the stored-hook runs (this is where QML learns of the change).
 *
 * Subscribing delivers the current value at once. A subscriber may assign the property again: the inner assignment is
 * completed first, and the outer one stores last. It may also destroy the property or its owner: the rest of that
 * assignment is then dropped. Confined to one thread.
 */
template<class Value>
class Published
{
public:
    Published(ObservableObject &owner, Value initial)
        : m_owner(owner), m_state(std::make_shared<State>(std::move(initial)))
    {
    }
    ~Published() { m_state->subject.end(); }
    Published(const Published &) = delete;
    Published &operator=(const Published &) = delete;

    const Value &value() const { return m_state->value; }
    const Value &operator()() const { return m_state->value; }

    void set(Value value)
    {
        // Holds what is used below, should a subscriber destroy this property meanwhile.
        const auto state = m_state;
        m_owner.announceWillChange();
        state->subject.send(value);
        if (state->subject.hasEnded())
            return;
        state->value = std::move(value);
        if (const auto stored = state->stored)
            stored();
    }

    /** The property as a stream: the current value on subscription, then every later assignment. */
    Publisher<Value> publisher() const
    {
        return Publisher<Value>([weak = std::weak_ptr<State>(m_state)](typename Publisher<Value>::Receive receive) {
            const auto state = weak.lock();
            if (!state || state->subject.hasEnded())
                return Subscription();
            // Subscribed first: an assignment made while the current value is delivered reaches this subscriber too.
            auto subscription = state->subject.publisher().sink(receive);
            const Value current = state->value;
            receive(current);
            return subscription;
        });
    }

    /** Called after each store; one hook per property. */
    void onStored(std::function<void()> hook) { m_state->stored = std::move(hook); }

private:
    struct State
    {
        explicit State(Value initial) : value(std::move(initial)) {}
        Subject<Value> subject;
        Value value;
        std::function<void()> stored;
    };

    ObservableObject &m_owner;
    std::shared_ptr<State> m_state;
};

} // namespace favrin::platform
