#ifndef QRX_FOUNDATION_COW_RANGE_H
#define QRX_FOUNDATION_COW_RANGE_H

#include <cstddef>
#include <iterator>
#include <type_traits>

/// Walks a container whose items are numbered, for range-based loops. `Get(container, index)` gives the item,
/// a reference or a value. The container must live and stay as it is for as long as the loop.
template <class Container, auto Get>
class cow_IndexIterator {
public:
    using iterator_category = std::input_iterator_tag;
    using difference_type = std::ptrdiff_t;
    using reference = decltype(Get(*static_cast<const Container*>(nullptr), 0));
    using value_type = std::remove_cvref_t<reference>;
    using pointer = void;

    cow_IndexIterator() = default;
    cow_IndexIterator(const Container& container, int index) : container_(&container), index_(index) {}
    reference operator*() const { return Get(*container_, index_); }
    cow_IndexIterator& operator++() {
        ++index_;
        return *this;
    }
    cow_IndexIterator operator++(int) {
        cow_IndexIterator before(*this);
        ++index_;
        return before;
    }
    friend bool operator==(const cow_IndexIterator& a, const cow_IndexIterator& b) {
        return a.index_ == b.index_;
    }

private:
    const Container* container_ = nullptr;
    int index_ = 0;
};

/// One entry of a named container, for `for (const auto& [name, object] : container)`.
template <class Key, class Value>
struct cow_Entry {
    const Key& key;
    Value value; ///< a reference, or a view
};

#endif
