#include "whole_file/whf_Scratch.h"

#include "whole_file/whf_SignalCleanUp.h"

#include <cerrno>
#include <random>
#include <string_view>

namespace {

constexpr std::string_view kScratchPrefix = ".qrxdeck-";
constexpr int kFolderFlags = plt_kFolder | plt_kAlone;

void RemoveIfLeft(int folder, const char* name, const whf_System& system) {
    const whf_Descriptor opened(system.openFolder(folder, name, kFolderFlags), system);
    plt_Status found = {};
    if (opened.Number() < 0 || system.inspectOpen(opened.Number(), &found) != 0) return;
    if (!plt_IsPrivateFolder(found)) return;
    if (system.lock(opened.Number()) != 0) return;
    system.remove(opened.Number(), whf_Scratch::kFileName);
    system.removeFolder(folder, name);
}

} // namespace

int whf_Descriptor::Close() noexcept {
    if (number_ < 0) return 0;
    const int number = std::exchange(number_, -1);
    errno = 0;
    // An interrupted close has closed.
    return system_->close(number) != 0 && errno != EINTR ? whf_ErrorNumber() : 0;
}

void whf_Scratch::RemoveLeavings(int folder, const whf_System& system) {
    plt_List(folder, [&](const char* name) {
        if (std::string_view(name).starts_with(kScratchPrefix)) RemoveIfLeft(folder, name, system);
        return true;
    });
}

whf_Scratch::whf_Scratch(int folder, const std::string& folderName, const whf_System& system)
    : folder_(folder), system_(system), opened_(-1, system) {
    constexpr int attempts = 100;
    for (int i = 0; i < attempts; ++i) {
        if (Make(folderName)) return;
    }
    throw whf_Error("cannot make a temporary folder in '" + folderName + "'", EEXIST);
}

std::string whf_Scratch::NewName() {
    constexpr std::string_view letters = "abcdefghijklmnopqrstuvwxyz0123456789";
    constexpr int length = 12;
    std::random_device random;
    std::uniform_int_distribution<std::size_t> any(0, letters.size() - 1);
    std::string name(kScratchPrefix);
    for (int i = 0; i < length; ++i) name += letters[any(random)];
    return name;
}

bool whf_Scratch::Make(const std::string& folderName) {
    const auto fail = [&](int error) {
        throw whf_Error("cannot make a temporary folder in '" + folderName + "'", error);
    };
    name_ = NewName();
    const whf_SignalCleanUp::Block block;
    const int madeError = whf_ErrorOf([&] { return system_.makeFolder(folder_, name_.c_str()); });
    if (madeError == EEXIST) return false;
    if (madeError != 0) fail(madeError);
    int number = -1;
    const int openError =
        whf_ErrorOf([&] { return number = system_.openFolder(folder_, name_.c_str(), kFolderFlags); });
    whf_Descriptor opened(number, system_);
    plt_Status found = {};
    plt_Status named = {};
    int error = openError;
    // Somebody who tidied up had it locked before it was opened here, and has removed it.
    if (error == ENOENT) return false;
    if (error == 0) error = whf_ErrorOf([&] { return system_.inspectOpen(number, &found); });
    if (error == 0 && !plt_IsPrivateFolder(found)) error = EPERM;
    if (error != 0) {
        system_.removeFolder(folder_, name_.c_str());
        fail(error);
    }
    // Some file systems have no locks; there nobody takes the folder for a left one either.
    const int lockError = whf_ErrorOf([&] { return system_.lock(number); });
    const int lookError = whf_ErrorOf([&] { return system_.inspect(folder_, name_.c_str(), &named); });
    if (lockError == EWOULDBLOCK || lookError != 0 || named.st_dev != found.st_dev ||
        named.st_ino != found.st_ino) {
        system_.removeFolder(folder_, name_.c_str());
        return false;
    }
    opened_ = std::move(opened);
    cleanUpPlace_ = whf_SignalCleanUp::Set(folder_, name_.c_str(), number);
    return true;
}

int whf_Scratch::Remove() noexcept {
    if (removed_ || opened_.Number() < 0) return 0;
    removed_ = true;
    const int fileError =
        moved_ ? 0 : whf_ErrorOf([this] { return system_.remove(opened_.Number(), kFileName); });
    const int folderError = whf_ErrorOf([this] { return system_.removeFolder(folder_, name_.c_str()); });
    whf_SignalCleanUp::Clear(std::exchange(cleanUpPlace_, -1));
    opened_.Close();
    return fileError != 0 && fileError != ENOENT ? fileError : folderError;
}
