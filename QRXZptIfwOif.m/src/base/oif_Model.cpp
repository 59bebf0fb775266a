#include "base/oif_Model.h"

namespace {

template <class T>
const mdl_MapString2ObjCow<T>& None() {
    static const mdl_MapString2ObjCow<T> none;
    return none;
}

} // namespace

oif_Model::oif_Model(const ddb_Model& model, const cow_String& name) : qkw_Model(name), ddbModel_(model) {
    int place = 0;
    for (kprC_StepContainerIT it(ddbModel_.step().container()); !it.IsDone(); it.Next(), ++place) {
        if (place == 0) {
            initialStepName_ = it.CurrentKey();
            continue;
        }
        if (place == 1) firstAnalysisStepName_ = it.CurrentKey();
        if (!firstGeneralAnalysisStepName_.IsEmpty()) break;
        const nex_Context context("step", it.CurrentKey());
        const auto& step = nex_canDynamicCastRef<kprC_AnalysisStep>(it.CurrentValue(), NEX_HERE);
        if (!step.Perturbation()) firstGeneralAnalysisStepName_ = it.CurrentKey();
    }
}

ddb_PartContainer oif_Model::Parts() const {
    return ddbModel_.part();
}

ddb_InstanceContainer oif_Model::Instances() const {
    return ddbModel_.rootAssembly().instance();
}

const mdl_MapString2ObjCow<kadC_AdptMeshCtrl>& oif_Model::AdaptiveMeshControls() const {
    return ddbModel_.adaptiveMeshControls().container();
}

const mdl_MapString2ObjCow<kprC_TimePoint>& oif_Model::TimePoints() const {
    return ddbModel_.timePoints().container();
}

const mdl_MapString2ObjCow<kamC_Amplitude>& oif_Model::Amplitudes() const {
    return ddbModel_.amplitudes().ConstGet();
}

const kprC_PropagatingContainer<kbcC_BC>& oif_Model::BCs() const {
    return ddbModel_.boundaryConditions().container();
}

const mdl_MapString2ObjCow<kbpC_BeamProfile>& oif_Model::BeamProfiles() const {
    return ddbModel_.beamProfile().ConstGet();
}

const mdl_MapString2ObjCow<kcoC_Constraint>& oif_Model::Constraints() const {
    return ddbModel_.constraints().container();
}

const mdl_MapString2ObjCow<kflC_Filter>& oif_Model::Filters() const {
    return None<kflC_Filter>();
}

const mdl_MapString2ObjCow<kinC_ContactControls>& oif_Model::ContactControls() const {
    return ddbModel_.contactControls().container();
}

const mdl_MapString2ObjCow<kinC_ContactInitialization>& oif_Model::Initializations() const {
    return ddbModel_.contactInitializations().container();
}

const mdl_MapString2ObjCow<kinC_ContactStabilization>& oif_Model::Stabilizations() const {
    return None<kinC_ContactStabilization>();
}

const mdl_MapString2ObjCow<kinC_InteractionProperty>& oif_Model::InteractionProperties() const {
    return ddbModel_.interactionProperties().container();
}

const kprC_PropagatingContainer<kinC_Interaction>& oif_Model::Interactions() const {
    return ddbModel_.interactions().container();
}

const kprC_PropagatingContainer<kloC_Load>& oif_Model::Loads() const {
    return ddbModel_.loads().container();
}

const kprC_PropagatingContainer<kprC_AdptMeshCons>& oif_Model::AdaptiveMeshConstraints() const {
    return ddbModel_.adaptiveMeshConstraints().container();
}

const mdl_MapString2ObjCow<kmaC_Material>& oif_Model::Materials() const {
    return ddbModel_.material().ConstGet();
}

const kprC_PropagatingContainer<korC_FieldOutput>& oif_Model::FieldOutputs() const {
    return ddbModel_.fieldOutputRequests().container();
}

const kprC_PropagatingContainer<korC_HistoryOutput>& oif_Model::HistoryOutputs() const {
    return ddbModel_.historyOutputRequests().container();
}

const mdl_MapString2ObjCow<korC_IntegratedOutputSection>& oif_Model::IntegratedOutputSections() const {
    return None<korC_IntegratedOutputSection>();
}

const kprC_PropagatingContainer<kpfC_Field>& oif_Model::Fields() const {
    return ddbModel_.fields().container();
}

const kprC_StepContainer& oif_Model::Steps() const {
    return ddbModel_.step().container();
}

const mdl_MapString2ObjCow<kseC_Section>& oif_Model::Sections() const {
    return static_cast<const mdl_MapString2ObjCow<kseC_Section>&>(SurfaceProperties());
}

const mdl_Repository& oif_Model::SurfaceProperties() const {
    return ddbModel_.Shortcut().ConstGet().ConstGetSections();
}

const mdl_MapString2ObjCow<karC_RemeshingRule>& oif_Model::RemeshingRules() const {
    return None<karC_RemeshingRule>();
}

const mdl_MapString2ObjCow<kfdC_AnalyticalField>& oif_Model::AnalyticalFields() const {
    return None<kfdC_AnalyticalField>();
}

const mdl_MapString2ObjCow<kfdC_DiscreteField>& oif_Model::DiscreteFields() const {
    return None<kfdC_DiscreteField>();
}

const mdl_MapString2ObjCow<kopC_Task>& oif_Model::Tasks() const {
    return None<kopC_Task>();
}

mdl_Model::FormulationEnm oif_Model::WaveFormulation() const {
    omu_PrimEnum<mdl_Model::FormulationEnm, 1> formulation;
    formulation.SetValue(ddbModel_.waveFormulation().CStr());
    return formulation.Value();
}
