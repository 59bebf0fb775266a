#ifndef QRX_PLATFORM_PLT_FILES_H
#define QRX_PLATFORM_PLT_FILES_H

#include <cstddef>
#include <cstdio>
#include <filesystem>
#include <functional>
#include <string>
#include <string_view>

#ifdef _WIN32
#include <cstdint>
#include <sys/types.h>
#else
#include <fcntl.h>
#include <sys/stat.h>
#endif

// Files and folders, each call as the one of POSIX that its comment names: what fails gives -1 and sets
// errno. Paths are UTF-8. `at` is an open folder in which names are looked up, or plt_kHere.

#ifdef _WIN32
using plt_Owner = unsigned;
using plt_Group = unsigned;
using plt_Mode = unsigned;
/// The members that are asked for, under the names that they have elsewhere.
struct plt_Status {
    std::uint64_t st_dev;
    std::uint64_t st_ino;
    plt_Mode st_mode;
    plt_Owner st_uid;
    plt_Group st_gid;
    long long st_size;
};
constexpr int plt_kHere = -100;
enum plt_OpenFlags : int { plt_kFolder = 0, plt_kNoLink = 1, plt_kAlone = 2 };
#else
using plt_Owner = uid_t;
using plt_Group = gid_t;
using plt_Mode = mode_t;
using plt_Status = struct stat;
constexpr int plt_kHere = AT_FDCWD;
/// How a folder is opened: no link at the name itself is followed; no other process opens it so as long as
/// this one has it open. The latter takes a plt_Lock too, where opening alone doesn't do it.
enum plt_OpenFlags : int {
    plt_kFolder = O_RDONLY | O_DIRECTORY | O_CLOEXEC,
    plt_kNoLink = O_NOFOLLOW,
    plt_kAlone = O_NOFOLLOW,
};
#endif

/// The path of a name that is UTF-8; `string()` of a path is UTF-8 everywhere.
std::filesystem::path plt_Path(std::string_view name);

bool plt_IsFolder(const plt_Status& status);
bool plt_IsFile(const plt_Status& status);
/// Whether all may write to the folder, but remove nothing of others.
bool plt_IsSharedByAll(const plt_Status& folder);
/// A folder of this user, that nobody else may look into.
bool plt_IsPrivateFolder(const plt_Status& status);
plt_Owner plt_Me();

/// readlink; a link's target that is UTF-8.
ssize_t plt_ReadLink(const char* path, char* buffer, std::size_t bytes);
/// openat, of a folder.
int plt_OpenFolder(int at, const char* name, int flags);
/// As plt_OpenFolder, of a folder that may be used but not listed.
int plt_OpenUnlistedFolder(int at, const char* name);
/// open, for reading.
int plt_OpenToRead(const char* path);
/// openat, of a new file for writing.
int plt_Create(int at, const char* name, plt_Mode mode);
/// openat, of a file for writing behind its end; it is made where there is none.
int plt_OpenToAppend(int at, const char* name);
/// openat, of a file that is there to be locked; it is made where there is none.
int plt_OpenToLock(int at, const char* name);
/// fstatat, which follows no link at the name itself, and fstat.
int plt_Inspect(int at, const char* name, plt_Status* found);
int plt_InspectOpen(int file, plt_Status* found);
/// faccessat, for writing.
int plt_MayWrite(int at, const char* name);
int plt_MakeFolder(int at, const char* name, plt_Mode mode);
/// flock: alone, without waiting; EWOULDBLOCK where another has it.
int plt_Lock(int file);
/// read, pread and write.
ssize_t plt_Read(int file, char* buffer, std::size_t bytes);
ssize_t plt_ReadAt(int file, char* buffer, std::size_t bytes, long long place);
ssize_t plt_Write(int file, const char* text, std::size_t bytes);
/// writev, of any number of texts; some of the first ones may be all that is taken.
struct plt_Piece {
    const char* text;
    std::size_t bytes;
};
ssize_t plt_WritePieces(int file, const plt_Piece* pieces, std::size_t count);
int plt_Truncate(int file, long long bytes);
/// fsync; EINVAL where there is nothing to sync.
int plt_Sync(int file);
/// Lets the system begin to bring written bytes to the disk, without waiting for it; nothing where a system has
/// no such call.
void plt_BeginSync(int file, long long from, long long bytes);
int plt_Close(int file);
/// fchown and fchmod; no failures where a system has no such thing.
int plt_SetOwner(int file, plt_Owner owner, plt_Group group);
int plt_SetMode(int file, plt_Mode mode);
/// Gives an open file the access control list of another one; false when there is one that can't be given.
bool plt_CopyAccessList(int file, const std::string& from);
/// renameat, which replaces in one step, and the same where nothing has the new name: EEXIST when something
/// has.
int plt_Rename(int fromFolder, const char* from, int toFolder, const char* to);
int plt_RenameToNew(int folder, const char* from, const char* to);
int plt_Remove(int at, const char* name);
int plt_RemoveFolder(int at, const char* name);
/// Calls `take` with each name in an open folder, until it gives false.
int plt_List(int folder, const std::function<bool(const char* name)>& take);
/// fopen, and a stream on a copy of an open file, which closing leaves open; null with errno.
std::FILE* plt_OpenStream(const char* path, const char* mode);
std::FILE* plt_StreamOf(int file);
/// mkdtemp: a fresh folder of the user's own among the temporary ones; empty with errno.
std::string plt_MakeTemporaryFolder(const char* beginning);

#endif
