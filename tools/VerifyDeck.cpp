#include "store_interface/model/odb_Odb.h"
#include "tools/DeckCommands.h"
#include "tools/DeckProof.h"

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
    report.Member("verified") = problems.empty() && !findings.HasErrors();
    // What was made ready when the deck was written lacks this.
    report.PrepareForSuccess();
    if (!problems.empty() || findings.HasErrors()) return ExitCode::INTERNAL_FAILURE;
    report.Print(target + ": read back, and as the store has it\n");
    return ExitCode::DONE;
}
