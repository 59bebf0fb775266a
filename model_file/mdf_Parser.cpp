#include "model_file/mdf_Parser.h"

#include "foundation/thr_Poll.h"
#include "foundation/thr_Progress.h"
#include "model_file/mdf_BulkReader.h"
#include "model_file/mdf_Locate.h"
#include "model_file/mdf_Token.h"
#include "model_file/mdf_TreeBuilder.h"
#include "model_file/mdf_Utf8.h"
#include "platform/plt_Files.h"

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <filesystem>
#include <memory>
#include <system_error>
#include <utility>

namespace {

constexpr std::size_t kFewNumbers = 4096;
constexpr std::size_t kLongestTail = 40;
constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";

constexpr const char* kValue = "a value";
constexpr const char* kName = "a member name in double quotes";
constexpr const char* kNoComma = "no comma behind the last one";

/// How many numbers follow in an array of numbers, or with `depth` 1 in one of rows, of which one is open; as
/// many as are seen where other things are met. Counting makes the array's memory once, at its final size.
std::size_t NumbersAhead(const char* at, const char* end, int depth) {
    std::size_t commas = 0;
    for (; at != end; ++at) {
        const char c = *at;
        if (c == ',') {
            ++commas;
        } else if (c == '[') {
            ++depth;
        } else if (c == ']') {
            if (--depth < 0) break;
        } else if (c == '"' || c == '/' || c == '{') {
            break;
        }
    }
    return commas + 1;
}

/// Goes through a document once, from token to token.
class DocumentReader {
public:
    DocumentReader(std::string_view text, mdf_Value& root, std::vector<fnd_Finding>& errors,
                   thr_Progress* progress)
        : begin_(text.data()), at_(begin_), end_(begin_ + text.size()), builder_(root), errors_(errors),
          progress_(progress) {}

    /// False after an error of syntax.
    bool Read();

private:
    /// What comes next.
    enum class Next { VALUE, NAME, BEHIND_VALUE };

    bool ReadValue();
    bool ReadName();
    bool ReadBehindValue();
    bool ReadNumber();
    bool ReadNumbers(mdf_Numbers& numbers, int depth);
    bool ReadRows(mdf_Rows& rows);
    bool ReadLiteral(std::string_view literal);
    bool ReadString(std::string_view& text);
    bool OpenObject();
    void CloseObject();
    bool OpenArray();
    bool MayNest();
    bool MayReadInBulk(const mdf_Numbers& numbers, std::size_t more);
    bool Add(mdf_Numbers& numbers, const mdf_Number& number, int depth);
    bool Fail(const char* begin, const char* expected);
    void SyntaxError(std::size_t offset, std::string text);

    void Skip();
    bool Passes(char sign);
    char Peek() const { return at_ != end_ ? *at_ : '\0'; }
    bool IsAtNumber() const { return at_ != end_ && mdf_BeginsNumber(*at_); }
    std::string_view Text() const { return {begin_, static_cast<std::size_t>(end_ - begin_)}; }
    std::size_t OffsetOf(const char* at) const { return static_cast<std::size_t>(at - begin_); }

    const char* begin_;
    const char* at_;
    const char* end_;
    mdf_Builder builder_;
    std::vector<fnd_Finding>& errors_;
    Next next_ = Next::VALUE;
    /// A comma stands ahead of what comes next.
    bool behindComma_ = false;
    /// Where the open objects begin.
    std::vector<std::size_t> objects_;
    /// The text of a string that has escapes or other characters than those of ASCII.
    std::string buffer_;
    /// The numbers that were read in bulk last, and whether they were integers then.
    std::pair<const mdf_Numbers*, bool> triedInBulk_{nullptr, false};
    int threads_ = 0;
    thr_Progress* progress_;
};

bool DocumentReader::Read() {
    if (Text().starts_with(kByteOrderMark)) at_ += kByteOrderMark.size();
    bool good = true;
    while (good) {
        Skip();
        switch (next_) {
        case Next::VALUE: good = ReadValue(); break;
        case Next::NAME: good = ReadName(); break;
        case Next::BEHIND_VALUE:
            if (builder_.Depth() > 0) {
                good = ReadBehindValue();
            } else if (at_ == end_) {
                return true;
            } else {
                good = Fail(at_, "the end of the file");
            }
            break;
        }
    }
    return false;
}

/// Passes over blanks and comments. What can't be passed over, such as a comment that isn't closed, is a
/// token that stands in the wrong place.
inline void DocumentReader::Skip() {
    while (at_ != end_ && mdf_IsBlank(*at_)) ++at_;
    if (at_ == end_ || *at_ != '/') return;
    const std::size_t from = OffsetOf(at_);
    const std::size_t to = mdf_SkipBlanksAndComments(Text(), from);
    const std::size_t nul = Text().substr(0, to).find('\0', from);
    at_ = begin_ + (nul == std::string_view::npos ? to : nul);
}

/// Passes over the sign and what is behind it that is no token.
inline bool DocumentReader::Passes(char sign) {
    if (Peek() != sign || at_ == end_) return false;
    ++at_;
    Skip();
    return true;
}

bool DocumentReader::ReadValue() {
    switch (Peek()) {
    case '[':
        if (mdf_Rows* rows = builder_.OpenRows()) return ReadRows(*rows);
        return OpenArray();
    case '{': return OpenObject();
    case '"': {
        std::string_view text;
        if (!ReadString(text)) return false;
        builder_.String(text);
        next_ = Next::BEHIND_VALUE;
        return true;
    }
    case 't': return ReadLiteral("true");
    case 'f': return ReadLiteral("false");
    case 'n': return ReadLiteral("null");
    default:
        if (IsAtNumber()) return ReadNumber();
        return Fail(at_, behindComma_ && Peek() == ']' ? kNoComma : kValue);
    }
}

bool DocumentReader::ReadName() {
    if (Peek() != '"') return Fail(at_, behindComma_ && Peek() == '}' ? kNoComma : kName);
    std::string_view name;
    if (!ReadString(name)) return false;
    builder_.Key(name);
    if (progress_ != nullptr) progress_->Set(at_ - begin_);
    Skip();
    if (!Passes(':')) return Fail(at_, "':'");
    behindComma_ = false;
    next_ = Next::VALUE;
    return true;
}

bool DocumentReader::ReadBehindValue() {
    const bool inObject = builder_.IsInObject();
    if (Passes(',')) {
        behindComma_ = true;
        next_ = inObject ? Next::NAME : Next::VALUE;
    } else if (inObject && Peek() == '}') {
        CloseObject();
    } else if (!inObject && Peek() == ']') {
        ++at_;
        builder_.EndArray();
    } else {
        return Fail(at_, inObject ? "',' or '}'" : "',' or ']'");
    }
    return true;
}

bool DocumentReader::MayNest() {
    thr_Poll::Now();
    if (builder_.Depth() < static_cast<std::size_t>(mdf_maxDepth)) return true;
    SyntaxError(OffsetOf(at_),
                "arrays and objects are nested deeper than " + std::to_string(mdf_maxDepth) + " levels");
    return false;
}

bool DocumentReader::OpenObject() {
    if (!MayNest()) return false;
    objects_.push_back(OffsetOf(at_));
    builder_.BeginObject();
    ++at_;
    Skip();
    behindComma_ = false;
    next_ = Next::NAME;
    if (Peek() == '}') CloseObject();
    return true;
}

void DocumentReader::CloseObject() {
    ++at_;
    std::string pointer;
    const std::vector<std::string> repeated = builder_.EndObject(pointer);
    next_ = Next::BEHIND_VALUE;
    const std::size_t object = objects_.back();
    objects_.pop_back();
    if (repeated.empty() || errors_.size() >= mdf_maxErrors) return;
    const std::vector<std::size_t> offsets = mdf_RepeatedMembers(Text().substr(0, OffsetOf(at_)), object);
    for (std::size_t i = 0; i < repeated.size() && errors_.size() < mdf_maxErrors; ++i) {
        fnd_Finding& error = errors_.emplace_back(fnd_Make(
            "duplicate-member", pointer,
            "the member " + mdf_QuotedToken(repeated[i]) + " stands more than once", "names that differ"));
        fnd_AppendPointer(error.place, repeated[i]);
        mdf_PutPosition(error, Text(), offsets[i]);
    }
}

bool DocumentReader::OpenArray() {
    if (!MayNest()) return false;
    builder_.BeginArray();
    ++at_;
    Skip();
    behindComma_ = false;
    next_ = Next::VALUE;
    if (Peek() != ']') return true;
    ++at_;
    builder_.EndArray();
    next_ = Next::BEHIND_VALUE;
    return true;
}

bool DocumentReader::ReadNumber() {
    if (mdf_Numbers* numbers = builder_.OpenNumbers())
        return ReadNumbers(*numbers, builder_.IsInRow() ? 1 : 0);
    const mdf_Number number = mdf_ReadNumber(at_, end_);
    if (number.kind >= mdf_Number::Kind::BROKEN) return Fail(at_, kValue);
    builder_.Number(number);
    at_ = number.end;
    next_ = Next::BEHIND_VALUE;
    return true;
}

/// Whether so many numbers have no room left that it pays to look how many follow. In one array that is done
/// once for integers and once for reals.
inline bool DocumentReader::MayReadInBulk(const mdf_Numbers& numbers, std::size_t more) {
    if (numbers.HasRoomFor(more) || numbers.Size() < kFewNumbers) return false;
    const std::pair key(&numbers, numbers.allInts);
    return std::exchange(triedInBulk_, key) != key;
}

/// Adds a number that begins here; false, with the error told, when it is none.
inline bool DocumentReader::Add(mdf_Numbers& numbers, const mdf_Number& number, int depth) {
    // Later than reading in bulk is thought of, which is between two rows.
    if (numbers.Full() && numbers.Size() >= 4 * kFewNumbers) [[unlikely]]
        numbers.Reserve(numbers.Size() + NumbersAhead(at_, end_, depth));
    if (number.kind == mdf_Number::Kind::INT) {
        numbers.AddInt(number.whole);
    } else if (number.kind < mdf_Number::Kind::BROKEN) {
        numbers.AddReal(number.value, number.kind == mdf_Number::Kind::LARGE);
    } else {
        return Fail(at_, kValue);
    }
    at_ = number.end;
    return true;
}

/// Reads on as long as numbers follow one another.
bool DocumentReader::ReadNumbers(mdf_Numbers& numbers, int depth) {
    do {
        if (depth == 0 && MayReadInBulk(numbers, 1)) {
            behindComma_ = !mdf_BulkReader(at_, end_, threads_, progress_).ReadNumbers(numbers);
            if (!behindComma_ || !IsAtNumber()) break;
        }
        if (!Add(numbers, mdf_ReadNumber(at_, end_), depth)) return false;
        Skip();
        behindComma_ = Passes(',');
    } while (behindComma_ && IsAtNumber());
    next_ = behindComma_ ? Next::VALUE : Next::BEHIND_VALUE;
    return true;
}

/// Reads on as long as rows of numbers follow one another. Where anything else is met, the row in which that
/// is stays open.
bool DocumentReader::ReadRows(mdf_Rows& rows) {
    if (!MayNest()) return false;
    do {
        if (rows.ends.empty() && rows.length > 0 && MayReadInBulk(rows.numbers, rows.length)) {
            behindComma_ = !mdf_BulkReader(at_, end_, threads_, progress_).ReadRows(rows);
            if (!behindComma_ || Peek() != '[') break;
        }
        builder_.BeginRow(rows);
        ++at_;
        Skip();
        if (IsAtNumber()) {
            if (!ReadNumbers(rows.numbers, 1)) return false;
            if (behindComma_ || Peek() != ']') return true;
        } else if (Peek() != ']') {
            behindComma_ = false;
            next_ = Next::VALUE;
            return true;
        }
        ++at_;
        rows.CloseRow();
        builder_.ForgetRow();
        Skip();
        behindComma_ = Passes(',');
    } while (behindComma_ && Peek() == '[');
    next_ = behindComma_ ? Next::VALUE : Next::BEHIND_VALUE;
    return true;
}

bool DocumentReader::ReadLiteral(std::string_view literal) {
    if (!Text().substr(OffsetOf(at_)).starts_with(literal)) return Fail(at_, kValue);
    at_ += literal.size();
    if (literal == "null")
        builder_.Null();
    else
        builder_.Bool(literal == "true");
    next_ = Next::BEHIND_VALUE;
    return true;
}

/// The text of a string, which may lie in the document or in the buffer.
bool DocumentReader::ReadString(std::string_view& text) {
    const auto isPlain = [](char c) {
        return c != '"' && c != '\\' && static_cast<unsigned char>(c) >= 0x20 &&
               static_cast<unsigned char>(c) < 0x80;
    };
    const char* const begin = at_;
    const char* at = begin + 1;
    while (at != end_ && isPlain(*at)) ++at;
    if (at != end_ && *at == '"') {
        text = {begin + 1, static_cast<std::size_t>(at - begin - 1)};
        at_ = at + 1;
        return true;
    }
    buffer_.assign(begin + 1, at);
    while (at != end_ && *at != '"') {
        const std::string_view rest(at, static_cast<std::size_t>(end_ - at));
        std::size_t length = 0;
        if (*at == '\\') {
            length = mdf_ReadEscape(rest, buffer_);
        } else if (static_cast<unsigned char>(*at) >= 0x20) {
            length = mdf_Utf8Length(rest);
            buffer_.append(at, length);
        }
        if (length == 0) return Fail(begin, kValue);
        at += length;
    }
    if (at == end_) return Fail(begin, kValue);
    text = buffer_;
    at_ = at + 1;
    return true;
}

/// Tells of the token that begins here and can't stand here, or is none.
bool DocumentReader::Fail(const char* begin, const char* expected) {
    const std::string_view text = Text();
    const std::size_t offset = OffsetOf(begin);
    const std::size_t end = mdf_EndOfToken(text, offset);
    const mdf_TokenProblem problem = mdf_ProblemOf(text, offset, end);
    const std::string_view seen = offset >= text.size() ? std::string_view() : mdf_TokenAt(text, offset, end);
    const std::size_t nul = begin == end_ || *begin == '"'
                                ? std::string_view::npos
                                : text.substr(0, std::max(end, offset + seen.size())).find('\0', offset);
    if (nul != std::string_view::npos) {
        SyntaxError(nul, "found a NUL byte, expected text");
        return false;
    }
    const std::string token = seen.empty() ? std::string("the end of the file") : mdf_QuotedToken(seen);
    std::string words = problem.reason.empty() ? std::string() : problem.reason + "; ";
    if (problem.insideString) {
        const std::string_view tail = mdf_Utf8End(text.substr(offset, end - offset), kLongestTail);
        SyntaxError(end - 1, words + "found " + mdf_QuotedToken(tail));
    } else if (problem.reason.empty() && expected == kValue && IsAtNumber()) {
        SyntaxError(offset, "the number " + token + " is beyond the range of double precision");
    } else {
        words += "found " + token;
        if (problem.isOfAnyKind) words.append(", expected ").append(expected);
        SyntaxError(offset, std::move(words));
    }
    return false;
}

void DocumentReader::SyntaxError(std::size_t offset, std::string text) {
    mdf_PutPosition(errors_.emplace_back(fnd_Make("syntax", {}, std::move(text))), Text(), offset);
}

} // namespace

bool mdf_Parse(std::string_view text, mdf_Value& root, std::vector<fnd_Finding>& errors,
               thr_Progress* progress) {
    const std::size_t errorsBefore = errors.size();
    root = mdf_Value();
    if (progress != nullptr) progress->Begin(static_cast<long long>(text.size()));
    if (!DocumentReader(text, root, errors, progress).Read()) root = mdf_Value();
    return errors.size() == errorsBefore;
}

bool mdf_ReadFile(const std::string& path, std::string& text, fnd_Finding& error) {
    const auto fail = [&](int number) {
        text.clear();
        error = fnd_Make("unreadable-file", {},
                         std::string("the file can't be read: ") + std::generic_category().message(number));
        return false;
    };
    errno = 0;
    std::FILE* opened = nullptr;
    do {
        errno = 0;
        opened = plt_OpenStream(path.c_str(), "rb");
    } while (opened == nullptr && errno == EINTR);
    const std::unique_ptr<std::FILE, int (*)(std::FILE*)> file(opened, std::fclose);
    if (!file) return fail(errno);
    std::setvbuf(file.get(), nullptr, _IONBF, 0);
    std::error_code unknown;
    const std::uintmax_t size = std::filesystem::file_size(plt_Path(path), unknown);
    // One byte more finds the end in the same read; pipes, of unknown size, take further rounds.
    text.resize(unknown ? 1 : static_cast<std::size_t>(size) + 1);
    std::size_t length = 0;
    while (true) {
        errno = 0;
        length += std::fread(text.data() + length, 1, text.size() - length, file.get());
        if (std::ferror(file.get()) != 0) {
            if (errno != EINTR) return fail(errno);
            std::clearerr(file.get());
            continue;
        }
        if (length < text.size()) break;
        text.resize(2 * text.size() + 4096);
    }
    text.resize(length);
    return true;
}
