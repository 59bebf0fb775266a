#ifndef QRX_VPG_GROUPBYNODES_H
#define QRX_VPG_GROUPBYNODES_H

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <span>
#include <utility>
#include <vector>

/// Finds the items that have one key, among `items` things that are told by a few nodes: `leastOf(item)` is
/// the smallest of an item's nodes (0 to `nodes` - 1), `keyOf(item)` tells them all. Calls `visit(items)` for
/// each key. Items are dealt to their smallest nodes by counting and only then compared, a few at a time, so
/// that the work grows with their number.
template <class LeastOf, class KeyOf, class Visit>
void vpg_GroupByNodes(std::size_t items, std::size_t nodes, const LeastOf& leastOf, const KeyOf& keyOf,
                      const Visit& visit) {
    using Index = std::uint32_t;
    std::vector<Index> end(nodes + 1, 0);
    for (std::size_t i = 0; i < items; ++i) ++end[static_cast<std::size_t>(leastOf(i)) + 1];
    for (std::size_t i = 1; i <= nodes; ++i) end[i] += end[i - 1];
    std::vector<Index> dealt(items);
    // Afterwards end[n] is where the items of node n end.
    for (std::size_t i = 0; i < items; ++i) {
        dealt[end[static_cast<std::size_t>(leastOf(i))]++] = static_cast<Index>(i);
    }

    std::vector<std::pair<decltype(keyOf(std::size_t())), Index>> keyed;
    std::vector<Index> same;
    for (std::size_t node = 0; node < nodes; ++node) {
        keyed.clear();
        for (std::size_t i = node == 0 ? 0 : end[node - 1]; i < end[node]; ++i) {
            keyed.emplace_back(keyOf(dealt[i]), dealt[i]);
        }
        std::ranges::sort(keyed);
        for (std::size_t i = 0; i < keyed.size();) {
            same.clear();
            const std::size_t first = i;
            for (; i < keyed.size() && keyed[i].first == keyed[first].first; ++i) {
                same.push_back(keyed[i].second);
            }
            visit(std::span<const Index>(same));
        }
    }
}

#endif
