#include "tools/DeckFile.h"

#include "foundation/qio_Device.h"
#include "tools/SignalCleanUp.h"

#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <system_error>
#include <utility>

#include <fcntl.h>
#include <unistd.h>

namespace {

constexpr DeckFileSystem kStandardSystem{
    [](const char* path, struct stat* found) { return ::stat(path, found); },
    [](char* pattern) { return ::mkdtemp(pattern); },
    [](const char* path) { return ::open(path, O_RDONLY | O_CLOEXEC); },
    [](int file) { return ::fsync(file); },
    [](int file) { return ::close(file); },
    [](const char* from, const char* to) { return std::rename(from, to); },
    [](const char* path) { return ::unlink(path); },
    [](const char* path) { return ::rmdir(path); },
};

std::string WithReason(const std::string& action, int error) {
    return error == 0 ? action : action + ": " + std::generic_category().message(error);
}

int ReasonOr(int fallback) {
    return errno != 0 ? errno : fallback;
}

/// Calls until the call isn't interrupted; the errno value of the failure, 0 for none.
template <class Call>
int ErrorOf(Call call) {
    for (;;) {
        errno = 0;
        if (call() >= 0) return 0;
        if (errno != EINTR) return ReasonOr(EIO);
    }
}

std::string FolderOf(const std::string& path) {
    const std::string folder = std::filesystem::path(path).parent_path().string();
    return folder.empty() ? "." : folder;
}

} // namespace

const DeckFileSystem& DeckFileSystem::Standard() {
    return kStandardSystem;
}

DeckFileError::DeckFileError(const std::string& action, int error)
    : std::runtime_error(WithReason(action, error)), error_(error) {}

/// The temporary folder with the deck in it; removes both.
class DeckFile::Scratch {
public:
    Scratch(const std::string& folder, const DeckFileSystem& system) : system_(system) {
        folder_ = folder + "/.qrxdeck-XXXXXX";
        jobName_.reserve(folder_.size() + 5);
        deck_.reserve(folder_.size() + 9);
        const SignalCleanUp::Block block;
        errno = 0;
        if (system_.makeFolder(folder_.data()) == nullptr) {
            throw DeckFileError("cannot make a temporary folder in '" + folder + "'", ReasonOr(EIO));
        }
        jobName_.append(folder_).append("/deck");
        deck_.append(jobName_).append(".inp");
        SignalCleanUp::Set(deck_.c_str(), folder_.c_str());
    }
    Scratch(const Scratch&) = delete;
    Scratch& operator=(const Scratch&) = delete;
    ~Scratch() { Remove(); }

    const std::string& Folder() const { return folder_; }
    const char* JobName() const { return jobName_.c_str(); }
    const std::string& Deck() const { return deck_; }

    void MarkMoved() { moved_ = true; }
    /// The errno value of the failure, 0 for none. Only the first call removes.
    int Remove() noexcept {
        if (removed_) return 0;
        removed_ = true;
        const int fileError = moved_ ? 0 : ErrorOf([this] { return system_.remove(deck_.c_str()); });
        const int folderError = ErrorOf([this] { return system_.removeFolder(folder_.c_str()); });
        SignalCleanUp::Clear();
        return fileError != 0 && fileError != ENOENT ? fileError : folderError;
    }

private:
    const DeckFileSystem& system_;
    std::string folder_;
    std::string jobName_;
    std::string deck_;
    bool moved_ = false;
    bool removed_ = false;
};

DeckFile::DeckFile(std::string target, const DeckFileSystem& system, std::string thing)
    : target_(std::move(target)), thing_(std::move(thing)), folder_(FolderOf(target_)), system_(system) {}

DeckFile::Result DeckFile::Replace(const std::function<void(const char* jobName)>& write) {
    CheckTarget();
    Scratch scratch(folder_, system_);
    temporaryFolder_ = scratch.Folder();
    qio_RecordOpenFailure(ENOENT);
    write(scratch.JobName());

    const qio_Report report = qio_LastReport();
    if (!report.opened) throw DeckFileError("cannot make the file", report.error);
    if (report.error != 0) throw DeckFileError("cannot write the " + thing_, report.error);
    SyncFile(scratch.Deck());
    const int error = ErrorOf([&] { return system_.rename(scratch.Deck().c_str(), target_.c_str()); });
    if (error != 0) throw DeckFileError("cannot put the " + thing_ + " in its place", error);

    scratch.MarkMoved();
    Result result;
    result.bytes = report.bytes;
    result.removeError = scratch.Remove();
    result.folderSyncError = Sync(folder_.c_str());
    return result;
}

void DeckFile::CheckTarget() const {
    struct stat found = {};
    const int error = ErrorOf([&] { return system_.inspect(target_.c_str(), &found); });
    if (error == ENOENT) return;
    if (error != 0) throw DeckFileError("cannot look at what is there", error);
    if (S_ISDIR(found.st_mode)) throw DeckFileError("a folder is in its place", EISDIR);
    if (!S_ISREG(found.st_mode)) throw DeckFileError("something that is no file is in its place", 0);
}

void DeckFile::SyncFile(const std::string& path) const {
    const int error = Sync(path.c_str());
    if (error != 0) throw DeckFileError("cannot bring the " + thing_ + " to the disk", error);
}

int DeckFile::Sync(const char* path) const {
    int file = -1;
    const int openError = ErrorOf([&] { return file = system_.open(path); });
    if (openError != 0) return openError;
    int error = ErrorOf([&] { return system_.sync(file); });
    // Some file systems have nothing to sync.
    if (error == EINVAL || error == ENOTSUP) error = 0;
    errno = 0;
    // An interrupted close has closed.
    if (system_.close(file) != 0 && errno != EINTR && error == 0) error = ReasonOr(EIO);
    return error;
}
