#ifndef QRX_TOOLS_OUTOFMEMORY_H
#define QRX_TOOLS_OUTOFMEMORY_H

/// What the program does when there is no memory left. Nothing could be told, and little taken apart, without
/// asking for more; so the process ends then and there, with what it had begun to write removed.
class OutOfMemory {
public:
    /// From now on a request for memory that can't be met ends the process with the exit code of a refusal,
    /// or with that of a lost report once MarkWritten() was called. `asJson`: told as a JSON object too.
    static void Install(bool asJson);
    static void MarkWritten(bool written = true) noexcept;
    /// The end itself; asks for no memory.
    [[noreturn]] static void End() noexcept;
};

#endif
