#ifndef QRX_OIF_OPTIONLINE_H
#define QRX_OIF_OPTIONLINE_H

#include "deck/oif_KeywordLine.h"

/// The keyword line of a material option.
class oif_OptionLine final : public oif_KeywordLineOf<oif_OptionLine> {
public:
    using oif_KeywordLineOf::oif_KeywordLineOf;

    /// 1 is orthotropic, 2 anisotropic.
    template <class E>
    oif_OptionLine& Direction(E type) {
        return WordIf(static_cast<int>(type) == 1, "type=ORTHO")
            .WordIf(static_cast<int>(type) == 2, "type=ANISO");
    }
    oif_OptionLine& Moduli(bool longTerm) {
        return Word(longTerm ? "moduli=LONG TERM" : "moduli=INSTANTANEOUS");
    }
};

#endif
