#include "tools/StandardStreams.h"

#include <cerrno>

#include <fcntl.h>
#include <unistd.h>

namespace {

int WriteAll(int file, std::string_view text) noexcept {
    while (!text.empty()) {
        errno = 0;
        const ssize_t taken = ::write(file, text.data(), text.size());
        if (taken > 0) {
            text.remove_prefix(static_cast<std::size_t>(taken));
        } else if (errno != EINTR) {
            return errno != 0 ? errno : EIO;
        }
    }
    return 0;
}

} // namespace

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
    return WriteAll(STDOUT_FILENO, text);
}

int WriteToStandardError(std::string_view text) noexcept {
    return WriteAll(STDERR_FILENO, text);
}
