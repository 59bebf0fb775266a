#ifndef QRX_STY_FOLDER_H
#define QRX_STY_FOLDER_H

#include "study/sty_File.h"

#include <exception>
#include <functional>
#include <map>
#include <optional>
#include <string>

/// Where the decks of a study stand below its folder: at most a thousand in one, which rows that follow each
/// other share; the folders above them have at most a thousand entries too.
class sty_Layout {
public:
    static constexpr long long kMostEntries = 1000;

    sty_Layout() = default;
    explicit sty_Layout(long long rows);
    /// "000/017.inp"; `name` empty: the row's number.
    std::string PathOf(long long row, const std::string& name) const;

private:
    int levels_ = 0;
    int digits_ = 1;
};

/// A failure of the file system that the next row would meet too.
class sty_Refused : public std::exception {
public:
    explicit sty_Refused(std::string text) : text_(std::move(text)) {}
    const char* what() const noexcept override { return text_.c_str(); }

private:
    std::string text_;
};

/// The folder of a study: decks, ledgers, and the hidden folder where files are written before they are put
/// in their places. Files are written whole or not at all; what a killed run left is written over by the next
/// one.
class sty_Folder {
public:
    static constexpr const char* kHidden = ".study";
    static constexpr const char* kIdentity = "study.json";
    /// What the names of files begin with that are not in their places yet.
    static constexpr const char* kUnplaced = ".study-";
    /// Writes a file; gives the errno value of a failure, 0 for none.
    using Writing = std::function<int(int file)>;

    /// Makes the folder where it isn't there. Raises sty_Refused.
    explicit sty_Folder(const std::string& path);
    const std::string& Path() const { return path_; }
    int Number() const { return folder_.Number(); }
    /// Whether there is anything but hidden files in it.
    bool IsEmpty() const;
    /// Makes the hidden folder.
    void Prepare();
    /// The text of a file, nothing where there is none.
    std::optional<std::string> Read(const std::string& name) const;
    /// Replaces a file, or makes it only where there is none; false when there was.
    bool Write(const std::string& name, const Writing& write, bool replace);
    /// Removes what a run that was killed left in a folder below this one: `name` is that of its placer.
    void RemoveUnplaced(const std::string& folder, const std::string& name) const;
    /// The size of a file below the folder, -1 where there is none.
    long long SizeOf(const std::string& path) const;
    /// Locks a file of the hidden folder for as long as the descriptor lives; nothing when another process
    /// has it.
    std::optional<sty_Descriptor> Lock(const std::string& name) const;

private:
    std::string path_;
    sty_Descriptor folder_;
    sty_Descriptor hidden_;
};

/// Puts decks below the folder, for one thread.
class sty_Placer {
public:
    /// `name` is one that no other thread or process uses.
    sty_Placer(const sty_Folder& folder, const std::string& name)
        : folder_(folder), name_(sty_Folder::kUnplaced + name) {}
    sty_Placer(const sty_Placer&) = delete;
    sty_Placer& operator=(const sty_Placer&) = delete;

    enum class Result { PLACED, FOREIGN };
    /// Writes a file and puts it in its place. A file that stands there already is replaced when it is
    /// `ours`, and taken for the same where `isSame` says so of its path; else it stays, and FOREIGN. Raises
    /// sty_Refused.
    Result Place(const std::string& path, const sty_Folder::Writing& write, bool ours,
                 const std::function<bool(const std::string& path)>& isSame);

private:
    int FolderOf(const std::string& path);
    void Make(int folder, const std::string& whole, const sty_Folder::Writing& write) const;

    const sty_Folder& folder_;
    std::string name_;
    std::string targetName_;
    sty_Descriptor target_;
};

#endif
