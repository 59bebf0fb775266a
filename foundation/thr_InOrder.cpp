#include "foundation/thr_InOrder.h"

#include <algorithm>
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

/// Stops the line and waits for its threads, however the work ends.
class Helpers {
public:
    Helpers(BlockLine& line, int count) : line_(line) {
        try {
            for (int i = 0; i < count; ++i) threads_.emplace_back([&line] { line.Work(); });
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
        line_.Stop();
        for (std::thread& thread : threads_) thread.join();
    }

    BlockLine& line_;
    std::vector<std::thread> threads_;
};

} // namespace

int thr_NumThreads(int wanted) {
    constexpr int most = 64;
    if (wanted <= 0) wanted = static_cast<int>(std::thread::hardware_concurrency());
    return std::clamp(wanted, 1, most);
}

void thr_TextBlocks::Run(int threads, const Make& make, const Take& take) const {
    const std::size_t used = std::min(static_cast<std::size_t>(thr_NumThreads(threads)), count);
    if (used == 0) return;
    BlockLine line(*this, 2 * used, make);
    const Helpers helpers(line, static_cast<int>(used) - 1);
    line.HandOn(take);
}
