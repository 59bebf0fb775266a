#include "whole_file/whf_WriteAll.h"

#include "platform/plt_Files.h"

#include <cerrno>

int whf_WriteAll(int file, std::string_view text) noexcept {
    while (!text.empty()) {
        errno = 0;
        const ssize_t taken = plt_Write(file, text.data(), text.size());
        if (taken > 0) {
            text.remove_prefix(static_cast<std::size_t>(taken));
        } else if (errno != EINTR) {
            return errno != 0 ? errno : EIO;
        }
    }
    return 0;
}
