#include "store_interface/model/ddb_Model.h"

#include "store_interface/model/odiK_Model.h"

kprC_AnalysisProductEnm ddb_DdbStepContainer::AnalysisProductOf(const kprC_StepContainer& steps,
                                                                int analysisProduct) {
    if (analysisProduct != cls_UnsetInt) return static_cast<kprC_AnalysisProductEnm>(analysisProduct);
    for (int i = 1; i < steps.Size(); ++i) {
        if (steps.StepAt(i).Explicit()) return kprC_AnalysisProductEnm::EXPLICIT;
    }
    return kprC_AnalysisProductEnm::IMPLICIT;
}

ddb_Mesh ddb_Model::mesh(int meshIndex) const {
    if (meshIndex == 0) return rootAssembly().mesh();
    const cow_CountedHld<odiK_Instance> instance = model_->InstanceOfMesh(meshIndex);
    if (instance.IsNull()) cow_RaiseNoSuchKey("ddb_Model::mesh", meshIndex);
    return ddb_PartInstance(ddb_BaseInstance(instance, model_)).mesh();
}

ddb_Datum ddb_Model::datum(const int& id) const {
    const auto& datums = model_->Datums();
    if (id < 1 || id > static_cast<int>(datums.size())) cow_RaiseNoSuchKey("ddb_Model::datum", id);
    return {id, datums[static_cast<std::size_t>(id) - 1]};
}

const odiK_Assembly& ddb_Model::Object(const cow_String& key) const {
    if (!(key == "rootAssembly")) cow_RaiseNoSuchKey("odiK_Model", key);
    return model_->AssemblyObject();
}

bool ddb_Model::hasCyclicSymmetry(const cow_String& constraintName) const {
    const auto& constraints = model_->constraints;
    return constraints.IsMember(constraintName) && constraints.ConstGet(constraintName).IsCyclic();
}

const ddb_ModelSectorDefinition& ddb_Model::modelSectorForCyclicSymmetry() const {
    static const ddb_ModelSectorDefinition none;
    return model_->cyclicSymmetry.IsNull() ? none : model_->cyclicSymmetry.ConstGet();
}

ddb_DdbStepContainer::ddb_DdbStepContainer(const cow_CountedHld<odiK_Model>& model)
    : ddb_Container(model, model->steps), analysisProduct_(model->analysisProduct) {}

const mdl_Repository& ddr_Model::ConstGetSections() const {
    return model_->sections;
}

ddb_Model::ddb_Model(const cow_CountedHld<odiK_Model>& model) : model_(model), attributes_(*model) {}

ddr_ShortcutTo<ddr_Model> ddb_Model::Shortcut() const {
    return {"model", model_->Name(), attributes_};
}

const cow_String& ddb_Model::solverInput() const {
    return model_->solverInput;
}

const cow_String& ddb_Model::topLevelSolverInput() const {
    return model_->topLevelSolverInput;
}

double ddb_Model::absoluteZero() const {
    return model_->absoluteZero;
}

double ddb_Model::stefanBoltzmann() const {
    return model_->stefanBoltzmann;
}

const cow_String& ddb_Model::waveFormulation() const {
    return model_->waveFormulation;
}

const cow_String& ddb_Model::restartJob() const {
    return model_->restartJob;
}

const cow_String& ddb_Model::restartStep() const {
    return model_->restartStep;
}

int ddb_Model::restartIncrement() const {
    return model_->restartIncrement;
}

bool ddb_Model::endRestartStep() const {
    return model_->endRestartStep;
}

const cow_String& ddb_Model::globalJob() const {
    return model_->globalJob;
}

bool ddb_Model::shellToSolid() const {
    return model_->shellToSolid;
}

ddr_ShortcutTo<mdl_MapString2ObjCow<kmaC_Material>> ddb_Model::material() const {
    return {"materials", "materials", model_->materials};
}

ddr_ShortcutTo<mdl_MapString2ObjCow<kamC_Amplitude>> ddb_Model::amplitudes() const {
    return {"amplitudes", "amplitudes", model_->amplitudes};
}

ddr_ShortcutTo<mdl_MapString2ObjCow<kbpC_BeamProfile>> ddb_Model::beamProfile() const {
    return {"beamProfiles", "beamProfiles", model_->beamProfiles};
}

ddb_Model::Named<kcoC_Constraint> ddb_Model::constraints() const {
    return {model_, model_->constraints};
}

ddb_Model::Named<kinC_ContactControls> ddb_Model::contactControls() const {
    return {model_, model_->contactControls};
}

ddb_Model::Named<kinC_ContactInitialization> ddb_Model::contactInitializations() const {
    return {model_, model_->contactInitializations};
}

ddb_Model::Named<kinC_InteractionProperty> ddb_Model::interactionProperties() const {
    return {model_, model_->interactionProperties};
}

ddb_Model::Named<kprC_TimePoint> ddb_Model::timePoints() const {
    return {model_, model_->timePoints};
}

ddb_Model::Named<kadC_AdptMeshCtrl> ddb_Model::adaptiveMeshControls() const {
    return {model_, model_->adaptiveMeshControls};
}

ddb_Model::Propagating<kbcC_BC> ddb_Model::boundaryConditions() const {
    return {model_, model_->boundaryConditions};
}

ddb_Model::Propagating<kloC_Load> ddb_Model::loads() const {
    return {model_, model_->loads};
}

ddb_Model::Propagating<kpfC_Field> ddb_Model::fields() const {
    return {model_, model_->fields};
}

ddb_Model::Propagating<kinC_Interaction> ddb_Model::interactions() const {
    return {model_, model_->interactions};
}

ddb_Model::Propagating<korC_FieldOutput> ddb_Model::fieldOutputRequests() const {
    return {model_, model_->fieldOutputRequests};
}

ddb_Model::Propagating<korC_HistoryOutput> ddb_Model::historyOutputRequests() const {
    return {model_, model_->historyOutputRequests};
}

ddb_Model::Propagating<kprC_AdptMeshCons> ddb_Model::adaptiveMeshConstraints() const {
    return {model_, model_->adaptiveMeshConstraints};
}
