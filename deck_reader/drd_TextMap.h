#ifndef QRX_DECK_READER_DRD_TEXTMAP_H
#define QRX_DECK_READER_DRD_TEXTMAP_H

#include "deck_reader/drd_Texts.h"

#include <cstddef>
#include <cstdint>
#include <string_view>
#include <utility>
#include <vector>

/// Numbers under texts. Decks have millions of names: all texts lie one behind the other, and a look-up reads
/// two or three places instead of the nodes of a std::unordered_map.
class drd_TextMap {
public:
    /// The number under the text and true where it is new; else the one that stands there. Each scope has
    /// texts of its own.
    std::pair<int&, bool> TryEmplace(std::string_view text, int number, std::uint64_t scope = 0);
    /// Null when there is none.
    const int* Find(std::string_view text, std::uint64_t scope = 0) const;
    int NumberOr(std::string_view text, int otherwise) const {
        const int* found = Find(text);
        return found == nullptr ? otherwise : *found;
    }
    /// Makes room for so many texts.
    void Reserve(std::size_t count);

private:
    struct Entry {
        std::uint64_t scope;
        const char* text;
        std::uint32_t length;
        int number;
    };
    /// 0: free; else one more than the index of an entry.
    struct Slot {
        std::uint32_t hash = 0;
        std::uint32_t entry = 0;
    };

    /// The slot that has the text, or the free one where it would stand.
    std::size_t SlotOf(std::string_view text, std::uint64_t scope, std::uint32_t hash) const;
    void Grow(std::size_t slots);

    std::vector<Slot> slots_; // a power of two, at most half of them taken
    std::vector<Entry> entries_;
    drd_Texts texts_;
};

/// Things that wait under a text for a partner; the first that came goes first.
class drd_Waiting {
public:
    void Put(std::string_view text, int thing);
    /// -1 when nothing waits under the text.
    int Take(std::string_view text);
    /// The same under a hash.
    void Put(std::uint64_t hash, int thing) { Put(TextOf(hash), thing); }
    int Take(std::uint64_t hash) { return Take(TextOf(hash)); }

private:
    struct Queue {
        int first;
        int last;
    };
    struct Thing {
        int thing;
        int next;
    };

    static std::string_view TextOf(const std::uint64_t& hash) {
        return {reinterpret_cast<const char*>(&hash), sizeof hash};
    }

    drd_TextMap texts_; // index of queues_
    std::vector<Queue> queues_;
    std::vector<Thing> things_;
};

#endif
