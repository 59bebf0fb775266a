#ifndef QRX_WHOLE_FILE_WHF_SIGNALCLEANUP_H
#define QRX_WHOLE_FILE_WHF_SIGNALCLEANUP_H

#include "platform/plt_Process.h"

/// Removes folders and the file in each when a signal, or a lack of memory, ends the process. Several threads
/// may have folders at once; those beyond kMost are left to the next run beside them.
class whf_SignalCleanUp {
public:
    /// From now on signals that end the process and can be caught clean up first. A file that outgrows its
    /// limit fails with EFBIG instead of ending it.
    static void Install();

    static constexpr int kMost = 32;
    /// The folder of this name in the open folder `at`, itself open as `folder`; the name is copied. Call
    /// Set() while a Block lives, together with the making of the folder. Gives the place for Clear(), -1
    /// where there is none left.
    static int Set(int at, const char* name, int folder) noexcept;
    static void Clear(int place) noexcept;
    /// A function to be called before the process ends by a signal; only calls that are safe within a signal
    /// handler.
    static void AlsoCall(void (*function)() noexcept) noexcept;
    /// Removes all that is set; only calls that are safe within a signal handler.
    static void Remove() noexcept;

    /// Holds the signals back for as long as it lives.
    using Block = plt_SignalBlock;
};

#endif
