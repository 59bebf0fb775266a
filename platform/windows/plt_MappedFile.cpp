#include "platform/plt_MappedFile.h"

#include "platform/plt_Files.h"
#include "platform/windows/plt_Text.h"

#include <io.h>

int plt_MappedFile::Open(const char* path) {
    return plt_OpenToRead(path);
}

const char* plt_MappedFile::Map(int file, std::size_t) {
    const HANDLE mapping = CreateFileMappingW(reinterpret_cast<HANDLE>(_get_osfhandle(file)), nullptr,
                                              PAGE_READONLY, 0, 0, nullptr);
    const void* const begin = mapping == nullptr ? nullptr : MapViewOfFile(mapping, FILE_MAP_READ, 0, 0, 0);
    if (begin == nullptr) plt_Fail();
    // What is mapped keeps it.
    if (mapping != nullptr) CloseHandle(mapping);
    return static_cast<const char*>(begin);
}

plt_MappedFile::~plt_MappedFile() {
    if (begin_ != nullptr) UnmapViewOfFile(begin_);
}
