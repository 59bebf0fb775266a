#include "model_file/mdf_Writer.h"

#include "foundation/num_ReadReal.h"
#include "model_file/mdf_Utf8.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <stdexcept>

namespace {

constexpr std::size_t indentation = 2;
constexpr std::size_t wrapColumn = 100;
constexpr std::size_t bufferSize = 1 << 16;

} // namespace

void mdf_Writer::NewLine(std::size_t depth) {
    text_ += '\n';
    column_ = indentation * depth;
    text_.append(column_, ' ');
}

/// Puts what stands between the last item and one of `length` characters.
void mdf_Writer::Separate(std::size_t length, bool isKey) {
    if (done_) throw std::logic_error("a document has one root");
    if (keyed_) {
        keyed_ = false;
        column_ += length;
        return;
    }
    if (!levels_.empty()) {
        Level& level = levels_.back();
        if (level.bracket == '{' && !isKey) throw std::logic_error("a member needs its key first");
        const bool first = level.empty;
        level.empty = false;
        if (!first) {
            text_ += ',';
            ++column_;
        }
        const bool full = level.layout == mdf_Layout::Wrapped && column_ + 1 + length > wrapColumn;
        if (level.layout == mdf_Layout::Lines || full) {
            if (text_.size() >= bufferSize) Flush();
            NewLine(levels_.size());
        } else if (!first) {
            text_ += ' ';
            ++column_;
        }
    }
    column_ += length;
}

void mdf_Writer::Scalar(std::string_view text) {
    Separate(text.size());
    text_ += text;
    done_ = levels_.empty();
}

void mdf_Writer::Begin(char bracket, mdf_Layout layout) {
    Separate(1);
    text_ += bracket;
    const bool onLine = !levels_.empty() && levels_.back().layout != mdf_Layout::Lines;
    levels_.push_back({bracket, onLine ? mdf_Layout::OneLine : layout, true});
}

void mdf_Writer::End(char bracket) {
    if (levels_.empty() || levels_.back().bracket != bracket || keyed_)
        throw std::logic_error("an end without its beginning");
    const Level level = levels_.back();
    levels_.pop_back();
    if (level.layout == mdf_Layout::Lines && !level.empty) NewLine(levels_.size());
    text_ += bracket == '{' ? '}' : ']';
    ++column_;
    done_ = levels_.empty();
}

void mdf_Writer::Key(std::string_view name) {
    if (levels_.empty() || levels_.back().bracket != '{' || keyed_)
        throw std::logic_error("a key stands before a member's value in an object");
    Separate(name.size() + 4, true);
    Quote(name);
    text_ += ": ";
    keyed_ = true;
}

void mdf_Writer::Null() {
    Scalar("null");
}

void mdf_Writer::Bool(bool value) {
    Scalar(value ? "true" : "false");
}

void mdf_Writer::Int(int value) {
    std::array<char, 16> digits;
    const auto end = std::to_chars(digits.data(), digits.data() + digits.size(), value).ptr;
    Scalar({digits.data(), static_cast<std::size_t>(end - digits.data())});
}

void mdf_Writer::Real(double value) {
    if (!std::isfinite(value)) throw std::invalid_argument("a number that is not finite has no text in JSON");
    std::array<char, 40> digits;
    RealText(digits.data(), std::to_chars(digits.data(), digits.data() + digits.size() - 2, value).ptr);
}

void mdf_Writer::Real(float value) {
    std::array<char, 40> digits;
    char* end = std::to_chars(digits.data(), digits.data() + digits.size() - 2, value).ptr;
    double read = 0.0;
    const bool isRead = num_ReadReal(digits.data(), end, read).ec == std::errc();
    // A text half way between two floats may round to the other one.
    if (isRead && std::isfinite(value) && static_cast<float>(read) == value) {
        RealText(digits.data(), end);
    } else {
        Real(static_cast<double>(value));
    }
}

/// The text from `begin` to `end`, which has room for two characters behind it.
void mdf_Writer::RealText(char* begin, char* end) {
    if (std::none_of(begin, end, [](char c) { return c == '.' || c == 'e'; })) {
        *end++ = '.';
        *end++ = '0';
    }
    Scalar({begin, static_cast<std::size_t>(end - begin)});
}

void mdf_Writer::String(std::string_view value) {
    Separate(value.size() + 2);
    Quote(value);
    done_ = levels_.empty();
}

void mdf_Writer::Quote(std::string_view text) {
    constexpr const char* digits = "0123456789abcdef";
    text_ += '"';
    while (!text.empty()) {
        const std::size_t length = mdf_Utf8Length(text);
        if (length == 0) throw std::invalid_argument("a text that is not UTF-8 can't stand in JSON");
        const char c = text.front();
        switch (c) {
        case '"': text_ += "\\\""; break;
        case '\\': text_ += "\\\\"; break;
        case '\n': text_ += "\\n"; break;
        case '\r': text_ += "\\r"; break;
        case '\t': text_ += "\\t"; break;
        case '\b': text_ += "\\b"; break;
        case '\f': text_ += "\\f"; break;
        default:
            if (length == 1 && c < 0x20) {
                text_ += "\\u00";
                text_ += digits[c >> 4];
                text_ += digits[c & 15];
            } else {
                text_ += text.substr(0, length);
            }
        }
        text.remove_prefix(length);
    }
    text_ += '"';
}

void mdf_Writer::Row(std::span<const int> row) {
    BeginArray(mdf_Layout::OneLine);
    for (const int value : row) Int(value);
    EndArray();
}

void mdf_Writer::Row(std::span<const double> row) {
    BeginArray(mdf_Layout::OneLine);
    for (const double value : row) Real(value);
    EndArray();
}

void mdf_Writer::Row(std::span<const float> row) {
    BeginArray(mdf_Layout::OneLine);
    for (const float value : row) Real(value);
    EndArray();
}

void mdf_Writer::Value(const mdf_Value& value) {
    const auto items = [&](mdf_Layout layout) {
        BeginArray(layout);
        for (std::size_t i = 0; i < value.Size(); ++i) Value(value.Item(i));
        EndArray();
    };
    switch (value.Kind()) {
    case mdf_Kind::Null: Null(); break;
    case mdf_Kind::Bool: Bool(value.Bool()); break;
    case mdf_Kind::Int: Int(value.Int()); break;
    case mdf_Kind::Real: Real(value.Real()); break;
    case mdf_Kind::String: String(value.String()); break;
    case mdf_Kind::Object:
        BeginObject();
        for (const mdf_Member& member : value.Members()) {
            Key(member.name);
            Value(member.value);
        }
        EndObject();
        break;
    case mdf_Kind::Array:
        BeginArray();
        for (const mdf_Value& item : value.Items()) Value(item);
        EndArray();
        break;
    case mdf_Kind::IntArray:
    case mdf_Kind::RealArray: items(mdf_Layout::Wrapped); break;
    case mdf_Kind::Matrix:
    case mdf_Kind::FacetArray:
        BeginArray();
        for (std::size_t row = 0; row < value.Size(); ++row) {
            const mdf_Value items_ = value.Item(row);
            BeginArray(mdf_Layout::OneLine);
            for (std::size_t i = 0; i < items_.Size(); ++i) Value(items_.Item(i));
            EndArray();
        }
        EndArray();
        break;
    }
}

bool mdf_Writer::Finish() {
    if (!done_ || !levels_.empty()) throw std::logic_error("the document is not complete");
    text_ += '\n';
    Flush();
    out_.flush();
    return out_.good();
}

void mdf_Writer::Flush() {
    out_.write(text_.data(), static_cast<std::streamsize>(text_.size()));
    text_.clear();
}
