#ifndef QRX_TOOLS_SIGNALCLEANUP_H
#define QRX_TOOLS_SIGNALCLEANUP_H

#include <csignal>

/// Removes one file and its folder when a signal ends the process. There is one such pair in a process.
class SignalCleanUp {
public:
    /// From now on SIGINT, SIGTERM and SIGHUP clean up before they end the process. A file that outgrows its
    /// limit fails with EFBIG instead of ending it.
    static void Install();

    /// Takes copies. Call Set() while a Block lives, together with the making of the folder.
    static void Set(const char* file, const char* folder) noexcept;
    static void Clear() noexcept;

    /// Holds the signals back for as long as it lives.
    class Block {
    public:
        Block() noexcept;
        Block(const Block&) = delete;
        Block& operator=(const Block&) = delete;
        ~Block();

    private:
        sigset_t former_;
    };
};

#endif
