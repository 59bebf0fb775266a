#include "foundation/thr_InOrder.h"

#include "foundation/thr_Poll.h"

#include <algorithm>
#include <atomic>
#include <condition_variable>
#include <exception>
#include <memory>
#include <mutex>
#include <system_error>
#include <thread>
#include <vector>

namespace {

/// The blocks that are being made or wait for their turn; block b uses the slot b modulo their number.
class BlockLine {
public:
    BlockLine(const thr_TextBlocks& blocks, std::size_t slots, const thr_TextBlocks::Make& make)
        : blocks_(blocks), make_(make), slots_(slots) {
        for (Slot& slot : slots_) slot.text.reset(new char[blocks.bytes]);
    }

    /// Makes blocks until there is none left.
    void Work() {
        std::unique_lock lock(mutex_);
        while (true) {
            moved_.wait(lock, [this] { return stopped_ || next_ == blocks_.count || HasFreeSlot(); });
            if (stopped_ || next_ == blocks_.count) return;
            MakeNext(lock);
        }
    }
    void HandOn(const thr_TextBlocks::Take& take) {
        std::unique_lock lock(mutex_);
        for (std::size_t block = 0; block < blocks_.count; ++block) {
            Slot& slot = slots_[block % slots_.size()];
            while (!slot.isMade) {
                if (next_ < blocks_.count && HasFreeSlot()) {
                    MakeNext(lock);
                } else {
                    moved_.wait(lock);
                }
            }
            lock.unlock();
            if (slot.failure) std::rethrow_exception(slot.failure);
            thr_Poll::Now();
            take(slot.text.get(), static_cast<std::size_t>(slot.end - slot.text.get()));
            lock.lock();
            slot.isMade = false;
            ++taken_;
            moved_.notify_all();
        }
    }
    void Stop() {
        const std::lock_guard lock(mutex_);
        stopped_ = true;
        moved_.notify_all();
    }

private:
    struct Slot {
        std::unique_ptr<char[]> text;
        char* end = nullptr;
        bool isMade = false;
        std::exception_ptr failure;
    };

    bool HasFreeSlot() const { return next_ < taken_ + slots_.size(); }
    void MakeNext(std::unique_lock<std::mutex>& lock) {
        const std::size_t block = next_++;
        Slot& slot = slots_[block % slots_.size()];
        lock.unlock();
        try {
            slot.end = make_(block, slot.text.get());
        } catch (...) {
            slot.failure = std::current_exception();
        }
        lock.lock();
        slot.isMade = true;
        moved_.notify_all();
    }

    const thr_TextBlocks& blocks_;
    const thr_TextBlocks::Make& make_;
    std::vector<Slot> slots_;
    std::mutex mutex_;
    std::condition_variable moved_;
    std::size_t next_ = 0;
    std::size_t taken_ = 0;
    bool stopped_ = false;
};

/// Further threads at one work; it waits for all of them, however the own part of it ends.
class Helpers {
public:
    template <class Work>
    Helpers(std::size_t count, const Work& work, std::function<void()> stop) : stop_(std::move(stop)) {
        try {
            for (std::size_t i = 0; i < count; ++i) threads_.emplace_back(work);
        } catch (const std::system_error&) { // the others do the work
        } catch (...) {
            End();
            throw;
        }
    }
    Helpers(const Helpers&) = delete;
    Helpers& operator=(const Helpers&) = delete;
    ~Helpers() { End(); }

private:
    void End() {
        stop_();
        for (std::thread& thread : threads_) thread.join();
    }

    std::function<void()> stop_;
    std::vector<std::thread> threads_;
};

std::atomic<int> usualThreads = 0;

} // namespace

void thr_SetUsualThreads(int threads) {
    usualThreads = threads;
}

int thr_NumThreads(int wanted) {
    constexpr int most = 64;
    if (wanted <= 0) wanted = usualThreads;
    if (wanted <= 0) {
        // Asking the system reads a file.
        static const auto cores = static_cast<int>(std::thread::hardware_concurrency());
        wanted = cores;
    }
    return std::clamp(wanted, 1, most);
}

void thr_TextBlocks::Run(int threads, const Make& make, const Take& take) const {
    const std::size_t used = std::min(static_cast<std::size_t>(thr_NumThreads(threads)), count);
    if (used == 0) return;
    BlockLine line(*this, 2 * used, make);
    const Helpers helpers(
        used - 1, [&line] { line.Work(); }, [&line] { line.Stop(); });
    line.HandOn(take);
}

void thr_ForEach(int threads, std::size_t count, const std::function<void(std::size_t)>& task) {
    const std::size_t used = std::min(static_cast<std::size_t>(thr_NumThreads(threads)), count);
    if (used == 0) return;
    std::atomic<std::size_t> next = 0;
    std::mutex mutex;
    std::exception_ptr failure;
    const auto work = [&] {
        try {
            for (std::size_t i = next++; i < count; i = next++) {
                // In the threads made here there is none to ask.
                thr_Poll::Now();
                task(i);
            }
        } catch (...) {
            next = count;
            const std::lock_guard lock(mutex);
            if (!failure) failure = std::current_exception();
        }
    };
    {
        const Helpers helpers(used - 1, work, [] {});
        work();
    }
    if (failure) std::rethrow_exception(failure);
}
