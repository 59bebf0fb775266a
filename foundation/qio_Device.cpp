#include "foundation/qio_Device.h"

#include "platform/plt_Files.h"

#include <cerrno>

namespace {

std::size_t WriteToFile(const char* text, std::size_t bytes, std::FILE* file) {
    errno = 0;
    const std::size_t taken = std::fwrite(text, 1, bytes, file);
    if (taken < bytes) {
        const int error = errno;
        std::clearerr(file);
        errno = error;
    }
    return taken;
}

constexpr qio_System kStandardSystem{
    plt_OpenStream,
    WriteToFile,
    [](std::FILE* file) { return std::fflush(file); },
    [](std::FILE* file) { return std::fclose(file); },
    [](const char* path) { return plt_Remove(plt_kHere, path); },
};

thread_local qio_Report lastReport;

int ReasonOr(int fallback) {
    return errno != 0 ? errno : fallback;
}

} // namespace

qio_System& qio_CurrentSystem() {
    static qio_System system = kStandardSystem;
    return system;
}

const qio_Report& qio_LastReport() {
    return lastReport;
}

void qio_RecordOpenFailure(int error) {
    lastReport = {false, error, 0};
}

std::FILE* qio_OpenFile(const char* path, const char* mode) {
    std::FILE* file = nullptr;
    do {
        errno = 0;
        file = qio_CurrentSystem().open(path, mode);
    } while (file == nullptr && errno == EINTR);
    if (file == nullptr) qio_RecordOpenFailure(ReasonOr(EIO));
    return file;
}

void qio_ios::attach(std::FILE* file, bool own) {
    close();
    file_ = file;
    own_ = own;
    report_ = {file != nullptr, 0, 0};
    if (file != nullptr && own) std::setvbuf(file, nullptr, _IONBF, 0);
}

void qio_ios::Write(const char* text, std::size_t bytes) {
    if (file_ == nullptr) {
        if (bytes > 0) {
            KeepError(EBADF);
            lastReport = report_;
        }
        return;
    }
    while (bytes > 0 && report_.error == 0) {
        errno = 0;
        const std::size_t taken = qio_CurrentSystem().write(text, bytes, file_);
        report_.bytes += static_cast<long long>(taken);
        text += taken;
        bytes -= taken;
        const bool goesOn = errno == EINTR || (errno == 0 && taken > 0);
        if (bytes > 0 && !goesOn) KeepError(ReasonOr(EIO));
    }
}

void qio_ios::close() noexcept {
    if (file_ == nullptr) return;
    int flushed;
    do {
        errno = 0;
        flushed = qio_CurrentSystem().flush(file_);
    } while (flushed != 0 && errno == EINTR);
    if (flushed != 0) KeepError(ReasonOr(EIO));
    if (own_) {
        errno = 0;
        // An interrupted close has closed.
        if (qio_CurrentSystem().close(file_) != 0 && errno != EINTR) KeepError(ReasonOr(EIO));
    }
    file_ = nullptr;
    lastReport = report_;
}

void qio_ios::KeepError(int error) {
    if (report_.error == 0) report_.error = error;
}
