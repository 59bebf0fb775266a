#include "tools/RunReport.h"

#include <cerrno>
#include <cstdio>
#include <system_error>

using nlohmann::ordered_json;

RunReport::RunReport(bool asJson) : asJson_(asJson) {
    root_["exitCode"] = 0;
    root_["messages"] = ordered_json::array();
}

void RunReport::AddAll(const mdf_Report& report) {
    for (const fnd_Finding& finding : report.findings) Add(report.fileName, finding);
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
    if (!asJson_) std::fwrite(text.data(), 1, text.size(), stdout);
}

ExitCode RunReport::Finish(ExitCode code) {
    if (asJson_) {
        root_["exitCode"] = static_cast<int>(code);
        // File names may hold bytes that are no UTF-8.
        const std::string text = root_.dump(2, ' ', false, ordered_json::error_handler_t::replace) + "\n";
        std::fwrite(text.data(), 1, text.size(), stdout);
    }
    errno = 0;
    const bool failed = std::fflush(stdout) != 0 || std::ferror(stdout) != 0;
    if (!failed) return code;
    const int error = errno;
    PutError("standard output: error: " +
             (error == 0 ? "write error" : std::generic_category().message(error)));
    return code == ExitCode::DONE ? ExitCode::FILE_SYSTEM_REFUSED : code;
}

void RunReport::Add(const std::string& file, const fnd_Finding& finding) {
    if (!asJson_) {
        PutError(mdf_LineOf(file, finding));
        return;
    }
    ordered_json entry = {
        {"severity", fnd_SeverityWord(finding.code->severity)}, {"code", finding.code->name}, {"file", file}};
    if (finding.line > 0) {
        entry["line"] = finding.line;
        entry["column"] = finding.column;
    } else {
        entry["pointer"] = finding.place;
    }
    entry["text"] = finding.Text();
    entry["found"] = finding.found;
    if (!finding.expected.empty()) entry["expected"] = finding.expected;
    if (!finding.hint.empty()) entry["hint"] = finding.hint;
    root_["messages"].push_back(entry);
}

void RunReport::PutError(const std::string& line) {
    std::fwrite(line.data(), 1, line.size(), stderr);
    std::fputc('\n', stderr);
}
