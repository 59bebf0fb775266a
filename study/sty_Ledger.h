#ifndef QRX_STY_LEDGER_H
#define QRX_STY_LEDGER_H

#include "store_interface/findings/fnd_Finding.h"
#include "study/sty_Folder.h"

#include <functional>
#include <mutex>
#include <vector>

/// What is wrong with a row.
struct sty_RowError {
    /// Empty where no column is to blame.
    std::string column;
    std::string pointer;
    std::string text;
};

/// What became of a row.
struct sty_Result {
    long long row = 0;
    std::string name;
    /// Below the study's folder; empty when the row failed.
    std::string deck;
    long long bytes = 0;
    std::string sha256;
    /// Mesher's files that the row's values lead to, each with its SHA-256.
    std::vector<std::pair<std::string, std::string>> meshes;
    double seconds = 0.0;
    /// An object, as JSON text.
    std::string parameters;
    /// What the template without any change gives too is left out.
    std::vector<fnd_Finding> findings;
    std::vector<sty_RowError> errors;

    bool IsDone() const { return errors.empty(); }
    /// "thickness: found 'a', expected a number; 2 more".
    std::string Reason() const;
};

/// The ledger's line, with its end.
std::string sty_LineOf(const sty_Result& result);

/// What a line of a ledger says, as far as it is asked for again.
struct sty_Entry {
    long long row = 0;
    std::string_view deck; ///< empty when the row failed
    long long bytes = 0;
    std::string_view meshes; ///< JSON, empty where the row names none
};
/// Nothing for a line that is none, such as one that was cut off.
std::optional<sty_Entry> sty_EntryOf(std::string_view line);
/// The reason in the line of a row that failed.
std::string sty_ReasonIn(std::string_view line);

/// Calls `take(line, begin)` for each line, without its end. Gives the bytes behind the last line: one that
/// was cut off is none. Raises sty_Refused when there is such a file and it can't be read.
std::size_t sty_ForEachLine(const std::string& path,
                            const std::function<void(std::string_view line, long long begin)>& take);

/// Which rows have their decks.
class sty_DoneRows {
public:
    explicit sty_DoneRows(long long rows) : bits_(static_cast<std::size_t>(rows) + 1) {}
    bool Has(long long row) const { return bits_[static_cast<std::size_t>(row)]; }
    bool IsRow(long long row) const { return row > 0 && static_cast<std::size_t>(row) < bits_.size(); }
    /// False when it was there.
    bool Add(long long row) {
        const bool isNew = !Has(row);
        bits_[static_cast<std::size_t>(row)] = true;
        return isNew;
    }

private:
    std::vector<bool> bits_;
};

/// The file that a run appends a line to for each row.
class sty_Ledger {
public:
    /// The name of the whole study's ledger, or of a shard's.
    static std::string NameOf(int shard, int shards);
    static bool IsLedger(std::string_view name);

    sty_Ledger(sty_Folder& folder, std::string name) : folder_(folder), name_(std::move(name)) {}
    bool Exists() const;
    /// Takes up what earlier runs left: rows with decks that are there are done. Lines that were cut off, of
    /// rows that failed or whose decks are gone, are taken out. Gives the number of rows that are done;
    /// `look` sees each of them.
    long long TakeUp(sty_DoneRows& done, const std::function<void(const sty_Entry& entry)>& look);
    void Open();
    /// Appends the line as one piece. Raises sty_Refused, and then leaves the ledger as it was.
    void Append(const std::string& line);

private:
    std::string Path() const { return folder_.Path() + "/" + name_; }

    sty_Folder& folder_;
    std::string name_;
    sty_Descriptor file_;
    std::mutex mutex_;
    long long bytes_ = 0;
};

#endif
