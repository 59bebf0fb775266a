#include "store_interface/model/odiK_Model.h"

#include "foundation/nex_Exception.h"
#include "store_interface/model/odiK_Repositories.h"

#include <algorithm>
#include <cmath>
#include <set>

namespace {

[[noreturn]] void Raise(const std::string& text) {
    nex_Raise(atr_String(std::string_view(text)));
}

std::string Quoted(const cow_String& name) {
    return std::string("'").append(name.View()).append("'");
}

[[noreturn]] void RaiseNoSuchPart(const cow_String& instance, const cow_String& part) {
    Raise("instance " + Quoted(instance) + ": there is no part named " + Quoted(part));
}

void NormalizeAxis(gsl_Vector& axis, const cow_String& datum, const char* member) {
    const double length = axis.ComputeMagnitude();
    if (!(length > 0.0)) Raise("datum " + Quoted(datum) + ": " + member + " has no length");
    if (!std::isfinite(length)) Raise("datum " + Quoted(datum) + ": " + member + " is too long");
    axis.Normalize();
}

void Place(odiK_Datum& datum) {
    const bool csys = datum.type == dtu_DatumType::CSYS;
    if (csys || datum.type == dtu_DatumType::AXIS) NormalizeAxis(datum.xAxis, datum.name, "xAxis");
    if (csys) {
        NormalizeAxis(datum.yAxis, datum.name, "yAxis");
        if (datum.zAxis == gsl_Vector()) datum.zAxis = gsl_Cross(datum.xAxis, datum.yAxis);
        const gsl_Vector normal = gsl_Cross(datum.xAxis, datum.yAxis);
        if (!(normal.ComputeMagnitude() > gsl_Util::Instance().AngleTolerance())) {
            Raise("datum " + Quoted(datum.name) + ": xAxis and yAxis are parallel");
        }
    }
    if (csys || datum.type == dtu_DatumType::PLANE) NormalizeAxis(datum.zAxis, datum.name, "zAxis");
}

void Propagate(mdl_Repository& repository, const kprC_Timeline& timeline) {
    for (const cow_String& name : repository.Keys()) {
        const auto problems =
            static_cast<kprC_PropagatingObject&>(repository.WritableRecord(name)).Propagate(timeline);
        if (!problems.empty()) mdl_RaisePropagationProblem(name, problems.front());
    }
}

std::string PathOfSet(std::string owner, int id) {
    return owner.append(".setData[").append(std::to_string(id)).append("]");
}

rgnC_Region RegionOf(const odiK_Instance& instance, const cow_String& instanceName, int place) {
    const cow_CountedHld<odiK_Set>& set = instance.Mesh()->Sets()[static_cast<std::size_t>(place)];
    const std::string owner = "rootAssembly.mesh[" + std::to_string(instance.meshIndex) + "]";
    return {ddr_Shortcut(PathOfSet(owner, place), set->name), instanceName,
            rgnC_Set(place, rgnC_SetData(set, instance.meshIndex))};
}

rgnC_SubsetData& SubsetOf(std::vector<rgnC_SubsetData>& subsets, int meshIndex) {
    for (rgnC_SubsetData& subset : subsets) {
        if (subset.meshIndex == meshIndex) return subset;
    }
    return subsets.emplace_back(rgnC_SubsetData{meshIndex, -1, {}, {}});
}

bool SameNodes(const odiK_Set& a, const odiK_Set& b) {
    return a.type == b.type &&
           std::ranges::equal(a.subsets, b.subsets,
                              [](const rgnC_SubsetData& one, const rgnC_SubsetData& other) {
                                  return one.meshIndex == other.meshIndex && one.subset == other.subset;
                              });
}

} // namespace

cow_String odiK_Assembly::ConnectorOrientationName(int place) {
    return cow_String("ConnOri-") + cow_String(place);
}

void odiK_Assembly::AppendConnectorOrientation(const ptoC_ConnectorOrientation& orientation) {
    ptoC_ConnectorOrientation named(orientation);
    if (named.name.IsEmpty()) named.name = ConnectorOrientationName(connectorOrientations.Size());
    connectorOrientations.Append(named);
}

void odiK_Model::Share(const odiK_Model& other) {
    origin_ = other.origin_;
    static_cast<odiK_ModelData&>(*this) = other;
    steps = other.steps;
    for (const odiK_Repository& repository : odiK_Repositories()) {
        if (!repository.IsInOrder()) repository.In(*this) = repository.In(other);
    }
    datums_ = other.datums_;
    for (const odiK_Datum& datum : datums_)
        datumIndex_.emplace(datum.name.View(), static_cast<int>(datumIndex_.size()) + 1);
    parts_ = other.parts_;
    instances_ = other.instances_;
    instanceOfMesh_ = other.instanceOfMesh_;
    sealed_ = other.sealed_;
    assemblyMesh_ = other.assemblyMesh_;
    assembly_ = other.assembly_;
    assemblySets_ = other.assemblySets_;
    for (const auto& set : assemblySets_)
        assemblySetIndex_.emplace(set->name.View(), static_cast<int>(assemblySetIndex_.size()));
    if (other.IsComplete()) SetComplete();
}

dtmC_DatumRef odiK_Model::AddDatum(odiK_Datum datum) {
    if (!FindDatum(datum.name).IsNullRef())
        Raise("a datum named " + Quoted(datum.name) + " is there already");
    datum.givenAxes[0] = datum.xAxis;
    datum.givenAxes[1] = datum.yAxis;
    datum.givenAxes[2] = datum.zAxis;
    Place(datum);
    datums_.push_back(datum);
    datumIndex_.emplace(datums_.back().name.View(), static_cast<int>(datums_.size()));
    return dtmC_DatumRef(static_cast<int>(datums_.size()));
}

dtmC_DatumRef odiK_Model::FindDatum(const cow_String& name) const {
    const auto place = datumIndex_.find(name.View());
    return place == datumIndex_.end() ? dtmC_DatumRef() : dtmC_DatumRef(place->second);
}

template <class Entry>
void odiK_Model::CheckNewName(const std::map<cow_String, cow_CountedHld<Entry>>& entries,
                              const cow_String& name, const char* kind) const {
    if (entries.count(name) != 0) Raise(std::string(kind) + " named " + Quoted(name) + " is there already");
}

odiK_Part& odiK_Model::AddPart(const cow_String& name) {
    CheckNewName(parts_, name, "a part");
    cow_CountedHld<odiK_Part> part(new odiK_Part());
    part->name = name;
    return *parts_.emplace(name, std::move(part)).first->second;
}

odiK_Instance& odiK_Model::AddInstance(const cow_String& name, const cow_String& partName) {
    if (parts_.count(partName) == 0) RaiseNoSuchPart(name, partName);
    odiK_Instance instance;
    instance.name = name;
    instance.partName = partName;
    return AddEntry(std::move(instance));
}

odiK_Instance& odiK_Model::AddOtherEntry(const cow_String& name, const cow_String& partName) {
    odiK_Instance entry;
    entry.name = name;
    entry.partName = partName;
    entry.isPartInstance = false;
    return AddEntry(std::move(entry));
}

odiK_Instance& odiK_Model::AddEntry(odiK_Instance entry) {
    CheckNewName(instances_, entry.name, "an instance");
    if (sealed_) {
        Raise("instance " + Quoted(entry.name) + ": instances must be added before the first set or region");
    }
    if (!entry.partName.IsEmpty()) {
        const auto part = parts_.find(entry.partName);
        if (part == parts_.end()) RaiseNoSuchPart(entry.name, entry.partName);
        entry.part = part->second;
    }
    const cow_String name = entry.name;
    cow_CountedHld<odiK_Instance> instance(new odiK_Instance(std::move(entry)));
    return *instances_.emplace(name, std::move(instance)).first->second;
}

odiK_Instance* odiK_Model::FindInstance(const cow_String& name) const {
    const auto place = instances_.find(name);
    return place == instances_.end() ? nullptr : place->second.Referent();
}

void odiK_Model::SealInstances() {
    if (sealed_) return;
    int others = 0;
    for (const auto& [name, instance] : instances_) {
        if (instance->isPartInstance) {
            instanceOfMesh_.push_back(instance);
            instance->meshIndex = static_cast<int>(instanceOfMesh_.size());
        } else {
            instance->meshIndex = -++others;
        }
    }
    sealed_ = true;
}

cow_CountedHld<odiK_Instance> odiK_Model::InstanceOfMesh(int meshIndex) const {
    if (meshIndex < 1 || meshIndex > static_cast<int>(instanceOfMesh_.size())) return {};
    return instanceOfMesh_[static_cast<std::size_t>(meshIndex) - 1];
}

odiK_Mesh& odiK_Model::AssemblyMesh() {
    if (assemblyMesh_.IsNull()) assemblyMesh_.Reset(new odiK_Mesh());
    return *assemblyMesh_;
}

int odiK_Model::FindAssemblySet(const cow_String& name) const {
    const auto place = assemblySetIndex_.find(name.View());
    return place == assemblySetIndex_.end() ? -1 : place->second;
}

void odiK_Model::AddAssemblySet(const cow_String& name, res_SetTypeEnm type, bool internal,
                                std::span<const odiK_MemberInput> members, fnd_Sink& problems) {
    SealInstances();
    if (FindAssemblySet(name) >= 0) {
        problems.Add("duplicate-name", "/name", "found a second set named " + Quoted(name),
                     "names that are unique in the assembly");
        return;
    }
    cow_CountedHld<odiK_Set> set(new odiK_Set());
    set->name = name;
    set->type = type;
    set->internal = internal;
    for (std::size_t i = 0; i < members.size(); ++i) {
        const std::string place = "/members/" + std::to_string(i);
        const odiK_MemberInput& member = members[i];
        const odiK_Instance* instance = FindInstance(member.instanceName);
        if (!member.instanceName.IsEmpty() && instance == nullptr) {
            problems.Add("no-such-name", place + "/instance", "found " + Quoted(member.instanceName),
                         "the name of an instance");
            continue;
        }
        const cow_CountedHld<odiK_Mesh> mesh = instance == nullptr ? assemblyMesh_ : instance->Mesh();
        static const odiK_Mesh none;
        (mesh.IsNull() ? none : *mesh)
            .AppendSubsets({name, type, internal, member.labels, member.facets},
                           instance == nullptr ? 0 : instance->meshIndex, set->subsets, place, problems);
    }
    assemblySets_.push_back(set);
    assemblySetIndex_.emplace(set->name.View(), static_cast<int>(assemblySets_.size()) - 1);
}

void odiK_Model::AddAssemblySet(const cow_String& name, res_SetTypeEnm type,
                                std::span<const odiK_MemberInput> members, bool internal) {
    fnd_Raise problems;
    AddAssemblySet(name, type, internal, members, problems);
}

rgnC_Region odiK_Model::FindRegion(const cow_String& instanceName, const cow_String& setName) {
    SealInstances();
    if (instanceName.IsEmpty()) {
        const int place = FindAssemblySet(setName);
        return place < 0 ? rgnC_Region() : RegionAt(instanceName, place);
    }
    const odiK_Instance* instance = FindInstance(instanceName);
    if (instance == nullptr || instance->Mesh().IsNull()) return {};
    const int place = instance->Mesh()->FindSet(setName);
    return place < 0 ? rgnC_Region() : RegionOf(*instance, instanceName, place);
}

rgnC_Region odiK_Model::RegionAt(const cow_String& instanceName, int place) {
    SealInstances();
    if (!instanceName.IsEmpty()) return RegionOf(*FindInstance(instanceName), instanceName, place);
    const cow_CountedHld<odiK_Set>& set = assemblySets_[static_cast<std::size_t>(place)];
    return {ddr_Shortcut(PathOfSet("rootAssembly", place), set->name), instanceName,
            rgnC_Set(place, rgnC_SetData(set))};
}

rgnC_Region odiK_Model::Region(const cow_String& instanceName, const cow_String& setName) {
    rgnC_Region region = FindRegion(instanceName, setName);
    if (!region.HasValue()) {
        Raise("there is no set named " + Quoted(setName) +
              (instanceName.IsEmpty() ? std::string(" in the assembly")
                                      : " in instance " + Quoted(instanceName)));
    }
    return region;
}

rgnC_Region odiK_Model::JoinNodeSets(const cow_List<rgnC_Region>& regions) {
    constexpr std::size_t kLongestStem = 70;
    std::string stem;
    cow_CountedHld<odiK_Set> set(new odiK_Set());
    std::set<std::pair<int, int>> known;
    for (const rgnC_Region& region : regions) {
        stem.append("_").append(region.SetName().View());
        const rgnC_SetData& data = region.ConstSet().Data();
        for (int i = 0; i < data.NumSubSets(); ++i) {
            const rgnC_SubsetData from = data.SubSet(i);
            rgnC_SubsetData& to = SubsetOf(set->subsets, from.meshIndex);
            for (const int node : from.subset) {
                if (known.emplace(from.meshIndex, node).second) to.subset.Append(node);
            }
        }
    }
    stem.resize(std::min(stem.size(), kLongestStem));
    for (int number = 1;; ++number) {
        const cow_String name(number == 1 ? stem : stem + "-" + std::to_string(number));
        const int place = FindAssemblySet(name);
        if (place >= 0) {
            if (!SameNodes(*assemblySets_[static_cast<std::size_t>(place)], *set)) continue;
        } else if (IsComplete()) {
            return {};
        } else {
            set->name = name;
            set->internal = true;
            assemblySets_.push_back(set);
            assemblySetIndex_.emplace(set->name.View(), static_cast<int>(assemblySets_.size()) - 1);
        }
        return FindRegion({}, name);
    }
}

void odiK_Model::CompleteTree(fnd_Sink& problems) {
    SealInstances();
    for (const auto& entry : instances_) {
        const cow_String& name = entry.first;
        const cow_CountedHld<odiK_Instance>& instance = entry.second;
        const odiK_AttributeInputs none;
        const odiK_AttributeInputs& part = instance->part.IsNull() ? none : instance->part->attributes;
        const auto fill = [&](ptoC_PartAttributeList& list,
                              const std::vector<odiK_AttributeInput>& partInputs,
                              const odiK_Instance::OwnInputs& ownInputs, const char* member) {
            list = {};
            const auto& inputs = ownInputs ? *ownInputs : partInputs;
            for (std::size_t i = 0; i < inputs.size(); ++i) {
                mdl_ObjCow<ptoC_PartAttribute> record = inputs[i].record;
                record.Get().region = FindRegion(name, inputs[i].setName);
                if (!record.ConstGet().region.HasValue()) {
                    problems.Add("no-such-set",
                                 "/assembly/instances/" + std::string(name.View()) + "/" + member + "/" +
                                     std::to_string(i) + "/region",
                                 "found " + Quoted(inputs[i].setName),
                                 "the name of a set of the instance's mesh");
                }
                list.Append(record.ConstGet());
            }
        };
        fill(instance->attributes.sectionAssignments, part.sectionAssignments,
             instance->ownSectionAssignments, "sectionAssignments");
        fill(instance->attributes.materialOrientations, part.materialOrientations,
             instance->ownMaterialOrientations, "materialOrientations");
        fill(instance->attributes.beamOrientations, part.beamOrientations, instance->ownBeamOrientations,
             "beamOrientations");
    }
}

void odiK_Model::Complete() {
    fnd_Raise problems;
    for (const auto& [name, part] : parts_) {
        if (!part->mesh.IsNull()) part->mesh->FinishElements(problems);
    }
    for (const auto& [name, instance] : instances_) {
        if (!instance->ownMesh.IsNull()) instance->ownMesh->FinishElements(problems);
    }
    if (!assemblyMesh_.IsNull()) assemblyMesh_->FinishElements(problems);
    CompleteTree(problems);
    const kprC_Timeline timeline(steps);
    for (const odiK_Repository& repository : odiK_Repositories()) {
        if (repository.IsPropagating()) Propagate(repository.In(*this), timeline);
    }
    SetComplete();
}

void odiK_Model::EnsureComplete() {
    if (IsComplete()) return;
    const std::lock_guard<std::mutex> lock(completing_);
    if (!IsComplete()) Complete();
}
