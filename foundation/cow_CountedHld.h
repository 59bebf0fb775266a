#ifndef QRX_FOUNDATION_COW_COUNTEDHLD_H
#define QRX_FOUNDATION_COW_COUNTEDHLD_H

#include "foundation/mem_Allocation.h"
#include "foundation/thr_Shared.h"

#include <type_traits>
#include <utility>

/// A reference count on the heap.
class cow_Counter : public thr_Count, public QRXBasCowAllocator {
public:
    using thr_Count::thr_Count;
};

/// The count of an object on the heap, and how to delete it.
class cow_OwnerCount : public cow_Counter {
public:
    using Destroy = void (*)(void* referent);
    explicit cow_OwnerCount(Destroy destroy) : cow_Counter(1), destroy_(destroy) {}
    Destroy HowToDestroy() const { return destroy_; }

private:
    Destroy destroy_;
};

/// A counted handle on a T of its own on the heap, which the last holder deletes. May be null. Only who makes
/// the first handle must know what a T is.
template <class T>
class cow_CountedHld {
public:
    cow_CountedHld() = default;
    /// Takes over `referent`, also when the count can't be allocated.
    explicit cow_CountedHld(T* referent) : referent_(referent) {
        if (referent_ == nullptr) return;
        try {
            count_ = new cow_OwnerCount([](void* object) { delete static_cast<T*>(object); });
        } catch (...) {
            delete referent_;
            throw;
        }
    }
    cow_CountedHld(const cow_CountedHld& other) noexcept : count_(other.count_), referent_(other.referent_) {
        if (count_ != nullptr) count_->Increment();
    }
    cow_CountedHld(cow_CountedHld&& other) noexcept
        : count_(std::exchange(other.count_, nullptr)), referent_(std::exchange(other.referent_, nullptr)) {}
    cow_CountedHld& operator=(const cow_CountedHld& other) noexcept {
        cow_CountedHld copy(other);
        Swap(copy);
        return *this;
    }
    cow_CountedHld& operator=(cow_CountedHld&& other) noexcept {
        cow_CountedHld moved(std::move(other));
        Swap(moved);
        return *this;
    }
    ~cow_CountedHld() {
        // NOLINTNEXTLINE(clang-analyzer-cplusplus.NewDelete): the count isn't seen through
        if (count_ != nullptr && count_->Decrement()) Delete();
    }

    /// Drops the old referent and takes over the new one.
    void Reset(T* referent) { *this = cow_CountedHld(referent); }

    bool IsNull() const { return referent_ == nullptr; }
    T* Referent() const { return referent_; }
    T& operator*() const { return *referent_; }
    T* operator->() const { return referent_; }
    int HolderCount() const { return count_ == nullptr ? 0 : count_->Count(); }
    friend bool operator==(const cow_CountedHld& a, const cow_CountedHld& b) {
        return a.referent_ == b.referent_;
    }

protected:
    void Swap(cow_CountedHld& other) noexcept {
        std::swap(count_, other.count_);
        std::swap(referent_, other.referent_);
    }

private:
    void Delete() noexcept {
        const cow_OwnerCount::Destroy destroy = count_->HowToDestroy();
        delete count_;
        destroy(const_cast<std::remove_const_t<T>*>(referent_));
    }

    cow_OwnerCount* count_ = nullptr;
    T* referent_ = nullptr;
};

#endif
