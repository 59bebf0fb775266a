#ifndef QRX_OIF_STEPBUILDER_H
#define QRX_OIF_STEPBUILDER_H

#include "base/oif_Component.h"

/// The head of every step but the initial one: banner, *Step, the procedure, what belongs to the procedure,
/// and the headers of its load cases. Raises for a procedure that it doesn't know.
class oif_StepBuilder final : public oif_ComponentOf<oif_StepBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;

private:
    void AddProcedure(const cow_String& stepName, const kprC_AnalysisStep& step, unsigned previousProcedure);
    void AddLoadCases(const cow_String& stepName, const kprC_AnalysisStep& step);
};

#endif
