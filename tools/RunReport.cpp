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
    for (const mdf_Message& message : report.messages) Add(report, message);
}

void RunReport::Error(const std::string& file, const std::string& text) {
    mdf_Report report;
    report.fileName = file;
    Add(report, {true, "", 0, 0, text});
}

void RunReport::Warning(const std::string& file, const std::string& text) {
    mdf_Report report;
    report.fileName = file;
    Add(report, {false, "", 0, 0, text});
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

void RunReport::Add(const mdf_Report& report, const mdf_Message& message) {
    if (!asJson_) {
        PutError(report.Line(message));
        return;
    }
    ordered_json entry = {{"severity", message.isError ? "error" : "warning"}, {"file", report.fileName}};
    if (message.line > 0) {
        entry["line"] = message.line;
        entry["column"] = message.column;
    } else {
        entry["pointer"] = message.pointer;
    }
    entry["text"] = message.text;
    root_["messages"].push_back(entry);
}

void RunReport::PutError(const std::string& line) {
    std::fwrite(line.data(), 1, line.size(), stderr);
    std::fputc('\n', stderr);
}
