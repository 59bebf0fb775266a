#ifndef QRX_FOUNDATION_ATR_STRING_H
#define QRX_FOUNDATION_ATR_STRING_H

#include "foundation/thr_Shared.h"

#include <string_view>

/// The shared storage of a text: its count of holders and its length; the characters and a final zero
/// byte follow it in the same piece of memory.
struct atr_StringRep {
    thr_Count count;
    int length;

    /// New storage for `length` characters, count 1; the final zero byte is set, the characters are not.
    static atr_StringRep* Create(int length);
    static void Release(atr_StringRep* rep) noexcept;
    char* Characters() { return reinterpret_cast<char*>(this + 1); }
};

/// A text that is shared by its copies: copying adds one to a count.
/// A default-constructed text has no storage and reads as "".
class atr_StringBase {
public:
    atr_StringBase() = default;
    explicit atr_StringBase(std::string_view text);
    atr_StringBase(const atr_StringBase& other) noexcept : characters_(other.characters_), rep_(other.rep_) {
        if (rep_ != nullptr) rep_->count.Increment();
    }
    atr_StringBase(atr_StringBase&& other) noexcept : characters_(other.characters_), rep_(other.rep_) {
        other.characters_ = "";
        other.rep_ = nullptr;
    }
    atr_StringBase& operator=(const atr_StringBase& other) noexcept;
    atr_StringBase& operator=(atr_StringBase&& other) noexcept;
    ~atr_StringBase() { Drop(); }

    const char* CStr() const { return characters_; }
    int Length() const { return rep_ == nullptr ? 0 : rep_->length; }
    bool IsEmpty() const { return Length() == 0; }
    std::string_view View() const { return {characters_, static_cast<std::size_t>(Length())}; }

protected:
    void Drop() noexcept {
        if (rep_ != nullptr && rep_->count.Decrement()) atr_StringRep::Release(rep_);
    }

    const char* characters_ = "";
    atr_StringRep* rep_ = nullptr;
};

/// The text type that exceptions carry.
class atr_String : public atr_StringBase {
public:
    atr_String() = default;
    atr_String(const char* text) : atr_StringBase(text == nullptr ? std::string_view() : text) {}
    explicit atr_String(std::string_view text) : atr_StringBase(text) {}
};

#endif
