#include "tools/RunReport.h"

#include "model_file/mdf_Locate.h"
#include "store_interface/findings/fnd_Text.h"
#include "tools/StandardStreams.h"

#include <algorithm>
#include <cerrno>
#include <system_error>

using nlohmann::ordered_json;

namespace {

constexpr std::size_t kBufferBytes = std::size_t{64} * 1024;

constexpr mdf_LineStyle kColours{"\033[1m", "\033[1;31m", "\033[1;35m", "\033[1;36m", "\033[2m", "\033[0m"};
constexpr long kMostShown = 50;

} // namespace

void RunTimes::End(const char* part) {
    double before = 0.0;
    for (const auto& [name, seconds] : parts_) before += seconds;
    parts_.emplace_back(part, std::chrono::duration<double>(Clock::now() - begin_).count() - before);
}

double RunTimes::Whole() const {
    double whole = 0.0;
    for (const auto& [name, seconds] : parts_) whole += seconds;
    return whole;
}

RunReport::RunReport(const ReportOptions& options)
    : options_(options),
      style_(!options.json && HasColours(StreamEnm::ERRORS, options.colour) ? kColours : mdf_LineStyle()),
      progress_(options.progress && !options.json && IsLiveTerminal(StreamEnm::ERRORS)) {
    Clear();
}

void RunReport::Clear() {
    root_ = ordered_json::object();
    if (!runFile_.empty()) root_["file"] = runFile_;
    root_["exitCode"] = 0;
    root_["messages"] = ordered_json::array();
    fileRead_.clear();
    textRead_.reset();
    foretold_.clear();
    ignored_.assign(options_.ignored.size(), 0);
    Ignore({});
    strictErrors_ = 0;
    std::ranges::fill(shown_, 0);
    std::ranges::fill(more_, 0);
    prepared_.clear();
}

void RunReport::BeginRun(const std::string& file) {
    runFile_ = file;
    times_ = RunTimes();
    Clear();
}

void RunReport::EndRun(ExitCode code) {
    progress_.End();
    TellIgnored();
    TellMore();
    if (AsJson()) {
        root_["exitCode"] = static_cast<int>(code);
        runs_.push_back(std::move(root_));
    } else {
        Put(pending_);
        pending_.clear();
    }
    runFile_.clear();
    Clear();
}

void RunReport::Ignore(odiK_IgnoreList list) {
    modelIgnores_ = std::move(list);
    ignoredByModel_.assign(modelIgnores_.Entries().size(), 0);
}

bool RunReport::IsIgnored(const fnd_Finding& finding) {
    if (finding.IsError()) return false;
    const auto asked = std::ranges::find(options_.ignored, finding.code->name);
    if (asked != options_.ignored.end()) {
        ++ignored_[static_cast<std::size_t>(asked - options_.ignored.begin())];
        return true;
    }
    const int entry = modelIgnores_.EntryFor(finding);
    if (entry >= 0) ++ignoredByModel_[static_cast<std::size_t>(entry)];
    return entry >= 0;
}

bool RunReport::HasRoomFor(fnd_Severity severity) {
    const auto place = static_cast<std::size_t>(severity);
    if (AsJson() || ShowsAll() || shown_[place] < kMostShown) {
        ++shown_[place];
        return true;
    }
    ++more_[place];
    return false;
}

void RunReport::TellIgnored() {
    for (std::size_t i = 0; i < ignored_.size(); ++i) {
        const long long count = std::exchange(ignored_[i], 0);
        if (count > 0 && AsJson())
            root_["ignored"].push_back({{"code", options_.ignored[i]}, {"count", count}});
    }
    for (std::size_t i = 0; i < ignoredByModel_.size(); ++i) {
        const odiK_IgnoredFinding& entry = modelIgnores_.Entries()[i];
        const std::string code(entry.code.View());
        const std::string reason(entry.reason.View());
        const long long count = std::exchange(ignoredByModel_[i], 0);
        if (count == 0) continue;
        if (AsJson())
            root_["ignored"].push_back({{"code", code}, {"count", count}, {"reason", reason}});
        else
            Print("ignored: " + std::to_string(count) + " " + code + ", " + fnd_Visible(reason) + "\n");
    }
}

void RunReport::TellMore() {
    std::string text;
    for (const fnd_Severity severity : {fnd_Severity::ERROR, fnd_Severity::WARNING, fnd_Severity::NOTE}) {
        const long count = more_[static_cast<std::size_t>(severity)];
        if (count == 0) continue;
        if (AsJson()) root_["more"][std::string(fnd_SeverityWord(severity)) + "s"] = count;
        text += (text.empty() ? "" : ", ") + fnd_Counted(count, fnd_SeverityWord(severity));
    }
    std::ranges::fill(more_, 0);
    if (!text.empty() && !AsJson())
        PutError(fnd_Visible(lastFile_) + ": ... and " + text + " more; --all shows them");
}

void RunReport::AddAll(const mdf_Report& report) {
    for (const fnd_Finding& finding : report.findings) Add(report.fileName, finding);
    more_[static_cast<std::size_t>(fnd_Severity::ERROR)] += report.moreErrors;
    more_[static_cast<std::size_t>(fnd_Severity::WARNING)] += report.moreWarnings;
    fileRead_ = report.fileName;
    textRead_ = report.text;
}

void RunReport::Locate(const std::string& file, std::vector<fnd_Finding>& findings) const {
    if (file == fileRead_ && textRead_ != nullptr) textRead_->Locate(findings);
}

void RunReport::AddAll(const std::string& file, std::vector<fnd_Finding> findings) {
    Locate(file, findings);
    for (const fnd_Finding& finding : findings) Add(file, finding);
}

void RunReport::Error(const std::string& file, const std::string& text) {
    Add(file, fnd_Make("run-failed", {}, text));
}

void RunReport::Warning(const std::string& file, const std::string& text) {
    Add(file, fnd_Make("run-warning", {}, text));
}

void RunReport::WriterError(const std::string& text, const std::string& context) {
    if (AsJson()) {
        root_["messages"].push_back({{"severity", "error"}, {"text", text}, {"context", context}});
        return;
    }
    PutError(text);
    if (!context.empty()) PutError(context);
}

void RunReport::Print(const std::string& text) {
    if (AsJson() || isOutputLeft_) return;
    pending_ += text;
    if (pending_.size() < kBufferBytes) return;
    Put(pending_);
    pending_.clear();
}

bool RunReport::PrepareForSuccess() {
    TellIgnored();
    TellMore();
    if (AsJson() && !runFile_.empty()) return true;
    if (AsJson()) {
        prepared_ = JsonText(ExitCode::DONE);
        return true;
    }
    const bool put = Put(pending_);
    pending_.clear();
    return put;
}

ExitCode RunReport::Finish(ExitCode code) {
    progress_.End();
    TellIgnored();
    TellMore();
    if (!AsJson()) {
        Put(pending_);
    } else if (code == ExitCode::DONE && !prepared_.empty()) {
        Put(prepared_);
    } else {
        Put(JsonText(code));
    }
    if (!isOutputLost_ || code != ExitCode::DONE) return code;
    return isWritten_ ? ExitCode::REPORT_LOST : ExitCode::FILE_SYSTEM_REFUSED;
}

std::string RunReport::JsonText(ExitCode code) {
    if (!runs_.empty()) root_ = {{"exitCode", 0}, {"runs", std::move(runs_)}};
    root_["exitCode"] = static_cast<int>(code);
    // File names may hold bytes that are no UTF-8.
    return root_.dump(2, ' ', false, ordered_json::error_handler_t::replace) + "\n";
}

void RunReport::Add(const std::string& file, const fnd_Finding& found) {
    if (found.code->name == "cannot-be-written") foretold_.push_back(found);
    if (IsIgnored(found)) return;
    fnd_Finding finding = found;
    const bool isOfRun = finding.code->name.starts_with("run-");
    if (options_.strict && finding.code->severity == fnd_Severity::WARNING && !isOfRun) {
        finding.code = &raised_.emplace_back(*finding.code);
        raised_.back().severity = fnd_Severity::ERROR;
        ++strictErrors_;
    }
    lastFile_ = file;
    if (!HasRoomFor(finding.code->severity)) return;
    if (!AsJson()) {
        PutError(mdf_LineOf(file, finding, style_));
        return;
    }
    prepared_.clear();
    ordered_json entry = {
        {"severity", fnd_SeverityWord(finding.code->severity)}, {"code", finding.code->name}, {"file", file}};
    if (finding.line > 0) {
        entry["line"] = finding.line;
        entry["column"] = finding.column;
    }
    if (finding.line == 0 || !finding.place.empty()) entry["pointer"] = finding.place;
    entry["text"] = finding.Text();
    entry["found"] = finding.found;
    if (!finding.expected.empty()) entry["expected"] = finding.expected;
    if (!finding.hint.empty()) entry["hint"] = finding.hint;
    root_["messages"].push_back(entry);
}

bool RunReport::Put(std::string_view text) {
    if (isOutputLost_) return false;
    int error = 0;
    progress_.Aside([&] { error = WriteToStandardOutput(text); });
    if (error == 0) return true;
    isOutputLost_ = true;
    PutError("standard output: error: " + std::generic_category().message(error));
    return false;
}

void RunReport::PutError(std::string line) {
    line += '\n';
    progress_.Aside([&line] { WriteToStandardError(line); });
}
