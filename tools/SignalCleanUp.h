#ifndef QRX_TOOLS_SIGNALCLEANUP_H
#define QRX_TOOLS_SIGNALCLEANUP_H

#include <csignal>

/// Removes one folder and the file in it when a signal, or a lack of memory, ends the process. There is one
/// such folder in a process.
class SignalCleanUp {
public:
    /// From now on signals that end the process and can be caught clean up first. A file that outgrows its
    /// limit fails with EFBIG instead of ending it.
    static void Install();

    /// The folder of this name in the open folder `at`, itself open as `folder`; the name is copied. Call
    /// Set() while a Block lives, together with the making of the folder.
    static void Set(int at, const char* name, int folder) noexcept;
    static void Clear() noexcept;
    /// Removes what is set; only calls that are safe within a signal handler.
    static void Remove() noexcept;

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
