#include "model_file/mdf_Parser.h"

#include "model_file/mdf_Token.h"
#include "model_file/mdf_Utf8.h"
#include "model_file/mdf_ValueData.h"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <cerrno>
#include <cstdint>
#include <cstdio>
#include <filesystem>
#include <iterator>
#include <limits>
#include <memory>
#include <system_error>
#include <utility>

/// How far the lexer has read.
struct mdf_Cursor {
    const char* begin;
    const char* at;
    const char* end;
};

namespace {

/// All copies step along one cursor, which thus tells where the lexer is.
class CursorIterator {
public:
    using iterator_category = std::input_iterator_tag;
    using value_type = char;
    using difference_type = std::ptrdiff_t;
    using pointer = const char*;
    using reference = const char&;

    /// Without a cursor: the end.
    explicit CursorIterator(mdf_Cursor* cursor) : cursor_(cursor) {}
    reference operator*() const { return *cursor_->at; }
    CursorIterator& operator++() {
        ++cursor_->at;
        return *this;
    }
    CursorIterator operator++(int) {
        ++cursor_->at;
        return *this;
    }
    bool operator==(const CursorIterator& other) const { return AtEnd() == other.AtEnd(); }
    bool operator!=(const CursorIterator& other) const { return !(*this == other); }

private:
    bool AtEnd() const { return cursor_ == nullptr || cursor_->at == cursor_->end; }

    mdf_Cursor* cursor_;
};

constexpr const char* foundNul = "found a NUL byte, expected text";
constexpr std::size_t kLongestTail = 40;
constexpr std::string_view byteOrderMark = "\xEF\xBB\xBF";

bool WrittenAsInteger(std::string_view number) {
    return number.find_first_not_of("-0123456789") == std::string_view::npos;
}

} // namespace

/// Makes the tree from the library's events.
class mdf_Builder {
public:
    mdf_Builder(mdf_Cursor& cursor, mdf_Value& root, std::vector<fnd_Finding>& errors)
        : cursor_(cursor), root_(root), errors_(errors) {}

    bool null() { return Other(mdf_Value()); }
    bool boolean(bool value) { return Other(mdf_Value(value)); }
    bool number_integer(std::int64_t value) {
        if (value < std::numeric_limits<int>::min() || value > std::numeric_limits<int>::max())
            return Real(static_cast<double>(value), true);
        return Int(static_cast<int>(value));
    }
    bool number_unsigned(std::uint64_t value) {
        if (value > static_cast<std::uint64_t>(std::numeric_limits<int>::max()))
            return Real(static_cast<double>(value), true);
        return Int(static_cast<int>(value));
    }
    bool number_float(double value, const std::string& text) { return Real(value, WrittenAsInteger(text)); }
    bool string(std::string& text);
    bool binary(nlohmann::json::binary_t&) { return false; }
    bool start_object(std::size_t);
    bool key(std::string& name);
    bool end_object();
    bool start_array(std::size_t);
    bool end_array();
    bool parse_error(std::size_t position, const std::string& token,
                     const nlohmann::detail::exception& failure);

    void SyntaxError(std::size_t offset, std::string text);
    std::size_t Offset() const { return static_cast<std::size_t>(cursor_.at - cursor_.begin); }

private:
    enum class Event { Start, BeginObject, Key, BeginArray, Number, Value };

    bool Int(int value);
    bool Real(double value, bool isLarge);
    bool Other(mdf_Value value);
    void Place(mdf_Value value);
    mdf_Numbers* OpenNumbers();
    void MakeRoom(mdf_Numbers& numbers) const;
    bool AddFacetName(const std::string& text);
    void DemoteRow();
    bool MayNest();
    void Note(Event event);
    std::size_t EndOfNumber() const;
    std::size_t FindToken(const char*& expected) const;
    mdf_Value& Top() { return frames_.back(); }

    std::string_view Text() const {
        return {cursor_.begin, static_cast<std::size_t>(cursor_.end - cursor_.begin)};
    }

    mdf_Cursor& cursor_;
    mdf_Value& root_;
    std::vector<fnd_Finding>& errors_;
    /// The arrays and objects that are open, outermost first; the last member of an open object is the one
    /// whose value is being read.
    std::vector<mdf_Value> frames_;
    /// The innermost open array is a row, and its items go straight into the Matrix or FacetArray on top.
    bool rowOpen_ = false;
    std::size_t rowBegin_ = 0;
    /// The last event, and where the lexer was after it.
    Event lastEvent_ = Event::Start;
    std::size_t lastOffset_ = 0;
};

/// The numbers of the row or array that is open, with room for one more; null when it holds other things.
mdf_Numbers* mdf_Builder::OpenNumbers() {
    if (frames_.empty()) return nullptr;
    mdf_Value& top = Top();
    mdf_Numbers* numbers = rowOpen_ ? &top.As<mdf_Rows>()->numbers : top.As<mdf_Numbers>();
    if (numbers != nullptr) MakeRoom(*numbers);
    return numbers;
}

void mdf_Builder::MakeRoom(mdf_Numbers& numbers) const {
    constexpr std::size_t small = 4096;
    const std::size_t size = numbers.Size();
    if (size < small || !numbers.Full()) return;
    // Counting the commas ahead makes the array's memory once, at its final size.
    std::size_t ahead = 1;
    int depth = rowOpen_ ? 1 : 0;
    const char* at = cursor_.at - 1;
    for (; at != cursor_.end; ++at) {
        if (*at == '"' || *at == '/' || *at == '{') break;
        if (*at == ',') ++ahead;
        if (*at == '[') ++depth;
        if (*at == ']' && --depth < 0) break;
    }
    const bool counted = depth < 0;
    numbers.Reserve(size + (counted ? ahead : std::max(ahead, size)));
}

bool mdf_Builder::Int(int value) {
    Note(Event::Number);
    mdf_Facets* facets = rowOpen_ ? Top().As<mdf_Facets>() : nullptr;
    if (facets != nullptr) {
        std::vector<int>& pairs = facets->pairs;
        if (pairs.size() - rowBegin_ < 2) {
            pairs.push_back(value);
            return true;
        }
        DemoteRow();
    }
    if (mdf_Numbers* numbers = OpenNumbers())
        numbers->AddInt(value);
    else
        Place(mdf_Value(value));
    return true;
}

bool mdf_Builder::Real(double value, bool isLarge) {
    Note(Event::Number);
    if (rowOpen_ && Top().As<mdf_Facets>() != nullptr) DemoteRow();
    if (mdf_Numbers* numbers = OpenNumbers()) {
        numbers->AddReal(value, isLarge);
    } else {
        Place(isLarge ? mdf_Value(mdf_Value::Data(mdf_Value::Large{value})) : mdf_Value(value));
    }
    return true;
}

bool mdf_Builder::string(std::string& text) {
    if (rowOpen_ && AddFacetName(text)) {
        Note(Event::Value);
        return true;
    }
    // The lexer's buffer is copied, not taken: it has the capacity of the longest text so far.
    return Other(mdf_Value(std::string_view(text)));
}

bool mdf_Builder::AddFacetName(const std::string& text) {
    mdf_Value& top = Top();
    if (mdf_Rows* rows = top.As<mdf_Rows>()) {
        const bool pairsSoFar =
            rows->numbers.allInts && rows->ends.empty() && (rows->count == 0 || rows->length == 2);
        if (!pairsSoFar || rows->numbers.Size() - rowBegin_ != 1) return false;
        mdf_Facets facets;
        facets.pairs = std::move(rows->numbers.ints);
        top = mdf_Value::Of(std::move(facets));
    } else if (top.As<mdf_Facets>()->pairs.size() - rowBegin_ != 1) {
        return false;
    }
    top.As<mdf_Facets>()->AddName(text);
    return true;
}

/// Makes the array on top general, and the row that is open an array of its own on top of it.
void mdf_Builder::DemoteRow() {
    mdf_Value& top = Top();
    mdf_Value row;
    if (mdf_Rows* rows = top.As<mdf_Rows>()) {
        mdf_Numbers& numbers = rows->numbers;
        row = numbers.Slice(rowBegin_, numbers.Size());
        numbers.Truncate(rowBegin_);
    } else {
        mdf_Facets& facets = *top.As<mdf_Facets>();
        const std::size_t filled = facets.pairs.size() - rowBegin_;
        if (filled == 2) {
            row = top.Item(facets.Count() - 1);
        } else {
            mdf_Numbers label;
            if (filled == 1) label.AddInt(facets.pairs.back());
            row = label.Slice(0, filled);
        }
        facets.pairs.resize(rowBegin_);
    }
    top.Generalise();
    frames_.push_back(std::move(row));
    rowOpen_ = false;
}

bool mdf_Builder::Other(mdf_Value value) {
    Note(Event::Value);
    if (rowOpen_) DemoteRow();
    Place(std::move(value));
    return true;
}

void mdf_Builder::Place(mdf_Value value) {
    if (frames_.empty()) {
        root_ = std::move(value);
        return;
    }
    mdf_Value& top = Top();
    if (mdf_ObjectData* object = top.As<mdf_ObjectData>()) {
        object->members.back().value = std::move(value);
        return;
    }
    top.Generalise();
    top.Items().push_back(std::move(value));
}

bool mdf_Builder::MayNest() {
    const std::size_t depth = frames_.size() + (rowOpen_ ? 1 : 0);
    if (depth < static_cast<std::size_t>(mdf_maxDepth)) return true;
    SyntaxError(Offset() - 1,
                "arrays and objects are nested deeper than " + std::to_string(mdf_maxDepth) + " levels");
    return false;
}

bool mdf_Builder::start_object(std::size_t) {
    Note(Event::BeginObject);
    if (!MayNest()) return false;
    if (rowOpen_) DemoteRow();
    frames_.push_back(mdf_Value::Of(mdf_ObjectData()));
    return true;
}

bool mdf_Builder::key(std::string& name) {
    Note(Event::Key);
    Top().As<mdf_ObjectData>()->members.push_back({name, mdf_Value()});
    return true;
}

bool mdf_Builder::end_object() {
    std::vector<std::string> repeated = Top().As<mdf_ObjectData>()->Index();
    mdf_Value object = std::move(Top());
    frames_.pop_back();
    if (!repeated.empty()) {
        std::string pointer;
        for (const mdf_Value& frame : frames_) {
            if (frame.IsObject())
                fnd_AppendPointer(pointer, frame.Members().back().name);
            else
                fnd_AppendPointer(pointer, std::to_string(frame.Size()));
        }
        for (const std::string& name : repeated) {
            if (errors_.size() >= mdf_maxErrors) break;
            fnd_Finding& error = errors_.emplace_back(fnd_Make(
                "duplicate-member", pointer, "the member " + mdf_QuotedToken(name) + " stands more than once",
                "names that differ"));
            fnd_AppendPointer(error.place, name);
        }
    }
    return Other(std::move(object));
}

bool mdf_Builder::start_array(std::size_t) {
    Note(Event::BeginArray);
    if (!MayNest()) return false;
    if (rowOpen_) DemoteRow();
    if (!frames_.empty()) {
        mdf_Value& top = Top();
        const mdf_Numbers* numbers = top.As<mdf_Numbers>();
        if (numbers != nullptr && numbers->Size() == 0) top = mdf_Value::Of(mdf_Rows());
        const mdf_Rows* rows = top.As<mdf_Rows>();
        const mdf_Facets* facets = top.As<mdf_Facets>();
        rowOpen_ = rows != nullptr || facets != nullptr;
        if (rowOpen_) {
            rowBegin_ = rows != nullptr ? rows->numbers.Size() : facets->pairs.size();
            return true;
        }
    }
    frames_.push_back(mdf_Value::Of(mdf_Numbers()));
    return true;
}

bool mdf_Builder::end_array() {
    Note(Event::Value);
    mdf_Rows* rows = rowOpen_ ? Top().As<mdf_Rows>() : nullptr;
    if (rows != nullptr) {
        rows->CloseRow();
        rowOpen_ = false;
        return true;
    }
    if (rowOpen_ && Top().As<mdf_Facets>()->pairs.size() - rowBegin_ == 2) {
        rowOpen_ = false;
        return true;
    }
    if (rowOpen_) DemoteRow();
    mdf_Value array = std::move(Top());
    frames_.pop_back();
    return Other(std::move(array));
}

void mdf_Builder::SyntaxError(std::size_t offset, std::string text) {
    const std::string_view before = Text().substr(0, offset);
    fnd_Finding& error = errors_.emplace_back(fnd_Make("syntax", {}, std::move(text)));
    const std::size_t newline = before.rfind('\n');
    std::size_t lineBegin = newline == std::string_view::npos ? 0 : newline + 1;
    if (lineBegin == 0 && before.starts_with(byteOrderMark)) lineBegin = byteOrderMark.size();
    error.line = 1 + static_cast<long>(std::count(before.begin(), before.end(), '\n'));
    error.column = 1 + static_cast<long>(offset - lineBegin);
}

void mdf_Builder::Note(Event event) {
    lastEvent_ = event;
    lastOffset_ = Offset();
}

/// Where the text goes on behind the number that was the last event. The lexer reads one character beyond a
/// number, if there is one.
std::size_t mdf_Builder::EndOfNumber() const {
    const std::string_view text = Text();
    const auto isDigit = [&](std::size_t at) { return text[at] >= '0' && text[at] <= '9'; };
    const std::size_t last = lastOffset_ - 1;
    if (lastOffset_ < text.size() || !isDigit(last)) return last;
    // A digit at the end of the text belongs to the number, unless that is a zero.
    if (last == 0 || text[last - 1] != '0') return lastOffset_;
    std::size_t begin = last - 1;
    while (begin > 0 &&
           (isDigit(begin - 1) || std::string_view("+-.eE").find(text[begin - 1]) != std::string_view::npos))
        --begin;
    const std::string_view number = text.substr(begin, last - begin);
    return number == "0" || number == "-0" ? last : lastOffset_;
}

/// The token that the lexer or the parser stumbled at, and what could have stood there.
std::size_t mdf_Builder::FindToken(const char*& expected) const {
    const std::string_view text = Text();
    std::size_t at = lastEvent_ == Event::Number ? EndOfNumber() : lastOffset_;
    if (at == 0 && text.starts_with(byteOrderMark)) at = byteOrderMark.size();
    at = mdf_SkipBlanksAndComments(text, at);
    const auto passed = [&](char sign) {
        if (at >= text.size() || text[at] != sign) return false;
        at = mdf_SkipBlanksAndComments(text, at + 1);
        return true;
    };
    constexpr const char* aValue = "a value";
    constexpr const char* aName = "a member name in double quotes";
    constexpr const char* noComma = "no comma behind the last one";
    const auto closes = [&](char sign) { return at < text.size() && text[at] == sign; };
    switch (lastEvent_) {
    case Event::Start:
    case Event::BeginArray: expected = aValue; break;
    case Event::BeginObject: expected = aName; break;
    case Event::Key: expected = passed(':') ? aValue : "':'"; break;
    case Event::Number:
    case Event::Value:
        if (frames_.empty()) {
            expected = "the end of the file";
        } else if (!rowOpen_ && frames_.back().IsObject()) {
            expected = !passed(',') ? "',' or '}'" : closes('}') ? noComma : aName;
        } else {
            expected = !passed(',') ? "',' or ']'" : closes(']') ? noComma : aValue;
        }
        break;
    }
    return at;
}

bool mdf_Builder::parse_error(std::size_t, const std::string&, const nlohmann::detail::exception& failure) {
    const std::string_view text = Text();
    const char* expected = "";
    const std::size_t begin = FindToken(expected);
    const mdf_TokenProblem problem = mdf_ProblemOf(text, begin, Offset());
    if (!problem.insideString && Offset() > 0 && text[Offset() - 1] == '\0') {
        SyntaxError(Offset() - 1, foundNul);
        return false;
    }
    const std::string token = begin >= text.size() ? std::string("the end of the file")
                                                   : mdf_QuotedToken(mdf_TokenAt(text, begin, Offset()));
    constexpr int numberOverflow = 406;
    if (failure.id == numberOverflow) {
        SyntaxError(begin, "the number " + token + " is beyond the range of double precision");
        return false;
    }
    std::string words = problem.reason.empty() ? std::string() : problem.reason + "; ";
    if (problem.insideString) {
        const std::string_view tail = mdf_Utf8End(text.substr(begin, Offset() - begin), kLongestTail);
        SyntaxError(Offset() - 1, words + "found " + mdf_QuotedToken(tail));
        return false;
    }
    words += "found " + token;
    if (problem.isOfAnyKind) words.append(", expected ").append(expected);
    SyntaxError(begin, std::move(words));
    return false;
}

bool mdf_Parse(std::string_view text, mdf_Value& root, std::vector<fnd_Finding>& errors) {
    const std::size_t errorsBefore = errors.size();
    root = mdf_Value();
    mdf_Cursor cursor{text.data(), text.data(), text.data() + text.size()};
    mdf_Builder builder(cursor, root, errors);
    bool done = nlohmann::json::sax_parse(CursorIterator(&cursor), CursorIterator(nullptr), &builder,
                                          nlohmann::json::input_format_t::json, true, true);
    // The lexer takes a NUL byte for the end of the text.
    const std::size_t nul = done ? text.find('\0') : std::string_view::npos;
    if (nul != std::string_view::npos) {
        builder.SyntaxError(nul, foundNul);
        done = false;
    }
    if (!done) root = mdf_Value();
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
        opened = std::fopen(path.c_str(), "rb");
    } while (opened == nullptr && errno == EINTR);
    const std::unique_ptr<std::FILE, int (*)(std::FILE*)> file(opened, std::fclose);
    if (!file) return fail(errno);
    std::setvbuf(file.get(), nullptr, _IONBF, 0);
    std::error_code unknown;
    const std::uintmax_t size = std::filesystem::file_size(path, unknown);
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
