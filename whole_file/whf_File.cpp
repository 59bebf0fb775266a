#include "whole_file/whf_File.h"

#include "foundation/qio_Device.h"
#include "whole_file/whf_Scratch.h"

#include <cerrno>
#include <cstdio>
#include <filesystem>
#include <memory>
#include <optional>
#include <system_error>
#include <vector>

#include <fcntl.h>
#include <sys/file.h>
#include <unistd.h>
#ifdef __linux__
#include <sys/xattr.h>
#endif

namespace {

constexpr whf_System kStandardSystem{
    [](const char* path, char* buffer, std::size_t bytes) { return ::readlink(path, buffer, bytes); },
    [](int at, const char* name, int flags) { return ::openat(at, name, flags); },
    [](int at, const char* name, struct stat* found) {
        return ::fstatat(at, name, found, AT_SYMLINK_NOFOLLOW);
    },
    [](int at, const char* name) { return ::faccessat(at, name, W_OK, AT_EACCESS); },
    [](int at, const char* name) { return ::mkdirat(at, name, 0700); },
    [](int file, struct stat* found) { return ::fstat(file, found); },
    [](int file) { return ::flock(file, LOCK_EX | LOCK_NB); },
    [](int at, const char* name, mode_t mode) {
        return ::openat(at, name, O_WRONLY | O_CREAT | O_EXCL | O_NOFOLLOW | O_CLOEXEC, mode);
    },
    [](int file) { return ::fsync(file); },
    [](int file, uid_t owner, gid_t group) { return ::fchown(file, owner, group); },
    [](int file, mode_t mode) { return ::fchmod(file, mode); },
    [](int file) { return ::close(file); },
    [](int fromFolder, const char* from, int toFolder, const char* to) {
        return ::renameat(fromFolder, from, toFolder, to);
    },
    [](int at, const char* name) { return ::unlinkat(at, name, 0); },
    [](int at, const char* name) { return ::unlinkat(at, name, AT_REMOVEDIR); },
};

std::string WithReason(const std::string& action, int error) {
    return error == 0 ? action : action + ": " + std::generic_category().message(error);
}

std::string FolderOf(const std::string& path) {
    const std::string folder = std::filesystem::path(path).parent_path().string();
    return folder.empty() ? "." : folder;
}

/// Whether somebody else may have put the link there to lead us astray: in a folder where all may write, only
/// the user's own links and those of the folder's owner are followed, as the kernel does.
bool IsForeign(const std::filesystem::path& link, const whf_System& system) {
    struct stat found = {};
    struct stat folder = {};
    const std::string here = FolderOf(link.string()) + "/.";
    if (whf_ErrorOf([&] { return system.inspect(AT_FDCWD, link.c_str(), &found); }) != 0) return false;
    if (whf_ErrorOf([&] { return system.inspect(AT_FDCWD, here.c_str(), &folder); }) != 0) return false;
    const bool isOpenToAll = (folder.st_mode & S_ISVTX) != 0 && (folder.st_mode & S_IWOTH) != 0;
    return isOpenToAll && found.st_uid != ::geteuid() && found.st_uid != folder.st_uid;
}

/// The path at the end of the chain of links that begins at the path; there may be nothing there.
std::string EndOfLinks(const std::string& path, const whf_System& system) {
    constexpr int longestChain = 40;
    std::filesystem::path end = path;
    for (int i = 0; i < longestChain; ++i) {
        char target[4096];
        ssize_t length = 0;
        const int error = whf_ErrorOf(
            [&] { return static_cast<int>(length = system.readlink(end.c_str(), target, sizeof target)); });
        // No link; what else may be wrong with it shows when it is looked at.
        if (error != 0) return end.string();
        if (IsForeign(end, system)) {
            throw whf_Error("the link in its place is another user's, in a folder where all may write",
                            EACCES);
        }
        const std::filesystem::path next(std::string(target, static_cast<std::size_t>(length)));
        end = next.is_absolute() ? next : end.parent_path() / next;
    }
    throw whf_Error("cannot look at what is there", ELOOP);
}

int OpenFolder(const std::string& path, const whf_System& system) {
    int folder = -1;
    const auto open = [&](int flags) {
        return whf_ErrorOf(
            [&] { return folder = system.openFolder(AT_FDCWD, path.c_str(), flags | O_CLOEXEC); });
    };
    int error = open(O_RDONLY | O_DIRECTORY);
#ifdef O_PATH
    // A folder that may be written but not listed.
    if (error == EACCES) error = open(O_PATH | O_DIRECTORY);
#endif
    if (error != 0) throw whf_Error("cannot open the folder '" + path + "'", error);
    return folder;
}

/// What is at the target; none where nothing is.
std::optional<struct stat> FindOld(int folder, const std::string& name, const whf_System& system) {
    struct stat found = {};
    const int error = whf_ErrorOf([&] { return system.inspect(folder, name.c_str(), &found); });
    if (error == ENOENT) return std::nullopt;
    if (error != 0) throw whf_Error("cannot look at what is there", error);
    if (S_ISDIR(found.st_mode)) throw whf_Error("a folder is in its place", EISDIR);
    if (!S_ISREG(found.st_mode)) throw whf_Error("something that is no file is in its place", 0);
    const int accessError = whf_ErrorOf([&] { return system.mayWrite(folder, name.c_str()); });
    if (accessError != 0) throw whf_Error("the file in its place may not be written", accessError);
    return found;
}

/// Gives the new file the access control list of the old one; false when it has one that can't be given.
bool CopyAccessList(int file, const std::string& old) {
#ifdef __linux__
    constexpr const char* list = "system.posix_acl_access";
    const ssize_t size = ::lgetxattr(old.c_str(), list, nullptr, 0);
    if (size <= 0) return true;
    std::vector<char> value(static_cast<std::size_t>(size));
    return ::lgetxattr(old.c_str(), list, value.data(), value.size()) == size &&
           ::fsetxattr(file, list, value.data(), value.size(), 0) == 0;
#else
    static_cast<void>(file);
    static_cast<void>(old);
    return true;
#endif
}

/// Makes the new file as accessible as the old one, and to nobody more.
int TakeOver(int file, const struct stat& old, const std::string& oldPath, const whf_System& system) {
    bool hasGroup = whf_ErrorOf([&] { return system.chown(file, old.st_uid, old.st_gid); }) == 0;
    if (!hasGroup) {
        hasGroup = whf_ErrorOf([&] { return system.chown(file, static_cast<uid_t>(-1), old.st_gid); }) == 0;
    }
    const mode_t mode = old.st_mode & 0777;
    // Another group gets no more than all others have.
    const mode_t narrowed = (mode & 0707) | (mode & ((mode & 07) << 3));
    if (hasGroup) {
        const int error = whf_ErrorOf([&] { return system.chmod(file, mode); });
        if (error != 0 || CopyAccessList(file, oldPath)) return error;
    }
    return whf_ErrorOf([&] { return system.chmod(file, narrowed); });
}

struct FileCloser {
    void operator()(std::FILE* file) const { std::fclose(file); }
};

} // namespace

const whf_System& whf_System::Standard() {
    return kStandardSystem;
}

whf_Error::whf_Error(const std::string& action, int error)
    : std::runtime_error(WithReason(action, error)), error_(error) {}

whf_File::whf_File(std::string target, const whf_System& system, std::string thing)
    : target_(std::move(target)), thing_(std::move(thing)), system_(system) {}

whf_File::Result whf_File::Replace(const Write& write, const Ready& ready) {
    const std::string path = EndOfLinks(target_, system_);
    const std::string folderName = FolderOf(path);
    const std::string name = std::filesystem::path(path).filename().string();
    whf_Descriptor folder(OpenFolder(folderName, system_), system_);
    const std::optional<struct stat> old = FindOld(folder.Number(), name, system_);
    whf_Scratch::RemoveLeavings(folder.Number(), system_);
    whf_Scratch scratch(folder.Number(), folderName, system_);
    temporaryFolder_ = folderName + "/" + scratch.Name();

    const auto check = [](const std::string& action, int error) {
        if (error != 0) throw whf_Error(action, error);
    };
    int number = -1;
    check("cannot make the file", whf_ErrorOf([&] {
              return number = system_.create(scratch.Number(), whf_Scratch::kFileName, old ? 0600 : 0666);
          }));
    whf_Descriptor file(number, system_);
    Result result;
    result.bytes = WriteTo(number, write);
    if (old) check("cannot keep the access to the " + thing_, TakeOver(number, *old, path, system_));
    const int syncError = whf_ErrorOf([&] { return system_.sync(number); });
    // Some file systems have nothing to sync.
    if (syncError != EINVAL && syncError != ENOTSUP) {
        check("cannot bring the " + thing_ + " to the disk", syncError);
    }
    check("cannot write the " + thing_, file.Close());
    if (ready) ready(result.bytes);
    check("cannot put the " + thing_ + " in its place", whf_ErrorOf([&] {
              return system_.rename(scratch.Number(), whf_Scratch::kFileName, folder.Number(), name.c_str());
          }));

    scratch.MarkMoved();
    result.removeError = scratch.Remove();
    result.folderSyncError = whf_ErrorOf([&] { return system_.sync(folder.Number()); });
    if (result.folderSyncError == EINVAL || result.folderSyncError == ENOTSUP) result.folderSyncError = 0;
    const int closeError = folder.Close();
    if (result.folderSyncError == 0) result.folderSyncError = closeError;
    return result;
}

long long whf_File::WriteTo(int number, const Write& write) const {
    const int copy = ::fcntl(number, F_DUPFD_CLOEXEC, 0);
    const std::unique_ptr<std::FILE, FileCloser> stream(copy < 0 ? nullptr : ::fdopen(copy, "wb"));
    if (stream == nullptr) {
        const int error = whf_ErrorNumber();
        if (copy >= 0) ::close(copy);
        throw whf_Error("cannot make the file", error);
    }
    std::setvbuf(stream.get(), nullptr, _IONBF, 0);
    qio_ios device;
    device.attach(stream.get(), false);
    write(device);
    device.close();
    if (device.Error() != 0) throw whf_Error("cannot write the " + thing_, device.Error());
    return device.Bytes();
}
