#ifndef QRX_MESH_FILE_MSF_CURSOR_H
#define QRX_MESH_FILE_MSF_CURSOR_H

#include "mesh_file/msf_Source.h"

#include <cstring>
#include <utility>

/// Walks over the bytes of a file, as words of text or as raw numbers. What can't be read fails with the
/// place: the line, or the offset once the file turned out to be binary.
class msf_Cursor {
public:
    explicit msf_Cursor(std::string_view bytes) : bytes_(bytes) {}

    std::size_t At() const { return at_; }
    void MoveTo(std::size_t at) { at_ = at; }
    std::size_t Left() const { return bytes_.size() - at_; }
    std::string_view Rest() const { return bytes_.substr(at_); }
    bool AtEnd() const { return at_ >= bytes_.size(); }
    void SayOffsets() { saysOffsets_ = true; }
    /// For what has no place in the file any more.
    void SayPlace(std::string place) { place_ = std::move(place); }

    /// The rest of the line without its end; moves behind it.
    std::string_view Line();
    /// The next line that isn't blank, blanks cut off at both ends; empty at the end of the file.
    std::string_view NextLine();
    /// The next word; fails at the end of the file.
    std::string_view Word(const char* expected);
    /// The next word, which stays ahead; empty at the end of the file.
    std::string_view PeekWord();
    long long Int(const char* expected);
    double Real(const char* expected);
    /// A number of things that take at least `bytesEach` of the file each, so that a wild count costs
    /// nothing.
    std::size_t Count(const char* things, std::size_t bytesEach);
    std::size_t Count(long long number, const char* things, std::size_t bytesEach);

    template <class T>
    T Raw(const char* expected) {
        T value;
        std::memcpy(&value, Take(sizeof(T), expected), sizeof(T));
        return value;
    }
    /// The address of that many bytes; moves behind them.
    const char* Take(std::size_t size, const char* expected);

    std::string Place() const { return PlaceAt(at_); }
    std::string PlaceAt(std::size_t at) const;
    [[noreturn]] void Fail(std::string found, std::string expected) const {
        FailAt(at_, std::move(found), std::move(expected));
    }
    /// At the word that was read last.
    [[noreturn]] void FailAtWord(std::string found, std::string expected) const {
        FailAt(word_, std::move(found), std::move(expected));
    }

private:
    [[noreturn]] void FailAt(std::size_t at, std::string found, std::string expected) const;
    void SkipBlanks();

    std::string_view bytes_;
    std::size_t at_ = 0;
    std::size_t word_ = 0;
    bool saysOffsets_ = false;
    std::string place_;
};

#endif
