#ifndef QRX_MESH_FILE_MSF_SOURCE_H
#define QRX_MESH_FILE_MSF_SOURCE_H

#include "platform/plt_MappedFile.h"

#include <cstddef>
#include <string>
#include <string_view>

/// Why a file was refused.
struct msf_Problem {
    /// "line 12", "offset 1024", or nothing for the whole file.
    std::string place;
    std::string found;
    std::string expected;
    /// The system doesn't hand the file out.
    bool unreadable = false;

    /// "line 12: found ..., expected ...".
    std::string Text() const;
};

/// Raised by readers; never leaves this layer.
struct msf_Failure {
    msf_Problem problem;
};
[[noreturn]] void msf_Fail(std::string place, std::string found, std::string expected);

/// A text of a file in quotes, cut to what a message can hold, its control characters made visible.
std::string msf_Shown(std::string_view text);
/// "1 cell", "2 cells".
std::string msf_Counted(long long count, const char* thing);

/// A whole regular file, mapped into memory for reading.
class msf_MappedFile {
public:
    /// Raises msf_Failure for what is no regular file, or can't be opened.
    explicit msf_MappedFile(const std::string& path);
    std::string_view Bytes() const { return file_.Bytes(); }

private:
    plt_MappedFile file_;
};

#endif
