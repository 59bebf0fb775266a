#ifndef QRX_TOOLS_PROGRESSLINE_H
#define QRX_TOOLS_PROGRESSLINE_H

#include "foundation/thr_Progress.h"

#include <chrono>
#include <condition_variable>
#include <functional>
#include <mutex>
#include <string>
#include <thread>

/// One line on the terminal that tells what a long run does, with bytes and rate. It comes after half a
/// second and goes before anything else is written; a thread of its own keeps it up to date, so that work
/// which can't be interrupted shows too.
class ProgressLine {
public:
    /// `on`: false for a run that nobody watches.
    explicit ProgressLine(bool on) : on_(on) {}
    ProgressLine(const ProgressLine&) = delete;
    ProgressLine& operator=(const ProgressLine&) = delete;
    ~ProgressLine() { End(); }

    /// From now on "PART THING" is in hand: "reading", "model.json".
    void Begin(const char* part, const std::string& thing);
    /// Takes the line away until the next Begin().
    void End();
    /// Writes something else to the terminal, for which the line is out of the way.
    void Aside(const std::function<void()>& write);
    thr_Progress& Work() { return work_; }

    /// Takes the line away when the process ends; only calls that are safe within a signal handler.
    static void Erase() noexcept;

private:
    using Clock = std::chrono::steady_clock;

    void Run();
    void Show();
    void Hide();
    std::string Line() const;

    const bool on_;
    thr_Progress work_;
    std::mutex mutex_;
    std::condition_variable changed_;
    std::thread thread_;
    bool stopped_ = true;
    Clock::time_point begin_;     // of all
    Clock::time_point beginPart_; // of what is in hand
    std::string what_;
};

#endif
