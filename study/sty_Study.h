#ifndef QRX_STY_STUDY_H
#define QRX_STY_STUDY_H

#include "study/sty_Ledger.h"

#include <string>
#include <vector>

/// What the user asks for.
struct sty_Request {
    std::string model;
    /// Which of the template's models; empty: the one that "write" takes.
    std::string modelName;
    std::string table;
    /// The study's folder.
    std::string out;
    /// Threads; 0: as many as there are processors.
    int jobs = 0;
    /// The part of the rows that this run is for, from 1.
    int shard = 1;
    int shards = 1;
    /// Goes on with what an earlier run left.
    bool resume = false;
    /// Makes all decks and writes nothing.
    bool dryRun = false;
};

struct sty_Counts {
    /// Those of the shard.
    long long rows = 0;
    /// Done by this run, by earlier ones, and failed in this one.
    long long done = 0;
    long long earlier = 0;
    long long failed = 0;
    long long bytes = 0;
    double seconds = 0.0;

    long long Left() const { return rows - done - earlier - failed; }
    double Rate() const { return seconds > 0.0 ? static_cast<double>(done + failed) / seconds : 0.0; }
};

struct sty_Failure {
    long long row = 0;
    std::string name;
    std::string reason;
};

/// Watches a run. Both are called by the thread that runs it.
class sty_Observer {
public:
    virtual ~sty_Observer() = default;
    /// What is to be said of the template, once.
    virtual void Tell(const std::string& file, const fnd_Finding& finding) = 0;
    /// A warning before the first row.
    virtual void Warn(const std::string& text) = 0;
    /// Called ten times a second; true lets the rows in hand end, and no other begin.
    virtual bool Pause(const sty_Counts& counts) = 0;
};

/// What a run came to.
struct sty_Outcome {
    enum class Kind {
        DONE,        ///< all rows were taken up, whatever became of them
        INTERRUPTED, ///< the observer wanted an end
        WRONG,       ///< template, table or folder can't be used; nothing was written
        REFUSED,     ///< the file system refused; what stands in the ledger stands
    };
    static constexpr std::size_t kMostFailures = 10;

    Kind kind = Kind::DONE;
    sty_Counts counts;
    /// The first ones by row.
    std::vector<sty_Failure> failures;
    /// What can't be used or was refused.
    std::string file;
    std::string problem;
};

/// Writes the decks of a study.
sty_Outcome sty_Run(const sty_Request& request, sty_Observer& observer);

/// The rows of a shard: `first` to `last`, from 1; neighbours stay together.
struct sty_Rows {
    long long first = 1;
    long long last = 0;
};
sty_Rows sty_RowsOf(long long rows, int shard, int shards);

/// What the ledgers of a study say together.
struct sty_Merged {
    long long rows = 0;
    long long done = 0;
    long long failed = 0;
    long long missing = 0;
    /// "17, 201-250".
    std::string missingRows;
    std::vector<sty_Failure> failures;
    /// Rows whose mesh files were others than for rows before them, the first ten.
    std::vector<sty_Failure> contradictions;
};
/// Joins the ledgers of a study's shards into one, a line a row in the order of rows. Raises sty_Refused, or
/// sty_NoStudy when the folder isn't one.
class sty_NoStudy : public sty_Refused {
public:
    using sty_Refused::sty_Refused;
};
sty_Merged sty_Merge(const std::string& folder);

/// Scripts that let schedulers run the shards. Paths in the request are absolute.
std::string sty_SlurmScript(const sty_Request& request, const std::string& program);
std::string sty_Snakefile(const sty_Request& request, const std::string& program);

#endif
