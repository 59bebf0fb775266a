#include "platform/plt_MappedFile.h"

#include "platform/plt_Files.h"
#include "platform/windows/plt_Text.h"

#include <io.h>

plt_MappedFile::plt_MappedFile(const std::string& path) {
    const int file = plt_OpenToRead(path.c_str());
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
        const HANDLE mapping = CreateFileMappingW(reinterpret_cast<HANDLE>(_get_osfhandle(file)), nullptr,
                                                  PAGE_READONLY, 0, 0, nullptr);
        if (mapping != nullptr)
            begin_ = static_cast<const char*>(MapViewOfFile(mapping, FILE_MAP_READ, 0, 0, 0));
        if (begin_ == nullptr) {
            error_ = plt_LastError();
        } else {
            size_ = static_cast<std::size_t>(status.st_size);
        }
        // What is mapped keeps it.
        if (mapping != nullptr) CloseHandle(mapping);
    }
    plt_Close(file);
}

plt_MappedFile::~plt_MappedFile() {
    if (begin_ != nullptr) UnmapViewOfFile(begin_);
}
