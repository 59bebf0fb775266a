#include "study/sty_Folder.h"

#include "platform/plt_Files.h"
#include "platform/plt_Process.h"
#include "store_interface/findings/fnd_Text.h"

#include <cerrno>
#include <cstdio>
#include <filesystem>

namespace {

[[noreturn]] void Refuse(const std::string& action, const std::string& path, int error) {
    throw sty_Refused("cannot " + action + " " + fnd_Quoted(path) + ": " + sty_ReasonOf(error));
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
    std::filesystem::create_directories(plt_Path(path), error);
    folder_ = sty_Descriptor(plt_OpenFolder(plt_kHere, path.c_str(), plt_kFolder));
    if (!folder_.IsOpen()) Refuse("open the folder", path, error ? error.value() : errno);
}

bool sty_Folder::IsEmpty() const {
    bool isEmpty = true;
    const auto look = [&isEmpty](const char* name) { return isEmpty = name[0] == '.'; };
    if (plt_List(Number(), look) != 0) Refuse("list the folder", path_, errno);
    return isEmpty;
}

void sty_Folder::Prepare() {
    if (plt_MakeFolder(Number(), kHidden, 0777) != 0 && errno != EEXIST)
        Refuse("make a folder in", path_, errno);
    hidden_ = sty_Descriptor(plt_OpenFolder(Number(), kHidden, plt_kFolder | plt_kNoLink));
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
    sty_Placer placer(*this, name + "." + std::to_string(plt_ProcessNumber()));
    const auto writeAndSync = [&](int file) {
        const int error = write(file);
        return error == 0 && plt_Sync(file) != 0 && errno != EINVAL ? errno : error;
    };
    return placer.Place(name, writeAndSync, replace, [](const std::string&) { return false; }) ==
           sty_Placer::Result::PLACED;
}

void sty_Folder::RemoveUnplaced(const std::string& folder, const std::string& name) const {
    const sty_Descriptor opened(plt_OpenFolder(Number(), folder.empty() ? "." : folder.c_str(), plt_kFolder));
    if (!opened.IsOpen()) return;
    const std::string beginning = kUnplaced + name;
    plt_List(opened.Number(), [&](const char* each) {
        if (std::string_view(each).starts_with(beginning)) plt_Remove(opened.Number(), each);
        return true;
    });
}

long long sty_Folder::SizeOf(const std::string& path) const {
    plt_Status found = {};
    if (plt_Inspect(Number(), path.c_str(), &found) != 0 || !plt_IsFile(found)) return -1;
    return found.st_size;
}

std::optional<sty_Descriptor> sty_Folder::Lock(const std::string& name) const {
    sty_Descriptor file(plt_OpenToLock(hidden_.Number(), name.c_str()));
    if (!file.IsOpen()) Refuse("make", path_ + "/" + kHidden + "/" + name, errno);
    // Some file systems have no locks.
    if (plt_Lock(file.Number()) != 0 && errno == EWOULDBLOCK) return std::nullopt;
    return file;
}

int sty_Placer::FolderOf(const std::string& path) {
    const std::size_t slash = path.rfind('/');
    if (slash == std::string::npos) return folder_.Number();
    const std::string name = path.substr(0, slash);
    if (target_.IsOpen() && name == targetName_) return target_.Number();
    for (std::size_t end = name.find('/');; end = name.find('/', end + 1)) {
        const std::string each = name.substr(0, end);
        if (plt_MakeFolder(folder_.Number(), each.c_str(), 0777) != 0 && errno != EEXIST)
            Refuse("make the folder", folder_.Path() + "/" + each, errno);
        if (end == std::string::npos) break;
    }
    target_ = sty_Descriptor(plt_OpenFolder(folder_.Number(), name.c_str(), plt_kFolder));
    if (!target_.IsOpen()) Refuse("open the folder", folder_.Path() + "/" + name, errno);
    targetName_ = name;
    return target_.Number();
}

void sty_Placer::Make(int folder, const std::string& whole, const sty_Folder::Writing& write) const {
    const auto create = [&] { return plt_Create(folder, name_.c_str(), 0666); };
    int number = create();
    if (number < 0 && errno == EEXIST) {
        plt_Remove(folder, name_.c_str());
        number = create();
    }
    const sty_Descriptor file(number);
    if (!file.IsOpen()) Refuse("make a file for", whole, errno);
    const int error = write(file.Number());
    if (error == 0) return;
    plt_Remove(folder, name_.c_str());
    Refuse("write", whole, error);
}

sty_Placer::Result sty_Placer::Place(const std::string& path, const sty_Folder::Writing& write, bool ours,
                                     const std::function<bool(const std::string& path)>& isSame) {
    const std::string whole = folder_.Path() + "/" + path;
    const int folder = FolderOf(path);
    const std::string target = path.substr(path.rfind('/') + 1);
    Make(folder, whole, write);
    const int renamed = ours ? plt_Rename(folder, name_.c_str(), folder, target.c_str())
                             : plt_RenameToNew(folder, name_.c_str(), target.c_str());
    const int error = renamed == 0 ? 0 : errno;
    if (error == 0) return Result::PLACED;
    plt_Remove(folder, name_.c_str());
    if (ours || error != EEXIST) Refuse("put in its place", whole, error);
    return isSame(whole) ? Result::PLACED : Result::FOREIGN;
}
