#ifndef QRX_TESTS_DECK_READER_DECKTESTING_H
#define QRX_TESTS_DECK_READER_DECKTESTING_H

#include "deck_reader/drd_Check.h"
#include "deck_reader/drd_Diff.h"
#include "deck_reader/drd_Flatten.h"
#include "deck_reader/drd_Names.h"
#include "deck_reader/drd_Reader.h"
#include "foundation/qio_Device.h"

#include <gtest/gtest.h>

#include <string>
#include <string_view>
#include <vector>

/// What the tests know of element types: hexahedra and springs.
inline drd_TypeInfo KnownTypes(std::string_view type) {
    if (type == "C3D8") return {8, 8, true};
    if (type == "T3D2") return {2, 2, true};
    if (type == "SPRINGA") return {2, 2, false};
    return {};
}

struct ReadDeckText {
    explicit ReadDeckText(std::string_view text, bool knowsTypes = true) {
        options.typeInfo = knowsTypes ? &KnownTypes : nullptr;
        deck = drd_ReadDeckText(text, "test.inp", options, findings);
    }
    /// "code:line" of all findings.
    std::vector<std::string> Codes() const {
        std::vector<std::string> codes;
        for (const drd_Finding& finding : findings.List()) {
            codes.push_back(std::string(finding.code->name) + ":" + std::to_string(finding.place.line));
        }
        return codes;
    }
    ReadDeckText& Checked() {
        drd_CheckDeck(deck, options, findings);
        return *this;
    }

    drd_ReadOptions options;
    drd_Findings findings;
    drd_Deck deck;
};

using Strings = std::vector<std::string>;

/// The texts of the differences of two decks.
inline Strings DifferencesOf(std::string_view first, std::string_view second,
                             const drd_DiffOptions& options = {}) {
    const ReadDeckText a(first);
    const ReadDeckText b(second);
    Strings texts;
    for (const drd_Difference& difference : drd_Diff(a.deck, b.deck, options).differences) {
        texts.push_back(difference.text);
    }
    return texts;
}

inline std::string Flattened(const drd_Deck& deck, drd_Findings& findings) {
    qio_StringDevice device;
    drd_Flatten(deck, device, findings);
    return device.Text();
}

#endif
