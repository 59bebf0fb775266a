#include "platform/plt_MappedFile.h"

#include "platform/plt_Files.h"

#include <cerrno>

#include <sys/mman.h>

plt_MappedFile::plt_MappedFile(const std::string& path) {
    // A pipe without a writer would hang an ordinary open.
    const int file = ::open(path.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC);
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
        size_ = static_cast<std::size_t>(status.st_size);
        void* mapped = ::mmap(nullptr, size_, PROT_READ, MAP_PRIVATE, file, 0);
        if (mapped == MAP_FAILED) {
            error_ = errno;
            size_ = 0;
        } else {
            begin_ = static_cast<const char*>(mapped);
            ::madvise(mapped, size_, MADV_SEQUENTIAL);
        }
    }
    plt_Close(file);
}

plt_MappedFile::~plt_MappedFile() {
    if (begin_ != nullptr) ::munmap(const_cast<char*>(begin_), size_);
}
