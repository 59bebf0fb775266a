#ifndef QRX_TOOLS_SCRATCHFOLDER_H
#define QRX_TOOLS_SCRATCHFOLDER_H

#include "tools/DeckFile.h"

#include <cerrno>
#include <utility>

/// The errno value, or EIO where a call failed without one.
inline int ErrorNumber() {
    return errno != 0 ? errno : EIO;
}

/// Calls until the call isn't interrupted; the errno value of the failure, 0 for none.
template <class Call>
int ErrorOf(Call call) {
    for (;;) {
        errno = 0;
        if (call() >= 0) return 0;
        if (errno != EINTR) return ErrorNumber();
    }
}

/// An open file or folder, closed at the end.
class Descriptor {
public:
    Descriptor(int number, const DeckFileSystem& system) : number_(number), system_(&system) {}
    Descriptor(Descriptor&& other) noexcept
        : number_(std::exchange(other.number_, -1)), system_(other.system_) {}
    Descriptor& operator=(Descriptor&& other) noexcept {
        Close();
        number_ = std::exchange(other.number_, -1);
        return *this;
    }
    ~Descriptor() { Close(); }

    int Number() const { return number_; }
    /// The errno value of the failure, 0 for none.
    int Close() noexcept;

private:
    int number_;
    const DeckFileSystem* system_;
};

/// A fresh hidden folder of the user's own in another one, and the file in it. Removes both.
class ScratchFolder {
public:
    static constexpr const char* kFileName = "deck.inp";

    /// Removes what runs that are no longer there left in the folder.
    static void RemoveLeavings(int folder, const DeckFileSystem& system);

    /// `folderName` is for messages.
    ScratchFolder(int folder, const std::string& folderName, const DeckFileSystem& system);
    ScratchFolder(const ScratchFolder&) = delete;
    ScratchFolder& operator=(const ScratchFolder&) = delete;
    ~ScratchFolder() { Remove(); }

    const std::string& Name() const { return name_; }
    int Number() const { return opened_.Number(); }
    void MarkMoved() { moved_ = true; }
    /// The errno value of the failure, 0 for none. Only the first call removes.
    int Remove() noexcept;

private:
    static std::string NewName();
    /// False when the name is taken, or another run takes the folder for a left one.
    bool Make(const std::string& folderName);

    int folder_;
    const DeckFileSystem& system_;
    std::string name_;
    Descriptor opened_;
    bool moved_ = false;
    bool removed_ = false;
};

#endif
