#include "whole_file/whf_SignalCleanUp.h"

#include "whole_file/whf_Scratch.h"

#include <atomic>
#include <climits>
#include <cstring>

#include <fcntl.h>
#include <unistd.h>

namespace {

constexpr int kSignals[] = {SIGINT, SIGTERM, SIGHUP, SIGQUIT, SIGXCPU};

enum class Use : int { FREE, FILLED, SET };
struct Folder {
    std::atomic<Use> use = Use::FREE;
    int at = -1;
    int number = -1;
    char name[NAME_MAX + 1] = {};
};
static_assert(std::atomic<Use>::is_always_lock_free);
Folder theFolders[whf_SignalCleanUp::kMost];

using Function = void (*)() noexcept;
std::atomic<Function> theFunction = nullptr;
static_assert(std::atomic<Function>::is_always_lock_free);

void CleanUp(int signal) {
    whf_SignalCleanUp::Remove();
    if (const Function function = theFunction.load(); function != nullptr) function();
    // The handler is the default one by now; this arrives when it returns.
    ::raise(signal);
}

} // namespace

void whf_SignalCleanUp::Install() {
    for (const int signal : kSignals) {
        struct sigaction former = {};
        ::sigaction(signal, nullptr, &former);
        // What the caller told the process to ignore stays ignored.
        if (former.sa_handler == SIG_IGN) continue;
        struct sigaction action = {};
        action.sa_handler = CleanUp;
        action.sa_flags = static_cast<int>(SA_RESETHAND);
        ::sigfillset(&action.sa_mask);
        ::sigaction(signal, &action, nullptr);
    }
    std::signal(SIGXFSZ, SIG_IGN);
}

int whf_SignalCleanUp::Set(int at, const char* name, int folder) noexcept {
    const std::size_t length = std::strlen(name);
    if (length > NAME_MAX) return -1;
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
        ::unlinkat(folder.number, whf_Scratch::kFileName, 0);
        ::unlinkat(folder.at, folder.name, AT_REMOVEDIR);
    }
}

whf_SignalCleanUp::Block::Block() noexcept {
    sigset_t signals;
    ::sigemptyset(&signals);
    for (const int signal : kSignals) ::sigaddset(&signals, signal);
    ::pthread_sigmask(SIG_BLOCK, &signals, &former_);
}

whf_SignalCleanUp::Block::~Block() {
    ::pthread_sigmask(SIG_SETMASK, &former_, nullptr);
}
