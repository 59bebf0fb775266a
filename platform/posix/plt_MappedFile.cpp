#include "platform/plt_MappedFile.h"

#include <fcntl.h>
#include <sys/mman.h>

int plt_MappedFile::Open(const char* path) {
    // A pipe without a writer would hang an ordinary open.
    return ::open(path, O_RDONLY | O_NONBLOCK | O_CLOEXEC);
}

const char* plt_MappedFile::Map(int file, std::size_t bytes) {
    void* const mapped = ::mmap(nullptr, bytes, PROT_READ, MAP_PRIVATE, file, 0);
    if (mapped == MAP_FAILED) return nullptr;
    ::madvise(mapped, bytes, MADV_SEQUENTIAL);
    return static_cast<const char*>(mapped);
}

plt_MappedFile::~plt_MappedFile() {
    if (begin_ != nullptr) ::munmap(const_cast<char*>(begin_), size_);
}
