#ifndef QRX_STY_MESHSUMS_H
#define QRX_STY_MESHSUMS_H

#include "study/sty_Ledger.h"

#include <filesystem>
#include <memory>
#include <set>

/// The mesher's files that rows name, for all threads: each is summed up once while it stays as it is, and
/// has to be for all rows of the study what it was for the first.
class sty_MeshSums {
public:
    /// Names are relative to the folder of the template, as within it.
    explicit sty_MeshSums(const std::string& model);

    /// The sum of a file that a row names now. Where another row had another one, `problem` says so.
    std::string Use(const std::string& file, long long row, std::string& problem);
    /// What is wrong with the files that a ledger's line names; empty for nothing. They must be what other
    /// lines say, and what is there now.
    std::string ProblemOf(const sty_Entry& entry);
    /// The same without a look at what is there. Of lines that say the same the first is told of.
    std::string ContradictionOf(const sty_Entry& entry);

private:
    struct Known {
        std::mutex mutex;
        std::string state;
        std::string sum;
        /// What it has to be, by the row that named it first.
        std::string wanted;
        long long row = 0;
    };
    Known& KnownOf(const std::string& file);
    std::filesystem::path PathOf(const std::string& file) const;
    std::string ProblemOf(const std::string& file, Known& known, long long row, const std::string& sum) const;
    template <class Visitor>
    std::string FirstProblem(const sty_Entry& entry, const Visitor& problemOf);

    std::filesystem::path folder_;
    std::mutex mutex_;
    std::map<std::string, std::unique_ptr<Known>> known_;
    std::set<std::string, std::less<>> looked_;
};

#endif
