#ifndef QRX_FOUNDATION_THR_PROGRESS_H
#define QRX_FOUNDATION_THR_PROGRESS_H

#include <atomic>

/// How far a long run has come: who works on it notes that, and another thread may look at it meanwhile.
struct thr_Progress {
    /// Bytes that have been worked through, and how many there are in all; 0 where that isn't known.
    std::atomic<long long> bytes = 0;
    std::atomic<long long> whole = 0;

    void Begin(long long all) {
        whole.store(all, std::memory_order_relaxed);
        bytes.store(0, std::memory_order_relaxed);
    }
    void Add(long long more) { bytes.fetch_add(more, std::memory_order_relaxed); }
    void Set(long long done) { bytes.store(done, std::memory_order_relaxed); }
};

#endif
