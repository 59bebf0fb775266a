#include "platform/plt_Files.h"

#include "platform/windows/plt_Text.h"

#include <algorithm>
#include <climits>
#include <memory>
#include <random>

#include <aclapi.h>
#include <fcntl.h>
#include <io.h>
#include <sys/stat.h>

// Open files are numbers of the C library here as well, each with a handle beneath. An open folder is one
// too, and tells its path; so names are looked up in it wherever it has been moved to.

namespace {

constexpr DWORD kShareAll = FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE;

struct HandleCloser {
    void operator()(HANDLE handle) const {
        if (handle != INVALID_HANDLE_VALUE) CloseHandle(handle);
    }
};
using OwnHandle = std::unique_ptr<void, HandleCloser>;

HANDLE HandleOf(int file) {
    return reinterpret_cast<HANDLE>(_get_osfhandle(file));
}

std::wstring PathOf(HANDLE handle) {
    std::wstring path(512, L'\0');
    for (;;) {
        const DWORD length =
            GetFinalPathNameByHandleW(handle, path.data(), static_cast<DWORD>(path.size()), 0);
        const bool fits = length < path.size();
        path.resize(length);
        if (fits) return path;
    }
}

std::wstring PathIn(int at, const char* name) {
    std::wstring own = plt_Wide(name);
    if (at == plt_kHere) return own;
    std::ranges::replace(own, L'/', L'\\');
    const std::wstring folder = PathOf(HandleOf(at));
    return own == L"." ? folder : folder + L"\\" + own;
}

HANDLE Open(const std::wstring& path, DWORD access, DWORD share, DWORD how, DWORD flags = 0) {
    return CreateFileW(path.c_str(), access, share, nullptr, how, FILE_ATTRIBUTE_NORMAL | flags, nullptr);
}

/// A number for a handle, which belongs to it from then on.
int NumberOf(HANDLE handle, int flags) {
    if (handle == INVALID_HANDLE_VALUE) return plt_Fail();
    const int number = _open_osfhandle(reinterpret_cast<intptr_t>(handle), flags | _O_BINARY | _O_NOINHERIT);
    if (number < 0) CloseHandle(handle);
    return number;
}

bool IsLink(const BY_HANDLE_FILE_INFORMATION& info) {
    return (info.dwFileAttributes & FILE_ATTRIBUTE_REPARSE_POINT) != 0;
}

int Inspect(HANDLE handle, plt_Status* found) {
    BY_HANDLE_FILE_INFORMATION info;
    if (GetFileInformationByHandle(handle, &info) == 0) return plt_Fail();
    *found = {};
    found->st_dev = info.dwVolumeSerialNumber;
    found->st_ino = static_cast<std::uint64_t>(info.nFileIndexHigh) << 32 | info.nFileIndexLow;
    found->st_size = static_cast<long long>(info.nFileSizeHigh) << 32 | info.nFileSizeLow;
    const bool isFolder = (info.dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY) != 0;
    const bool isFile = GetFileType(handle) == FILE_TYPE_DISK && !IsLink(info);
    found->st_mode = isFolder ? S_IFDIR | 0700U : isFile ? S_IFREG | 0600U : S_IFCHR;
    return 0;
}

} // namespace

std::filesystem::path plt_Path(std::string_view name) {
    return plt_Wide(name);
}

bool plt_IsFolder(const plt_Status& status) {
    return (status.st_mode & S_IFMT) == S_IFDIR;
}

bool plt_IsFile(const plt_Status& status) {
    return (status.st_mode & S_IFMT) == S_IFREG;
}

bool plt_IsSharedByAll(const plt_Status&) {
    return false;
}

bool plt_IsPrivateFolder(const plt_Status& status) {
    return plt_IsFolder(status);
}

plt_Owner plt_Me() {
    return 0;
}

ssize_t plt_ReadLink(const char* path, char* buffer, std::size_t bytes) {
    const std::wstring name = plt_Wide(path);
    const DWORD attributes = GetFileAttributesW(name.c_str());
    if (attributes == INVALID_FILE_ATTRIBUTES) return plt_Fail();
    if ((attributes & FILE_ATTRIBUTE_REPARSE_POINT) == 0) return plt_Fail(EINVAL);
    const OwnHandle handle(Open(name, 0, kShareAll, OPEN_EXISTING, FILE_FLAG_BACKUP_SEMANTICS));
    if (handle.get() == INVALID_HANDLE_VALUE) return plt_Fail();
    std::wstring end = PathOf(handle.get());
    if (end.starts_with(LR"(\\?\UNC\)")) {
        end.replace(0, 8, LR"(\\)");
    } else if (end.starts_with(LR"(\\?\)")) {
        end.erase(0, 4);
    }
    const std::string target = plt_Narrow(end);
    // Other things than links, such as files that a service keeps elsewhere, lead to themselves.
    if (std::filesystem::path(end) == std::filesystem::absolute(name)) return plt_Fail(EINVAL);
    const std::size_t taken = std::min(bytes, target.size());
    std::copy_n(target.data(), taken, buffer);
    return static_cast<ssize_t>(taken);
}

int plt_OpenFolder(int at, const char* name, int flags) {
    const DWORD share = (flags & plt_kAlone) != 0 ? static_cast<DWORD>(FILE_SHARE_DELETE) : kShareAll;
    const bool follow = (flags & (plt_kNoLink | plt_kAlone)) == 0;
    const HANDLE handle =
        Open(PathIn(at, name), FILE_LIST_DIRECTORY | FILE_READ_ATTRIBUTES, share, OPEN_EXISTING,
             FILE_FLAG_BACKUP_SEMANTICS | (follow ? 0U : FILE_FLAG_OPEN_REPARSE_POINT));
    if (handle == INVALID_HANDLE_VALUE) return plt_Fail();
    BY_HANDLE_FILE_INFORMATION info;
    const bool isFolder = GetFileInformationByHandle(handle, &info) != 0 &&
                          (info.dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY) != 0 &&
                          (follow || !IsLink(info));
    if (!isFolder) {
        CloseHandle(handle);
        return plt_Fail(ENOTDIR);
    }
    return NumberOf(handle, _O_RDONLY);
}

int plt_OpenUnlistedFolder(int, const char*) {
    return plt_Fail(EACCES);
}

int plt_OpenToRead(const char* path) {
    const std::wstring name = plt_Wide(path);
    return NumberOf(Open(name, GENERIC_READ, kShareAll, OPEN_EXISTING, FILE_FLAG_BACKUP_SEMANTICS),
                    _O_RDONLY);
}

int plt_Create(int at, const char* name, plt_Mode) {
    return NumberOf(
        Open(PathIn(at, name), GENERIC_WRITE | READ_CONTROL | WRITE_DAC, FILE_SHARE_READ, CREATE_NEW),
        _O_WRONLY);
}

int plt_OpenToAppend(int at, const char* name) {
    // Truncating takes more than the right to append.
    const int file =
        NumberOf(Open(PathIn(at, name), GENERIC_READ | GENERIC_WRITE, FILE_SHARE_READ, OPEN_ALWAYS),
                 _O_RDWR | _O_APPEND);
    return file;
}

int plt_OpenToLock(int at, const char* name) {
    return NumberOf(Open(PathIn(at, name), GENERIC_READ | GENERIC_WRITE, kShareAll, OPEN_ALWAYS), _O_RDWR);
}

int plt_Inspect(int at, const char* name, plt_Status* found) {
    const OwnHandle handle(Open(PathIn(at, name), FILE_READ_ATTRIBUTES, kShareAll, OPEN_EXISTING,
                                FILE_FLAG_BACKUP_SEMANTICS | FILE_FLAG_OPEN_REPARSE_POINT));
    return handle.get() == INVALID_HANDLE_VALUE ? plt_Fail() : Inspect(handle.get(), found);
}

int plt_InspectOpen(int file, plt_Status* found) {
    return Inspect(HandleOf(file), found);
}

int plt_MayWrite(int at, const char* name) {
    const DWORD attributes = GetFileAttributesW(PathIn(at, name).c_str());
    if (attributes != INVALID_FILE_ATTRIBUTES && (attributes & FILE_ATTRIBUTE_READONLY) != 0)
        return plt_Fail(EACCES);
    const OwnHandle handle(Open(PathIn(at, name), GENERIC_WRITE, kShareAll, OPEN_EXISTING));
    return handle.get() == INVALID_HANDLE_VALUE ? plt_Fail() : 0;
}

int plt_MakeFolder(int at, const char* name, plt_Mode) {
    return CreateDirectoryW(PathIn(at, name).c_str(), nullptr) == 0 ? plt_Fail() : 0;
}

int plt_Lock(int file) {
    plt_Status status;
    // A folder is locked by how it is opened.
    if (plt_InspectOpen(file, &status) == 0 && plt_IsFolder(status)) return 0;
    OVERLAPPED place = {};
    constexpr DWORD alone = LOCKFILE_EXCLUSIVE_LOCK | LOCKFILE_FAIL_IMMEDIATELY;
    return LockFileEx(HandleOf(file), alone, 0, 1, 0, &place) == 0 ? plt_Fail() : 0;
}

ssize_t plt_Read(int file, char* buffer, std::size_t bytes) {
    return _read(file, buffer, static_cast<unsigned>(std::min<std::size_t>(bytes, INT_MAX)));
}

ssize_t plt_ReadAt(int file, char* buffer, std::size_t bytes, long long place) {
    OVERLAPPED at = {};
    at.Offset = static_cast<DWORD>(place);
    at.OffsetHigh = static_cast<DWORD>(place >> 32);
    DWORD taken = 0;
    if (ReadFile(HandleOf(file), buffer, static_cast<DWORD>(bytes), &taken, &at) == 0)
        return GetLastError() == ERROR_HANDLE_EOF ? 0 : plt_Fail();
    return static_cast<ssize_t>(taken);
}

ssize_t plt_Write(int file, const char* text, std::size_t bytes) {
    return _write(file, text, static_cast<unsigned>(std::min<std::size_t>(bytes, INT_MAX)));
}

ssize_t plt_WritePieces(int file, const plt_Piece* pieces, std::size_t) {
    return plt_Write(file, pieces->text, pieces->bytes);
}

int plt_Truncate(int file, long long bytes) {
    return _chsize_s(file, bytes) == 0 ? 0 : -1;
}

int plt_Sync(int file) {
    plt_Status status;
    if (plt_InspectOpen(file, &status) == 0 && plt_IsFolder(status)) return plt_Fail(EINVAL);
    return FlushFileBuffers(HandleOf(file)) == 0 ? plt_Fail() : 0;
}

void plt_BeginSync(int, long long, long long) {}

int plt_Close(int file) {
    return _close(file);
}

int plt_SetOwner(int, plt_Owner, plt_Group) {
    return 0;
}

int plt_SetMode(int, plt_Mode) {
    return 0;
}

bool plt_CopyAccessList(int file, const std::string& from) {
    PACL list = nullptr;
    PSECURITY_DESCRIPTOR all = nullptr;
    if (GetNamedSecurityInfoW(plt_Wide(from).c_str(), SE_FILE_OBJECT, DACL_SECURITY_INFORMATION, nullptr,
                              nullptr, &list, nullptr, &all) != ERROR_SUCCESS)
        return false;
    SECURITY_DESCRIPTOR_CONTROL control = 0;
    DWORD revision = 0;
    GetSecurityDescriptorControl(all, &control, &revision);
    const SECURITY_INFORMATION inheritance = (control & SE_DACL_PROTECTED) != 0
                                                 ? PROTECTED_DACL_SECURITY_INFORMATION
                                                 : UNPROTECTED_DACL_SECURITY_INFORMATION;
    const DWORD error =
        SetSecurityInfo(HandleOf(file), SE_FILE_OBJECT, DACL_SECURITY_INFORMATION | inheritance, nullptr,
                        nullptr, list, nullptr);
    LocalFree(all);
    return error == ERROR_SUCCESS;
}

int plt_Rename(int fromFolder, const char* from, int toFolder, const char* to) {
    return MoveFileExW(PathIn(fromFolder, from).c_str(), PathIn(toFolder, to).c_str(),
                       MOVEFILE_REPLACE_EXISTING | MOVEFILE_WRITE_THROUGH) == 0
               ? plt_Fail()
               : 0;
}

int plt_RenameToNew(int folder, const char* from, const char* to) {
    return MoveFileExW(PathIn(folder, from).c_str(), PathIn(folder, to).c_str(), MOVEFILE_WRITE_THROUGH) == 0
               ? plt_Fail()
               : 0;
}

int plt_Remove(int at, const char* name) {
    return DeleteFileW(PathIn(at, name).c_str()) == 0 ? plt_Fail() : 0;
}

int plt_RemoveFolder(int at, const char* name) {
    return RemoveDirectoryW(PathIn(at, name).c_str()) == 0 ? plt_Fail() : 0;
}

int plt_List(int folder, const std::function<bool(const char* name)>& take) {
    WIN32_FIND_DATAW found;
    const HANDLE search = FindFirstFileW((PathOf(HandleOf(folder)) + L"\\*").c_str(), &found);
    if (search == INVALID_HANDLE_VALUE) return plt_Fail();
    do {
        if (!take(plt_Narrow(found.cFileName).c_str())) break;
    } while (FindNextFileW(search, &found) != 0);
    FindClose(search);
    return 0;
}

std::FILE* plt_OpenStream(const char* path, const char* mode) {
    std::wstring asBytes = plt_Wide(mode);
    // Ends of lines are what who writes them says.
    if (asBytes.find(L'b') == std::wstring::npos) asBytes += L'b';
    return _wfopen(plt_Wide(path).c_str(), asBytes.c_str());
}

std::FILE* plt_StreamOf(int file) {
    const int copy = _dup(file);
    if (copy < 0) return nullptr;
    std::FILE* stream = _fdopen(copy, "wb");
    if (stream == nullptr) {
        const int error = errno;
        _close(copy);
        errno = error;
    }
    return stream;
}

std::string plt_MakeTemporaryFolder(const char* beginning) {
    wchar_t place[MAX_PATH + 2];
    if (GetTempPathW(MAX_PATH + 2, place) == 0) {
        plt_Fail();
        return {};
    }
    std::random_device random;
    for (int attempts = 100; attempts > 0; --attempts) {
        const std::string path = plt_Narrow(place) + beginning + std::to_string(random());
        if (plt_MakeFolder(plt_kHere, path.c_str(), 0700) == 0) return path;
        if (errno != EEXIST) break;
    }
    return {};
}
