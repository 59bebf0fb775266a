#include "view_page/vpg_Layout.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/sections/kseC_BeamSection.h"
#include "store_interface/records/sections/kseC_SolidSections.h"
#include "view_page/vpg_Profiles.h"
#include "view_page/vpg_Values.h"

#include <algorithm>

using nlohmann::ordered_json;

namespace {

/// Of a node set this many nodes are shown that nothing else shows.
constexpr int kMaxInnerNodes = 1000;

gsl_Matrix PlacementOf(const odiK_Instance& instance) {
    const auto& t = instance.translation;
    const auto& r = instance.rotation;
    gsl_Vector axis(static_cast<double>(r[0]), static_cast<double>(r[1]), static_cast<double>(r[2]));
    const double angle = axis.ComputeMagnitude();
    axis.Normalize();
    gsl_Matrix placement;
    placement.AxisRotation(gsl_Point(), axis, angle);
    placement.SetTranslation(
        {static_cast<double>(t[0]), static_cast<double>(t[1]), static_cast<double>(t[2])});
    return placement;
}

/// Three rows of four: the turn, and behind it the move.
ordered_json MatrixText(const gsl_Matrix& placement) {
    const gsl_Vector x = placement.Apply(gsl_Vector(1, 0, 0));
    const gsl_Vector y = placement.Apply(gsl_Vector(0, 1, 0));
    const gsl_Vector z = placement.Apply(gsl_Vector(0, 0, 1));
    const gsl_Vector t = placement.GetTranslation();
    return {x.X(), y.X(), z.X(), t.X(), x.Y(), y.Y(), z.Y(), t.Y(), x.Z(), y.Z(), z.Z(), t.Z()};
}

ordered_json HeadOf(const odiK_SetHead& set, int count) {
    const char* const kinds[] = {"node", "element", "surface"};
    return {{"name", vpg_Text(set.name)},
            {"kind", kinds[static_cast<int>(set.type)]},
            {"internal", set.internal},
            {"count", count}};
}

} // namespace

vpg_Layout::vpg_Layout(const odb_Odb& odb, const cow_String& modelName) : model_(*odb.FindModel(modelName)) {
    AddInstances();
    AddAssembly();
    if (shown_.empty()) AddPartsAlone();
    ResolveSets();
    ChooseNodes();
}

int vpg_Layout::PlaceOf(const cow_String& instanceName) const {
    const auto place = placeOfInstance_.find(instanceName);
    return place == placeOfInstance_.end() ? -1 : place->second;
}

std::size_t vpg_Layout::EntryOf(const cow_CountedHld<odiK_Mesh>& mesh, std::vector<float> foreign) {
    const auto [place, isNew] = placeOfMesh_.emplace(&*mesh, meshes_.size());
    if (isNew) {
        Entry entry;
        entry.handle = mesh;
        entry.mesh = std::make_unique<vpg_Mesh>(*mesh, std::move(foreign));
        meshes_.push_back(std::move(entry));
    }
    return place->second;
}

void vpg_Layout::AddInstances() {
    for (const auto& [name, instance] : model_.Instances()) {
        if (!instance->isPartInstance || instance->Mesh().IsNull()) continue;
        ofMeshIndex_[instance->meshIndex] = shown_.size();
        placeOfInstance_[name] = static_cast<int>(shown_.size());
        Shown shown;
        shown.name = vpg_Text(name);
        shown.part = vpg_Text(instance->partName);
        shown.mesh = EntryOf(instance->Mesh());
        shown.placement = PlacementOf(*instance);
        shown.attributes = &instance->attributes;
        shown.instance = &*instance;
        shown_.push_back(std::move(shown));
    }
}

void vpg_Layout::AddAssembly() {
    const cow_CountedHld<odiK_Mesh>& mesh = model_.ConstAssemblyMesh();
    if (mesh.IsNull()) return;
    ofMeshIndex_[0] = shown_.size();
    Shown shown;
    shown.name = vpg_Text(model_.AssemblyObject().name);
    shown.kind = "assembly";
    shown.mesh = EntryOf(mesh, ForeignNodes(*mesh));
    shown_.push_back(std::move(shown));
}

void vpg_Layout::AddPartsAlone() {
    for (const auto& [name, part] : model_.Parts()) {
        if (part->mesh.IsNull()) continue;
        Shown shown;
        shown.name = vpg_Text(name);
        shown.part = shown.name;
        shown.kind = "part";
        shown.mesh = EntryOf(part->mesh);
        shown_.push_back(std::move(shown));
    }
}

std::vector<float> vpg_Layout::ForeignNodes(const odiK_Mesh& mesh) const {
    std::vector<float> places;
    for (const odiK_ForeignNode& foreign : mesh.Nodes().foreign) {
        const odiK_Instance* instance = model_.FindInstance(foreign.instanceName);
        gsl_Point place;
        if (instance != nullptr && !instance->Mesh().IsNull()) {
            const odiK_Mesh& other = *instance->Mesh();
            const int node = other.FindNode(foreign.label);
            if (node >= 0) {
                const float* xyz = other.Nodes().coordinates.data() + 3 * vpg_Index(node);
                place = PlacementOf(*instance).Apply(gsl_Point(
                    static_cast<double>(xyz[0]), static_cast<double>(xyz[1]), static_cast<double>(xyz[2])));
            }
        }
        for (const double x : {place.X(), place.Y(), place.Z()}) places.push_back(static_cast<float>(x));
    }
    return places;
}

// Before any node is chosen: facets of surfaces become cells here.
void vpg_Layout::ResolveSets() {
    for (Entry& entry : meshes_) {
        for (const auto& set : entry.handle->Sets()) {
            entry.sets.push_back(vpg_PartOfSet(*entry.mesh, set->type, set->subsets));
        }
    }
    for (const auto& set : model_.AssemblySets()) {
        std::map<std::size_t, std::vector<rgnC_SubsetData>> byShown;
        for (const rgnC_SubsetData& subset : set->subsets) {
            const auto shown = ofMeshIndex_.find(subset.meshIndex);
            if (shown != ofMeshIndex_.end()) byShown[shown->second].push_back(subset);
        }
        std::vector<AssemblySet>& parts = assemblySets_.emplace_back();
        for (const auto& [shown, subsets] : byShown) {
            parts.push_back({shown, vpg_PartOfSet(*meshes_[shown_[shown].mesh].mesh, set->type, subsets)});
        }
    }
}

void vpg_Layout::ShowNodes(Entry& entry, const std::vector<int>& nodes) {
    int added = 0;
    for (const int node : nodes) {
        char& isShown = entry.shown[vpg_Index(node)];
        if (isShown != 0 || added == kMaxInnerNodes) continue;
        isShown = 1;
        ++added;
    }
}

void vpg_Layout::ChooseNodes() {
    for (Entry& entry : meshes_) {
        entry.shown.assign(vpg_Index(entry.mesh->NumNodes()), 0);
        for (const vpg_Block& block : entry.mesh->Blocks()) {
            for (const int node : block.nodes) entry.shown[vpg_Index(node)] = 1;
        }
        for (const vpg_SetPart& part : entry.sets) ShowNodes(entry, part.nodes);
    }
    for (const auto& parts : assemblySets_) {
        for (const AssemblySet& part : parts) ShowNodes(meshes_[shown_[part.shown].mesh], part.part.nodes);
    }
    for (Entry& entry : meshes_) {
        int count = 0;
        for (const char isShown : entry.shown) entry.pageNodes.push_back(isShown != 0 ? count++ : -1);
    }
}

void vpg_Layout::Describe(ordered_json& header, vpg_Arrays& arrays) {
    ordered_json& meshes = header["meshes"] = ordered_json::array();
    for (Entry& entry : meshes_) meshes.push_back(MeshText(entry, arrays));
    header["sections"] = SectionsText();
    ordered_json& instances = header["instances"] = ordered_json::array();
    for (const Shown& shown : shown_) instances.push_back(InstanceText(shown, arrays));
    header["sets"] = AssemblySetsText(arrays);
}

ordered_json vpg_Layout::MeshText(Entry& entry, vpg_Arrays& arrays) const {
    const odiK_Mesh& mesh = *entry.handle;
    std::vector<float> places;
    std::vector<int> labels;
    for (int node = 0; node < entry.mesh->NumNodes(); ++node) {
        if (entry.pageNodes[vpg_Index(node)] < 0) continue;
        for (const float x : entry.mesh->Place(node)) places.push_back(x);
        labels.push_back(mesh.Nodes().Label(node));
    }
    std::vector<int> edges = vpg_FeatureEdges(*entry.mesh);
    for (int& node : edges) node = entry.pageNodes[vpg_Index(node)];
    ordered_json text = {{"nodes", mesh.Nodes().NumNodes()}, {"elements", mesh.NumElements()},
                         {"positions", arrays.Add(places)},  {"nodeLabels", arrays.Add(labels)},
                         {"edges", arrays.Add(edges)},       {"blocks", ordered_json::array()},
                         {"sets", ordered_json::array()},    {"unknown", ordered_json::object()}};
    for (const vpg_Block& block : entry.mesh->Blocks())
        text["blocks"].push_back(BlockText(entry, block, arrays));
    for (std::size_t i = 0; i < entry.sets.size(); ++i) {
        const odiK_Set& set = *mesh.Sets()[i];
        ordered_json head = HeadOf(set, entry.sets[i].count);
        head.update(PartText(entry, entry.sets[i], arrays));
        text["sets"].push_back(std::move(head));
    }
    for (const auto& [type, count] : entry.mesh->UnknownTypes()) text["unknown"][type] = count;
    return text;
}

ordered_json vpg_Layout::BlockText(const Entry& entry, const vpg_Block& block, vpg_Arrays& arrays) const {
    const odiK_ElementClass& elements = entry.handle->Classes()[vpg_Index(block.classIndex)];
    std::vector<int> nodes;
    nodes.reserve(block.nodes.size());
    for (const int node : block.nodes) nodes.push_back(entry.pageNodes[vpg_Index(node)]);
    std::vector<int> labels;
    labels.reserve(block.elements.size());
    for (const int element : block.elements) labels.push_back(elements.labels[vpg_Index(element)]);
    const cel_Cell& cell = cel_CellOf(block.kind);
    ordered_json text = {{"role", vpg_WordOf(block.role)},  {"cell", cell.name},
                         {"corners", cell.corners},         {"nodes", cell.nodes},
                         {"type", vpg_Text(elements.type)}, {"first", block.firstCell},
                         {"count", block.NumCells()},       {"connectivity", arrays.Add(nodes)},
                         {"labels", arrays.Add(labels)}};
    if (!block.sides.empty()) text["sides"] = arrays.Add(block.sides);
    return text;
}

ordered_json vpg_Layout::PartText(const Entry& entry, const vpg_SetPart& part, vpg_Arrays& arrays) const {
    ordered_json text = ordered_json::object();
    if (!part.cells.empty()) text["cells"] = arrays.AddRuns(part.cells);
    if (!part.negative.empty()) text["negative"] = arrays.AddRuns(part.negative);
    std::vector<int> nodes;
    for (const int node : part.nodes) {
        if (entry.pageNodes[vpg_Index(node)] >= 0) nodes.push_back(entry.pageNodes[vpg_Index(node)]);
    }
    if (!nodes.empty()) text["nodes"] = arrays.AddRuns(nodes);
    if (!part.box.IsEmpty()) {
        text["box"] = {part.box.low[0],  part.box.low[1],  part.box.low[2],
                       part.box.high[0], part.box.high[1], part.box.high[2]};
    }
    return text;
}

ordered_json vpg_Layout::AssemblySetsText(vpg_Arrays& arrays) const {
    ordered_json sets = ordered_json::array();
    for (std::size_t i = 0; i < assemblySets_.size(); ++i) {
        int count = 0;
        for (const AssemblySet& part : assemblySets_[i]) count += part.part.count;
        ordered_json text = HeadOf(*model_.AssemblySets()[i], count);
        ordered_json& parts = text["parts"] = ordered_json::array();
        for (const AssemblySet& part : assemblySets_[i]) {
            ordered_json one = {{"instance", part.shown}};
            one.update(PartText(meshes_[shown_[part.shown].mesh], part.part, arrays));
            parts.push_back(std::move(one));
        }
        sets.push_back(std::move(text));
    }
    return sets;
}

ordered_json vpg_Layout::RegionOf(const rgnC_Region& region) const {
    if (!region.HasValue()) return nullptr;
    if (region.InstanceName().IsEmpty()) return {{"instance", -1}, {"set", region.ConstSet().Id()}};
    const int place = PlaceOf(region.InstanceName());
    if (place < 0) return nullptr;
    return {{"instance", place}, {"set", region.ConstSet().Id()}};
}

ordered_json vpg_Layout::InstanceText(const Shown& shown, vpg_Arrays& arrays) {
    ordered_json text = {{"name", shown.name},
                         {"kind", shown.kind},
                         {"part", shown.part},
                         {"mesh", shown.mesh},
                         {"placement", MatrixText(shown.placement)}};
    // Instances that have their assignments from one part share the array.
    const bool own = shown.instance != nullptr && shown.instance->ownSectionAssignments.has_value();
    const void* owner = own || shown.instance == nullptr ? static_cast<const void*>(&shown)
                                                         : static_cast<const void*>(&*shown.instance->part);
    const auto [array, isNew] = sectionArrays_.emplace(std::pair(owner, shown.mesh), -1);
    if (isNew) {
        const std::vector<int> sections = SectionsOfCells(shown);
        if (!sections.empty()) array->second = arrays.Add(sections);
    }
    if (array->second >= 0) text["sections"] = array->second;
    if (shown.attributes != nullptr) {
        ordered_json& orientations = text["orientations"] =
            OrientationsOf(shown.attributes->materialOrientations);
        for (ordered_json& beam : OrientationsOf(shown.attributes->beamOrientations)) {
            orientations.push_back(std::move(beam));
        }
    }
    if (shown.kind == std::string_view("assembly")) {
        text["orientations"] = OrientationsOf(model_.AssemblyObject().connectorOrientations);
    }
    return text;
}

std::vector<std::int16_t> vpg_Layout::SectionsOfElements(const Shown& shown) const {
    const vpg_Mesh& mesh = MeshOf(shown);
    std::vector<std::int16_t> ofElement(vpg_Index(mesh.Mesh().NumElements()), -1);
    const bool isAssembly = shown.kind == std::string_view("assembly");
    if (shown.attributes == nullptr && !isAssembly) return ofElement;
    std::map<cow_String, int> placeOf;
    for (const auto& [name, section] : model_.sections) {
        placeOf.emplace(name, static_cast<int>(placeOf.size()));
    }
    for (const ptoC_PartAttribute& attribute :
         isAssembly ? model_.AssemblyObject().sectionAssignments : shown.attributes->sectionAssignments) {
        const auto& assignment = nex_canDynamicCastRef<ptoC_SectionAssignment>(attribute, NEX_HERE);
        const auto section = placeOf.find(assignment.sectionName);
        if (section == placeOf.end() || !assignment.region.HasValue()) continue;
        // The assembly may give sections to sets of instances, whose classes are those of another mesh.
        if (isAssembly && assignment.region.InstanceName().Length() > 0) continue;
        const rgnC_SetData& set = assignment.region.ConstSet().Data();
        if (set.Kind() != static_cast<int>(res_SetTypeEnm::ELEMENTS)) continue;
        for (const rgnC_SubsetData& subset : set.Object().subsets) {
            if (isAssembly && subset.meshIndex != 0) continue;
            vpg_ForEachElement(mesh.Mesh(), std::span(&subset, 1), [&](int element) {
                ofElement[vpg_Index(element)] = static_cast<std::int16_t>(section->second);
            });
        }
    }
    return ofElement;
}

/// Empty where no cell has one.
std::vector<int> vpg_Layout::SectionsOfCells(const Shown& shown) const {
    const std::vector<std::int16_t> ofElement = SectionsOfElements(shown);
    if (std::ranges::all_of(ofElement, [](std::int16_t section) { return section < 0; })) return {};
    std::vector<int> ofCell = MeshOf(shown).ElementsOfCells();
    for (int& cell : ofCell) cell = ofElement[vpg_Index(cell)];
    return ofCell;
}

ordered_json vpg_Layout::OrientationsOf(const ptoC_PartAttributeList& list) const {
    ordered_json texts = ordered_json::array();
    for (const ptoC_PartAttribute& attribute : list) {
        ordered_json text = {{"region", RegionOf(attribute.region)}};
        if (const auto* material = nex_canDynamicCastPtr<ptoC_MaterialOrientation>(&attribute)) {
            text.update({{"kind", "material"},
                         {"datum", material->datum.Id()},
                         {"axis", static_cast<int>(material->axis)},
                         {"angle", material->angle}});
        } else if (const auto* beam = nex_canDynamicCastPtr<ptoC_BeamOrientation>(&attribute)) {
            text.update(
                {{"kind", "beam"}, {"vector", {beam->vector.X(), beam->vector.Y(), beam->vector.Z()}}});
        } else if (const auto* connector = nex_canDynamicCastPtr<ptoC_ConnectorOrientation>(&attribute)) {
            text.update({{"kind", "connector"},
                         {"datum", connector->csys1.Id()},
                         {"axis", static_cast<int>(connector->axis1)},
                         {"angle", connector->angle1}});
        }
        texts.push_back(std::move(text));
    }
    return texts;
}

ordered_json vpg_Layout::SectionsText() const {
    ordered_json sections = ordered_json::array();
    for (const auto& [name, section] : model_.sections) {
        ordered_json text = {{"name", vpg_Text(name)},
                             {"class", vpg_Text(cls_Classes().ShortNameOf(section.DynTypeId()))},
                             {"doc", cls_Classes().Find(section.DynTypeId())->info.doc},
                             {"material", vpg_Text(section.MaterialName())}};
        vpg_Outline outline;
        if (const auto* beam = nex_canDynamicCastPtr<kseC_BeamSection>(&section)) {
            text["profile"] = vpg_Text(beam->profileName);
            if (model_.beamProfiles.IsMember(beam->profileName)) {
                outline = vpg_OutlineOf(model_.beamProfiles.ConstGet(beam->profileName));
            }
        } else if (const auto* truss = nex_canDynamicCastPtr<kseC_TrussSection>(&section)) {
            outline = vpg_OutlineOfArea(truss->area);
        }
        if (!outline.empty()) text["outline"] = outline;
        sections.push_back(std::move(text));
    }
    return sections;
}
