#ifndef QRX_FOUNDATION_THR_SHARED_H
#define QRX_FOUNDATION_THR_SHARED_H

#include <atomic>
#include <memory>
#if __has_include(<sys/single_threaded.h>)
#include <sys/single_threaded.h>
#endif

// What lets several threads read one object at once although reading it counts holders and keeps what was
// worked out.

/// Whether the process has this thread alone, so that nobody else can be at a count.
inline bool thr_IsAlone() {
#if __has_include(<sys/single_threaded.h>)
    return __libc_single_threaded != 0;
#else
    return false;
#endif
}

/// A count of holders. Threads may have holders of one object each and make and drop them at once; a process
/// of one thread pays nothing for it.
class thr_Count {
public:
    explicit thr_Count(int count = 1) : count_(count) {}
    void Increment() {
        if (thr_IsAlone()) {
            count_.store(count_.load(std::memory_order_relaxed) + 1, std::memory_order_relaxed);
        } else {
            count_.fetch_add(1, std::memory_order_relaxed);
        }
    }
    /// True when the count falls to zero.
    bool Decrement() {
        if (!thr_IsAlone()) return count_.fetch_sub(1, std::memory_order_acq_rel) == 1;
        const int left = count_.load(std::memory_order_relaxed) - 1;
        count_.store(left, std::memory_order_relaxed);
        return left == 0;
    }
    int Count() const { return count_.load(std::memory_order_acquire); }

private:
    std::atomic<int> count_;
};

/// A small value that readers may change, such as a guess where to look first. Copies start with its value.
template <class T>
class thr_Relaxed {
public:
    thr_Relaxed(T value) : value_(value) {}
    thr_Relaxed(const thr_Relaxed& other) : value_(T(other)) {}
    thr_Relaxed& operator=(const thr_Relaxed& other) { return *this = T(other); }
    thr_Relaxed& operator=(T value) {
        value_.store(value, std::memory_order_relaxed);
        return *this;
    }
    operator T() const { return value_.load(std::memory_order_relaxed); }

private:
    std::atomic<T> value_;
};

/// Something worked out by the first reader who needs it and kept for all. Copies start without it.
template <class T>
class thr_Kept {
public:
    thr_Kept() = default;
    thr_Kept(const thr_Kept&) {}
    thr_Kept& operator=(const thr_Kept&) {
        Drop();
        return *this;
    }
    ~thr_Kept() { delete kept_.load(std::memory_order_relaxed); }

    /// Null when there is none yet.
    T* Get() const { return kept_.load(std::memory_order_acquire); }
    /// Keeps it, unless another thread was faster; gives what is kept.
    T* Keep(std::unique_ptr<T> made) const {
        T* former = nullptr;
        if (!kept_.compare_exchange_strong(former, made.get(), std::memory_order_acq_rel)) return former;
        return made.release();
    }
    /// Only who may write the object may drop what is kept.
    void Drop() { delete kept_.exchange(nullptr, std::memory_order_relaxed); }

private:
    mutable std::atomic<T*> kept_ = nullptr;
};

#endif
