#ifndef QRX_OIF_OUTPUTREQUESTBUILDER_H
#define QRX_OIF_OUTPUTREQUESTBUILDER_H

#include "deck/oif_Component.h"

/// Controls, restart and output requests that close the steps.
class oif_OutputRequestBuilder final : public oif_ComponentOf<oif_OutputRequestBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;

private:
    void AddSolutionControls(const kprC_AnalysisStep& step, const cow_String& stepName);
    void AddSolverControls(const kprC_AnalysisStep& step, const cow_String& stepName);
    /// `previous` is the print in force so far; it becomes the one that the next step's is compared with.
    void AddDiagnosticPrint(const kprC_AnalysisStep& step, const cow_String& stepName,
                            mdl_ObjCow<kprC_DiagnosticPrint>& previous);
    /// The watched node's set as decks refer to it; empty when nothing is watched.
    cow_String GetMonitorSetName(const kprC_AnalysisStep& step) const;
    bool HasFieldRequest(const cow_String& stepName) const;
    bool HasHistoryRequest(const cow_String& stepName) const;
};

#endif
