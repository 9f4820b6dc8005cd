#include "service/collectiondifference.h"

#include <algorithm>
#include <cstdint>

namespace favrin::service {

namespace {

using Offset = std::ptrdiff_t;

/** An element that both lists hold, with its offset in its list. */
struct Element
{
    std::size_t identity;
    std::size_t offset;
};

using Elements = std::span<const Element>;

Elements part(Elements list, Offset first, Offset count)
{
    return list.subspan(static_cast<std::size_t>(first), static_cast<std::size_t>(count));
}

/** E. Myers, "An O(ND) Difference Algorithm and Its Variations" (1986), section 4b: divide at the middle of the path.
 */
class LinearSpaceScript
{
public:
    LinearSpaceScript(Offset longestPath, CollectionDifference &result)
        : m_forward(static_cast<std::size_t>(longestPath + 3)), m_backward(m_forward.size()), m_result(result)
    {
    }

    void solve(Elements oldList, Elements newList)
    {
        while (!oldList.empty() && !newList.empty() && oldList.front().identity == newList.front().identity) {
            oldList = oldList.subspan(1);
            newList = newList.subspan(1);
        }
        while (!oldList.empty() && !newList.empty() && oldList.back().identity == newList.back().identity) {
            oldList = oldList.first(oldList.size() - 1);
            newList = newList.first(newList.size() - 1);
        }
        if (oldList.empty() || newList.empty()) {
            for (const Element &element : oldList)
                m_result.removals.push_back(element.offset);
            for (const Element &element : newList)
                m_result.insertions.push_back(element.offset);
            return;
        }
        const auto [x, y] = middle(oldList, newList);
        solve(part(oldList, 0, x), part(newList, 0, y));
        solve(part(oldList, x, std::ssize(oldList) - x), part(newList, y, std::ssize(newList) - y));
    }

private:
    struct Point
    {
        Offset x;
        Offset y;
    };

    /** A point on a shortest path, about half its edits from either end. Both lists hold something. */
    Point middle(Elements oldList, Elements newList)
    {
        const Offset width = std::ssize(oldList);
        const Offset height = std::ssize(newList);
        const Offset delta = width - height;
        at(m_forward, 1) = 0;
        at(m_backward, 1) = 0;
        for (Offset edits = 0;; ++edits) {
            // Diagonals beyond the corners of the grid hold no point.
            const Offset first = -edits + 2 * std::max<Offset>(0, edits - height);
            const Offset last = edits - 2 * std::max<Offset>(0, edits - width);
            for (Offset k = first; k <= last; k += 2) {
                Offset x = start(m_forward, k, edits);
                while (x < width && x - k < height && identity(oldList, x) == identity(newList, x - k))
                    ++x;
                at(m_forward, k) = x;
                const bool overlapPossible = delta % 2 != 0 && std::abs(delta - k) < edits;
                if (overlapPossible && x + at(m_backward, delta - k) >= width)
                    return {x, x - k};
            }
            for (Offset k = first; k <= last; k += 2) {
                Offset x = start(m_backward, k, edits);
                while (x < width && x - k < height &&
                       identity(oldList, width - 1 - x) == identity(newList, height - 1 - (x - k)))
                    ++x;
                at(m_backward, k) = x;
                const bool overlapPossible = delta % 2 == 0 && std::abs(delta - k) <= edits;
                if (overlapPossible && x + at(m_forward, delta - k) >= width)
                    return {width - x, height - (x - k)};
            }
        }
    }

    static std::size_t identity(Elements list, Offset offset)
    {
        return list[static_cast<std::size_t>(offset)].identity;
    }

    /** The furthest point on diagonal @p k that one more edit reaches. */
    Offset start(std::vector<Offset> &furthest, Offset k, Offset edits)
    {
        const bool down = k == -edits || (k != edits && at(furthest, k - 1) < at(furthest, k + 1));
        return down ? at(furthest, k + 1) : at(furthest, k - 1) + 1;
    }

    /** The entry of diagonal @p k; the diagonals in use at a time never share one. */
    static Offset &at(std::vector<Offset> &furthest, Offset k)
    {
        const Offset size = std::ssize(furthest);
        return furthest[static_cast<std::size_t>(k < 0 ? k + size : k)];
    }

    std::vector<Offset> m_forward;
    std::vector<Offset> m_backward;
    CollectionDifference &m_result;
};

std::vector<bool> occurring(std::span<const std::size_t> list, std::size_t identityCount)
{
    std::vector<bool> occurs(identityCount, false);
    for (const std::size_t identity : list)
        occurs[identity] = true;
    return occurs;
}

/** The elements that the other list holds too; the offsets of all others go to @p lone. */
std::vector<Element> sharedElements(std::span<const std::size_t> list, const std::vector<bool> &inOther,
                                    std::vector<std::size_t> &lone)
{
    std::vector<Element> shared;
    for (std::size_t offset = 0; offset < list.size(); ++offset) {
        if (inOther[list[offset]])
            shared.push_back({list[offset], offset});
        else
            lone.push_back(offset);
    }
    return shared;
}

std::size_t identityCount(std::span<const std::size_t> first, std::span<const std::size_t> second)
{
    std::size_t count = 0;
    for (const auto list : {first, second}) {
        for (const std::size_t identity : list)
            count = std::max(count, identity + 1);
    }
    return count;
}

} // namespace

CollectionDifference differenceOfIdentities(std::span<const std::size_t> oldList, std::span<const std::size_t> newList)
{
    CollectionDifference result;
    // What only one of the lists holds is in every script; without it, lists with little in common are quick too.
    const std::size_t identities = identityCount(oldList, newList);
    const auto oldShared = sharedElements(oldList, occurring(newList, identities), result.removals);
    const auto newShared = sharedElements(newList, occurring(oldList, identities), result.insertions);

    LinearSpaceScript(std::ssize(oldShared) + std::ssize(newShared), result).solve(oldShared, newShared);
    std::ranges::sort(result.removals);
    std::ranges::sort(result.insertions);
    return result;
}

} // namespace favrin::service
