#include "tools/ProgressLine.h"

#include "store_interface/findings/fnd_Text.h"
#include "tools/StandardStreams.h"

#include <algorithm>
#include <atomic>
#include <cstdio>
#include <system_error>

namespace {

constexpr auto kQuietTime = std::chrono::milliseconds(500);
constexpr auto kInterval = std::chrono::milliseconds(100);
constexpr std::string_view kErase = "\r\033[K";

std::atomic<bool> isLineShown = false;

/// "340 kB", "1.2 GB".
std::string BytesText(double bytes) {
    constexpr const char* kUnits[] = {"B", "kB", "MB", "GB", "TB"};
    std::size_t unit = 0;
    for (; bytes >= 999.5 && unit + 1 < std::size(kUnits); ++unit) bytes /= 1000.0;
    char text[32];
    std::snprintf(text, sizeof text, bytes < 9.95 && unit > 0 ? "%.1f %s" : "%.0f %s", bytes, kUnits[unit]);
    return text;
}

} // namespace

void ProgressLine::Begin(const char* part, const std::string& thing) {
    if (!on_) return;
    const std::lock_guard lock(mutex_);
    what_ = std::string(part) + " " + fnd_Visible(thing);
    beginPart_ = Clock::now();
    work_.Begin(0);
    if (thread_.joinable()) return;
    begin_ = beginPart_;
    stopped_ = false;
    try {
        thread_ = std::thread([this] { Run(); });
    } catch (const std::system_error&) { // the work is done without it
    }
}

void ProgressLine::End() {
    if (!thread_.joinable()) return;
    {
        const std::lock_guard lock(mutex_);
        stopped_ = true;
        Hide();
    }
    changed_.notify_all();
    thread_.join();
}

void ProgressLine::Aside(const std::function<void()>& write) {
    const std::lock_guard lock(mutex_);
    Hide();
    write();
}

void ProgressLine::Erase() noexcept {
    if (isLineShown.exchange(false)) WriteToStandardError(kErase);
}

void ProgressLine::Run() {
    std::unique_lock lock(mutex_);
    auto next = begin_ + kQuietTime;
    while (!changed_.wait_until(lock, next, [this] { return stopped_; })) {
        Show();
        next = Clock::now() + kInterval;
    }
}

void ProgressLine::Show() {
    std::string line = Line();
    const int columns = ColumnsOfTerminal(true);
    // A line that wraps could not be taken back.
    if (columns > 0 && line.size() >= static_cast<std::size_t>(columns)) {
        std::size_t end = static_cast<std::size_t>(columns) - 1;
        while (end > 0 && (static_cast<unsigned char>(line[end]) & 0xC0U) == 0x80U) --end;
        line.resize(end);
    }
    isLineShown = true;
    WriteToStandardError("\r" + line + "\033[K");
}

void ProgressLine::Hide() {
    Erase();
}

std::string ProgressLine::Line() const {
    const double seconds = std::chrono::duration<double>(Clock::now() - beginPart_).count();
    const auto bytes = static_cast<double>(work_.bytes.load(std::memory_order_relaxed));
    const auto whole = static_cast<double>(work_.whole.load(std::memory_order_relaxed));
    std::string line = what_;
    if (bytes > 0.0) {
        line += ": " + BytesText(bytes);
        if (whole > 0.0) line += " of " + BytesText(whole);
        if (seconds > 0.0) line += ", " + BytesText(bytes / seconds) + "/s";
    }
    char text[32];
    std::snprintf(text, sizeof text, ", %.0f s",
                  std::chrono::duration<double>(Clock::now() - begin_).count());
    return line + text;
}
