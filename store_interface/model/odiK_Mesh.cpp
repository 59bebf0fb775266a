#include "store_interface/model/odiK_Mesh.h"

#include "foundation/nex_Exception.h"
#include "store_interface/findings/fnd_Text.h"

#include <algorithm>

namespace {

std::string Number(long long value) {
    return std::to_string(value);
}

std::string Count(std::size_t number, const char* thing) {
    return fnd_Counted(static_cast<long long>(number), thing);
}

std::string Place(const char* array, std::size_t index) {
    return std::string("/") + array + "/" + std::to_string(index);
}

bool CheckLabels(const std::vector<int>& labels, fnd_Sink& problems) {
    bool good = true;
    for (std::size_t i = 0; i < labels.size(); ++i) {
        if (labels[i] > 0) continue;
        problems.Add("wrong-label", Place("labels", i), "found " + Number(labels[i]), "a positive label");
        good = false;
    }
    return good;
}

bool CheckConnectivity(const std::vector<int>& nodes, const std::vector<int>& labels, int nodesPerElement,
                       fnd_Sink& problems) {
    if (nodesPerElement >= 0 && nodes.size() == labels.size() * static_cast<std::size_t>(nodesPerElement)) {
        return true;
    }
    problems.Add("length-mismatch", "/connectivity", "found " + Count(nodes.size(), "node"),
                 Number(nodesPerElement) + " for each of " + Count(labels.size(), "label"));
    return false;
}

} // namespace

int odiK_NodeData::Label(int nodeIndex) const {
    if (nodeIndex < labels.Length()) return labels[nodeIndex];
    const auto place = static_cast<std::size_t>(nodeIndex - labels.Length());
    if (place >= foreign.size())
        cow_RaiseOutOfRange(nodeIndex, labels.Length() + static_cast<int>(foreign.size()));
    return foreign[place].label;
}

void odiK_Mesh::SetNodes(std::vector<int> labels, std::vector<float> coordinates, fnd_Sink& problems) {
    if (coordinates.size() != 3 * labels.size()) {
        problems.Add("length-mismatch", "/coordinates",
                     "found " + Count(coordinates.size() / 3, "point") + " for " +
                         Count(labels.size(), "label"),
                     "one for each");
        return;
    }
    if (!CheckLabels(labels, problems)) return;
    for (const int place : nodes_.index.Build(labels)) {
        problems.Add("duplicate-label", Place("labels", static_cast<std::size_t>(place)),
                     "node label " + Number(labels[static_cast<std::size_t>(place)]) + " stands twice",
                     "labels that are unique in the mesh");
    }
    const int count = static_cast<int>(labels.size());
    nodes_.labels = cow_List<int>(cow_ListConstruct(count));
    nodes_.labels.AppendMany(count, [&](int i) { return labels[static_cast<std::size_t>(i)]; });
    nodes_.coordinates = std::move(coordinates);
}

void odiK_Mesh::SetNodes(std::vector<int> labels, std::vector<float> coordinates) {
    fnd_Raise problems;
    SetNodes(std::move(labels), std::move(coordinates), problems);
}

int odiK_Mesh::AddForeignNode(const cow_String& instanceName, int label) {
    nodes_.foreign.push_back({instanceName, label});
    return nodes_.NumNodes() + static_cast<int>(nodes_.foreign.size()) - 1;
}

void odiK_Mesh::AddElements(const cow_String& type, std::vector<int> labels, int nodesPerElement,
                            std::vector<int> nodeLabels, const bme_ElemCtrlParams& controls,
                            fnd_Sink& problems) {
    if (!CheckConnectivity(nodeLabels, labels, nodesPerElement, problems)) return;
    bool good = true;
    const auto width = static_cast<std::size_t>(nodesPerElement);
    for (std::size_t i = 0; i < nodeLabels.size(); ++i) {
        const int node = FindNode(nodeLabels[i]);
        if (node < 0) {
            problems.Add("no-such-label", Place("connectivity", i / width) + "/" + std::to_string(i % width),
                         "found node " + Number(nodeLabels[i]), "the label of a node of this mesh");
            good = false;
        }
        nodeLabels[i] = node;
    }
    if (good)
        AddElementsByIndex(type, std::move(labels), nodesPerElement, std::move(nodeLabels), controls,
                           problems);
}

void odiK_Mesh::AddElements(const cow_String& type, std::vector<int> labels, int nodesPerElement,
                            std::vector<int> nodeLabels, const bme_ElemCtrlParams& controls) {
    fnd_Raise problems;
    AddElements(type, std::move(labels), nodesPerElement, std::move(nodeLabels), controls, problems);
}

void odiK_Mesh::AddElementsByIndex(const cow_String& type, std::vector<int> labels, int nodesPerElement,
                                   std::vector<int> nodeIndices, const bme_ElemCtrlParams& controls,
                                   fnd_Sink& problems) {
    if (!CheckConnectivity(nodeIndices, labels, nodesPerElement, problems)) return;
    if (!CheckLabels(labels, problems)) return;
    odiK_ElementClass added;
    added.type = type;
    added.nodesPerElement = nodesPerElement;
    added.labels = std::move(labels);
    added.connectivity = std::move(nodeIndices);
    added.controls = controls;
    added.shape = ddb_ShapeOfLabel(type.View());
    added.firstElementIndex = numElements_;
    numElements_ += added.NumElements();
    classes_.push_back(std::move(added));
}

cel_LabelIndex::Repetitions odiK_Mesh::IndexElements() const {
    indexedClasses_ = classes_.size();
    if (classes_.size() == 1) return elementIndex_.Build(classes_.front().labels);
    std::vector<int> all;
    all.reserve(static_cast<std::size_t>(numElements_));
    for (const odiK_ElementClass& elements : classes_) {
        all.insert(all.end(), elements.labels.begin(), elements.labels.end());
    }
    return elementIndex_.Build(all);
}

void odiK_Mesh::FinishElements(fnd_Sink& problems) {
    std::size_t classIndex = 0;
    for (const int index : IndexElements()) {
        while (classes_[classIndex].firstElementIndex + classes_[classIndex].NumElements() <= index)
            ++classIndex;
        const auto place = static_cast<std::size_t>(index - classes_[classIndex].firstElementIndex);
        problems.Add("duplicate-label", Place("elements", classIndex) + Place("labels", place),
                     "element label " + Number(classes_[classIndex].labels[place]) + " stands twice",
                     "labels that are unique in the mesh");
    }
}

bool odiK_Mesh::FindElement(int label, int& classIndex, int& place) const {
    const int index = FindElementIndex(label);
    if (index < 0) return false;
    const auto next = std::upper_bound(
        classes_.begin(), classes_.end(), index,
        [](int i, const odiK_ElementClass& elements) { return i < elements.firstElementIndex; });
    // Of classes that begin at one place all but the last are empty.
    classIndex = static_cast<int>(next - classes_.begin()) - 1;
    place = index - classes_[static_cast<std::size_t>(classIndex)].firstElementIndex;
    return true;
}

int odiK_Mesh::FindSet(const cow_String& name) const {
    const auto place = setIndex_.find(name.View());
    return place == setIndex_.end() ? -1 : place->second;
}

void odiK_Mesh::AddSet(const odiK_SetInput& input, fnd_Sink& problems) {
    if (FindSet(input.name) >= 0) {
        problems.Add("duplicate-name", "/name", "found a second set named " + fnd_Quoted(input.name.View()),
                     "names that are unique in the mesh");
        return;
    }
    auto set = cow_CountedHld<odiK_Set>(new odiK_Set());
    set->name = input.name;
    set->type = input.type;
    set->internal = input.internal;
    AppendSubsets(input, 0, set->subsets, "", problems);
    sets_.push_back(set);
    setIndex_.emplace(set->name.View(), static_cast<int>(sets_.size()) - 1);
}

void odiK_Mesh::AddNodeSet(const cow_String& name, const std::vector<int>& labels, bool internal) {
    fnd_Raise problems;
    AddSet({name, res_SetTypeEnm::NODES, internal, labels, {}}, problems);
}

void odiK_Mesh::AddElementSet(const cow_String& name, const std::vector<int>& labels, bool internal) {
    fnd_Raise problems;
    AddSet({name, res_SetTypeEnm::ELEMENTS, internal, labels, {}}, problems);
}

void odiK_Mesh::AddSurface(const cow_String& name, const std::vector<odiK_FacetInput>& facets,
                           bool internal) {
    fnd_Raise problems;
    AddSet({name, res_SetTypeEnm::FACETS, internal, {}, facets}, problems);
}

void odiK_Mesh::AppendSubsets(const odiK_SetInput& input, int meshIndex,
                              std::vector<rgnC_SubsetData>& subsets, const std::string& place,
                              fnd_Sink& problems) const {
    const bool facets = input.type == res_SetTypeEnm::FACETS;
    const bool nodes = input.type == res_SetTypeEnm::NODES;
    const std::size_t count = facets ? input.facets.size() : input.labels.size();
    const std::size_t before = subsets.size();
    struct Member {
        int classIndex;
        int entry;
        int facet;
    };
    for (const odiK_ElementRun& run : input.runs) {
        const int numClasses = static_cast<int>(classes_.size());
        if (run.classIndex < 0 || run.classIndex >= numClasses)
            cow_RaiseOutOfRange(run.classIndex, numClasses, "odiK_Mesh: class");
        const int most = classes_[static_cast<std::size_t>(run.classIndex)].NumElements();
        if (run.begin < 0 || run.begin > run.end || run.end > most)
            cow_RaiseOutOfRange(run.begin < 0 ? run.begin : run.end, most + 1, "odiK_Mesh: end of a run");
        const int length = run.end - run.begin;
        if (length == 0) continue;
        if (subsets.size() == before || subsets.back().classIndex != run.classIndex)
            subsets.push_back({meshIndex, run.classIndex, cow_List<int>(cow_ListConstruct(length)), {}});
        subsets.back().subset.AppendMany(length, [&](int i) { return run.begin + i; });
    }
    std::vector<Member> members;
    members.reserve(count);
    for (std::size_t i = 0; i < count; ++i) {
        Member member{-1, -1, -1};
        const int label = facets ? input.facets[i].elementLabel : input.labels[i];
        if (nodes) member.entry = FindNode(label);
        if (nodes ? member.entry < 0 : !FindElement(label, member.classIndex, member.entry)) {
            problems.Add("no-such-label", place + (facets ? Place("facets", i) + "/0" : Place("labels", i)),
                         "found " + Number(label),
                         std::string("the label of ") + (nodes ? "a node" : "an element") + " of the mesh");
            continue;
        }
        if (facets) {
            const odiK_FacetInput& facet = input.facets[i];
            const odiK_ElementClass& elements = classes_[static_cast<std::size_t>(member.classIndex)];
            member.facet = facet.face.empty() ? facet.id : odiK_FacetOfFace(elements.shape, facet.face);
            if (member.facet < 0 || !odiK_FacetFits(elements.shape, member.facet)) {
                problems.Add("no-such-face", place + Place("facets", i) + "/1",
                             "found " + (facet.face.empty() ? Number(facet.id) : fnd_Quoted(facet.face)),
                             "a face of an element of type " + std::string(elements.type.View()));
                continue;
            }
        }
        members.push_back(member);
    }

    for (std::size_t begin = 0; begin < members.size();) {
        std::size_t end = begin;
        while (end < members.size() && members[end].classIndex == members[begin].classIndex) ++end;
        const int length = static_cast<int>(end - begin);
        const cow_ListConstruct room(length);
        const Member* const first = &members[begin];
        subsets.push_back({meshIndex, first->classIndex, cow_List<int>(room), {}});
        rgnC_SubsetData& subset = subsets.back();
        subset.subset.AppendMany(length, [first](int i) { return first[i].entry; });
        if (facets) {
            subset.facetIds = cow_List<int>(room);
            subset.facetIds.AppendMany(length, [first](int i) { return first[i].facet; });
        }
        begin = end;
    }
}

int odiK_FacetOfFace(const ddb_ElementShape& shape, std::string_view face) {
    const ddb_FaceRule rule = ddb_FaceRuleOf(shape);
    if (rule.rule == ddb_FaceRuleEnm::SHELL) return face == "SPOS" ? 0 : face == "SNEG" ? 1 : -1;
    const std::string_view prefix(rule.prefix);
    if (prefix.empty() || !face.starts_with(prefix) || face.size() != prefix.size() + 1) return -1;
    const int facet = face.back() - '1';
    return facet >= 0 && odiK_FacetFits(shape, facet) ? facet : -1;
}

bool odiK_FacetFits(const ddb_ElementShape& shape, int facet) {
    const ddb_FaceRule rule = ddb_FaceRuleOf(shape);
    if (rule.rule == ddb_FaceRuleEnm::SHELL) return facet == 0 || facet == 1 || facet == 6;
    const bool ends = std::string_view(rule.prefix) == "END";
    return facet >= 0 && facet <= (ends ? 1 : 5);
}
