#include "store_interface/model/ddb_Mesh.h"

#include "store_interface/model/ddb_Assembly.h"
#include "store_interface/model/odiK_Model.h"

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
    return {index, model_->RegionAt(instanceName_, index)};
}

ddb_SetListIT ddb_SetList::createIterator() const {
    return ddb_SetListIT(*this);
}

int ddb_NodeData::NumNodes() const {
    return mesh_->Nodes().NumNodes();
}

uti_CoordCont3D ddb_NodeData::CoordContainer() const {
    return uti_CoordCont3D(mesh_->Nodes().coordinates);
}

int ddb_NodeData::GetUserNodeLabel(unsigned index) const {
    return mesh_->Nodes().Label(static_cast<int>(index));
}

void ddb_NodeData::GetUserNodeLabels(cow_List<int>& labels) const {
    labels = mesh_->Nodes().labels;
}

int ddb_NodeData::GetMeshNodeIndex(int label) const {
    return mesh_->FindNode(label);
}

int ddb_ElementClass::numElements() const {
    return Class().NumElements();
}

int ddb_ElementClass::numNodesPerElement() const {
    return Class().nodesPerElement;
}

const cow_String& ddb_ElementClass::elementTypeLabel() const {
    return Class().type;
}

const std::vector<int>& ddb_ElementClass::elementConnectivity() const {
    return Class().connectivity;
}

const std::vector<int>& ddb_ElementClass::userElementLabelsAsFlatArray() const {
    return Class().labels;
}

const ddb_ElementShape& ddb_ElementClass::shape() const {
    return Class().shape;
}

const odiK_ElementClass& ddb_ElementClass::Class() const {
    return mesh_->Classes()[static_cast<std::size_t>(index_)];
}

int ddb_ElementData::numClasses() const {
    return static_cast<int>(mesh_->Classes().size());
}

int ddb_ElementData::numElements() const {
    return mesh_->NumElements();
}

const bme_ElemCtrlParams& bme_ElementClass::GetElemControlParams() const {
    return class_->controls;
}

int bme_ElementClass::FirstElementIndex() const {
    return class_->firstElementIndex;
}

int bme_ElementClass::NumElements() const {
    return class_->NumElements();
}

unsigned bme_ElementData::NumClasses() const {
    return static_cast<unsigned>(mesh_->Classes().size());
}

bme_ElementClass bme_ElementData::GetClass(unsigned index) const {
    if (index >= NumClasses()) cow_RaiseOutOfRange(static_cast<int>(index), static_cast<int>(NumClasses()));
    return bme_ElementClass(mesh_->Classes()[index]);
}
