#ifndef QRX_OIF_OPTIONLINE_H
#define QRX_OIF_OPTIONLINE_H

#include "base/oif_KeywordLine.h"

/// The keyword line of a material option.
class oif_OptionLine final : public oif_KeywordLine {
public:
    using oif_KeywordLine::oif_KeywordLine;

    /// 1 is orthotropic, 2 anisotropic.
    template <class E>
    void Direction(E type) {
        BreakingIf(static_cast<int>(type) == 1, "type=ORTHO")
            .BreakingIf(static_cast<int>(type) == 2, "type=ANISO");
    }
    void Moduli(bool longTerm) { Breaking(longTerm ? "moduli=LONG TERM" : "moduli=INSTANTANEOUS"); }
};

#endif
