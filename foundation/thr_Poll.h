#ifndef QRX_FOUNDATION_THR_POLL_H
#define QRX_FOUNDATION_THR_POLL_H

#include <functional>
#include <utility>

/// Lets a long run be broken off: who starts it gives its thread a function, which the run calls between two
/// objects that it works on. The function may raise, and the run ends as it does at any exception.
class thr_Poll {
public:
    explicit thr_Poll(std::function<void()> function)
        : function_(std::move(function)), outer_(std::exchange(Current(), this)) {}
    thr_Poll(const thr_Poll&) = delete;
    thr_Poll& operator=(const thr_Poll&) = delete;
    ~thr_Poll() { Current() = outer_; }

    static void Now() {
        if (const thr_Poll* poll = Current(); poll != nullptr) poll->function_();
    }

private:
    static const thr_Poll*& Current() {
        static thread_local const thr_Poll* current = nullptr;
        return current;
    }

    std::function<void()> function_;
    const thr_Poll* outer_;
};

#endif
