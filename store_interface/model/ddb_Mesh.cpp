#include "store_interface/model/ddb_Mesh.h"

#include "store_interface/model/ddb_Assembly.h"

ddb_PartInstance ddb_ScopedNodeData::getPartInstance(int index) const {
    const auto& foreign = mesh_->Nodes().foreign;
    const int ends = NumNodes() + static_cast<int>(foreign.size());
    const bool isOwn = index < NumNodes();
    if (index < 0 || index >= ends || isNativeNode(index)) cow_RaiseOutOfRange(index, ends);
    const cow_String& name =
        isOwn ? instanceName_ : foreign[static_cast<std::size_t>(index - NumNodes())].instanceName;
    const auto instance = model_->Instances().find(name);
    if (instance == model_->Instances().end()) cow_RaiseNoSuchKey("ddb_InstanceContainer", name);
    return ddb_PartInstance(ddb_BaseInstance(instance->second, model_));
}

ddb_ElementClass ddb_ElementData::elementClass(int index) const {
    if (index < 0 || index >= numClasses()) cow_RaiseOutOfRange(index, numClasses());
    return {mesh_, index};
}

const std::vector<cow_CountedHld<odiK_Set>>* ddb_SetList::Sets() const {
    if (instanceName_.IsEmpty()) return &model_->AssemblySets();
    const odiK_Instance* instance = model_->FindInstance(instanceName_);
    const cow_CountedHld<odiK_Mesh> mesh =
        instance == nullptr ? cow_CountedHld<odiK_Mesh>() : instance->Mesh();
    return mesh.IsNull() ? nullptr : &mesh->Sets();
}

int ddb_SetList::size() const {
    const auto* sets = Sets();
    return sets == nullptr ? 0 : static_cast<int>(sets->size());
}

ddb_Set ddb_SetList::get(int index) const {
    const auto* sets = Sets();
    if (sets == nullptr || index < 0 || index >= static_cast<int>(sets->size()))
        cow_RaiseOutOfRange(index, size());
    return {index, model_->Region(instanceName_, (*sets)[static_cast<std::size_t>(index)]->name)};
}

ddb_SetListIT ddb_SetList::createIterator() const {
    return ddb_SetListIT(*this);
}
