#include "tools/StandardStreams.h"

#include "whole_file/whf_WriteAll.h"

#include <cerrno>

#include <fcntl.h>
#include <unistd.h>

void SecureStandardStreams() noexcept {
    for (const int number : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO}) {
        if (::fcntl(number, F_GETFD) >= 0 || errno != EBADF) continue;
        // The lowest free number is this one; the wrong direction makes all use fail.
        const int opened = ::open("/dev/null", number == STDOUT_FILENO ? O_RDONLY : O_WRONLY);
        if (opened != number && opened >= 0) ::close(opened);
    }
}

bool CanWriteToStandardOutput() noexcept {
    const int flags = ::fcntl(STDOUT_FILENO, F_GETFL);
    return flags >= 0 && (flags & O_ACCMODE) != O_RDONLY;
}

int WriteToStandardOutput(std::string_view text) noexcept {
    return whf_WriteAll(STDOUT_FILENO, text);
}

int WriteToStandardError(std::string_view text) noexcept {
    return whf_WriteAll(STDERR_FILENO, text);
}
