#ifndef QRX_FOUNDATION_QIO_DEVICE_H
#define QRX_FOUNDATION_QIO_DEVICE_H

#include <cstddef>
#include <cstdio>
#include <string>

/// The system calls of the library's output. Tests put their own here to make a call fail.
struct qio_System {
    /// As fopen.
    std::FILE* (*open)(const char* path, const char* mode);
    /// Writes up to `bytes` and returns how many were taken. When they are fewer, errno tells why; 0 is a
    /// short write without a reason.
    std::size_t (*write)(const char* text, std::size_t bytes, std::FILE* file);
    /// As fflush, fclose and remove.
    int (*flush)(std::FILE* file);
    int (*close)(std::FILE* file);
    int (*remove)(const char* path);
};

/// The calls in use, for the whole process. Change them only while no other thread writes.
qio_System& qio_CurrentSystem();

/// Puts other system calls in place for as long as it lives.
class qio_SystemSwap {
public:
    explicit qio_SystemSwap(const qio_System& system) : former_(qio_CurrentSystem()) {
        qio_CurrentSystem() = system;
    }
    qio_SystemSwap(const qio_SystemSwap&) = delete;
    qio_SystemSwap& operator=(const qio_SystemSwap&) = delete;
    ~qio_SystemSwap() { qio_CurrentSystem() = former_; }

private:
    qio_System former_;
};

/// How the last output of this thread went.
struct qio_Report {
    bool opened = false; ///< false: the file could not be opened
    int error = 0;       ///< the first failure as an errno value, 0 for none
    long long bytes = 0; ///< bytes that the file took
};

/// The report of the last qio_ios of this thread that was closed, or of the last file that could not be
/// opened. All is well when `opened` is true and `error` is 0.
const qio_Report& qio_LastReport();
/// Makes "could not be opened, for this errno value" the thread's last report.
void qio_RecordOpenFailure(int error);
/// Opens a file; on failure null, with the failure recorded.
std::FILE* qio_OpenFile(const char* path, const char* mode);

/// An output device: bytes go in, in order. It reports no failure to who writes.
class qio_ostream {
public:
    virtual ~qio_ostream() = default;
    virtual void Write(const char* text, std::size_t bytes) = 0;

    qio_ostream(const qio_ostream&) = delete;
    qio_ostream& operator=(const qio_ostream&) = delete;

protected:
    qio_ostream() = default;
};

/// The device on an open file. Short and interrupted writes go on; after the first failure nothing more is
/// written, so that a file never has a hole, and the failure is kept. Whoever buffers in front of the device
/// must flush before close(): bytes that come later are lost, which counts as the failure EBADF.
class qio_ios : public qio_ostream {
public:
    qio_ios() = default;
    ~qio_ios() override { close(); }

    /// Takes over an open file, after closing the one before. An owned file must be fresh; it is made
    /// unbuffered and close() closes it. Any other file keeps its buffer, and close() flushes it.
    void attach(std::FILE* file, bool own);
    /// Ends the work on the file and makes the thread's last report. Does nothing when no file is open.
    void close() noexcept;
    bool is_open() const { return file_ != nullptr; }
    void Write(const char* text, std::size_t bytes) override;

    /// The first failure as an errno value, 0 for none, and the bytes that the file took so far. Both stay
    /// readable after close().
    int Error() const { return report_.error; }
    long long Bytes() const { return report_.bytes; }

private:
    void KeepError(int error);

    std::FILE* file_ = nullptr;
    bool own_ = false;
    qio_Report report_;
};

/// A device that collects its text in memory.
class qio_StringDevice : public qio_ostream {
public:
    void Write(const char* text, std::size_t bytes) override { text_.append(text, bytes); }
    const std::string& Text() const { return text_; }
    void Clear() { text_.clear(); }

private:
    std::string text_;
};

#endif
