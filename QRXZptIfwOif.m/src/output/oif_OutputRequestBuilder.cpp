#include "output/oif_OutputRequestBuilder.h"

#include "deck/oif_Comment.h"
#include "mesh/oif_SetName.h"
#include "steps/oif_StepControls.h"
#include "steps/oif_StepExtras.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <memory>

namespace {

/// The keyword of the controls if they are of the class Record itself.
template <class Keyword, class Record>
std::unique_ptr<qkw_Keyword> KeywordFor(const kprC_Controls& controls, bool quasiNewton) {
    if (controls.DynTypeId() != Record::TypeId()) return nullptr;
    return std::make_unique<Keyword>(static_cast<const Record&>(controls), quasiNewton);
}

constexpr std::unique_ptr<qkw_Keyword> (*kControlsKeywords[])(const kprC_Controls&, bool) = {
    KeywordFor<oif_TypicalControls, kprC_TypicalControls>,
    KeywordFor<oif_HeatTransferControls, kprC_HeatTransferControls>,
    KeywordFor<oif_MassDiffusionControls, kprC_MassDiffusionControls>,
    KeywordFor<oif_CTEControls, kprC_CTEControls>,
    KeywordFor<oif_CTDControls, kprC_CTDControls>,
    KeywordFor<oif_PoreControls, kprC_PoreControls>,
    KeywordFor<oif_ElectricalControls, kprC_ElectricalControls>,
};

template <class Output>
bool AnyHasStep(const kprC_PropagatingContainer<Output>& requests, const cow_String& stepName) {
    for (mdl_RepositoryIT it(requests); !it.IsDone(); it.Next()) {
        if (static_cast<const korC_Output&>(it.CurrentRecord()).HasStep(stepName)) return true;
    }
    return false;
}

} // namespace

void oif_OutputRequestBuilder::Build() {
    mdl_ObjCow<kprC_DiagnosticPrint> print;
    kprC_StepContainerIT it(Model().Steps());
    if (it.IsDone()) return;
    for (it.Next(); !it.IsDone(); it.Next()) {
        const cow_String& stepName = it.CurrentKey();
        const nex_Context context("step", stepName);
        const auto& step = nex_canDynamicCastRef<kprC_AnalysisStep>(it.CurrentValue(), NEX_HERE);
        AddSolutionControls(step, stepName);
        AddSolverControls(step, stepName);
        const cow_String monitorSet = GetMonitorSetName(step);
        const bool hasField = HasFieldRequest(stepName);
        // Load cases have no history.
        const bool hasHistory = step.loadCases.IsEmpty() && HasHistoryRequest(stepName);
        if (hasField || hasHistory || !step.restart.IsNull() || !step.diagnosticPrint.IsNull() ||
            !monitorSet.IsEmpty()) {
            AddStepDefinition(stepName, oif_Comment("\nOUTPUT REQUESTS\n"));
        }
        if (!step.restart.IsNull()) AddStepDefinition(stepName, oif_Restart(step.restart));
        AddDiagnosticPrint(step, stepName, print);
        if (!monitorSet.IsEmpty()) AddStepDefinition(stepName, oif_Monitor(step.monitor, monitorSet));
    }
}

void oif_OutputRequestBuilder::AddSolutionControls(const kprC_AnalysisStep& step,
                                                   const cow_String& stepName) {
    if (step.controls.IsNull()) return;
    const kprC_Controls& controls = step.controls.ConstGet();
    if (!controls.HasDefaultValue()) AddStepDefinition(stepName, oif_Comment("\nCONTROLS\n"));
    const bool quasiNewton = step.SolutionTechnique() == kprC_Step::SolutionTechniqueEnm::QUASI_NEWTON;
    for (const auto& keywordFor : kControlsKeywords) {
        const std::unique_ptr<qkw_Keyword> keyword = keywordFor(controls, quasiNewton);
        if (keyword == nullptr) continue;
        AddStepDefinition(stepName, *keyword);
        return;
    }
}

void oif_OutputRequestBuilder::AddSolverControls(const kprC_AnalysisStep& step, const cow_String& stepName) {
    if (step.solverControls.IsNull()) return;
    const kprC_LinearCtrl& controls = step.solverControls.ConstGet();
    if (!controls.useDefault) AddStepDefinition(stepName, oif_Comment("\nSOLVER CONTROLS\n"));
    AddStepDefinition(stepName, oif_SolverControls(controls));
}

void oif_OutputRequestBuilder::AddDiagnosticPrint(const kprC_AnalysisStep& step, const cow_String& stepName,
                                                  mdl_ObjCow<kprC_DiagnosticPrint>& previous) {
    if (previous.IsNull()) {
        previous = step.Explicit() ? mdl_ObjCow<kprC_DiagnosticPrint>(kprC_ExplicitDiagnosticPrint())
                                   : mdl_ObjCow<kprC_DiagnosticPrint>(kprC_StandardDiagnosticPrint());
    }
    if (step.diagnosticPrint.IsNull()) return;
    AddStepDefinition(stepName, oif_DiagnosticPrint(step.diagnosticPrint, previous));
    const auto* perturbation =
        nex_canDynamicCastPtr<kprC_PerturbationDiagnosticPrint>(&step.diagnosticPrint.ConstGet());
    if (perturbation == nullptr) {
        previous = step.diagnosticPrint;
        return;
    }
    // Of a perturbation's print two numbers stay, in a standard one.
    const auto* former = nex_canDynamicCastPtr<kprC_StandardDiagnosticPrint>(&previous.ConstGet());
    kprC_StandardDiagnosticPrint print = former == nullptr ? kprC_StandardDiagnosticPrint() : *former;
    print.frequency = perturbation->frequency;
    print.solve = perturbation->solve;
    previous = mdl_ObjCow<kprC_DiagnosticPrint>(print);
}

cow_String oif_OutputRequestBuilder::GetMonitorSetName(const kprC_AnalysisStep& step) const {
    if (step.monitor.IsNull()) return {};
    const rgnC_Region& region = step.monitor.ConstGet().region;
    if (region.SetName().IsEmpty()) return {};
    return oif_SetName(region, Info()).UniqueSetName(oif_SetName::regionContext::ASSEMBLY);
}

bool oif_OutputRequestBuilder::HasFieldRequest(const cow_String& stepName) const {
    return AnyHasStep(Model().FieldOutputs(), stepName);
}

bool oif_OutputRequestBuilder::HasHistoryRequest(const cow_String& stepName) const {
    return AnyHasStep(Model().HistoryOutputs(), stepName);
}
