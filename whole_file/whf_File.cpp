#include "whole_file/whf_File.h"

#include "foundation/qio_Device.h"
#include "whole_file/whf_Scratch.h"

#include <cerrno>
#include <cstdio>
#include <filesystem>
#include <memory>
#include <optional>
#include <system_error>

namespace {

constexpr whf_System kStandardSystem{
    plt_ReadLink,
    plt_OpenFolder,
    plt_Inspect,
    plt_MayWrite,
    [](int at, const char* name) { return plt_MakeFolder(at, name, 0700); },
    plt_InspectOpen,
    plt_Lock,
    plt_Create,
    plt_Sync,
    plt_SetOwner,
    plt_SetMode,
    plt_Close,
    plt_Rename,
    plt_Remove,
    plt_RemoveFolder,
};

std::string WithReason(const std::string& action, int error) {
    return error == 0 ? action : action + ": " + std::generic_category().message(error);
}

std::string FolderOf(const std::string& path) {
    const std::string folder = plt_Path(path).parent_path().string();
    return folder.empty() ? "." : folder;
}

/// Whether somebody else may have put the link there to lead us astray: in a folder where all may write, only
/// the user's own links and those of the folder's owner are followed, as the kernel does.
bool IsForeign(const std::filesystem::path& link, const whf_System& system) {
    plt_Status found = {};
    plt_Status folder = {};
    const std::string here = FolderOf(link.string()) + "/.";
    if (whf_ErrorOf([&] { return system.inspect(plt_kHere, link.string().c_str(), &found); }) != 0)
        return false;
    if (whf_ErrorOf([&] { return system.inspect(plt_kHere, here.c_str(), &folder); }) != 0) return false;
    return plt_IsSharedByAll(folder) && found.st_uid != plt_Me() && found.st_uid != folder.st_uid;
}

/// The path at the end of the chain of links that begins at the path; there may be nothing there.
std::string EndOfLinks(const std::string& path, const whf_System& system) {
    constexpr int longestChain = 40;
    std::filesystem::path end = plt_Path(path);
    for (int i = 0; i < longestChain; ++i) {
        char target[4096];
        ssize_t length = 0;
        const int error = whf_ErrorOf([&] {
            return static_cast<int>(length = system.readlink(end.string().c_str(), target, sizeof target));
        });
        // No link; what else may be wrong with it shows when it is looked at.
        if (error != 0) return end.string();
        if (IsForeign(end, system)) {
            throw whf_Error("the link in its place is another user's, in a folder where all may write",
                            EACCES);
        }
        const std::filesystem::path next = plt_Path({target, static_cast<std::size_t>(length)});
        end = next.is_absolute() ? next : end.parent_path() / next;
    }
    throw whf_Error("cannot look at what is there", ELOOP);
}

int OpenFolder(const std::string& path, const whf_System& system) {
    int folder = -1;
    int error = whf_ErrorOf([&] { return folder = system.openFolder(plt_kHere, path.c_str(), plt_kFolder); });
    // A folder that may be written but not listed.
    if (error == EACCES)
        error = whf_ErrorOf([&] { return folder = plt_OpenUnlistedFolder(plt_kHere, path.c_str()); });
    if (error != 0) throw whf_Error("cannot open the folder '" + path + "'", error);
    return folder;
}

/// What is at the target; none where nothing is.
std::optional<plt_Status> FindOld(int folder, const std::string& name, const whf_System& system) {
    plt_Status found = {};
    const int error = whf_ErrorOf([&] { return system.inspect(folder, name.c_str(), &found); });
    if (error == ENOENT) return std::nullopt;
    if (error != 0) throw whf_Error("cannot look at what is there", error);
    if (plt_IsFolder(found)) throw whf_Error("a folder is in its place", EISDIR);
    if (!plt_IsFile(found)) throw whf_Error("something that is no file is in its place", 0);
    const int accessError = whf_ErrorOf([&] { return system.mayWrite(folder, name.c_str()); });
    if (accessError != 0) throw whf_Error("the file in its place may not be written", accessError);
    return found;
}

/// Makes the new file as accessible as the old one, and to nobody more.
int TakeOver(int file, const plt_Status& old, const std::string& oldPath, const whf_System& system) {
    bool hasGroup = whf_ErrorOf([&] { return system.chown(file, old.st_uid, old.st_gid); }) == 0;
    if (!hasGroup) {
        hasGroup =
            whf_ErrorOf([&] { return system.chown(file, static_cast<plt_Owner>(-1), old.st_gid); }) == 0;
    }
    const plt_Mode mode = old.st_mode & 0777;
    // Another group gets no more than all others have.
    const plt_Mode narrowed = (mode & 0707) | (mode & ((mode & 07) << 3));
    if (hasGroup) {
        const int error = whf_ErrorOf([&] { return system.chmod(file, mode); });
        if (error != 0 || plt_CopyAccessList(file, oldPath)) return error;
    }
    return whf_ErrorOf([&] { return system.chmod(file, narrowed); });
}

/// Writes to a file while the disk already takes what was written before.
class Device : public qio_ios {
public:
    Device(std::FILE* stream, int file) : file_(file) { attach(stream, false); }

    void Write(const char* text, std::size_t bytes) override {
        constexpr long long kPiece = 16 << 20;
        qio_ios::Write(text, bytes);
        if (Bytes() - begun_ < kPiece) return;
        plt_BeginSync(file_, begun_, Bytes() - begun_);
        begun_ = Bytes();
    }

private:
    int file_;
    long long begun_ = 0;
};

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
    const std::string name = plt_Path(path).filename().string();
    whf_Descriptor folder(OpenFolder(folderName, system_), system_);
    const std::optional<plt_Status> old = FindOld(folder.Number(), name, system_);
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
    const std::unique_ptr<std::FILE, FileCloser> stream(plt_StreamOf(number));
    if (stream == nullptr) throw whf_Error("cannot make the file", whf_ErrorNumber());
    std::setvbuf(stream.get(), nullptr, _IONBF, 0);
    Device device(stream.get(), number);
    write(device);
    device.close();
    if (device.Error() != 0) throw whf_Error("cannot write the " + thing_, device.Error());
    return device.Bytes();
}
