#ifndef QRX_TOOLS_DECKFILE_H
#define QRX_TOOLS_DECKFILE_H

#include <functional>
#include <stdexcept>
#include <string>

#include <sys/stat.h>

/// The system calls that put a deck in its place. Tests put their own here to make a call fail.
struct DeckFileSystem {
    /// As stat.
    int (*inspect)(const char* path, struct stat* found);
    /// As mkdtemp.
    char* (*makeFolder)(char* pattern);
    /// As open, for reading.
    int (*open)(const char* path);
    /// As fsync, close, rename, unlink and rmdir.
    int (*sync)(int file);
    int (*close)(int file);
    int (*rename)(const char* from, const char* to);
    int (*remove)(const char* path);
    int (*removeFolder)(const char* path);

    static const DeckFileSystem& Standard();
};

/// The file system refused. what() tells what could not be done, and why.
class DeckFileError : public std::runtime_error {
public:
    DeckFileError(const std::string& action, int error);
    /// The errno value, 0 for a failure without a reason.
    int Error() const { return error_; }

private:
    int error_;
};

/// A deck, or another file, that is replaced as a whole or not at all: it is written in a fresh hidden folder
/// beside its place, brought to the disk, and renamed onto its place in one step. Whatever fails before that,
/// an exception of the writer included, leaves an older deck as it was and nothing else behind.
class DeckFile {
public:
    struct Result {
        long long bytes = 0;
        /// What failed, as errno values, when the deck stood in its place already: to bring the folder to the
        /// disk, and to remove the temporary folder.
        int folderSyncError = 0;
        int removeError = 0;
    };

    /// A symbolic link at the target is replaced, not followed. The system must outlive the deck file.
    /// Messages call the file by the word `thing`.
    explicit DeckFile(std::string target, const DeckFileSystem& system = DeckFileSystem::Standard(),
                      std::string thing = "deck");

    /// Calls `write` with a job name to write `<job name>.inp` under; the name is free of whatever the
    /// target's name holds. The bytes must go through the library's device, whose report of this thread tells
    /// whether all arrived. Raises DeckFileError, and lets the exceptions of `write` through.
    Result Replace(const std::function<void(const char* jobName)>& write);

    const std::string& Target() const { return target_; }
    const std::string& Thing() const { return thing_; }
    /// The temporary folder of the last Replace().
    const std::string& TemporaryFolder() const { return temporaryFolder_; }

private:
    class Scratch;

    void CheckTarget() const;
    void SyncFile(const std::string& path) const;
    /// The errno value of the failure, 0 for none.
    int Sync(const char* path) const;

    std::string target_;
    std::string thing_;
    std::string folder_;
    std::string temporaryFolder_;
    const DeckFileSystem& system_;
};

#endif
