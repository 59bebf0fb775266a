#include "deck_reader/drd_Emitter.h"
#include "deck_reader/drd_Flatten.h"
#include "foundation/qio_Device.h"
#include "tools/CommandParts.h"
#include "tools/DeckCommands.h"

#include <functional>

namespace {

/// Writes to the file, replaced as a whole, or to the standard output when the name is empty.
bool WriteOut(const std::string& output, const std::function<void(qio_ostream&)>& write, RunReport& report) {
    if (output.empty() || output == kStandardStream) {
        qio_StringDevice text;
        write(text);
        if (report.AsJson()) report.Member("deck") = text.Text();
        report.Print(text.Text());
        return true;
    }
    return ReplaceFile(output, "deck", write, report);
}

} // namespace

ExitCode RunFlatten(const FlattenRequest& request, RunReport& report) {
    drd_Deck deck;
    if (!ReadDeckOrModel(request.input, deck, request.deck, report)) return ExitCode::MODEL_IS_WRONG;
    drd_Findings findings;
    const auto write = [&](qio_ostream& device) { drd_Flatten(deck, device, findings); };
    const bool isWritten = WriteOut(request.output, write, report);
    AddFindings(deck, findings, report);
    if (!isWritten) return ExitCode::FILE_SYSTEM_REFUSED;
    return findings.HasErrors() ? ExitCode::CANNOT_BE_EXPRESSED : ExitCode::DONE;
}

int RunTextOfDeck(const std::string& input, const DeckRequest& request, RunReport& report) {
    drd_Deck deck;
    if (!ReadDeckOrModel(input, deck, request, report)) return 2;
    return WriteOut(
               {}, [&deck](qio_ostream& device) { drd_Reformat(deck, device); }, report)
               ? 0
               : 2;
}
