#include "foundation/utl_Stream.h"

#include <algorithm>
#include <atomic>

namespace {

std::atomic<std::size_t> defaultBufferBytes{std::size_t{256} * 1024};

/// How far the end of [begin, end) is from the last newline, or from `begin` if there is none.
struct Tail {
    std::size_t bytes;
    bool hasNewline;
};

Tail TailOf(const char* begin, const char* end) {
    const char* p = end;
    while (p != begin && p[-1] != '\n') --p;
    return {static_cast<std::size_t>(end - p), p != begin};
}

} // namespace

utl_Stream::utl_Stream(qio_ostream& device, int lineLimit, int doublePrecision, int floatPrecision,
                       std::size_t bufferBytes)
    : device_(device), bufferBytes_(bufferBytes != 0 ? bufferBytes : defaultBufferBytes.load()),
      lineLimit_(std::max(lineLimit, 0)), doublePrecision_(doublePrecision), floatPrecision_(floatPrecision) {
    buffer_.reset(new char[bufferBytes_ + kSlack]);
    current_ = buffer_.get();
    limit_ = current_ + bufferBytes_;
}

utl_Stream::~utl_Stream() {
    try {
        Flush();
    } catch (...) { // the device's own failure; nobody is left to be told
    }
}

std::size_t utl_Stream::SetDefaultBufferSize(std::size_t bytes) {
    return defaultBufferBytes.exchange(std::max<std::size_t>(bytes, 1));
}

void utl_Stream::Flush() {
    const auto pending = static_cast<std::size_t>(current_ - buffer_.get());
    if (pending == 0) return;
    const Tail tail = TailOf(buffer_.get(), current_);
    carriedColumn_ = tail.hasNewline ? tail.bytes : carriedColumn_ + tail.bytes;
    current_ = buffer_.get();
    device_.Write(current_, pending);
}

void utl_Stream::AppendLong(const char* text, std::size_t bytes) {
    if (bytes < static_cast<std::size_t>(limit_ - current_)) {
        std::memcpy(current_, text, bytes);
        current_ += bytes;
        return;
    }
    Flush();
    const Tail tail = TailOf(text, text + bytes);
    carriedColumn_ = tail.hasNewline ? tail.bytes : carriedColumn_ + tail.bytes;
    device_.Write(text, bytes);
}

void utl_Stream::MakeRoom(std::size_t bytes) {
    if (bytes <= static_cast<std::size_t>(limit_ - current_) + kSlack) return;
    Flush();
    if (bytes <= bufferBytes_ + kSlack) return;
    buffer_.reset(new char[bytes + kSlack]);
    bufferBytes_ = bytes;
    current_ = buffer_.get();
    limit_ = current_ + bytes;
}

bool utl_Stream::IsPastLimit() const {
    const auto limit = static_cast<std::ptrdiff_t>(lineLimit_);
    const std::ptrdiff_t pending = current_ - buffer_.get();
    const char* earliest = current_ - std::min(pending, limit + 1);
    const Tail tail = TailOf(earliest, current_);
    if (tail.hasNewline) return false;
    const std::size_t column = tail.bytes + (earliest == buffer_.get() ? carriedColumn_ : 0);
    return column > static_cast<std::size_t>(lineLimit_);
}
