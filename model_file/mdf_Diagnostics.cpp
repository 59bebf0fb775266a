#include "model_file/mdf_Diagnostics.h"

#include "model_file/mdf_Locate.h"
#include "model_file/mdf_Utf8.h"

#include <algorithm>
#include <charconv>

void mdf_Diagnostics::Take(fnd_Finding finding) {
    const bool isError = finding.IsError();
    int& count = isError ? numErrors_ : numWarnings_;
    if (count++ < report_->most) {
        report_->findings.push_back(std::move(finding));
    } else {
        ++(isError ? report_->moreErrors : report_->moreWarnings);
    }
}

bool mdf_Diagnostics::WantsHint() {
    return numErrors_ < kMostHints;
}

void mdf_Diagnostics::Expected(const fnd_Path& path, const mdf_Value& found, const std::string& expected,
                               const std::string& hint) {
    Add("wrong-value", path, "found " + mdf_Shown(found), expected, hint);
}

std::string_view mdf_GivenWord(const mdf_Value& value) {
    return value.IsString() ? std::string_view(value.String()) : std::string_view();
}

std::string mdf_Shown(const mdf_Value& value) {
    constexpr std::size_t longest = 60;
    if (value.IsNull()) return "null";
    if (value.IsBool()) return value.Bool() ? "true" : "false";
    if (value.IsInt()) return std::to_string(value.Int());
    if (value.IsLargeInteger()) {
        char text[400];
        return {text, std::to_chars(text, text + sizeof text, value.Real(), std::chars_format::fixed, 0).ptr};
    }
    if (value.IsNumber()) return fnd_Shown(value.Real());
    if (value.IsString()) {
        const std::string& text = value.String();
        return text.size() <= longest ? fnd_Quoted(text)
                                      : fnd_Quoted(mdf_Utf8Beginning(text, longest)) + "...";
    }
    if (value.IsObject()) return "an object";
    return "an array of " + std::to_string(value.Size()) + (value.Size() == 1 ? " item" : " items");
}

void mdf_CapitalsCheck::Enter(const std::string& name, const fnd_Path& path, const char* kind,
                              mdf_Diagnostics& diagnostics) {
    const auto [place, isNew] = byLowerCase_.emplace(fnd_LowerCase(name), name);
    if (isNew || place->second == name) return;
    diagnostics.Add("capitals-only", path,
                    std::string("this ") + kind + " and " + fnd_Quoted(place->second) +
                        " differ only in capitals, which solvers take for one name");
}

bool mdf_Report::HasErrors() const {
    return std::ranges::any_of(findings, [](const fnd_Finding& finding) { return finding.IsError(); });
}

void mdf_Report::Locate(std::span<fnd_Finding> located) const {
    if (text != nullptr) text->Locate(located);
}

std::string mdf_Report::Line(const fnd_Finding& finding) const {
    return mdf_LineOf(fileName, finding);
}

std::string mdf_LineOf(const std::string& fileName, const fnd_Finding& finding, const mdf_LineStyle& style) {
    std::string line = style.place + fnd_Visible(fileName) + ":";
    if (finding.line > 0) line += std::to_string(finding.line) + ":" + std::to_string(finding.column) + ":";
    const fnd_Severity severity = finding.code->severity;
    const char* const paint = severity == fnd_Severity::ERROR     ? style.error
                              : severity == fnd_Severity::WARNING ? style.warning
                                                                  : style.note;
    line.append(style.end).append(" ").append(paint).append(fnd_SeverityWord(severity)).append(":");
    line.append(style.end).append(" ").append(finding.Text());
    const bool isOfRun = finding.code->name.starts_with("run-");
    if (isOfRun && finding.place.empty()) return line;
    line.append(" ").append(style.dim);
    if (!finding.place.empty()) line.append("(").append(fnd_Visible(finding.place)).append(")");
    if (!isOfRun) line.append(finding.place.empty() ? "[" : " [").append(finding.code->name).append("]");
    return line.append(style.end);
}
