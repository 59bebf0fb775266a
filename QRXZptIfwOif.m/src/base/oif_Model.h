#ifndef QRX_OIF_MODEL_H
#define QRX_OIF_MODEL_H

#include "keyword_layer/qkw_Model.h"

/// The model view over the store. Filters, stabilizations, integrated output sections, remeshing rules,
/// analytical and discrete fields and tasks are not read from the store: their maps are always empty.
class oif_Model : public qkw_Model {
public:
    /// Raises if a step behind the first is no analysis step.
    oif_Model(const ddb_Model& model, const cow_String& name);

    const ddb_Model& Model() const { return ddbModel_; }
    ddb_Assembly RootAssembly() const { return ddbModel_.rootAssembly(); }
    ddb_PartContainer Parts() const;
    ddb_InstanceContainer Instances() const;
    /// The object with the assembly's attribute lists.
    const odiK_Assembly& Assembly() const { return ddbModel_.Object("rootAssembly"); }

    const mdl_MapString2ObjCow<kadC_AdptMeshCtrl>& AdaptiveMeshControls() const override;
    const mdl_MapString2ObjCow<kprC_TimePoint>& TimePoints() const override;
    const mdl_MapString2ObjCow<kamC_Amplitude>& Amplitudes() const override;
    const kprC_PropagatingContainer<kbcC_BC>& BCs() const override;
    const mdl_MapString2ObjCow<kbpC_BeamProfile>& BeamProfiles() const override;
    const mdl_MapString2ObjCow<kcoC_Constraint>& Constraints() const override;
    const mdl_MapString2ObjCow<kflC_Filter>& Filters() const override;
    const mdl_MapString2ObjCow<kinC_ContactControls>& ContactControls() const override;
    const mdl_MapString2ObjCow<kinC_ContactInitialization>& Initializations() const override;
    const mdl_MapString2ObjCow<kinC_ContactStabilization>& Stabilizations() const override;
    const mdl_MapString2ObjCow<kinC_InteractionProperty>& InteractionProperties() const override;
    const kprC_PropagatingContainer<kinC_Interaction>& Interactions() const override;
    const kprC_PropagatingContainer<kloC_Load>& Loads() const override;
    const kprC_PropagatingContainer<kprC_AdptMeshCons>& AdaptiveMeshConstraints() const override;
    const mdl_MapString2ObjCow<kmaC_Material>& Materials() const override;
    const kprC_PropagatingContainer<korC_FieldOutput>& FieldOutputs() const override;
    const kprC_PropagatingContainer<korC_HistoryOutput>& HistoryOutputs() const override;
    const mdl_MapString2ObjCow<korC_IntegratedOutputSection>& IntegratedOutputSections() const override;
    const kprC_PropagatingContainer<kpfC_Field>& Fields() const override;
    const kprC_StepContainer& Steps() const override;
    const mdl_MapString2ObjCow<kseC_Section>& Sections() const override;
    const mdl_Repository& SurfaceProperties() const override;
    const mdl_MapString2ObjCow<karC_RemeshingRule>& RemeshingRules() const override;
    const mdl_MapString2ObjCow<kfdC_AnalyticalField>& AnalyticalFields() const override;
    const mdl_MapString2ObjCow<kfdC_DiscreteField>& DiscreteFields() const override;
    const mdl_MapString2ObjCow<kopC_Task>& Tasks() const override;
    double AbsoluteZero() const override { return ddbModel_.absoluteZero(); }
    double StefanBoltzmann() const override { return ddbModel_.stefanBoltzmann(); }
    double UniversalGasConstant() const override { return 0.0; }
    int ModelType() const override { return 1; }
    mdl_Model::FormulationEnm WaveFormulation() const override;
    cow_String RestartJob() const override { return ddbModel_.restartJob(); }
    cow_String RestartStep() const override { return ddbModel_.restartStep(); }
    int RestartIncrement() const override { return ddbModel_.restartIncrement(); }
    bool EndRestartStep() const override { return ddbModel_.endRestartStep(); }
    cow_String GlobalJob() const override { return ddbModel_.globalJob(); }
    bool ShellToSolid() const override { return ddbModel_.shellToSolid(); }
    cow_String Description() const override { return {}; }
    bool aquaAnalysis() const override { return false; }
    double seabedElevation() const override { return 0.0; }
    double stillFluidSurfaceElevation() const override { return 0.0; }
    double gravitationalConstant() const override { return 0.0; }
    double fluidMassDensity() const override { return 0.0; }
    cls_xp2DArrayDouble steadyCurrentData() const override { return {}; }
    qkw_Model* Copy() const override { return new oif_Model(*this); }

private:
    ddb_Model ddbModel_;
};

#endif
