#pragma once

#include "platform/observation/publisher.h"

#include <functional>
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
 * Confined to one thread. Subscribing delivers the current value at once.
 */
template<class Value>
class Published
{
public:
    Published(ObservableObject &owner, Value initial) : m_owner(owner), m_value(std::move(initial)) {}
    Published(const Published &) = delete;
    Published &operator=(const Published &) = delete;

    const Value &value() const { return m_value; }
    const Value &operator()() const { return m_value; }

    void set(Value value)
    {
        m_owner.announceWillChange();
        m_subject.send(value);
        m_value = std::move(value);
        if (m_stored)
            m_stored();
    }

    /** The property as a stream: the current value on subscription, then every later assignment. */
    Publisher<Value> publisher()
    {
        return Publisher<Value>([this](std::function<void(const Value &)> receive) {
            receive(m_value);
            return m_subject.publisher().sink(std::move(receive));
        });
    }

    /** Called after each store; one hook per property. */
    void onStored(std::function<void()> hook) { m_stored = std::move(hook); }

private:
    ObservableObject &m_owner;
    Subject<Value> m_subject;
    Value m_value;
    std::function<void()> m_stored;
};

} // namespace favrin::platform
