#ifndef QRX_DECK_READER_DRD_LINESOURCE_H
#define QRX_DECK_READER_DRD_LINESOURCE_H

#include <cstdio>
#include <cstring>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

struct thr_Progress;

/// The lines of one file or text, without their ends: "\n", "\r\n" or "\r". A byte order mark is passed over.
/// A file goes through a buffer of fixed size; a line beyond kLongestLine is cut there, so that no file can
/// fill the memory with one line. At a zero byte, which no text has, the source ends.
class drd_LineSource {
public:
    static constexpr std::size_t kLongestLine = std::size_t{1} << 20;

    /// Takes over an open file; null for no progress.
    explicit drd_LineSource(std::FILE* file, thr_Progress* progress = nullptr);
    explicit drd_LineSource(std::string_view text);

    /// The next line; false behind the last. The line lives until the next call, and the byte behind it is
    /// '\n', '\r' or zero.
    bool Next(std::string_view& line) {
        wasCut_ = false;
        if (isSimple_) [[likely]] {
            const auto rest = static_cast<std::size_t>(end_ - at_);
            const void* newline = std::memchr(at_, '\n', rest);
            const char* ending = static_cast<const char*>(newline);
            if (newline != nullptr && static_cast<std::size_t>(ending - at_) <= kLongestLine) [[likely]] {
                line = {at_, static_cast<std::size_t>(ending - at_)};
                at_ = ending + 1;
                ++line_;
                return true;
            }
        }
        return NextSlowly(line);
    }
    /// The number of the line that Next() gave last.
    long Line() const { return line_; }
    /// The line was longer than kLongestLine.
    bool WasCut() const { return wasCut_; }
    /// Some line near this one has a tab.
    bool MayHaveTabs() const { return hasTabs_; }
    /// The source ended at a byte that no text has.
    bool IsBinary() const { return isBinary_; }
    /// Some line ended with a carriage return alone.
    bool HasLoneReturns() const { return hasLoneReturns_; }
    bool HasFailed() const { return hasFailed_; }

private:
    struct Closer {
        void operator()(std::FILE* file) const { std::fclose(file); }
    };

    bool NextSlowly(std::string_view& line);
    bool CutLine(std::string_view& line);
    /// The end of the line that begins at at_, or null when it isn't in the buffer.
    const char* LineEnd() const;
    void StepOver(const char* ending);
    void Fill();
    void Inspect(char* from);

    std::unique_ptr<std::FILE, Closer> file_;
    thr_Progress* progress_ = nullptr;
    std::vector<char> buffer_;
    std::string cut_;
    const char* at_ = nullptr;
    const char* end_ = nullptr;
    long line_ = 0;
    bool atEnd_ = false;
    bool isSimple_ = false;
    bool hasTabs_ = false;
    bool wasCut_ = false;
    bool isBinary_ = false;
    bool hasLoneReturns_ = false;
    bool hasFailed_ = false;
    bool hasBegun_ = false;
};

#endif
