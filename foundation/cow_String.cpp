#include "foundation/cow_String.h"

#include "foundation/mem_Allocation.h"

#include <algorithm>
#include <charconv>
#include <cstring>
#include <limits>
#include <new>
#include <stdexcept>

atr_StringRep* atr_StringRep::Create(int length) {
    void* memory = mem_OperatorNewThrow(sizeof(atr_StringRep) + static_cast<std::size_t>(length) + 1);
    auto* rep = new (memory) atr_StringRep{thr_Count(1), length};
    rep->Characters()[length] = '\0';
    return rep;
}

void atr_StringRep::Release(atr_StringRep* rep) noexcept {
    mem_OperatorDelete(rep);
}

namespace {

int CheckedLength(std::size_t length) {
    if (length > static_cast<std::size_t>(std::numeric_limits<int>::max() - 64)) {
        throw std::length_error("text of 2 GiB or more");
    }
    return static_cast<int>(length);
}

} // namespace

atr_StringBase::atr_StringBase(std::string_view text) {
    if (text.empty()) return;
    rep_ = atr_StringRep::Create(CheckedLength(text.size()));
    std::memcpy(rep_->Characters(), text.data(), text.size());
    characters_ = rep_->Characters();
}

atr_StringBase& atr_StringBase::operator=(const atr_StringBase& other) noexcept {
    if (other.rep_ != nullptr) other.rep_->count.Increment();
    Drop();
    characters_ = other.characters_;
    rep_ = other.rep_;
    return *this;
}

atr_StringBase& atr_StringBase::operator=(atr_StringBase&& other) noexcept {
    std::swap(characters_, other.characters_);
    std::swap(rep_, other.rep_);
    return *this;
}

cow_String::cow_String(int value) {
    char text[16];
    const auto end = std::to_chars(text, text + sizeof text, value).ptr;
    *this = cow_String(std::string_view(text, static_cast<std::size_t>(end - text)));
}

cow_String::cow_String(double value) {
    char text[32];
    const auto end = std::to_chars(text, text + sizeof text, value, std::chars_format::general, 6).ptr;
    *this = cow_String(std::string_view(text, static_cast<std::size_t>(end - text)));
}

cow_String& cow_String::Append(const cow_String& text, int offset, int length) {
    const int begin = std::clamp(offset, 0, text.Length());
    const int room = text.Length() - begin;
    const int count = std::clamp(length, 0, room);
    return AppendView(text.View().substr(static_cast<std::size_t>(begin), static_cast<std::size_t>(count)));
}

int cow_String::Find(const char* text, int from) const {
    if (from < 0 || from > Length()) return -1;
    const auto position = View().find(text, static_cast<std::size_t>(from));
    return position == std::string_view::npos ? -1 : static_cast<int>(position);
}

cow_String& cow_String::AppendView(std::string_view text) {
    if (text.empty()) return *this;
    const std::size_t old = View().size();
    atr_StringRep* joined = atr_StringRep::Create(CheckedLength(old + text.size()));
    std::memcpy(joined->Characters(), characters_, old);
    std::memcpy(joined->Characters() + old, text.data(), text.size());
    Drop();
    rep_ = joined;
    characters_ = joined->Characters();
    return *this;
}

cow_String operator+(const cow_String& a, const cow_String& b) {
    cow_String joined(a);
    joined.Append(b);
    return joined;
}
