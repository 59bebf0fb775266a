#ifndef QRX_WHOLE_FILE_WHF_SCRATCH_H
#define QRX_WHOLE_FILE_WHF_SCRATCH_H

#include "whole_file/whf_File.h"

#include <cerrno>
#include <utility>

/// The errno value, or EIO where a call failed without one.
inline int whf_ErrorNumber() {
    return errno != 0 ? errno : EIO;
}

/// Calls until the call isn't interrupted; the errno value of the failure, 0 for none.
template <class Call>
int whf_ErrorOf(Call call) {
    for (;;) {
        errno = 0;
        if (call() >= 0) return 0;
        if (errno != EINTR) return whf_ErrorNumber();
    }
}

/// An open file or folder, closed at the end.
class whf_Descriptor {
public:
    whf_Descriptor(int number, const whf_System& system) : number_(number), system_(&system) {}
    whf_Descriptor(whf_Descriptor&& other) noexcept
        : number_(std::exchange(other.number_, -1)), system_(other.system_) {}
    whf_Descriptor& operator=(whf_Descriptor&& other) noexcept {
        Close();
        number_ = std::exchange(other.number_, -1);
        return *this;
    }
    ~whf_Descriptor() { Close(); }

    int Number() const { return number_; }
    /// The errno value of the failure, 0 for none.
    int Close() noexcept;

private:
    int number_;
    const whf_System* system_;
};

/// A fresh hidden folder of the user's own in another one, and the file in it. Removes both.
class whf_Scratch {
public:
    static constexpr const char* kFileName = "deck.inp";

    /// Removes what runs that are no longer there left in the folder.
    static void RemoveLeavings(int folder, const whf_System& system);

    /// `folderName` is for messages.
    whf_Scratch(int folder, const std::string& folderName, const whf_System& system);
    whf_Scratch(const whf_Scratch&) = delete;
    whf_Scratch& operator=(const whf_Scratch&) = delete;
    ~whf_Scratch() { Remove(); }

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
    const whf_System& system_;
    std::string name_;
    whf_Descriptor opened_;
    int cleanUpPlace_ = -1;
    bool moved_ = false;
    bool removed_ = false;
};

#endif
