#ifndef QRX_DECK_READER_DRD_FLAT_H
#define QRX_DECK_READER_DRD_FLAT_H

#include <cstddef>
#include <cstdlib>
#include <cstring>
#include <new>
#include <span>
#include <type_traits>
#include <utility>

/// A growing array of plain values. It grows with realloc, which moves the pages of a large block instead of
/// copying them, so that an array in growth never stands in memory twice.
template <class T>
class drd_Flat {
    static_assert(std::is_trivially_copyable_v<T>);

public:
    drd_Flat() = default;
    drd_Flat(drd_Flat&& other) noexcept
        : data_(std::exchange(other.data_, nullptr)), size_(std::exchange(other.size_, 0)),
          capacity_(std::exchange(other.capacity_, 0)) {}
    drd_Flat& operator=(drd_Flat&& other) noexcept {
        std::swap(data_, other.data_);
        std::swap(size_, other.size_);
        std::swap(capacity_, other.capacity_);
        return *this;
    }
    drd_Flat(const drd_Flat&) = delete;
    drd_Flat& operator=(const drd_Flat&) = delete;
    ~drd_Flat() { std::free(data_); }

    void Add(T value) {
        if (size_ == capacity_) [[unlikely]]
            Resize(capacity_ + capacity_ / 2 + 16);
        data_[size_++] = value;
    }
    void Add(const T* values, std::size_t count) {
        if (count == 0) return;
        if (size_ + count > capacity_) Resize(size_ + count + size_ / 2);
        std::memcpy(data_ + size_, values, count * sizeof(T));
        size_ += count;
    }
    void Cut(std::size_t size) { size_ = size < size_ ? size : size_; }
    /// Gives back what was taken ahead.
    void Trim() {
        if (size_ < capacity_ && size_ > 0) Resize(size_);
    }

    std::size_t Size() const { return size_; }
    bool IsEmpty() const { return size_ == 0; }
    T* Data() { return data_; }
    const T* Data() const { return data_; }
    T& operator[](std::size_t index) { return data_[index]; }
    const T& operator[](std::size_t index) const { return data_[index]; }
    const T* begin() const { return data_; }
    const T* end() const { return data_ + size_; }
    std::span<const T> Part(std::size_t first, std::size_t count) const { return {data_ + first, count}; }
    std::size_t Bytes() const { return size_ * sizeof(T); }

private:
    void Resize(std::size_t capacity) {
        if (capacity > static_cast<std::size_t>(-1) / sizeof(T)) throw std::bad_alloc();
        void* grown = std::realloc(data_, capacity * sizeof(T));
        if (grown == nullptr) throw std::bad_alloc();
        data_ = static_cast<T*>(grown);
        capacity_ = capacity;
    }

    T* data_ = nullptr;
    std::size_t size_ = 0;
    std::size_t capacity_ = 0;
};

#endif
