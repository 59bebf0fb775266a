#include "platform/plt_Process.h"

#include "platform/windows/plt_Text.h"

#include <csignal>
#include <cstdlib>

#include <fcntl.h>
#include <io.h>
#include <process.h>
#include <shellapi.h>

namespace {

void (*theCleaning)() = nullptr;
volatile std::sig_atomic_t theSignal = 0;
volatile std::sig_atomic_t isPolite = 0;

/// Called in a thread of its own when the user, or the system, ends the process.
BOOL WINAPI AtEnd(DWORD event) {
    if (isPolite != 0 && theSignal == 0) {
        theSignal = event == CTRL_C_EVENT ? SIGINT : SIGTERM;
        return TRUE;
    }
    if (theCleaning != nullptr) theCleaning();
    return FALSE;
}

} // namespace

void plt_SecureStandardStreams() noexcept {
    for (const int number : {plt_kStandardInput, plt_kStandardOutput, plt_kStandardError}) {
        if (_get_osfhandle(number) < 0) continue;
        _setmode(number, _O_BINARY);
        // Colours, and lines that change, are sequences there as everywhere.
        const auto handle = reinterpret_cast<HANDLE>(_get_osfhandle(number));
        DWORD mode = 0;
        if (number != plt_kStandardInput && GetConsoleMode(handle, &mode) != 0)
            SetConsoleMode(handle, mode | ENABLE_VIRTUAL_TERMINAL_PROCESSING);
    }
    SetConsoleOutputCP(CP_UTF8);
}

bool plt_CanWriteToStandardOutput() noexcept {
    return _get_osfhandle(plt_kStandardOutput) >= 0;
}

bool plt_IsTerminal(int file) noexcept {
    // Other devices are no terminals, though the C library takes them for such.
    DWORD mode = 0;
    return GetConsoleMode(reinterpret_cast<HANDLE>(_get_osfhandle(file)), &mode) != 0;
}

int plt_ColumnsOfTerminal(int file) noexcept {
    if (!plt_IsTerminal(file)) return -1;
    CONSOLE_SCREEN_BUFFER_INFO info;
    const auto handle = reinterpret_cast<HANDLE>(_get_osfhandle(file));
    return GetConsoleScreenBufferInfo(handle, &info) != 0 ? info.srWindow.Right - info.srWindow.Left + 1 : 0;
}

std::vector<std::string> plt_CommandLine(int, char**) {
    int count = 0;
    wchar_t** words = CommandLineToArgvW(GetCommandLineW(), &count);
    std::vector<std::string> line;
    for (int i = 0; words != nullptr && i < count; ++i) line.push_back(plt_Narrow(words[i]));
    LocalFree(words);
    return line;
}

int plt_ProcessNumber() noexcept {
    return _getpid();
}

std::string plt_ProgramPath() {
    std::wstring path(32768, L'\0');
    path.resize(GetModuleFileNameW(nullptr, path.data(), static_cast<DWORD>(path.size())));
    return plt_Narrow(path);
}

void plt_EndNow(int code) noexcept {
    _exit(code);
}

void plt_EndBySignal(int signal) {
    _exit(128 + signal);
}

bool plt_OpenOnDesktop(const std::string& path) {
    const HINSTANCE opened =
        ShellExecuteW(nullptr, L"open", plt_Wide(path).c_str(), nullptr, nullptr, SW_SHOWNORMAL);
    // Up to 32 are errors.
    return reinterpret_cast<INT_PTR>(opened) > 32;
}

void plt_AtEndingSignals(void (*clean)()) {
    theCleaning = clean;
    SetConsoleCtrlHandler(AtEnd, TRUE);
}

plt_SignalBlock::plt_SignalBlock() noexcept : former_{} {}

plt_SignalBlock::~plt_SignalBlock() = default;

struct plt_PoliteSignals::Former {};

plt_PoliteSignals::plt_PoliteSignals() {
    isPolite = 1;
    SetConsoleCtrlHandler(AtEnd, FALSE);
    SetConsoleCtrlHandler(AtEnd, TRUE);
}

plt_PoliteSignals::~plt_PoliteSignals() {
    isPolite = 0;
}

int plt_PoliteSignals::Came() noexcept {
    return theSignal;
}

plt_ApartEnm plt_RunApart(const std::function<bool(int pipe)>&, const std::function<void(int pipe)>&) {
    errno = ENOSYS;
    return plt_ApartEnm::NO_PROCESS;
}
