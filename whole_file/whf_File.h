#ifndef QRX_WHOLE_FILE_WHF_FILE_H
#define QRX_WHOLE_FILE_WHF_FILE_H

#include "platform/plt_Files.h"

#include <functional>
#include <stdexcept>
#include <string>

class qio_ostream;

/// The system calls that put a deck in its place, each as the call of that name and -1 with errno when it
/// fails. `at` is an open folder, in which names are looked up. Tests put their own here to make a call fail.
struct whf_System {
    ssize_t (*readlink)(const char* path, char* buffer, std::size_t bytes);
    int (*openFolder)(int at, const char* name, int flags);
    /// Never follows a link at the name itself.
    int (*inspect)(int at, const char* name, plt_Status* found);
    /// As faccessat, for writing.
    int (*mayWrite)(int at, const char* name);
    int (*makeFolder)(int at, const char* name);
    /// As fstat.
    int (*inspectOpen)(int file, plt_Status* found);
    /// As flock: alone, without waiting.
    int (*lock)(int file);
    /// As openat, for a new file to be written.
    int (*create)(int at, const char* name, plt_Mode mode);
    int (*sync)(int file);
    int (*chown)(int file, plt_Owner owner, plt_Group group);
    int (*chmod)(int file, plt_Mode mode);
    int (*close)(int file);
    int (*rename)(int fromFolder, const char* from, int toFolder, const char* to);
    int (*remove)(int at, const char* name);
    int (*removeFolder)(int at, const char* name);

    static const whf_System& Standard();
};

/// The file system refused. what() tells what could not be done, and why.
class whf_Error : public std::runtime_error {
public:
    whf_Error(const std::string& action, int error);
    /// The errno value, 0 for a failure without a reason.
    int Error() const { return error_; }

private:
    int error_;
};

/// A deck, or another file, that is replaced as a whole or not at all: it is written in a fresh hidden folder
/// beside its place, brought to the disk, and renamed onto its place in one step. Whatever fails before that,
/// an exception of the writer included, leaves an older deck as it was and nothing else behind.
///
/// The hidden folder belongs to the user alone and is used through its descriptor, so nobody who may write to
/// the folder of the deck can put another file, or a link, in between. It is locked while its run lives; one
/// that a run left behind when it was killed is removed by the next run that writes beside it.
class whf_File {
public:
    struct Result {
        long long bytes = 0;
        /// What failed, as errno values, when the deck stood in its place already: to bring the folder to the
        /// disk, and to remove the temporary folder.
        int folderSyncError = 0;
        int removeError = 0;
    };
    using Write = std::function<void(qio_ostream& device)>;
    using Ready = std::function<void(long long bytes)>;

    /// A symbolic link at the target is followed: what it points to is replaced. The system must outlive the
    /// deck file. Messages call the file by the word `thing`.
    explicit whf_File(std::string target, const whf_System& system = whf_System::Standard(),
                      std::string thing = "deck");

    /// Calls `write`, and `ready` when all is written and only the renaming is left. Raises whf_Error,
    /// and lets the exceptions of both through.
    ///
    /// What replaces a file has its mode, its access control list and, where that is permitted, its owner and
    /// group; where it isn't, nobody has more rights than before. A file that may not be written is not
    /// replaced. Other hard links to it go on showing what it held.
    Result Replace(const Write& write, const Ready& ready = {});

    const std::string& Target() const { return target_; }
    const std::string& Thing() const { return thing_; }
    /// The temporary folder of the last Replace().
    const std::string& TemporaryFolder() const { return temporaryFolder_; }

private:
    /// The bytes that were written to the open file.
    long long WriteTo(int number, const Write& write) const;

    std::string target_;
    std::string thing_;
    std::string temporaryFolder_;
    const whf_System& system_;
};

#endif
