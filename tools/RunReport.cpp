#include "tools/RunReport.h"

#include "model_file/mdf_Locate.h"
#include "store_interface/findings/fnd_Text.h"
#include "tools/StandardStreams.h"

#include <cerrno>
#include <system_error>

using nlohmann::ordered_json;

namespace {

constexpr std::size_t kBufferBytes = std::size_t{64} * 1024;

void PutError(std::string line) {
    line += '\n';
    WriteToStandardError(line);
}

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

RunReport::RunReport(bool asJson) : asJson_(asJson) {
    root_["exitCode"] = 0;
    root_["messages"] = ordered_json::array();
}

void RunReport::AddAll(const mdf_Report& report) {
    for (const fnd_Finding& finding : report.findings) Add(report.fileName, finding);
    fileRead_ = report.fileName;
    textRead_ = report.text;
}

void RunReport::AddAll(const std::string& file, std::vector<fnd_Finding> findings) {
    if (file == fileRead_ && textRead_ != nullptr) textRead_->Locate(findings);
    for (const fnd_Finding& finding : findings) Add(file, finding);
}

void RunReport::Error(const std::string& file, const std::string& text) {
    Add(file, fnd_Make("run-failed", {}, text));
}

void RunReport::Warning(const std::string& file, const std::string& text) {
    Add(file, fnd_Make("run-warning", {}, text));
}

void RunReport::WriterError(const std::string& text, const std::string& context) {
    if (asJson_) {
        root_["messages"].push_back({{"severity", "error"}, {"text", text}, {"context", context}});
        return;
    }
    PutError(text);
    if (!context.empty()) PutError(context);
}

void RunReport::Print(const std::string& text) {
    if (asJson_) return;
    pending_ += text;
    if (pending_.size() < kBufferBytes) return;
    Put(pending_);
    pending_.clear();
}

bool RunReport::PrepareForSuccess() {
    if (asJson_) {
        prepared_ = JsonText(ExitCode::DONE);
        return true;
    }
    const bool put = Put(pending_);
    pending_.clear();
    return put;
}

ExitCode RunReport::Finish(ExitCode code) {
    if (!asJson_) {
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
    root_["exitCode"] = static_cast<int>(code);
    // File names may hold bytes that are no UTF-8.
    return root_.dump(2, ' ', false, ordered_json::error_handler_t::replace) + "\n";
}

void RunReport::Add(const std::string& file, const fnd_Finding& finding) {
    if (finding.code->name == "cannot-be-written") foretold_.push_back(finding);
    if (!asJson_) {
        PutError(mdf_LineOf(file, finding));
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
    const int error = WriteToStandardOutput(text);
    if (error == 0) return true;
    isOutputLost_ = true;
    PutError("standard output: error: " + std::generic_category().message(error));
    return false;
}
