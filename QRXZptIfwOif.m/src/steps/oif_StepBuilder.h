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
    template <class Step>
    void AddMassScaling(const cow_String& stepName, const Step& step);
    template <class Step>
    void AddModalDamping(const cow_String& stepName, const Step& step);
    void AddLoadCases(const cow_String& stepName, const kprC_AnalysisStep& step);
    cow_String AssemblySetName(const rgnC_Region& region) const;
};

#endif
