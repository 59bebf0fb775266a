#include "tools/SignalCleanUp.h"

#include "tools/ScratchFolder.h"

#include <climits>
#include <cstring>

#include <fcntl.h>
#include <unistd.h>

namespace {

constexpr int kSignals[] = {SIGINT, SIGTERM, SIGHUP, SIGQUIT, SIGXCPU};

int theFolder = -1;
int theScratch = -1;
char theName[NAME_MAX + 1];
volatile std::sig_atomic_t isSet = 0;

void CleanUp(int signal) {
    SignalCleanUp::Remove();
    // The handler is the default one by now; this arrives when it returns.
    ::raise(signal);
}

} // namespace

void SignalCleanUp::Install() {
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

void SignalCleanUp::Set(int at, const char* name, int folder) noexcept {
    if (std::strlen(name) >= sizeof theName) return;
    std::strcpy(theName, name);
    theFolder = at;
    theScratch = folder;
    isSet = 1;
}

void SignalCleanUp::Clear() noexcept {
    isSet = 0;
}

void SignalCleanUp::Remove() noexcept {
    if (isSet == 0) return;
    ::unlinkat(theScratch, ScratchFolder::kFileName, 0);
    ::unlinkat(theFolder, theName, AT_REMOVEDIR);
}

SignalCleanUp::Block::Block() noexcept {
    sigset_t signals;
    ::sigemptyset(&signals);
    for (const int signal : kSignals) ::sigaddset(&signals, signal);
    ::pthread_sigmask(SIG_BLOCK, &signals, &former_);
}

SignalCleanUp::Block::~Block() {
    ::pthread_sigmask(SIG_SETMASK, &former_, nullptr);
}
