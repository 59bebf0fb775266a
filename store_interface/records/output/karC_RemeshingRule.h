#ifndef QRX_STORE_KARC_REMESHINGRULE_H
#define QRX_STORE_KARC_REMESHINGRULE_H

#include "store_interface/records/cls_Lists.h"
#include "store_interface/regions/rgnC_Region.h"

/// A rule for adaptive remeshing between jobs: which error indicators a step works out, and where. A deck
/// asks for them as field output. Held by name; a store holds none, a model view of a program's own may.
class karC_RemeshingRule final : public cls_RecordOf<karC_RemeshingRule> {
public:
    static constexpr cls_ClassInfo Class{"karC_RemeshingRule", "a rule for adaptive remeshing between jobs"};

    enum class OutputFrequencyEnm : int { LAST_INCREMENT = 0, ALL_INCREMENTS = 1 };

    cow_String description;
    bool suppressed = false;
    cow_String stepName;
    rgnC_Region region;
    bool fieldOutput = true;
    OutputFrequencyEnm outputFrequency = OutputFrequencyEnm::LAST_INCREMENT;
    cls_xpListString variables;

    /// Each indicator behind the variable that it rests on, each name once.
    cls_xpListString GetFullVariableList() const;
    bool EveryIncrement() const { return outputFrequency == OutputFrequencyEnm::ALL_INCREMENTS; }

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(karC_RemeshingRule::OutputFrequencyEnm);

#endif
