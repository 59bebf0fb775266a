#include "tools/SignalCleanUp.h"

#include <climits>
#include <cstring>

#include <unistd.h>

namespace {

constexpr int kSignals[] = {SIGINT, SIGTERM, SIGHUP};

char theFile[PATH_MAX];
char theFolder[PATH_MAX];
volatile std::sig_atomic_t isSet = 0;

// Only calls that are safe within a signal handler.
void CleanUp(int signal) {
    if (isSet != 0) {
        ::unlink(theFile);
        ::rmdir(theFolder);
    }
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

void SignalCleanUp::Set(const char* file, const char* folder) noexcept {
    // Longer paths can't be made in the first place.
    if (std::strlen(file) >= sizeof theFile) return;
    std::strcpy(theFile, file);
    std::strcpy(theFolder, folder);
    isSet = 1;
}

void SignalCleanUp::Clear() noexcept {
    isSet = 0;
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
