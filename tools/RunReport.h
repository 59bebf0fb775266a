#ifndef QRX_TOOLS_RUNREPORT_H
#define QRX_TOOLS_RUNREPORT_H

#include "model_file/mdf_ModelFile.h"

#include <nlohmann/json.hpp>

#include <chrono>
#include <string>
#include <utility>
#include <vector>

/// What a run of the program came to.
enum class ExitCode : int {
    DONE = 0,
    MODEL_IS_WRONG = 1,
    WRONG_USAGE = 2,
    FILE_SYSTEM_REFUSED = 3, ///< or there is not enough memory
    CANNOT_BE_EXPRESSED = 4,
    INTERNAL_FAILURE = 5,
    REPORT_LOST = 6, ///< what was to be written stands, but the report on it could not be given
};

/// How long the parts of a run took, from its beginning on.
class RunTimes {
public:
    /// The part that ends now.
    void End(const char* part);
    double Whole() const;
    const std::vector<std::pair<const char*, double>>& Parts() const { return parts_; }

private:
    using Clock = std::chrono::steady_clock;
    Clock::time_point begin_ = Clock::now();
    std::vector<std::pair<const char*, double>> parts_;
};

/// What a run has to say: as text, messages at once on the standard error; or all of it as one JSON object on
/// the standard output when the run ends, and nothing on the standard error.
class RunReport {
public:
    explicit RunReport(bool asJson);

    bool AsJson() const { return asJson_; }
    RunTimes& Times() { return times_; }
    void AddAll(const mdf_Report& report);
    void Add(const std::string& file, const fnd_Finding& finding);
    /// What was found in a file; with lines if it is the one whose report was added last.
    void AddAll(const std::string& file, std::vector<fnd_Finding> findings);
    /// Those of the findings so far that foretell what writing raises.
    const std::vector<fnd_Finding>& Foretold() const { return foretold_; }
    void Error(const std::string& file, const std::string& text);
    void Warning(const std::string& file, const std::string& text);
    /// A text exactly as the deck writer raised it, and what was being written.
    void WriterError(const std::string& text, const std::string& context);
    /// A member of the JSON object.
    nlohmann::ordered_json& Member(const char* name) { return root_[name]; }
    /// Text for the standard output; left out of JSON.
    void Print(const std::string& text);

    /// To be called when the file that the run writes needs nothing but its renaming: puts out what was
    /// printed, and makes the JSON object of a run that is done, so that all that this could fail for has
    /// been by then. False, with the reason told, when the standard output takes nothing.
    bool PrepareForSuccess();
    /// From now on a report that can't be given is all that can be lost.
    void MarkWritten() { isWritten_ = true; }
    /// Ends the report. An output that can't be written turns success into a refusal of the file system, or
    /// into a lost report.
    ExitCode Finish(ExitCode code);

private:
    /// False, with the reason told, when it can't be written.
    bool Put(std::string_view text);
    std::string JsonText(ExitCode code);

    bool asJson_;
    RunTimes times_;
    std::string fileRead_;
    std::shared_ptr<const mdf_FileText> textRead_;
    std::vector<fnd_Finding> foretold_;
    bool isWritten_ = false;
    bool isOutputLost_ = false;
    std::string pending_;  // printed, not yet written
    std::string prepared_; // the JSON object of a run that is done; empty when there is more to say
    nlohmann::ordered_json root_;
};

#endif
