#include "tools/ScratchFolder.h"

#include "tools/SignalCleanUp.h"

#include <cerrno>
#include <memory>
#include <random>
#include <string_view>

#include <dirent.h>
#include <fcntl.h>
#include <unistd.h>

namespace {

constexpr std::string_view kScratchPrefix = ".qrxdeck-";
constexpr int kFolderFlags = O_RDONLY | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC;

bool IsOurs(const struct stat& found) {
    return S_ISDIR(found.st_mode) && found.st_uid == ::geteuid() && (found.st_mode & 077) == 0;
}

void RemoveIfLeft(int folder, const char* name, const DeckFileSystem& system) {
    const Descriptor opened(system.openFolder(folder, name, kFolderFlags), system);
    struct stat found = {};
    if (opened.Number() < 0 || system.inspectOpen(opened.Number(), &found) != 0 || !IsOurs(found)) return;
    if (system.lock(opened.Number()) != 0) return;
    system.remove(opened.Number(), ScratchFolder::kFileName);
    system.removeFolder(folder, name);
}

} // namespace

int Descriptor::Close() noexcept {
    if (number_ < 0) return 0;
    const int number = std::exchange(number_, -1);
    errno = 0;
    // An interrupted close has closed.
    return system_->close(number) != 0 && errno != EINTR ? ErrorNumber() : 0;
}

void ScratchFolder::RemoveLeavings(int folder, const DeckFileSystem& system) {
    const int listed = ::openat(folder, ".", O_RDONLY | O_DIRECTORY | O_CLOEXEC);
    if (listed < 0) return;
    const std::unique_ptr<DIR, int (*)(DIR*)> entries(::fdopendir(listed), ::closedir);
    if (entries == nullptr) {
        ::close(listed);
        return;
    }
    while (const dirent* entry = ::readdir(entries.get())) {
        if (std::string_view(entry->d_name).starts_with(kScratchPrefix))
            RemoveIfLeft(folder, entry->d_name, system);
    }
}

ScratchFolder::ScratchFolder(int folder, const std::string& folderName, const DeckFileSystem& system)
    : folder_(folder), system_(system), opened_(-1, system) {
    constexpr int attempts = 100;
    for (int i = 0; i < attempts; ++i) {
        if (Make(folderName)) return;
    }
    throw DeckFileError("cannot make a temporary folder in '" + folderName + "'", EEXIST);
}

std::string ScratchFolder::NewName() {
    constexpr std::string_view letters = "abcdefghijklmnopqrstuvwxyz0123456789";
    constexpr int length = 12;
    std::random_device random;
    std::uniform_int_distribution<std::size_t> any(0, letters.size() - 1);
    std::string name(kScratchPrefix);
    for (int i = 0; i < length; ++i) name += letters[any(random)];
    return name;
}

bool ScratchFolder::Make(const std::string& folderName) {
    const auto fail = [&](int error) {
        throw DeckFileError("cannot make a temporary folder in '" + folderName + "'", error);
    };
    name_ = NewName();
    const SignalCleanUp::Block block;
    const int madeError = ErrorOf([&] { return system_.makeFolder(folder_, name_.c_str()); });
    if (madeError == EEXIST) return false;
    if (madeError != 0) fail(madeError);
    int number = -1;
    const int openError =
        ErrorOf([&] { return number = system_.openFolder(folder_, name_.c_str(), kFolderFlags); });
    Descriptor opened(number, system_);
    struct stat found = {};
    struct stat named = {};
    int error = openError;
    if (error == 0) error = ErrorOf([&] { return system_.inspectOpen(number, &found); });
    if (error == 0 && !IsOurs(found)) error = EPERM;
    if (error != 0) {
        system_.removeFolder(folder_, name_.c_str());
        fail(error);
    }
    // Some file systems have no locks; there nobody takes the folder for a left one either.
    const int lockError = ErrorOf([&] { return system_.lock(number); });
    const int lookError = ErrorOf([&] { return system_.inspect(folder_, name_.c_str(), &named); });
    if (lockError == EWOULDBLOCK || lookError != 0 || named.st_dev != found.st_dev ||
        named.st_ino != found.st_ino) {
        system_.removeFolder(folder_, name_.c_str());
        return false;
    }
    opened_ = std::move(opened);
    SignalCleanUp::Set(folder_, name_.c_str(), number);
    return true;
}

int ScratchFolder::Remove() noexcept {
    if (removed_ || opened_.Number() < 0) return 0;
    removed_ = true;
    const int fileError =
        moved_ ? 0 : ErrorOf([this] { return system_.remove(opened_.Number(), kFileName); });
    const int folderError = ErrorOf([this] { return system_.removeFolder(folder_, name_.c_str()); });
    SignalCleanUp::Clear();
    opened_.Close();
    return fileError != 0 && fileError != ENOENT ? fileError : folderError;
}
