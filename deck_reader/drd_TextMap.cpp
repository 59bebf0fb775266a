#include "deck_reader/drd_TextMap.h"

#include <functional>

namespace {

std::uint32_t HashOfKey(std::string_view text) {
    const std::size_t hash = std::hash<std::string_view>()(text);
    return static_cast<std::uint32_t>(hash ^ (hash >> 16U >> 16U));
}

} // namespace

std::size_t drd_TextMap::SlotOf(std::string_view text, std::uint32_t hash) const {
    const std::size_t mask = slots_.size() - 1;
    std::size_t at = hash & mask;
    for (; slots_[at].entry != 0; at = (at + 1) & mask) {
        if (slots_[at].hash != hash) continue;
        const Entry& entry = entries_[slots_[at].entry - 1];
        if (text == std::string_view(texts_.data() + entry.begin, entry.length)) break;
    }
    return at;
}

void drd_TextMap::Grow() {
    const std::vector<Slot> before = std::move(slots_);
    slots_.assign(before.empty() ? 16 : 4 * before.size(), {});
    const std::size_t mask = slots_.size() - 1;
    for (const Slot& slot : before) {
        if (slot.entry == 0) continue;
        std::size_t at = slot.hash & mask;
        while (slots_[at].entry != 0) at = (at + 1) & mask;
        slots_[at] = slot;
    }
}

std::pair<int&, bool> drd_TextMap::TryEmplace(std::string_view text, int number) {
    if (2 * (entries_.size() + 1) > slots_.size()) Grow();
    const std::uint32_t hash = HashOfKey(text);
    Slot& slot = slots_[SlotOf(text, hash)];
    if (slot.entry != 0) return {entries_[slot.entry - 1].number, false};
    entries_.push_back({texts_.size(), static_cast<std::uint32_t>(text.size()), number});
    texts_.append(text);
    slot = {hash, static_cast<std::uint32_t>(entries_.size())};
    return {entries_.back().number, true};
}

const int* drd_TextMap::Find(std::string_view text) const {
    if (slots_.empty()) return nullptr;
    const Slot& slot = slots_[SlotOf(text, HashOfKey(text))];
    return slot.entry == 0 ? nullptr : &entries_[slot.entry - 1].number;
}

void drd_Waiting::Put(std::string_view text, int thing) {
    const int added = static_cast<int>(things_.size());
    things_.push_back({thing, -1});
    const auto [queue, isNew] = texts_.TryEmplace(text, static_cast<int>(queues_.size()));
    if (isNew) {
        queues_.push_back({added, added});
        return;
    }
    Queue& waiting = queues_[static_cast<std::size_t>(queue)];
    if (waiting.first < 0) {
        waiting.first = added;
    } else {
        things_[static_cast<std::size_t>(waiting.last)].next = added;
    }
    waiting.last = added;
}

int drd_Waiting::Take(std::string_view text) {
    const int queue = texts_.NumberOr(text, -1);
    if (queue < 0) return -1;
    Queue& waiting = queues_[static_cast<std::size_t>(queue)];
    if (waiting.first < 0) return -1;
    const Thing& taken = things_[static_cast<std::size_t>(waiting.first)];
    waiting.first = taken.next;
    return taken.thing;
}
