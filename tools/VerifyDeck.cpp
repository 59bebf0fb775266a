#include "store_interface/findings/fnd_Text.h"
#include "store_interface/model/odb_Odb.h"
#include "tools/DeckCommands.h"
#include "tools/DeckProof.h"

#include <cstdio>

ExitCode VerifyDeck(const odb_Odb& odb, const std::string& target, RunReport& report) {
    const odiK_Model* model = odb.DeckModel();
    drd_Findings findings;
    DeckRequest request;
    // What a model's own text includes is none of the store's.
    request.keepIncludesShut = true;
    const drd_Deck deck = ReadDeck(target, request, findings);
    AddFindings(deck, findings, report);
    const std::vector<std::string> problems = ProveDeck(*model, deck);
    for (const std::string& problem : problems) report.Error(target, problem);
    report.Times().End("verifying");
    const double seconds = report.Times().Parts().back().second;
    report.Member("verified") = problems.empty() && !findings.HasErrors();
    if (report.AsJson()) {
        nlohmann::ordered_json& written = report.Member("written");
        written["times"]["verifying"] = seconds;
        written["seconds"] = report.Times().Whole();
    }
    // What was made ready when the deck was written lacks this.
    report.PrepareForSuccess();
    if (!problems.empty() || findings.HasErrors()) return ExitCode::INTERNAL_FAILURE;
    char time[32];
    std::snprintf(time, sizeof time, " (%.2f s)", seconds);
    report.Print(fnd_Visible(target) + ": read back, and as the store has it" + time + "\n");
    return ExitCode::DONE;
}
