#ifndef QRX_FOUNDATION_UTL_STREAM_H
#define QRX_FOUNDATION_UTL_STREAM_H

#include "foundation/cow_String.h"
#include "foundation/num_RealText.h"
#include "foundation/qio_Device.h"

#include <cmath>
#include <cstddef>
#include <cstring>
#include <functional>
#include <memory>
#include <string_view>

/// The deck stream: the only way for text into a deck. Text gathers in one buffer and goes on to the device
/// when that is full. No operation reports a failed write; the device knows. Memory is taken when the stream
/// is made, and later only for a Reserve beyond kSlack.
class utl_Stream {
public:
    /// Bytes that every item finds free behind the buffer.
    static constexpr std::size_t kSlack = 512;

    /// Opens the stream on a device, which must outlive it. A line is past its limit when it holds more than
    /// `lineLimit` bytes; the precisions are those of `<<`, in significant digits. The buffer is handed on
    /// once `bufferBytes` stand in it (1 or more; 0 is the default size).
    utl_Stream(qio_ostream& device, int lineLimit, int doublePrecision, int floatPrecision,
               std::size_t bufferBytes = 0);
    utl_Stream(const utl_Stream&) = delete;
    utl_Stream& operator=(const utl_Stream&) = delete;
    /// Flushes. An exception of the device ends here; call Flush() before to see it.
    ~utl_Stream();

    /// The default buffer size of streams made from now on; returns the one before.
    static std::size_t SetDefaultBufferSize(std::size_t bytes);

    /// Ends the line; on an empty line that makes a blank one.
    void LineBreak() { Commit((*current_ = '\n', current_ + 1)); }
    /// Ends the line if it is past the limit.
    void OptionalLineBreak() {
        if (IsPastLimit()) LineBreak();
    }

    /// Appends the text as it stands; null appends nothing.
    void Print(const char* text) {
        if (text != nullptr) Append(text, std::strlen(text));
    }
    void Print(const cow_String& text) { Append(text.CStr(), static_cast<std::size_t>(text.Length())); }
    /// Appends the decimal digits, right-aligned in `width`; a wider number is not cut.
    void Print(int value, int width) { Commit(num_WriteInt(Reserve(num_IntRoom(width)), value, width)); }
    /// Appends the value in the deck's real form (num_WriteReal), zero if it is a small real.
    void Print(double value, int width, int precision) {
        if (std::fabs(value) < smallReal_) value = 0.0;
        Commit(num_WriteReal(Reserve(num_RealRoom(width, precision)), value, width, precision));
    }
    void Print(float value, int width, int precision) { Print(static_cast<double>(value), width, precision); }

    /// Room for `bytes` right in the buffer, for writers that lay out whole lines. What was written counts
    /// once Commit() has been told its end; any other operation in between gives the room up.
    char* Reserve(std::size_t bytes) {
        if (bytes > kSlack) [[unlikely]]
            MakeRoom(bytes);
        return current_;
    }
    void Commit(char* end) {
        current_ = end;
        if (current_ >= limit_) [[unlikely]]
            Flush();
    }

    /// Lays out the items from `begin` to before `end` at `out` and gives the end of the text. Reads only, as
    /// several threads may call it at once.
    using LayOut = std::function<char*(std::size_t begin, std::size_t end, char* out)>;
    /// Prints `count` items, none of which needs more than `room` bytes. Many of them are laid out by several
    /// threads; the device gets their text from this one, in order.
    void PrintItems(std::size_t count, std::size_t room, const LayOut& layOut);
    /// How many threads PrintItems() may use; 0, as at first, stands for the process's usual number.
    void SetThreads(int threads) { threads_ = threads; }
    int Threads() const { return threads_; }

    /// Passes all pending text on to the device.
    void Flush();

    int DoublePrecision() const { return doublePrecision_; }
    int FloatPrecision() const { return floatPrecision_; }
    /// Magnitudes below this are written as zero.
    double SmallReal() const { return smallReal_; }

    /// num_FixNumericString.
    static void FixNumericString(char* text, int width) { num_FixNumericString(text, width); }

private:
    friend class utl_StreamSmallReal;

    void Append(const char* text, std::size_t bytes) {
        if (bytes <= kSlack) [[likely]] {
            std::memcpy(current_, text, bytes);
            Commit(current_ + bytes);
        } else {
            AppendLong(text, bytes);
        }
    }
    void AppendLong(const char* text, std::size_t bytes);
    void MakeRoom(std::size_t bytes);
    void NoteColumn(const char* text, std::size_t bytes);
    bool IsPastLimit() const;

    // Between operations current_ < limit_, and kSlack bytes stand behind limit_.
    char* current_ = nullptr;
    char* limit_ = nullptr;
    double smallReal_ = 0.0;
    qio_ostream& device_;
    std::unique_ptr<char[]> buffer_;
    std::size_t bufferBytes_;
    std::size_t carriedColumn_ = 0; // bytes of the current line that the device already has
    int lineLimit_;
    int doublePrecision_;
    int floatPrecision_;
    int threads_ = 0;
};

inline utl_Stream& operator<<(utl_Stream& stream, const char* text) {
    stream.Print(text);
    return stream;
}
inline utl_Stream& operator<<(utl_Stream& stream, const cow_String& text) {
    stream.Print(text);
    return stream;
}
inline utl_Stream& operator<<(utl_Stream& stream, int value) {
    stream.Print(value, 0);
    return stream;
}
inline utl_Stream& operator<<(utl_Stream& stream, double value) {
    stream.Print(value, 0, stream.DoublePrecision());
    return stream;
}
inline utl_Stream& operator<<(utl_Stream& stream, float value) {
    stream.Print(value, 0, stream.FloatPrecision());
    return stream;
}
inline utl_Stream& operator<<(utl_Stream& stream, utl_Stream& (*manipulator)(utl_Stream&)) {
    return manipulator(stream);
}
/// A character or truth value would go out as its number.
utl_Stream& operator<<(utl_Stream&, char) = delete;
utl_Stream& operator<<(utl_Stream&, bool) = delete;

/// Ends the current line.
inline utl_Stream& endl(utl_Stream& stream) {
    stream.LineBreak();
    return stream;
}

/// While it lives, reals of a magnitude below `smallReal` are written as zero ("0.", without a sign). Guards
/// nest: each puts back the value that it found. 0.0 filters nothing.
class utl_StreamSmallReal {
public:
    utl_StreamSmallReal(utl_Stream& stream, double smallReal) : stream_(stream), former_(stream.smallReal_) {
        stream.smallReal_ = smallReal;
    }
    utl_StreamSmallReal(const utl_StreamSmallReal&) = delete;
    utl_StreamSmallReal& operator=(const utl_StreamSmallReal&) = delete;
    ~utl_StreamSmallReal() { stream_.smallReal_ = former_; }

private:
    utl_Stream& stream_;
    double former_;
};

#endif
