#include "store_interface/model/ddb_Assembly.h"

#include "store_interface/model/odiK_Model.h"
#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

const cow_CountedHld<odiK_Mesh>& EmptyMesh() {
    static const cow_CountedHld<odiK_Mesh> mesh(new odiK_Mesh());
    return mesh;
}

} // namespace

ddb_Part ddb_PartContainer::get(const cow_String& name) const {
    const auto place = model_->Parts().find(name);
    if (place == model_->Parts().end()) cow_RaiseNoSuchKey("ddb_PartContainer", name);
    return ddb_Part(place->second);
}

unsigned ddb_BaseInstance::DynTypeId() const {
    return IsPartInstance() ? ddb_PartInstance::TypeId() : TypeId();
}

cow_List<float> ddb_BaseInstance::transform() const {
    cow_List<float> values;
    for (const float value : instance_->translation) values.Append(value);
    for (const float value : instance_->rotation) values.Append(value);
    return values;
}

ddb_PartInstance::ddb_PartInstance(const ddb_BaseInstance& instance) : ddb_BaseInstance(instance) {
    nex_CheckCast(instance.DynTypeId(), TypeId(), NEX_HERE);
}

ddb_Mesh ddb_PartInstance::mesh() const {
    const cow_CountedHld<odiK_Mesh> mesh = instance_->Mesh();
    return {mesh.IsNull() ? EmptyMesh() : mesh, model_, instance_->name, instance_->meshIndex};
}

std::optional<ddb_PartInstance> ddb_InstanceContainer::FindByMeshIndex(int meshIndex) const {
    const cow_CountedHld<odiK_Instance> instance = model_->InstanceOfMesh(meshIndex);
    if (instance.IsNull()) return std::nullopt;
    return ddb_PartInstance(ddb_BaseInstance(instance, model_));
}

ddb_MaterialOrientationContainer ddb_PartInstance::materialOrientations() const {
    return {instance_, instance_->attributes.materialOrientations};
}

ddb_BeamOrientationContainer ddb_PartInstance::beamOrientations() const {
    return {instance_, instance_->attributes.beamOrientations};
}

ddr_ShortcutTo<odiK_PartInstance> ddb_PartInstance::Shortcut() const {
    return {cow_String("rootAssembly.instance[") + cow_String(instance_->meshIndex) + "]", instance_->name,
            instance_->attributes};
}

ddb_Mesh ddb_Assembly::mesh() const {
    return {hasMesh() ? model_->ConstAssemblyMesh() : EmptyMesh(), model_, cow_String(), 0};
}

ddb_Set ddb_Assembly::nset(const cow_String& name) const {
    const rgnC_Region region = model_->FindRegion(cow_String(), name);
    if (!region.HasValue() || region.FlagWord() != 1) cow_RaiseNoSuchKey("ddb_Assembly::nset", name);
    return {region.ConstSet().Id(), region};
}

ddr_ShortcutTo<odiK_Assembly> ddb_Assembly::Shortcut() const {
    return {"rootAssembly", name(), model_->AssemblyObject()};
}

const cow_String& ddb_Part::solverInput() const {
    return part_->solverInput;
}

int ddb_PartContainer::size() const {
    return static_cast<int>(model_->Parts().size());
}

ddb_ContainerIT<odiK_Part, ddb_Part> ddb_PartContainer::createIterator() const {
    return {model_->Parts(), model_};
}

bool ddb_BaseInstance::IsPartInstance() const {
    return instance_->isPartInstance;
}

int ddb_NumAttributes(const ptoC_PartAttributeList& list) {
    return list.Size();
}

const ptoC_PartAttribute& ddb_AttributeAt(const ptoC_PartAttributeList& list, int index) {
    return list.ConstGet(index);
}

ddb_OrientationView::ddb_OrientationView(const ptoC_PartAttribute& record) : region_(record.region) {}

const cow_String& ddb_PartInstance::name() const {
    return instance_->name;
}

const cow_String& ddb_PartInstance::partName() const {
    return instance_->partName;
}

const cow_String& ddb_PartInstance::solverInput() const {
    return instance_->solverInput;
}

int ddb_InstanceContainer::size() const {
    return static_cast<int>(model_->Instances().size());
}

ddb_ContainerIT<odiK_Instance, ddb_BaseInstance> ddb_InstanceContainer::createIterator() const {
    return {model_->Instances(), model_};
}

const cow_String& ddb_Assembly::name() const {
    return model_->AssemblyObject().name;
}

const cow_String& ddb_Assembly::solverInput() const {
    return model_->AssemblyObject().solverInput;
}

bool ddb_Assembly::hasMesh() const {
    return !model_->ConstAssemblyMesh().IsNull();
}
