#pragma once

#include <cstddef>
#include <span>
#include <unordered_map>
#include <vector>

namespace favrin::service {

/** What turns one list into another: a shortest script of removals and insertions. */
struct CollectionDifference
{
    /** Offsets into the old list, increasing. */
    std::vector<std::size_t> removals;
    /** Offsets into the new list, increasing. */
    std::vector<std::size_t> insertions;

    bool operator==(const CollectionDifference &) const = default;
};

/**
 * The difference of two lists of numbers, by Myers' algorithm in linear space: time grows with the length times the
 * number of edits, memory with the length alone.
 */
CollectionDifference differenceOfIdentities(std::span<const std::size_t> oldList, std::span<const std::size_t> newList);

/** The difference of two lists of hashable values, compared by ==. */
template<class Value>
CollectionDifference difference(std::span<const Value> oldList, std::span<const Value> newList)
{
    // Equal values get the same number, so that each is compared and hashed only once.
    std::unordered_map<Value, std::size_t> identities;
    const auto identitiesOf = [&identities](std::span<const Value> list) {
        std::vector<std::size_t> numbers;
        numbers.reserve(list.size());
        for (const Value &value : list)
            numbers.push_back(identities.try_emplace(value, identities.size()).first->second);
        return numbers;
    };
    const auto oldNumbers = identitiesOf(oldList);
    const auto newNumbers = identitiesOf(newList);
    return differenceOfIdentities(oldNumbers, newNumbers);
}

} // namespace favrin::service
