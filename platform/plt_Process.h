#ifndef QRX_PLATFORM_PLT_PROCESS_H
#define QRX_PLATFORM_PLT_PROCESS_H

#include <functional>
#include <memory>
#include <string>
#include <vector>

// The process and the streams that it was started with.

constexpr int plt_kStandardInput = 0;
constexpr int plt_kStandardOutput = 1;
constexpr int plt_kStandardError = 2;

/// Makes the standard streams ready: those that are closed are opened on nothing, so that no file gets their
/// numbers; what is written to the standard output or read from the standard input fails all the same. Texts
/// go as the bytes that they are, and a terminal takes them for UTF-8.
void plt_SecureStandardStreams() noexcept;
/// Whether anything can be written to the standard output at all.
bool plt_CanWriteToStandardOutput() noexcept;
bool plt_IsTerminal(int file) noexcept;
/// -1 for what is no terminal, 0 where it doesn't tell.
int plt_ColumnsOfTerminal(int file) noexcept;

/// The words of the command line, as UTF-8.
std::vector<std::string> plt_CommandLine(int argc, char** argv);

int plt_ProcessNumber() noexcept;
/// The path of the program that runs; empty where the system doesn't tell.
std::string plt_ProgramPath();
/// Ends the process, and nothing else.
[[noreturn]] void plt_EndNow(int code) noexcept;
/// Ends the process as the signal would.
[[noreturn]] void plt_EndBySignal(int signal);

/// Lets the desktop open a file; false when it has no program for it.
bool plt_OpenOnDesktop(const std::string& path);

/// Calls `clean`, which must be safe in a handler of signals, when a signal, or the user, ends the process.
/// What the caller told the process to ignore stays ignored. A file that outgrows its limit fails with EFBIG
/// instead of ending it.
void plt_AtEndingSignals(void (*clean)());

/// Holds the signals back that end the process, for as long as it lives.
class plt_SignalBlock {
public:
    plt_SignalBlock() noexcept;
    plt_SignalBlock(const plt_SignalBlock&) = delete;
    plt_SignalBlock& operator=(const plt_SignalBlock&) = delete;
    ~plt_SignalBlock();

private:
    // What the system keeps of them; its header is not for everybody.
    alignas(8) unsigned char former_[128];
};

/// While it lives, the first signal that would end the process only asks for an end; the second one ends it.
class plt_PoliteSignals {
public:
    plt_PoliteSignals();
    plt_PoliteSignals(const plt_PoliteSignals&) = delete;
    plt_PoliteSignals& operator=(const plt_PoliteSignals&) = delete;
    ~plt_PoliteSignals();
    /// The signal that came, 0 for none.
    static int Came() noexcept;

private:
    struct Former;
    std::unique_ptr<Former> former_;
};

/// Runs `work` in a process of its own, in which nothing else of this one happens, and `take` here meanwhile;
/// each has an end of one pipe. The work is whole when it gives true; NO_PROCESS with errno.
enum class plt_ApartEnm { WHOLE, DIED, NO_PROCESS };
plt_ApartEnm plt_RunApart(const std::function<bool(int pipe)>& work,
                          const std::function<void(int pipe)>& take);

#endif
