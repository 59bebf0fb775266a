#include "deck_reader/drd_TextMap.h"

#include <bit>
#include <functional>

namespace {

/// Names that differ in their last digit alone get neighbouring hashes: decks number names and ask for them
/// in turn, and find those of a million beside each other instead of anywhere in memory.
std::uint32_t HashOfKey(std::string_view text, std::uint64_t scope) {
    const std::string_view root = text.substr(0, text.empty() ? 0 : text.size() - 1);
    const std::size_t hash = std::hash<std::string_view>()(root) ^ (scope * 0x9E3779B97F4A7C15U);
    const auto last = text.empty() ? 0U : static_cast<unsigned>(static_cast<unsigned char>(text.back()));
    return static_cast<std::uint32_t>(hash ^ (hash >> 16U >> 16U)) + last;
}

} // namespace

std::size_t drd_TextMap::SlotOf(std::string_view text, std::uint64_t scope, std::uint32_t hash) const {
    const std::size_t mask = slots_.size() - 1;
    std::size_t at = hash & mask;
    for (; slots_[at].entry != 0; at = (at + 1) & mask) {
        if (slots_[at].hash != hash) continue;
        const Entry& entry = entries_[slots_[at].entry - 1];
        if (scope == entry.scope && text == std::string_view(entry.text, entry.length)) break;
    }
    return at;
}

void drd_TextMap::Grow(std::size_t slots) {
    const std::vector<Slot> before = std::move(slots_);
    slots_.assign(slots, {});
    const std::size_t mask = slots_.size() - 1;
    for (const Slot& slot : before) {
        if (slot.entry == 0) continue;
        std::size_t at = slot.hash & mask;
        while (slots_[at].entry != 0) at = (at + 1) & mask;
        slots_[at] = slot;
    }
}

void drd_TextMap::Reserve(std::size_t count) {
    entries_.reserve(count);
    const std::size_t slots = std::bit_ceil(2 * count + 2);
    if (slots > slots_.size()) Grow(slots);
}

std::pair<int&, bool> drd_TextMap::TryEmplace(std::string_view text, int number, std::uint64_t scope) {
    if (2 * (entries_.size() + 1) > slots_.size()) Grow(slots_.empty() ? 16 : 4 * slots_.size());
    const std::uint32_t hash = HashOfKey(text, scope);
    Slot& slot = slots_[SlotOf(text, scope, hash)];
    if (slot.entry != 0) return {entries_[slot.entry - 1].number, false};
    entries_.push_back({scope, texts_.Keep(text).data(), static_cast<std::uint32_t>(text.size()), number});
    slot = {hash, static_cast<std::uint32_t>(entries_.size())};
    return {entries_.back().number, true};
}

const int* drd_TextMap::Find(std::string_view text, std::uint64_t scope) const {
    if (slots_.empty()) return nullptr;
    const Slot& slot = slots_[SlotOf(text, scope, HashOfKey(text, scope))];
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
