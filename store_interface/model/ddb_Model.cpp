#include "store_interface/model/ddb_Model.h"

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
