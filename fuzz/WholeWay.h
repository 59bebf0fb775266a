#ifndef QRX_FUZZ_WHOLEWAY_H
#define QRX_FUZZ_WHOLEWAY_H

#include "deck/oif_Writer.h"
#include "deck_checks/dck_Check.h"
#include "foundation/nex_Exception.h"
#include "foundation/qio_Device.h"
#include "model_file/mdf_ModelFile.h"
#include "tests/support/KeptVariants.h"

#include <sstream>
#include <string>

/// A deck, or the text that writing it raised.
inline std::string DeckOrFailure(const odb_Odb& odb) {
    qio_StringDevice device;
    try {
        oif_Writer(odb).WriteInput(device);
    } catch (const QRXBasException& failure) {
        // A model can be right in itself and still have no deck.
        return std::string("raised: ") + failure.what();
    }
    return device.Text();
}

inline std::string FileOf(const odb_Odb& odb) {
    std::ostringstream out;
    return mdf_WriteModelFile(odb, out) ? out.str() : std::string();
}

/// Goes the whole way with a text as a model file: it is read or refused with a reason; what was read is
/// checked, written as a deck and as a model file; that reads back the same and gives the same deck; one of
/// its variants has the deck that it has without what is kept. Gives what went wrong, or nothing.
inline std::string WholeWay(std::string_view text) {
    mdf_Report report;
    const auto odb = mdf_ReadModelText(text, "m.json", report);
    if ((odb == nullptr) != report.HasErrors()) return "read in spite of errors, or refused without one";
    for (const fnd_Finding& finding : report.findings) {
        if (finding.found.empty() || report.Line(finding).find('\n') != std::string::npos) {
            return "a finding that can't be told: " + finding.Text();
        }
    }
    if (odb == nullptr) return {};

    for (const fnd_Finding& finding : dck_Check(*odb)) {
        if (finding.IsError()) return "the store's check refuses what the reader took: " + finding.Text();
    }
    const std::string deck = DeckOrFailure(*odb);
    const std::string file = FileOf(*odb);
    mdf_Report again;
    const auto copy = mdf_ReadModelText(file, "copy.json", again);
    if (copy == nullptr) return "what was written is refused: " + again.Line(again.findings.at(0));
    if (FileOf(*copy) != file) return "what was written is written otherwise when it was read";
    if (DeckOrFailure(*copy) != deck) return "what was written gives another deck";
    if (DeckOrFailure(*odb) != deck) return "a second deck is another one";
    KeptVariants variants(*odb);
    if (variants.Count() == 0) return variants.ProblemOfBase();
    return variants.ProblemOf(text.size() % variants.Count());
}

#endif
