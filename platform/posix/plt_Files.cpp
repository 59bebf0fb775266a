#include "platform/plt_Files.h"

#include <cerrno>
#include <cstdlib>
#include <memory>
#include <vector>

#include <dirent.h>
#include <fcntl.h>
#include <sys/file.h>
#include <sys/uio.h>
#include <unistd.h>
#ifdef __linux__
#include <sys/xattr.h>
#endif

std::filesystem::path plt_Path(std::string_view name) {
    return name;
}

bool plt_IsFolder(const plt_Status& status) {
    return S_ISDIR(status.st_mode);
}

bool plt_IsFile(const plt_Status& status) {
    return S_ISREG(status.st_mode);
}

bool plt_IsSharedByAll(const plt_Status& folder) {
    return (folder.st_mode & S_ISVTX) != 0 && (folder.st_mode & S_IWOTH) != 0;
}

bool plt_IsPrivateFolder(const plt_Status& status) {
    return S_ISDIR(status.st_mode) && status.st_uid == ::geteuid() && (status.st_mode & 077) == 0;
}

plt_Owner plt_Me() {
    return ::geteuid();
}

ssize_t plt_ReadLink(const char* path, char* buffer, std::size_t bytes) {
    return ::readlink(path, buffer, bytes);
}

int plt_OpenFolder(int at, const char* name, int flags) {
    return ::openat(at, name, flags);
}

int plt_OpenUnlistedFolder(int at, const char* name) {
#ifdef O_PATH
    return ::openat(at, name, O_PATH | O_DIRECTORY | O_CLOEXEC);
#else
    static_cast<void>(at);
    static_cast<void>(name);
    errno = EACCES;
    return -1;
#endif
}

int plt_OpenToRead(const char* path) {
    return ::open(path, O_RDONLY | O_CLOEXEC);
}

int plt_Create(int at, const char* name, plt_Mode mode) {
    return ::openat(at, name, O_WRONLY | O_CREAT | O_EXCL | O_NOFOLLOW | O_CLOEXEC, mode);
}

int plt_OpenToAppend(int at, const char* name) {
    return ::openat(at, name, O_WRONLY | O_APPEND | O_CREAT | O_CLOEXEC | O_NOFOLLOW, 0666);
}

int plt_OpenToLock(int at, const char* name) {
    return ::openat(at, name, O_RDWR | O_CREAT | O_CLOEXEC | O_NOFOLLOW, 0666);
}

int plt_Inspect(int at, const char* name, plt_Status* found) {
    return ::fstatat(at, name, found, AT_SYMLINK_NOFOLLOW);
}

int plt_InspectOpen(int file, plt_Status* found) {
    return ::fstat(file, found);
}

int plt_MayWrite(int at, const char* name) {
    return ::faccessat(at, name, W_OK, AT_EACCESS);
}

int plt_MakeFolder(int at, const char* name, plt_Mode mode) {
    return ::mkdirat(at, name, mode);
}

int plt_Lock(int file) {
    return ::flock(file, LOCK_EX | LOCK_NB);
}

ssize_t plt_Read(int file, char* buffer, std::size_t bytes) {
    return ::read(file, buffer, bytes);
}

ssize_t plt_ReadAt(int file, char* buffer, std::size_t bytes, long long place) {
    return ::pread(file, buffer, bytes, place);
}

ssize_t plt_Write(int file, const char* text, std::size_t bytes) {
    return ::write(file, text, bytes);
}

ssize_t plt_WritePieces(int file, const plt_Piece* pieces, std::size_t count) {
    constexpr std::size_t most = 64;
    iovec vectors[most];
    const std::size_t taken = count < most ? count : most;
    for (std::size_t i = 0; i < taken; ++i) vectors[i] = {const_cast<char*>(pieces[i].text), pieces[i].bytes};
    return ::writev(file, vectors, static_cast<int>(taken));
}

int plt_Truncate(int file, long long bytes) {
    return ::ftruncate(file, bytes);
}

int plt_Sync(int file) {
    return ::fsync(file);
}

void plt_BeginSync([[maybe_unused]] int file, [[maybe_unused]] long long from,
                   [[maybe_unused]] long long bytes) {
#ifdef __linux__
    ::sync_file_range(file, from, bytes, SYNC_FILE_RANGE_WRITE);
#endif
}

int plt_Close(int file) {
    return ::close(file);
}

int plt_SetOwner(int file, plt_Owner owner, plt_Group group) {
    return ::fchown(file, owner, group);
}

int plt_SetMode(int file, plt_Mode mode) {
    return ::fchmod(file, mode);
}

bool plt_CopyAccessList(int file, const std::string& from) {
#ifdef __linux__
    constexpr const char* list = "system.posix_acl_access";
    const ssize_t size = ::lgetxattr(from.c_str(), list, nullptr, 0);
    if (size <= 0) return true;
    std::vector<char> value(static_cast<std::size_t>(size));
    return ::lgetxattr(from.c_str(), list, value.data(), value.size()) == size &&
           ::fsetxattr(file, list, value.data(), value.size(), 0) == 0;
#else
    static_cast<void>(file);
    static_cast<void>(from);
    return true;
#endif
}

int plt_Rename(int fromFolder, const char* from, int toFolder, const char* to) {
    return ::renameat(fromFolder, from, toFolder, to);
}

int plt_RenameToNew(int folder, const char* from, const char* to) {
#ifdef RENAME_NOREPLACE
    if (::renameat2(folder, from, folder, to, RENAME_NOREPLACE) == 0) return 0;
    // Some file systems don't know the flag.
    if (errno != EINVAL && errno != ENOSYS && errno != ENOTSUP) return -1;
#endif
    if (::linkat(folder, from, folder, to, 0) != 0) return -1;
    return ::unlinkat(folder, from, 0);
}

int plt_Remove(int at, const char* name) {
    return ::unlinkat(at, name, 0);
}

int plt_RemoveFolder(int at, const char* name) {
    return ::unlinkat(at, name, AT_REMOVEDIR);
}

int plt_List(int folder, const std::function<bool(const char* name)>& take) {
    const int listed = ::openat(folder, ".", plt_kFolder);
    if (listed < 0) return -1;
    const std::unique_ptr<DIR, int (*)(DIR*)> entries(::fdopendir(listed), ::closedir);
    if (entries == nullptr) {
        const int error = errno;
        ::close(listed);
        errno = error;
        return -1;
    }
    while (const dirent* entry = ::readdir(entries.get())) {
        if (!take(entry->d_name)) break;
    }
    return 0;
}

std::FILE* plt_OpenStream(const char* path, const char* mode) {
    return std::fopen(path, mode);
}

std::FILE* plt_StreamOf(int file) {
    const int copy = ::fcntl(file, F_DUPFD_CLOEXEC, 0);
    if (copy < 0) return nullptr;
    std::FILE* stream = ::fdopen(copy, "wb");
    if (stream == nullptr) {
        const int error = errno;
        ::close(copy);
        errno = error;
    }
    return stream;
}

std::string plt_MakeTemporaryFolder(const char* beginning) {
    std::error_code error;
    std::string path = std::filesystem::temp_directory_path(error).string() + "/" + beginning + "XXXXXX";
    return ::mkdtemp(path.data()) != nullptr ? path : std::string();
}
