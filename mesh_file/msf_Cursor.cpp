#include "mesh_file/msf_Cursor.h"

#include "foundation/num_ReadReal.h"

#include <algorithm>
#include <charconv>

namespace {

/// Control characters are blanks too.
bool IsBlank(char c) {
    return static_cast<unsigned char>(c) <= ' ';
}

std::string_view Trimmed(std::string_view text) {
    while (!text.empty() && IsBlank(text.front())) text.remove_prefix(1);
    while (!text.empty() && IsBlank(text.back())) text.remove_suffix(1);
    return text;
}

} // namespace

void msf_Cursor::SkipBlanks() {
    while (at_ < bytes_.size() && IsBlank(bytes_[at_])) ++at_;
}

std::string_view msf_Cursor::Line() {
    word_ = at_;
    const std::size_t end = std::min(bytes_.find('\n', at_), bytes_.size());
    std::string_view line = bytes_.substr(at_, end - at_);
    if (!line.empty() && line.back() == '\r') line.remove_suffix(1);
    at_ = std::min(end + 1, bytes_.size());
    return line;
}

std::string_view msf_Cursor::NextLine() {
    while (!AtEnd()) {
        const std::string_view line = Trimmed(Line());
        if (!line.empty()) return line;
    }
    return {};
}

std::string_view msf_Cursor::PeekWord() {
    SkipBlanks();
    std::size_t end = at_;
    while (end < bytes_.size() && !IsBlank(bytes_[end])) ++end;
    return bytes_.substr(at_, end - at_);
}

std::string_view msf_Cursor::Word(const char* expected) {
    const std::string_view word = PeekWord();
    word_ = at_;
    if (word.empty()) Fail("found the end of the file", expected);
    at_ += word.size();
    return word;
}

long long msf_Cursor::Int(const char* expected) {
    SkipBlanks();
    const char* const end = bytes_.data() + bytes_.size();
    const char* begin = bytes_.data() + at_;
    if (begin != end && *begin == '+') ++begin;
    long long value = 0;
    const auto [stop, error] = std::from_chars(begin, end, value);
    if (error != std::errc() || (stop != end && !IsBlank(*stop))) {
        const std::string_view word = Word(expected);
        FailAtWord("found " + msf_Shown(word), expected);
    }
    word_ = at_;
    at_ = static_cast<std::size_t>(stop - bytes_.data());
    return value;
}

double msf_Cursor::Real(const char* expected) {
    SkipBlanks();
    const char* const end = bytes_.data() + bytes_.size();
    const char* begin = bytes_.data() + at_;
    if (begin != end && *begin == '+') ++begin;
    double value = 0.0;
    const auto [stop, error] = num_ReadReal(begin, end, value);
    if (error == std::errc() && (stop == end || IsBlank(*stop))) {
        word_ = at_;
        at_ = static_cast<std::size_t>(stop - bytes_.data());
        return value;
    }
    // Fortran writes "1.5D+02", and tiny numbers may lie below what a double holds.
    const std::string_view given = Word(expected);
    std::string word(given);
    std::replace(word.begin(), word.end(), 'D', 'e');
    std::replace(word.begin(), word.end(), 'd', 'e');
    const char* const first = word.data() + (word.front() == '+' ? 1 : 0);
    const char* const last = word.data() + word.size();
    const auto [rest, problem] = num_ReadReal(first, last, value);
    const bool tiny = problem == std::errc::result_out_of_range && word.find("e-") != std::string::npos;
    if (rest != last || (problem != std::errc() && !tiny)) FailAtWord("found " + msf_Shown(given), expected);
    return tiny ? 0.0 : value;
}

std::size_t msf_Cursor::Count(const char* things, std::size_t bytesEach) {
    const std::string expected = std::string("the number of ") + things;
    return Count(Int(expected.c_str()), things, bytesEach);
}

std::size_t msf_Cursor::Count(long long number, const char* things, std::size_t bytesEach) {
    const std::size_t most = Left() / std::max<std::size_t>(bytesEach, 1) + 1;
    if (number < 0 || static_cast<unsigned long long>(number) > most || number > 0x7FFFFFFF) {
        FailAtWord("found " + std::to_string(number) + " as the number of " + things,
                   "no more than the file has room for");
    }
    return static_cast<std::size_t>(number);
}

const char* msf_Cursor::Take(std::size_t size, const char* expected) {
    if (size > Left()) Fail("found the end of the file", expected);
    const char* const begin = bytes_.data() + at_;
    word_ = at_;
    at_ += size;
    return begin;
}

std::string msf_Cursor::PlaceAt(std::size_t at) const {
    if (!place_.empty()) return place_;
    if (saysOffsets_) return "offset " + std::to_string(at);
    const auto end = bytes_.begin() + static_cast<std::ptrdiff_t>(std::min(at, bytes_.size()));
    return "line " + std::to_string(std::count(bytes_.begin(), end, '\n') + 1);
}

void msf_Cursor::FailAt(std::size_t at, std::string found, std::string expected) const {
    msf_Fail(PlaceAt(at), std::move(found), std::move(expected));
}
