#include "whole_file/whf_SignalCleanUp.h"

#include "whole_file/whf_Scratch.h"

#include <atomic>
#include <cstring>

namespace {

// Longer names are left to the next run.
constexpr std::size_t kLongestName = 255;

enum class Use : int { FREE, FILLED, SET };
struct Folder {
    std::atomic<Use> use = Use::FREE;
    int at = -1;
    int number = -1;
    char name[kLongestName + 1] = {};
};
static_assert(std::atomic<Use>::is_always_lock_free);
Folder theFolders[whf_SignalCleanUp::kMost];

using Function = void (*)() noexcept;
std::atomic<Function> theFunction = nullptr;
static_assert(std::atomic<Function>::is_always_lock_free);

void CleanUp() {
    whf_SignalCleanUp::Remove();
    if (const Function function = theFunction.load(); function != nullptr) function();
}

} // namespace

void whf_SignalCleanUp::Install() {
    plt_AtEndingSignals(&CleanUp);
}

int whf_SignalCleanUp::Set(int at, const char* name, int folder) noexcept {
    const std::size_t length = std::strlen(name);
    if (length > kLongestName) return -1;
    for (int place = 0; place < kMost; ++place) {
        Folder& own = theFolders[place];
        Use expected = Use::FREE;
        if (!own.use.compare_exchange_strong(expected, Use::FILLED)) continue;
        std::memcpy(own.name, name, length + 1);
        own.at = at;
        own.number = folder;
        own.use.store(Use::SET);
        return place;
    }
    return -1;
}

void whf_SignalCleanUp::Clear(int place) noexcept {
    if (place >= 0) theFolders[place].use.store(Use::FREE);
}

void whf_SignalCleanUp::AlsoCall(void (*function)() noexcept) noexcept {
    theFunction.store(function);
}

void whf_SignalCleanUp::Remove() noexcept {
    for (const Folder& folder : theFolders) {
        if (folder.use.load() != Use::SET) continue;
        plt_Remove(folder.number, whf_Scratch::kFileName);
        plt_RemoveFolder(folder.at, folder.name);
    }
}
