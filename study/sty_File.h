#ifndef QRX_STY_FILE_H
#define QRX_STY_FILE_H

#include "whole_file/whf_WriteAll.h"

#include <string>
#include <string_view>
#include <utility>
#include <vector>

/// An open file or folder, closed at the end.
class sty_Descriptor {
public:
    explicit sty_Descriptor(int number = -1) : number_(number) {}
    sty_Descriptor(sty_Descriptor&& other) noexcept : number_(std::exchange(other.number_, -1)) {}
    sty_Descriptor& operator=(sty_Descriptor&& other) noexcept {
        std::swap(number_, other.number_);
        return *this;
    }
    ~sty_Descriptor();
    int Number() const { return number_; }
    bool IsOpen() const { return number_ >= 0; }

private:
    int number_;
};

/// A file that is read from its beginning to its end, piece by piece.
class sty_File {
public:
    explicit sty_File(const std::string& path);
    /// The next piece, which stays until the one after it; empty at the end and after a failure.
    std::string_view Next();
    /// The errno value of the first failure, 0 for none.
    int Error() const { return error_; }

private:
    sty_Descriptor file_;
    std::vector<char> buffer_;
    int error_ = 0;
};

/// Writes lines to a file, many at a time.
class sty_LineWriter {
public:
    explicit sty_LineWriter(int file) : file_(file) {}
    void Add(std::string_view line) {
        text_.append(line).append("\n");
        if (text_.size() >= kBytes) Flush();
    }
    /// The errno value of the first failure, 0 for none.
    int End() {
        Flush();
        return error_;
    }

private:
    static constexpr std::size_t kBytes = std::size_t{1} << 20;

    void Flush() {
        if (error_ == 0) error_ = whf_WriteAll(file_, text_);
        text_.clear();
    }

    int file_;
    int error_ = 0;
    std::string text_;
};

/// "No space left on device".
std::string sty_ReasonOf(int error);

#endif
