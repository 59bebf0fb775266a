#ifndef QRX_DECK_READER_DRD_TEXTS_H
#define QRX_DECK_READER_DRD_TEXTS_H

#include <cstddef>
#include <cstring>
#include <memory>
#include <new>
#include <span>
#include <string>
#include <string_view>
#include <type_traits>
#include <utility>
#include <vector>

/// A word of a deck, which holds its text: as light as a view, joined like a string.
class drd_Word : public std::string_view {
public:
    drd_Word() = default;
    // NOLINTNEXTLINE(google-explicit-constructor): a view by another name
    drd_Word(std::string_view text) : std::string_view(text) {}
    // NOLINTNEXTLINE(google-explicit-constructor): taken along, a word is a string of its own
    operator std::string() const { return std::string(data(), size()); }

    template <class Own>
    requires std::is_same_v<Own, std::string>
    friend std::string operator+(Own&& ahead, drd_Word word) { return std::move(ahead.append(word)); }
    friend std::string operator+(std::string_view ahead, drd_Word word) { return std::string(ahead) + word; }
    friend std::string operator+(drd_Word word, std::string_view behind) {
        return std::string(word).append(behind);
    }
    friend std::string operator+(drd_Word word, drd_Word behind) { return std::string(word).append(behind); }
};

/// Texts, and rows of plain values, that stay where they are until their holder goes: in blocks that never
/// move. A holder can be moved.
class drd_Texts {
public:
    drd_Word Keep(std::string_view text) {
        char* kept = Room(text.size(), 1);
        if (!text.empty()) std::memcpy(kept, text.data(), text.size());
        return std::string_view(kept, text.size());
    }
    template <class T>
    std::span<const T> Keep(const std::vector<T>& row) {
        static_assert(std::is_trivially_copyable_v<T>);
        if (row.empty()) return {};
        char* kept = Room(row.size() * sizeof(T), alignof(T));
        std::memcpy(kept, static_cast<const void*>(row.data()), row.size() * sizeof(T));
        return {reinterpret_cast<const T*>(kept), row.size()};
    }
    template <class T>
    const T* KeepOne(const T& value) {
        static_assert(std::is_trivially_copyable_v<T>);
        return new (Room(sizeof(T), alignof(T))) T(value);
    }
    /// Lets all that was kept go.
    void Clear() {
        if (blocks_.size() > 1) blocks_.erase(blocks_.begin(), blocks_.end() - 1);
        used_ = 0;
    }

private:
    char* Room(std::size_t bytes, std::size_t alignment) {
        const std::size_t blanks = (alignment - used_ % alignment) % alignment;
        if (blocks_.empty() || used_ + blanks + bytes > size_) return NewBlock(bytes);
        used_ += blanks + bytes;
        return blocks_.back().get() + used_ - bytes;
    }
    char* NewBlock(std::size_t bytes);

    std::vector<std::unique_ptr<char[]>> blocks_;
    std::size_t size_ = 0; // of the last block
    std::size_t used_ = 0;
};

#endif
