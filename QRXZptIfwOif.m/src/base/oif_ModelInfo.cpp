#include "base/oif_ModelInfo.h"

#include "keyword_layer/qkw_QuorixName.h"

oif_ModelInfo::oif_ModelInfo(const ddb_Model& model)
    : model_(model), meshNames_(new omi_IntTable<cow_String>()) {
    SetModel(new oif_Model(model_, cow_String()));
    SetQIFSolverVersion();
    SetMeshData();
    SetStepData();
}

void oif_ModelInfo::Numbering::Enter(const cow_String& instance, int count) {
    total += count;
    last[instance] = count;
}

int& oif_ModelInfo::Numbering::Last(const cow_String& instance) {
    const auto place = last.find(instance);
    if (place == last.end()) cow_RaiseNoSuchKey("cow_Map", instance);
    return place->second;
}

int oif_ModelInfo::Numbering::Offset(const cow_String& instance) const {
    if (last.count(instance) == 0) cow_RaiseNoSuchKey("cow_Map", instance);
    return 0;
}

int oif_ModelInfo::Numbering::GetNew(const cow_String& instance, bool commit, bool v6Format) {
    mdl_ReadNotes::NoteUntold(); // which labels are free depends on who asked before
    if (!v6Format) {
        const int label = total + 1 + extra;
        if (commit) ++extra;
        return label;
    }
    int& given = Last(instance);
    const int label = given + 1;
    if (commit) given = label;
    return label;
}

int oif_ModelInfo::Numbering::Increment(const cow_String& instance, int count, bool v6Format) {
    mdl_ReadNotes::NoteUntold();
    if (!v6Format) {
        extra += count;
        return total + extra;
    }
    return Last(instance) += count;
}

void oif_ModelInfo::EnterMesh(const cow_String& instance, const ddb_Mesh& mesh) {
    meshNames_->Insert(mesh.meshIndex(), instance);
    nodes_.Enter(instance, mesh.nodeData().NumNodes());
    elements_.Enter(instance, mesh.elementData().numElements());
}

void oif_ModelInfo::SetMeshData() {
    const ddb_Assembly assembly = model_.rootAssembly();
    for (const auto& [name, instance] : assembly.instance()) {
        if (!instance.IsPartInstance()) continue;
        EnterMesh(name, ddb_PartInstance(instance).mesh());
    }
    if (assembly.hasMesh()) {
        EnterMesh(cow_String(), assembly.mesh());
    } else {
        nodes_.Enter(cow_String(), 0);
        elements_.Enter(cow_String(), 0);
    }
}

void oif_ModelInfo::SetStepData() {
    explicitJob_ = false;
    const ddb_DdbStepContainer steps = model_.step();
    if (steps.size() == 0) return;
    ddb_DdbStepIT it = steps.createIterator();
    for (it.next(); !it.isDone() && !explicitJob_; it.next()) explicitJob_ = it.currentValue().isExplicit();
}

int oif_ModelInfo::AssyElementOffsets(const cow_String& instance) const {
    return elements_.Offset(instance);
}

int oif_ModelInfo::AssyNodeOffsets(const cow_String& instance) const {
    return nodes_.Offset(instance);
}

int oif_ModelInfo::GetNewNodeIndex(const cow_String& instance, bool commit) {
    return nodes_.GetNew(instance, commit, v6Format_);
}

int oif_ModelInfo::IncrementNodeIndex(const cow_String& instance, int count) {
    return nodes_.Increment(instance, count, v6Format_);
}

int oif_ModelInfo::GetNewElementIndex(const cow_String& instance, bool commit) {
    return elements_.GetNew(instance, commit, v6Format_);
}

int oif_ModelInfo::IncrementElementIndex(const cow_String& instance, int count) {
    return elements_.Increment(instance, count, v6Format_);
}

cow_String oif_ModelInfo::InstanceName(int meshIndex) const {
    return meshNames_->ConstGet(meshIndex);
}

cow_String oif_ModelInfo::GetOrientationName(const dtmC_DatumRef& datum, double angle,
                                             cow_String suffix) const {
    // A null reference has no datum and gives the empty name.
    cow_String name = datum.IsNullRef() ? cow_String() : model_.datum(datum.Id()).Shortcut().Name();
    if (!suffix.IsEmpty() && angle != 0.0) name.Append("_").Append(suffix).Append("_");
    return qkw_QuorixName(name, false).Printable();
}

kprC_AnalysisProductEnm oif_ModelInfo::AnalysisProduct() const {
    return model_.step().AnalysisProduct();
}
