#include "tools/StandardStreams.h"

#include "whole_file/whf_WriteAll.h"

#include <cerrno>

#include <fcntl.h>
#include <sys/ioctl.h>
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

int ReadStandardInput(std::string& text) {
    constexpr std::size_t least = std::size_t{64} * 1024;
    std::size_t length = 0;
    text.resize(least);
    while (true) {
        if (length == text.size()) text.resize(2 * length);
        const ssize_t taken = ::read(STDIN_FILENO, text.data() + length, text.size() - length);
        if (taken < 0 && errno == EINTR) continue;
        if (taken <= 0) {
            text.resize(length);
            return taken < 0 ? errno : 0;
        }
        length += static_cast<std::size_t>(taken);
    }
}

int ColumnsOfTerminal(bool ofErrors) noexcept {
    const int number = ofErrors ? STDERR_FILENO : STDOUT_FILENO;
    if (::isatty(number) == 0) return -1;
    struct winsize size = {};
    return ::ioctl(number, TIOCGWINSZ, &size) == 0 ? size.ws_col : 0;
}
