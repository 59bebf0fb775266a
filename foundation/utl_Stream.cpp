#include "foundation/utl_Stream.h"

#include "foundation/thr_InOrder.h"

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
    NoteColumn(buffer_.get(), pending);
    current_ = buffer_.get();
    device_.Write(current_, pending);
}

/// Where the text that the device gets leaves the current line.
void utl_Stream::NoteColumn(const char* text, std::size_t bytes) {
    const Tail tail = TailOf(text, text + bytes);
    carriedColumn_ = tail.hasNewline ? tail.bytes : carriedColumn_ + tail.bytes;
}

void utl_Stream::PrintItems(std::size_t count, std::size_t room, const LayOut& layOut) {
    // Blocks stay in a core's cache, and fewer than a few of them are not worth a thread.
    constexpr std::size_t blockBytes = std::size_t{1} << 20;
    const std::size_t itemsOfBlock = std::max<std::size_t>(blockBytes / room, 1);
    if (count >= 8 * itemsOfBlock && thr_NumThreads(threads_) > 1) {
        Flush();
        const thr_TextBlocks blocks{(count - 1) / itemsOfBlock + 1, itemsOfBlock * room};
        blocks.Run(
            threads_,
            [&](std::size_t block, char* out) {
                return layOut(block * itemsOfBlock, std::min((block + 1) * itemsOfBlock, count), out);
            },
            [this](const char* text, std::size_t bytes) {
                NoteColumn(text, bytes);
                device_.Write(text, bytes);
            });
        return;
    }
    for (std::size_t begin = 0; begin < count;) {
        char* out = Reserve(room);
        const std::size_t free = static_cast<std::size_t>(limit_ - out) + kSlack;
        const std::size_t end = std::min(count, begin + free / room);
        Commit(layOut(begin, end, out));
        begin = end;
    }
}

void utl_Stream::AppendLong(const char* text, std::size_t bytes) {
    if (bytes < static_cast<std::size_t>(limit_ - current_)) {
        std::memcpy(current_, text, bytes);
        current_ += bytes;
        return;
    }
    Flush();
    NoteColumn(text, bytes);
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
