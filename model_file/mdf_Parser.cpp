#include "model_file/mdf_Parser.h"

#include "model_file/mdf_ValueData.h"
#include "model_file/mdf_Writer.h"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstdint>
#include <cstdio>
#include <filesystem>
#include <iterator>
#include <limits>
#include <memory>
#include <system_error>
#include <utility>

namespace {

/// How far the lexer has read.
struct Cursor {
    const char* begin;
    const char* at;
    const char* end;
};

/// All copies step along one cursor, which thus tells where the lexer is.
class CursorIterator {
public:
    using iterator_category = std::input_iterator_tag;
    using value_type = char;
    using difference_type = std::ptrdiff_t;
    using pointer = const char*;
    using reference = const char&;

    /// Without a cursor: the end.
    explicit CursorIterator(Cursor* cursor) : cursor_(cursor) {}
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

    Cursor* cursor_;
};

constexpr const char* foundNul = "found a NUL byte, expected text";
constexpr std::size_t longestQuote = 40;
constexpr std::string_view byteOrderMark = "\xEF\xBB\xBF";

std::string Hex(unsigned char byte) {
    constexpr const char* digits = "0123456789ABCDEF";
    return {digits[byte >> 4], digits[byte & 15]};
}

/// The text in single quotes, with bytes that can't be shown as \xNN.
std::string Quoted(std::string_view text) {
    const std::size_t whole = text.size();
    std::string quoted = "'";
    while (!text.empty()) {
        if (whole - text.size() >= longestQuote) return quoted + "...'";
        const std::size_t length = mdf_Utf8Length(text);
        const auto byte = static_cast<unsigned char>(text.front());
        if (length == 0 || byte < 0x20 || byte == 0x7F)
            quoted += "\\x" + Hex(byte);
        else
            quoted += text.substr(0, length);
        text.remove_prefix(std::max<std::size_t>(length, 1));
    }
    return quoted + "'";
}

bool IsBlank(char c) {
    return c == ' ' || c == '\t' || c == '\n' || c == '\r';
}

std::size_t SkipBlanksAndComments(std::string_view text, std::size_t at) {
    while (at < text.size()) {
        if (IsBlank(text[at])) {
            ++at;
            continue;
        }
        const std::string_view rest = text.substr(at);
        std::size_t end = std::string_view::npos;
        if (rest.starts_with("//")) {
            end = std::min(text.find_first_of("\r\n", at), text.size());
        } else if (rest.starts_with("/*")) {
            end = text.find("*/", at + 2);
            if (end != std::string_view::npos) end += 2;
        }
        if (end == std::string_view::npos) return at;
        at = end;
    }
    return at;
}

/// The token as a person sees it: a bracket, a string up to `end`, else a run of other characters.
std::string_view TokenAt(std::string_view text, std::size_t at, std::size_t end) {
    if (text[at] == '"') return text.substr(at, std::max<std::size_t>(end - at, 1));
    const std::size_t stop = text.find_first_of(" \t\r\n,:[]{}\"", at);
    return text.substr(at, std::max<std::size_t>(std::min(stop, text.size()) - at, 1));
}

/// What stands before `end`, no longer than a quote.
std::string_view Tail(std::string_view text, std::size_t begin, std::size_t end) {
    if (end - begin > longestQuote) begin = end - longestQuote;
    while (begin + 1 < end && (static_cast<unsigned char>(text[begin]) & 0xC0) == 0x80) ++begin;
    return text.substr(begin, end - begin);
}

/// What was expected, in our words, from the end of the library's message; empty when it doesn't say.
std::string_view Expected(std::string_view message) {
    struct Words {
        std::string_view library;
        std::string_view ours;
    };
    static constexpr std::array<Words, 6> table{
        {{"; expected '[', '{', or a literal", "a value"},
         {"; expected string literal", "a member name in double quotes"},
         {"; expected ':'", "':'"},
         {"; expected ']'", "',' or ']'"},
         {"; expected '}'", "',' or '}'"},
         {"; expected end of input", "the end of the file"}}};
    for (const Words& words : table) {
        if (message.ends_with(words.library)) return words.ours;
    }
    return {};
}

/// The reason in the lexer's words; empty when the tokens are good and stand in the wrong order.
std::string_view LexerReason(std::string_view message) {
    const std::size_t end = message.find("; last read: '");
    if (end == std::string_view::npos) return {};
    constexpr std::string_view dash = " - ";
    const std::size_t begin = message.find(dash);
    return message.substr(begin + dash.size(), end - begin - dash.size());
}

bool WrittenAsInteger(std::string_view number) {
    return number.find_first_not_of("-0123456789") == std::string_view::npos;
}

} // namespace

/// Makes the tree from the library's events.
class mdf_Builder {
public:
    mdf_Builder(Cursor& cursor, mdf_Value& root, std::vector<mdf_Error>& errors)
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
    bool Int(int value);
    bool Real(double value, bool isLarge);
    bool Other(mdf_Value value);
    void Place(mdf_Value value);
    mdf_Numbers* OpenNumbers();
    void MakeRoom(mdf_Numbers& numbers) const;
    bool AddFacetName(const std::string& text);
    void DemoteRow();
    bool MayNest();
    std::size_t TokenBegin() const;
    mdf_Value& Top() { return frames_.back(); }

    std::string_view Text() const {
        return {cursor_.begin, static_cast<std::size_t>(cursor_.end - cursor_.begin)};
    }

    Cursor& cursor_;
    mdf_Value& root_;
    std::vector<mdf_Error>& errors_;
    /// The arrays and objects that are open, outermost first; the last member of an open object is the one
    /// whose value is being read.
    std::vector<mdf_Value> frames_;
    /// The innermost open array is a row, and its items go straight into the Matrix or FacetArray on top.
    bool rowOpen_ = false;
    std::size_t rowBegin_ = 0;
    /// Where the lexer was after the last event, and whether that was a number: the lexer reads one character
    /// beyond a number.
    std::size_t lastEvent_ = 0;
    bool lastWasNumber_ = false;
};

/// The numbers of the row or array that is open, with room for one more; null when it holds other things.
mdf_Numbers* mdf_Builder::OpenNumbers() {
    if (frames_.empty()) return nullptr;
    mdf_Value& top = Top();
    mdf_Numbers* numbers = nullptr;
    if (rowOpen_)
        numbers = &top.rows_->numbers;
    else if (top.kind_ == mdf_Kind::IntArray || top.kind_ == mdf_Kind::RealArray)
        numbers = top.numbers_;
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
    lastEvent_ = Offset();
    lastWasNumber_ = true;
    if (rowOpen_ && Top().kind_ == mdf_Kind::FacetArray) {
        std::vector<int>& pairs = Top().facets_->pairs;
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
    lastEvent_ = Offset();
    lastWasNumber_ = true;
    if (rowOpen_ && Top().kind_ == mdf_Kind::FacetArray) DemoteRow();
    if (mdf_Numbers* numbers = OpenNumbers()) {
        numbers->AddReal(value, isLarge);
        if (!rowOpen_) Top().kind_ = mdf_Kind::RealArray;
    } else {
        mdf_Value real(value);
        real.largeInteger_ = isLarge;
        Place(std::move(real));
    }
    return true;
}

bool mdf_Builder::string(std::string& text) {
    if (rowOpen_ && AddFacetName(text)) {
        lastEvent_ = Offset();
        lastWasNumber_ = false;
        return true;
    }
    // The lexer's buffer is copied, not taken: it has the capacity of the longest text so far.
    return Other(mdf_Value(std::string_view(text)));
}

bool mdf_Builder::AddFacetName(const std::string& text) {
    mdf_Value& top = Top();
    if (top.kind_ == mdf_Kind::Matrix) {
        mdf_Rows& rows = *top.rows_;
        const bool pairsSoFar =
            rows.numbers.allInts && rows.ends.empty() && (rows.count == 0 || rows.length == 2);
        if (!pairsSoFar || rows.numbers.Size() - rowBegin_ != 1) return false;
        auto facets = std::make_unique<mdf_Facets>();
        facets->pairs = std::move(rows.numbers.ints);
        top.Release();
        top.facets_ = facets.release();
        top.kind_ = mdf_Kind::FacetArray;
    } else if (top.facets_->pairs.size() - rowBegin_ != 1) {
        return false;
    }
    top.facets_->AddName(text);
    return true;
}

/// Makes the array on top general, and the row that is open an array of its own on top of it.
void mdf_Builder::DemoteRow() {
    mdf_Value& top = Top();
    mdf_Value row;
    if (top.kind_ == mdf_Kind::Matrix) {
        mdf_Numbers& numbers = top.rows_->numbers;
        row = numbers.Slice(rowBegin_, numbers.Size());
        numbers.Truncate(rowBegin_);
    } else {
        mdf_Facets& facets = *top.facets_;
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
    lastEvent_ = Offset();
    lastWasNumber_ = false;
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
    if (top.kind_ == mdf_Kind::Object) {
        top.object_->members.back().value = std::move(value);
        return;
    }
    top.Generalise();
    top.array_->push_back(std::move(value));
}

bool mdf_Builder::MayNest() {
    lastEvent_ = Offset();
    lastWasNumber_ = false;
    const std::size_t depth = frames_.size() + (rowOpen_ ? 1 : 0);
    if (depth < static_cast<std::size_t>(mdf_maxDepth)) return true;
    SyntaxError(Offset() - 1,
                "arrays and objects are nested deeper than " + std::to_string(mdf_maxDepth) + " levels");
    return false;
}

bool mdf_Builder::start_object(std::size_t) {
    if (!MayNest()) return false;
    if (rowOpen_) DemoteRow();
    mdf_Value object;
    object.object_ = new mdf_ObjectData;
    object.kind_ = mdf_Kind::Object;
    frames_.push_back(std::move(object));
    return true;
}

bool mdf_Builder::key(std::string& name) {
    lastEvent_ = Offset();
    lastWasNumber_ = false;
    Top().object_->members.push_back({name, mdf_Value()});
    return true;
}

bool mdf_Builder::end_object() {
    std::vector<std::string> repeated = Top().object_->Index();
    mdf_Value object = std::move(Top());
    frames_.pop_back();
    if (!repeated.empty()) {
        std::string pointer;
        for (const mdf_Value& frame : frames_) {
            if (frame.kind_ == mdf_Kind::Object)
                mdf_AppendPointer(pointer, frame.object_->members.back().name);
            else
                mdf_AppendPointer(pointer, frame.Size());
        }
        for (const std::string& name : repeated) {
            if (errors_.size() >= mdf_maxErrors) break;
            mdf_Error& error = errors_.emplace_back();
            error.pointer = pointer;
            mdf_AppendPointer(error.pointer, name);
            error.text = "the member " + Quoted(name) + " stands more than once; expected names that differ";
        }
    }
    return Other(std::move(object));
}

bool mdf_Builder::start_array(std::size_t) {
    if (!MayNest()) return false;
    if (rowOpen_) DemoteRow();
    if (!frames_.empty()) {
        mdf_Value& top = Top();
        if (top.kind_ == mdf_Kind::IntArray && top.numbers_->Size() == 0) {
            auto rows = std::make_unique<mdf_Rows>();
            top.Release();
            top.rows_ = rows.release();
            top.kind_ = mdf_Kind::Matrix;
        }
        rowOpen_ = top.kind_ == mdf_Kind::Matrix || top.kind_ == mdf_Kind::FacetArray;
        if (rowOpen_) {
            rowBegin_ = top.kind_ == mdf_Kind::Matrix ? top.rows_->numbers.Size() : top.facets_->pairs.size();
            return true;
        }
    }
    mdf_Value array;
    array.numbers_ = new mdf_Numbers;
    array.kind_ = mdf_Kind::IntArray;
    frames_.push_back(std::move(array));
    return true;
}

bool mdf_Builder::end_array() {
    lastEvent_ = Offset();
    lastWasNumber_ = false;
    if (rowOpen_ && Top().kind_ == mdf_Kind::Matrix) {
        Top().rows_->CloseRow();
        rowOpen_ = false;
        return true;
    }
    if (rowOpen_ && Top().facets_->pairs.size() - rowBegin_ == 2) {
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
    mdf_Error& error = errors_.emplace_back();
    const std::size_t newline = before.rfind('\n');
    std::size_t lineBegin = newline == std::string_view::npos ? 0 : newline + 1;
    if (lineBegin == 0 && before.starts_with(byteOrderMark)) lineBegin = byteOrderMark.size();
    error.line = 1 + static_cast<long>(std::count(before.begin(), before.end(), '\n'));
    error.column = 1 + static_cast<long>(offset - lineBegin);
    error.text = std::move(text);
}

/// Where the token that was read last begins: after the last event, a separator, and what the lexer skips.
std::size_t mdf_Builder::TokenBegin() const {
    const std::string_view text = Text();
    std::size_t at = lastWasNumber_ ? lastEvent_ - 1 : lastEvent_;
    if (at == 0 && text.starts_with(byteOrderMark)) at = byteOrderMark.size();
    at = SkipBlanksAndComments(text, at);
    while (at + 1 < Offset() && (text[at] == ',' || text[at] == ':'))
        at = SkipBlanksAndComments(text, at + 1);
    return at;
}

bool mdf_Builder::parse_error(std::size_t, const std::string&, const nlohmann::detail::exception& failure) {
    const std::string_view text = Text();
    const std::string_view message = failure.what();
    const std::string_view reason = LexerReason(message);
    const bool inString = reason.starts_with("invalid string");
    if (!inString && Offset() > 0 && text[Offset() - 1] == '\0') {
        SyntaxError(Offset() - 1, foundNul);
        return false;
    }
    const bool ended = reason.empty() && message.find("unexpected end of input") != std::string_view::npos;
    const std::size_t begin = ended ? text.size() : std::min(TokenBegin(), text.size());
    const std::string token =
        begin == text.size() ? std::string("the end of the file") : Quoted(TokenAt(text, begin, Offset()));

    constexpr int numberOverflow = 406;
    if (failure.id == numberOverflow) {
        SyntaxError(begin, "the number " + token + " is beyond the range of double precision");
        return false;
    }
    std::string words = reason.empty() ? std::string() : std::string(reason) + "; ";
    std::size_t position = begin;
    if (inString && reason.find("missing closing quote") == std::string_view::npos) {
        position = Offset() - 1;
        words += "found " + Quoted(Tail(text, begin, Offset()));
    } else {
        words += "found " + token;
    }
    const std::string_view expected = Expected(message);
    if (!expected.empty()) words.append(", expected ").append(expected);
    SyntaxError(position, std::move(words));
    return false;
}

std::string mdf_Error::Message(std::string_view fileName) const {
    std::string message(fileName);
    if (line > 0) message.append(":").append(std::to_string(line)).append(":").append(std::to_string(column));
    message += ": ";
    if (!pointer.empty()) message += pointer + ": ";
    return message + text;
}

void mdf_AppendPointer(std::string& pointer, std::string_view token) {
    pointer += '/';
    for (const char c : token) {
        if (c == '~')
            pointer += "~0";
        else if (c == '/')
            pointer += "~1";
        else
            pointer += c;
    }
}

void mdf_AppendPointer(std::string& pointer, std::size_t index) {
    pointer += '/' + std::to_string(index);
}

bool mdf_Parse(std::string_view text, mdf_Value& root, std::vector<mdf_Error>& errors) {
    const std::size_t errorsBefore = errors.size();
    root = mdf_Value();
    Cursor cursor{text.data(), text.data(), text.data() + text.size()};
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

bool mdf_ReadFile(const std::string& path, std::string& text, mdf_Error& error) {
    const auto fail = [&](int number) {
        text.clear();
        error = mdf_Error();
        error.text = std::string("the file can't be read: ") + std::generic_category().message(number);
        return false;
    };
    errno = 0;
    const std::unique_ptr<std::FILE, int (*)(std::FILE*)> file(std::fopen(path.c_str(), "rb"), std::fclose);
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
        if (std::ferror(file.get()) != 0) return fail(errno);
        if (length < text.size()) break;
        text.resize(2 * text.size() + 4096);
    }
    text.resize(length);
    return true;
}
