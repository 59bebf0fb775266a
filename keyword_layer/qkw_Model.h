#ifndef QRX_KEYWORD_QKW_MODEL_H
#define QRX_KEYWORD_QKW_MODEL_H

#include "store_interface/model/ddb_Model.h"
#include "store_interface/records/amplitudes/kamC_Amplitude.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/cls_UnreadFamilies.h"
#include "store_interface/records/conditions/kbcC_BC.h"
#include "store_interface/records/conditions/kloC_Load.h"
#include "store_interface/records/conditions/kpfC_Field.h"
#include "store_interface/records/constraints/kcoC_Constraint.h"
#include "store_interface/records/interactions/kinC_Interaction.h"
#include "store_interface/records/materials/kmaC_Material.h"
#include "store_interface/records/output/karC_RemeshingRule.h"
#include "store_interface/records/output/korC_Output.h"
#include "store_interface/records/sections/kbpC_BeamProfile.h"
#include "store_interface/records/sections/kseC_Section.h"

/// The store's base of a model's attributes; here for its enumeration.
class mdl_Model {
public:
    /// How an acoustic wave is formulated.
    enum class FormulationEnm : int { NOT_SET = 0, SCATTERED = 1, TOTAL = 2 };
};
const omu_EnumTable& omu_EnumTableOf(mdl_Model::FormulationEnm);

using cls_xp2DArrayDouble = cow_2DArray<double>;

/// What the builders see of the model's attributes: a read-only view with one operation for each kind, and
/// three names of steps that are worked out once. References live as long as the view.
class qkw_Model : public mem_AllocationOperators {
public:
    virtual ~qkw_Model() = default;
    virtual const mdl_MapString2ObjCow<kadC_AdptMeshCtrl>& AdaptiveMeshControls() const = 0;
    virtual const mdl_MapString2ObjCow<kprC_TimePoint>& TimePoints() const = 0;
    virtual const mdl_MapString2ObjCow<kamC_Amplitude>& Amplitudes() const = 0;
    virtual const kprC_PropagatingContainer<kbcC_BC>& BCs() const = 0;
    virtual const mdl_MapString2ObjCow<kbpC_BeamProfile>& BeamProfiles() const = 0;
    virtual const mdl_MapString2ObjCow<kcoC_Constraint>& Constraints() const = 0;
    virtual const mdl_MapString2ObjCow<kflC_Filter>& Filters() const = 0;
    virtual const mdl_MapString2ObjCow<kinC_ContactControls>& ContactControls() const = 0;
    virtual const mdl_MapString2ObjCow<kinC_ContactInitialization>& Initializations() const = 0;
    virtual const mdl_MapString2ObjCow<kinC_ContactStabilization>& Stabilizations() const = 0;
    virtual const mdl_MapString2ObjCow<kinC_InteractionProperty>& InteractionProperties() const = 0;
    virtual const kprC_PropagatingContainer<kinC_Interaction>& Interactions() const = 0;
    virtual const kprC_PropagatingContainer<kloC_Load>& Loads() const = 0;
    virtual const kprC_PropagatingContainer<kprC_AdptMeshCons>& AdaptiveMeshConstraints() const = 0;
    virtual const mdl_MapString2ObjCow<kmaC_Material>& Materials() const = 0;
    virtual const kprC_PropagatingContainer<korC_FieldOutput>& FieldOutputs() const = 0;
    virtual const kprC_PropagatingContainer<korC_HistoryOutput>& HistoryOutputs() const = 0;
    virtual const mdl_MapString2ObjCow<korC_IntegratedOutputSection>& IntegratedOutputSections() const = 0;
    virtual const kprC_PropagatingContainer<kpfC_Field>& Fields() const = 0;
    virtual const kprC_StepContainer& Steps() const = 0;
    virtual const mdl_MapString2ObjCow<kseC_Section>& Sections() const = 0;
    virtual const mdl_Repository& SurfaceProperties() const = 0;
    virtual const mdl_MapString2ObjCow<karC_RemeshingRule>& RemeshingRules() const = 0;
    virtual const mdl_MapString2ObjCow<kfdC_AnalyticalField>& AnalyticalFields() const = 0;
    virtual const mdl_MapString2ObjCow<kfdC_DiscreteField>& DiscreteFields() const = 0;
    virtual const mdl_MapString2ObjCow<kopC_Task>& Tasks() const = 0;
    virtual double AbsoluteZero() const = 0;
    virtual double StefanBoltzmann() const = 0;
    virtual double UniversalGasConstant() const = 0;
    virtual int ModelType() const = 0;
    virtual mdl_Model::FormulationEnm WaveFormulation() const = 0;
    virtual cow_String RestartJob() const = 0;
    virtual cow_String RestartStep() const = 0;
    virtual int RestartIncrement() const = 0;
    virtual bool EndRestartStep() const = 0;
    virtual cow_String GlobalJob() const = 0;
    virtual bool ShellToSolid() const = 0;
    virtual cow_String Description() const = 0;
    virtual bool aquaAnalysis() const = 0;
    virtual double seabedElevation() const = 0;
    virtual double stillFluidSurfaceElevation() const = 0;
    virtual double gravitationalConstant() const = 0;
    virtual double fluidMassDensity() const = 0;
    virtual cls_xp2DArrayDouble steadyCurrentData() const = 0;
    virtual qkw_Model* Copy() const = 0;

    const cow_String& Name() const { return name_; }
    /// The names of the first step, of the second, and of the first one behind the first that is no linear
    /// perturbation; empty where there is none.
    cow_String InitialStepName() const { return initialStepName_; }
    cow_String FirstAnalysisStepName() const { return firstAnalysisStepName_; }
    cow_String FirstGeneralAnalysisStepName() const { return firstGeneralAnalysisStepName_; }

protected:
    explicit qkw_Model(const cow_String& name) : name_(name) {}
    qkw_Model(const qkw_Model&) = default;

    cow_String name_;
    cow_String initialStepName_;
    cow_String firstAnalysisStepName_;
    cow_String firstGeneralAnalysisStepName_;
};

#endif
