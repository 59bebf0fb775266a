#include "platform/plt_Process.h"

#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <filesystem>
#include <iterator>

#include <fcntl.h>
#include <sys/ioctl.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

namespace {

constexpr int kSignals[] = {SIGINT, SIGTERM, SIGHUP, SIGQUIT, SIGXCPU};
constexpr int kPoliteSignals[] = {SIGINT, SIGTERM, SIGHUP};

void (*theCleaning)() = nullptr;
volatile std::sig_atomic_t theSignal = 0;

void CleanUp(int signal) {
    theCleaning();
    // The handler is the default one by now; this arrives when it returns.
    ::raise(signal);
}

void NoteSignal(int signal) {
    theSignal = signal;
}

/// An own handler for those of the signals that the caller didn't tell the process to ignore.
void Handle(int signal, void (*handler)(int), int flags, struct sigaction& former) {
    ::sigaction(signal, nullptr, &former);
    if (former.sa_handler == SIG_IGN) return;
    struct sigaction action = {};
    action.sa_handler = handler;
    action.sa_flags = static_cast<int>(SA_RESETHAND) | flags;
    if (handler == CleanUp) ::sigfillset(&action.sa_mask);
    ::sigaction(signal, &action, nullptr);
}

} // namespace

void plt_SecureStandardStreams() noexcept {
    for (const int number : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO}) {
        if (::fcntl(number, F_GETFD) >= 0 || errno != EBADF) continue;
        // The lowest free number is this one; the wrong direction makes all use fail.
        const int opened = ::open("/dev/null", number == STDOUT_FILENO ? O_RDONLY : O_WRONLY);
        if (opened != number && opened >= 0) ::close(opened);
    }
}

bool plt_CanWriteToStandardOutput() noexcept {
    const int flags = ::fcntl(STDOUT_FILENO, F_GETFL);
    return flags >= 0 && (flags & O_ACCMODE) != O_RDONLY;
}

bool plt_IsTerminal(int file) noexcept {
    return ::isatty(file) == 1;
}

int plt_ColumnsOfTerminal(int file) noexcept {
    if (::isatty(file) == 0) return -1;
    winsize size = {};
    return ::ioctl(file, TIOCGWINSZ, &size) == 0 ? size.ws_col : 0;
}

std::vector<std::string> plt_CommandLine(int argc, char** argv) {
    return {argv, argv + argc};
}

int plt_ProcessNumber() noexcept {
    return ::getpid();
}

std::string plt_ProgramPath() {
    std::error_code error;
    const std::string path = std::filesystem::read_symlink("/proc/self/exe", error).string();
    return error ? std::string() : path;
}

void plt_EndNow(int code) noexcept {
    ::_exit(code);
}

void plt_EndBySignal(int signal) {
    std::signal(signal, SIG_DFL);
    ::raise(signal);
    ::_exit(128 + signal);
}

bool plt_OpenOnDesktop(const std::string& path) {
    const pid_t child = ::fork();
    if (child < 0) return false;
    if (child == 0) {
        for (const char* program : {"xdg-open", "open"}) ::execlp(program, program, path.c_str(), nullptr);
        ::_exit(127);
    }
    int status = 0;
    return ::waitpid(child, &status, 0) == child && WIFEXITED(status) && WEXITSTATUS(status) == 0;
}

void plt_AtEndingSignals(void (*clean)()) {
    theCleaning = clean;
    struct sigaction former = {};
    for (const int signal : kSignals) Handle(signal, CleanUp, 0, former);
    std::signal(SIGXFSZ, SIG_IGN);
}

plt_SignalBlock::plt_SignalBlock() noexcept {
    static_assert(sizeof(sigset_t) <= sizeof former_);
    sigset_t signals;
    ::sigemptyset(&signals);
    for (const int signal : kSignals) ::sigaddset(&signals, signal);
    ::pthread_sigmask(SIG_BLOCK, &signals, reinterpret_cast<sigset_t*>(former_));
}

plt_SignalBlock::~plt_SignalBlock() {
    ::pthread_sigmask(SIG_SETMASK, reinterpret_cast<const sigset_t*>(former_), nullptr);
}

struct plt_PoliteSignals::Former {
    struct sigaction actions[std::size(kPoliteSignals)];
};

plt_PoliteSignals::plt_PoliteSignals() : former_(new Former()) {
    for (std::size_t i = 0; i < std::size(kPoliteSignals); ++i)
        Handle(kPoliteSignals[i], NoteSignal, SA_RESTART, former_->actions[i]);
}

plt_PoliteSignals::~plt_PoliteSignals() {
    for (std::size_t i = 0; i < std::size(kPoliteSignals); ++i)
        ::sigaction(kPoliteSignals[i], &former_->actions[i], nullptr);
}

int plt_PoliteSignals::Came() noexcept {
    return theSignal;
}

plt_ApartEnm plt_RunApart(const std::function<bool(int pipe)>& work,
                          const std::function<void(int pipe)>& take) {
    int ends[2];
    if (::pipe(ends) != 0) return plt_ApartEnm::NO_PROCESS;
    const pid_t child = ::fork();
    if (child < 0) {
        const int error = errno;
        ::close(ends[0]);
        ::close(ends[1]);
        errno = error;
        return plt_ApartEnm::NO_PROCESS;
    }
    if (child == 0) {
        ::close(ends[0]);
        const rlimit noCore{0, 0};
        ::setrlimit(RLIMIT_CORE, &noCore);
        try {
            ::_exit(work(ends[1]) ? 0 : 1);
        } catch (...) {
            ::_exit(1);
        }
    }
    ::close(ends[1]);
    take(ends[0]);
    ::close(ends[0]);
    int status = 0;
    while (::waitpid(child, &status, 0) < 0 && errno == EINTR) continue;
    return status == 0 ? plt_ApartEnm::WHOLE : plt_ApartEnm::DIED;
}
