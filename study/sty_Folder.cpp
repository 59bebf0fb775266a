#include "study/sty_Folder.h"

#include "store_interface/findings/fnd_Text.h"

#include <cerrno>
#include <cstdio>
#include <filesystem>
#include <memory>

#include <dirent.h>
#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

constexpr int kOpenFolder = O_RDONLY | O_DIRECTORY | O_CLOEXEC;

[[noreturn]] void Refuse(const std::string& action, const std::string& path, int error) {
    throw sty_Refused("cannot " + action + " " + fnd_Quoted(path) + ": " + sty_ReasonOf(error));
}

/// Renames within a folder where nothing has the new name; EEXIST when something has.
int RenameToNew(int folder, const char* name, const char* target) {
#ifdef RENAME_NOREPLACE
    if (::renameat2(folder, name, folder, target, RENAME_NOREPLACE) == 0) return 0;
    // Some file systems don't know the flag.
    if (errno != EINVAL && errno != ENOSYS && errno != ENOTSUP) return errno;
#endif
    if (::linkat(folder, name, folder, target, 0) != 0) return errno;
    return ::unlinkat(folder, name, 0) == 0 ? 0 : errno;
}

} // namespace

sty_Layout::sty_Layout(long long rows) : digits_(static_cast<int>(std::to_string(rows).size())) {
    for (long long held = kMostEntries; held < rows; held *= kMostEntries) ++levels_;
}

std::string sty_Layout::PathOf(long long row, const std::string& name) const {
    std::string path;
    long long held = 1;
    for (int i = 0; i < levels_; ++i) held *= kMostEntries;
    for (; held > 1; held /= kMostEntries) {
        char folder[24];
        std::snprintf(folder, sizeof folder, "%03lld/", (row - 1) / held % kMostEntries);
        path += folder;
    }
    if (!name.empty()) return path + name + ".inp";
    std::string digits = std::to_string(row);
    return path + std::string(static_cast<std::size_t>(digits_) - digits.size(), '0') + digits + ".inp";
}

sty_Folder::sty_Folder(const std::string& path) : path_(path) {
    std::error_code error;
    std::filesystem::create_directories(path, error);
    folder_ = sty_Descriptor(::open(path.c_str(), kOpenFolder));
    if (!folder_.IsOpen()) Refuse("open the folder", path, error ? error.value() : errno);
}

bool sty_Folder::IsEmpty() const {
    const int listed = ::openat(Number(), ".", kOpenFolder);
    const std::unique_ptr<DIR, int (*)(DIR*)> entries(listed < 0 ? nullptr : ::fdopendir(listed), ::closedir);
    if (entries == nullptr) Refuse("list the folder", path_, errno);
    while (const dirent* entry = ::readdir(entries.get())) {
        if (entry->d_name[0] != '.') return false;
    }
    return true;
}

void sty_Folder::Prepare() {
    if (::mkdirat(Number(), kHidden, 0777) != 0 && errno != EEXIST) Refuse("make a folder in", path_, errno);
    hidden_ = sty_Descriptor(::openat(Number(), kHidden, kOpenFolder | O_NOFOLLOW));
    if (!hidden_.IsOpen()) Refuse("open the folder", path_ + "/" + kHidden, errno);
}

std::optional<std::string> sty_Folder::Read(const std::string& name) const {
    const std::string path = path_ + "/" + name;
    sty_File file(path);
    std::string text;
    for (;;) {
        const std::string_view piece = file.Next();
        if (piece.empty()) break;
        text += piece;
    }
    if (file.Error() == ENOENT) return std::nullopt;
    if (file.Error() != 0) Refuse("read", path, file.Error());
    return text;
}

bool sty_Folder::Write(const std::string& name, const Writing& write, bool replace) {
    sty_Placer placer(*this, name + "." + std::to_string(::getpid()));
    const auto writeAndSync = [&](int file) {
        const int error = write(file);
        return error == 0 && ::fsync(file) != 0 && errno != EINVAL ? errno : error;
    };
    return placer.Place(name, writeAndSync, replace, [](const std::string&) { return false; }) ==
           sty_Placer::Result::PLACED;
}

void sty_Folder::RemoveUnplaced(const std::string& folder, const std::string& name) const {
    const sty_Descriptor opened(::openat(Number(), folder.empty() ? "." : folder.c_str(), kOpenFolder));
    if (!opened.IsOpen()) return;
    const std::string beginning = kUnplaced + name;
    const int listed = ::openat(opened.Number(), ".", kOpenFolder);
    const std::unique_ptr<DIR, int (*)(DIR*)> entries(listed < 0 ? nullptr : ::fdopendir(listed), ::closedir);
    if (entries == nullptr) return;
    while (const dirent* entry = ::readdir(entries.get())) {
        if (std::string_view(entry->d_name).starts_with(beginning))
            ::unlinkat(opened.Number(), entry->d_name, 0);
    }
}

long long sty_Folder::SizeOf(const std::string& path) const {
    struct stat found = {};
    if (::fstatat(Number(), path.c_str(), &found, AT_SYMLINK_NOFOLLOW) != 0 || !S_ISREG(found.st_mode))
        return -1;
    return found.st_size;
}

std::optional<sty_Descriptor> sty_Folder::Lock(const std::string& name) const {
    sty_Descriptor file(
        ::openat(hidden_.Number(), name.c_str(), O_RDWR | O_CREAT | O_CLOEXEC | O_NOFOLLOW, 0666));
    if (!file.IsOpen()) Refuse("make", path_ + "/" + kHidden + "/" + name, errno);
    // Some file systems have no locks.
    if (::flock(file.Number(), LOCK_EX | LOCK_NB) != 0 && errno == EWOULDBLOCK) return std::nullopt;
    return file;
}

int sty_Placer::FolderOf(const std::string& path) {
    const std::size_t slash = path.rfind('/');
    if (slash == std::string::npos) return folder_.Number();
    const std::string name = path.substr(0, slash);
    if (target_.IsOpen() && name == targetName_) return target_.Number();
    for (std::size_t end = name.find('/');; end = name.find('/', end + 1)) {
        const std::string each = name.substr(0, end);
        if (::mkdirat(folder_.Number(), each.c_str(), 0777) != 0 && errno != EEXIST)
            Refuse("make the folder", folder_.Path() + "/" + each, errno);
        if (end == std::string::npos) break;
    }
    target_ = sty_Descriptor(::openat(folder_.Number(), name.c_str(), kOpenFolder));
    if (!target_.IsOpen()) Refuse("open the folder", folder_.Path() + "/" + name, errno);
    targetName_ = name;
    return target_.Number();
}

void sty_Placer::Make(int folder, const std::string& whole, const sty_Folder::Writing& write) const {
    const auto create = [&] {
        return ::openat(folder, name_.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0666);
    };
    int number = create();
    if (number < 0 && errno == EEXIST) {
        ::unlinkat(folder, name_.c_str(), 0);
        number = create();
    }
    const sty_Descriptor file(number);
    if (!file.IsOpen()) Refuse("make a file for", whole, errno);
    const int error = write(file.Number());
    if (error == 0) return;
    ::unlinkat(folder, name_.c_str(), 0);
    Refuse("write", whole, error);
}

sty_Placer::Result sty_Placer::Place(const std::string& path, const sty_Folder::Writing& write, bool ours,
                                     const std::function<bool(const std::string& path)>& isSame) {
    const std::string whole = folder_.Path() + "/" + path;
    const int folder = FolderOf(path);
    const std::string target = path.substr(path.rfind('/') + 1);
    Make(folder, whole, write);
    int error = 0;
    if (ours) {
        error = ::renameat(folder, name_.c_str(), folder, target.c_str()) == 0 ? 0 : errno;
    } else {
        error = RenameToNew(folder, name_.c_str(), target.c_str());
    }
    if (error == 0) return Result::PLACED;
    ::unlinkat(folder, name_.c_str(), 0);
    if (ours || error != EEXIST) Refuse("put in its place", whole, error);
    return isSame(whole) ? Result::PLACED : Result::FOREIGN;
}
