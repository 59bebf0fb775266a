#include "deck_reader/drd_Finding.h"
#include "store_interface/findings/fnd_Finding.h"
#include "store_interface/findings/fnd_Nearest.h"
#include "store_interface/findings/fnd_Text.h"
#include "tools/HelpCommands.h"

#include <algorithm>
#include <iterator>

using nlohmann::ordered_json;

namespace {

struct Explanation {
    std::string_view code;
    /// What was found, why that matters to an analysis, and what to do about it.
    const char* means;
    const char* matters;
    const char* mend;
};

constexpr Explanation kExplanations[] = {
#include "deck_reader/drd_Explanations.inl"
#include "store_interface/findings/fnd_Explanations.inl"
};

constexpr bool IsExplained(std::string_view code) {
    return std::ranges::count(kExplanations, code, &Explanation::code) == 1;
}
static_assert(std::ranges::all_of(fnd_Codes, [](const fnd_Code& code) { return IsExplained(code.name); }),
              "each code has one explanation");
static_assert(std::ranges::all_of(drd_Codes, [](const drd_Code& code) { return IsExplained(code.name); }),
              "each code has one explanation");
static_assert(std::size(kExplanations) == std::size(fnd_Codes) + std::size(drd_Codes),
              "no explanation without a code");

struct ExplainedCode {
    std::string_view name;
    const char* severity;
    const char* meaning;
    const Explanation* explanation;
};

const std::vector<ExplainedCode>& ExplainedCodes() {
    static const std::vector<ExplainedCode> kCodes = [] {
        std::vector<ExplainedCode> codes;
        const auto add = [&codes](std::string_view name, const char* severity, const char* meaning) {
            codes.push_back(
                {name, severity, meaning, std::ranges::find(kExplanations, name, &Explanation::code)});
        };
        for (const fnd_Code& code : fnd_Codes) add(code.name, fnd_SeverityWord(code.severity), code.meaning);
        constexpr const char* kWords[] = {"error", "warning", "note"};
        for (const drd_Code& code : drd_Codes)
            add(code.name, kWords[static_cast<std::size_t>(code.severity)], code.meaning);
        std::ranges::sort(codes, {}, &ExplainedCode::name);
        return codes;
    }();
    return kCodes;
}

ordered_json JsonOfExplained(const ExplainedCode& code) {
    return {{"code", code.name},
            {"severity", code.severity},
            {"meaning", code.meaning},
            {"means", code.explanation->means},
            {"matters", code.explanation->matters},
            {"mend", code.explanation->mend}};
}

std::string TextOfExplained(const ExplainedCode& code, std::size_t width) {
    const std::string indent = "  ";
    std::string text =
        Wrapped(std::string(code.name) + " (" + code.severity + "): " + code.meaning, width) + "\n";
    const std::pair<const char*, const char*> parts[] = {{"What it means", code.explanation->means},
                                                         {"Why it matters", code.explanation->matters},
                                                         {"What to do", code.explanation->mend}};
    for (const auto& [title, part] : parts)
        text += "\n" + std::string(title) + "\n" + indent + Wrapped(part, width, indent) + "\n";
    return text;
}

std::string ListOfCodes(std::size_t width) {
    std::size_t longest = 0;
    for (const ExplainedCode& code : ExplainedCodes()) longest = std::max(longest, code.name.size());
    const std::string indent(longest + 11, ' ');
    std::string text;
    for (const ExplainedCode& code : ExplainedCodes()) {
        std::string row(code.name);
        row.append(longest + 2 - row.size(), ' ').append(code.severity);
        row.append(indent.size() - row.size(), ' ');
        text += row + Wrapped(code.meaning, std::max(width, indent.size() + 20), indent) + "\n";
    }
    return text;
}

} // namespace

std::vector<std::string> CodesOfFindings() {
    std::vector<std::string> names;
    for (const ExplainedCode& code : ExplainedCodes()) names.emplace_back(code.name);
    return names;
}

ExitCode RunExplain(const std::vector<std::string>& codes, RunReport& report) {
    ordered_json& explained = report.Member("findings") = ordered_json::array();
    if (codes.empty()) {
        for (const ExplainedCode& code : ExplainedCodes()) explained.push_back(JsonOfExplained(code));
        report.Print(ListOfCodes(TextWidth()));
        return ExitCode::DONE;
    }
    const char* separator = "";
    for (const std::string& name : codes) {
        const auto code = std::ranges::find(ExplainedCodes(), name, &ExplainedCode::name);
        if (code == ExplainedCodes().end()) {
            const std::string hint = fnd_DidYouMean(name, CodesOfFindings());
            report.Error("qrxdeck", "there is no finding " + fnd_Quoted(name) + "; " +
                                        (hint.empty() ? "\"qrxdeck explain\" lists them" : hint));
            return ExitCode::WRONG_USAGE;
        }
        explained.push_back(JsonOfExplained(*code));
        report.Print(separator + TextOfExplained(*code, TextWidth()));
        separator = "\n";
    }
    return ExitCode::DONE;
}
