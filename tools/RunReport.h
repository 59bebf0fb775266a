#ifndef QRX_TOOLS_RUNREPORT_H
#define QRX_TOOLS_RUNREPORT_H

#include "model_file/mdf_ModelFile.h"
#include "store_interface/model/odiK_IgnoreList.h"
#include "tools/ProgressLine.h"
#include "tools/Terminal.h"

#include <nlohmann/json.hpp>

#include <chrono>
#include <deque>
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

/// How the runs of one call are to be told of.
struct ReportOptions {
    bool json = false;
    ColourWhenEnm colour = ColourWhenEnm::AUTO;
    /// No end of messages.
    bool all = false;
    /// Warnings count as errors.
    bool strict = false;
    /// Codes of what isn't told.
    std::vector<std::string> ignored;
    /// Shows on a terminal how far the run has come.
    bool progress = false;

    static ReportOptions AsJson(bool json) {
        ReportOptions options;
        options.json = json;
        return options;
    }
};

/// What a run has to say: as text, messages at once on the standard error; or all of it as one JSON object on
/// the standard output when the run ends, and nothing on the standard error. One call may be several runs,
/// each on a file of its own.
class RunReport {
public:
    explicit RunReport(bool asJson) : RunReport(ReportOptions::AsJson(asJson)) {}
    explicit RunReport(const ReportOptions& options);

    bool AsJson() const { return options_.json; }
    bool ShowsAll() const { return options_.all; }
    RunTimes& Times() { return times_; }
    ProgressLine& Watched() { return progress_; }
    bool OutputHasColours() const { return HasColours(StreamEnm::OUTPUT, options_.colour); }

    /// Of several runs, the one on the file begins. In JSON each is an object of its own.
    void BeginRun(const std::string& file);
    void EndRun(ExitCode code);
    /// From now on says nothing of what the models say to pass over.
    void Ignore(odiK_IgnoreList list);
    bool IsStrict() const { return options_.strict; }
    /// The standard output belongs to what the command writes; nothing is printed there any more.
    void LeaveOutput() { isOutputLeft_ = true; }
    /// Whether there was a warning that counts as an error.
    bool HasStrictErrors() const { return strictErrors_ > 0; }

    void AddAll(const mdf_Report& report);
    void Add(const std::string& file, const fnd_Finding& finding);
    /// Gives findings in a file their lines, if it is the one whose report was added last.
    void Locate(const std::string& file, std::vector<fnd_Finding>& findings) const;
    /// What was found in a file, with lines.
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
    void PutError(std::string line);
    std::string JsonText(ExitCode code);
    bool IsIgnored(const fnd_Finding& finding);
    /// Whether one more of the severity is shown; those beyond are counted.
    bool HasRoomFor(fnd_Severity severity);
    void TellIgnored();
    void TellMore();
    void Clear();

    const ReportOptions options_;
    const mdf_LineStyle style_;
    ProgressLine progress_;
    RunTimes times_;
    std::string runFile_; // empty: the call is one run
    nlohmann::ordered_json runs_;
    odiK_IgnoreList modelIgnores_;
    std::vector<long long> ignored_;        // by code of the options
    std::vector<long long> ignoredByModel_; // by entry
    std::deque<fnd_Code> raised_;           // codes of warnings that are errors here
    int strictErrors_ = 0;
    long shown_[3] = {}; // by severity
    long more_[3] = {};  // not shown
    std::string lastFile_;
    std::string fileRead_;
    std::shared_ptr<const mdf_FileText> textRead_;
    std::vector<fnd_Finding> foretold_;
    bool isWritten_ = false;
    bool isOutputLost_ = false;
    bool isOutputLeft_ = false;
    std::string pending_;  // printed, not yet written
    std::string prepared_; // the JSON object of a run that is done; empty when there is more to say
    nlohmann::ordered_json root_;
};

#endif
