#include "platform/plt_MappedFile.h"

#include "platform/plt_Files.h"

#include <cerrno>

plt_MappedFile::plt_MappedFile(const std::string& path) {
    const int file = Open(path.c_str());
    if (file < 0) {
        error_ = errno;
        return;
    }
    plt_Status status = {};
    if (plt_InspectOpen(file, &status) != 0) {
        error_ = errno;
    } else if (!plt_IsFile(status)) {
        error_ = plt_IsFolder(status) ? EISDIR : ENOTSUP;
    } else if (status.st_size > 0) {
        const auto bytes = static_cast<std::size_t>(status.st_size);
        begin_ = Map(file, bytes);
        if (begin_ == nullptr)
            error_ = errno;
        else
            size_ = bytes;
    }
    plt_Close(file);
}
