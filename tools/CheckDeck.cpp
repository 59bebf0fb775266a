#include "deck_reader/drd_Check.h"
#include "deck_reader/drd_Text.h"
#include "platform/plt_Files.h"
#include "store_interface/findings/fnd_Finding.h"
#include "store_interface/model/ddb_ElementTypes.h"
#include "tools/DeckCommands.h"

#include <array>
#include <filesystem>
#include <fstream>
#include <iterator>

namespace {

drd_TypeInfo InfoOf(std::string_view type) {
    drd_TypeInfo info;
    if (const auto found = ddb_FindElementType(type)) {
        info.minNodes = found->minNodes;
        info.maxNodes = found->maxNodes;
    }
    const ddb_ElementFamily* family = ddb_FamilyOf(type);
    info.needsSection = family != nullptr && family->section != ddb_SectionNeedEnm::NOTHING &&
                        family->section != ddb_SectionNeedEnm::UNKNOWN;
    return info;
}

/// The codes of decks as codes of findings.
const fnd_Code& CodeOf(const drd_Code& code) {
    static const auto kCodes = [] {
        std::array<fnd_Code, std::size(drd_Codes)> codes{};
        for (std::size_t i = 0; i < codes.size(); ++i) {
            const drd_SeverityEnm severity = drd_Codes[i].severity;
            codes[i] = {drd_Codes[i].name,
                        severity == drd_SeverityEnm::ERROR     ? fnd_Severity::ERROR
                        : severity == drd_SeverityEnm::WARNING ? fnd_Severity::WARNING
                                                               : fnd_Severity::NOTE,
                        drd_Codes[i].meaning};
        }
        return codes;
    }();
    return kCodes[static_cast<std::size_t>(&code - drd_Codes)];
}

} // namespace

bool IsDeck(const std::string& path) {
    const std::string extension = drd_FoldKey(plt_Path(path).extension().string());
    if (extension == ".inp") return true;
    if (extension == ".json") return false;
    std::error_code error;
    if (!std::filesystem::is_regular_file(plt_Path(path), error)) return false;
    std::ifstream file(plt_Path(path), std::ios::binary);
    char first = '\0';
    return static_cast<bool>(file >> first) && first == '*';
}

drd_ReadOptions DeckOptions(const DeckRequest& request) {
    drd_ReadOptions options;
    options.followIncludes = !request.keepIncludesShut;
    options.typeInfo = &InfoOf;
    options.progress = request.progress;
    return options;
}

drd_Deck ReadDeck(const std::string& path, const DeckRequest& request, drd_Findings& findings) {
    return drd_ReadDeck(path, DeckOptions(request), findings);
}

drd_Deck ReadDeckWatched(const std::string& path, const DeckRequest& request, drd_Findings& findings,
                         RunReport& report) {
    report.Watched().Begin("reading", path);
    DeckRequest watched = request;
    watched.progress = &report.Watched().Work();
    return ReadDeck(path, watched, findings);
}

void AddFindings(const drd_Deck& deck, const drd_Findings& findings, RunReport& report) {
    for (const drd_Finding& found : findings.List()) {
        fnd_Finding finding{&CodeOf(*found.code), {}, found.found, found.expected, found.hint};
        finding.line = found.place.line;
        finding.column = 1;
        report.Add(deck.FileName(found.place), finding);
    }
    for (const auto& [name, count] : findings.Counts()) {
        if (count <= drd_Findings::kShownOfOneKind) continue;
        report.Warning(deck.files[0].name, std::to_string(count - drd_Findings::kShownOfOneKind) +
                                               " more of the kind '" + std::string(name) + "'");
    }
}

ExitCode RunCheckDeck(const std::string& path, const DeckRequest& request, RunReport& report) {
    drd_Findings findings;
    const drd_Deck deck = ReadDeckWatched(path, request, findings, report);
    const bool unreadable = deck.files.size() == 1 && findings.Counts().contains("deck-unreadable");
    report.Watched().Begin("checking", path);
    if (!unreadable) drd_CheckDeck(deck, DeckOptions(request), findings);
    AddFindings(deck, findings, report);
    if (unreadable) return ExitCode::FILE_SYSTEM_REFUSED;
    if (findings.HasErrors() || report.HasStrictErrors()) return ExitCode::MODEL_IS_WRONG;
    report.Print(path + ": no errors\n");
    return ExitCode::DONE;
}
