#include "deck_checks/dck_Check.h"
#include "deck_checks/dck_Checks.h"
#include "deck_checks/dck_Text.h"
#include "foundation/mq_MeshQuality.h"
#include "store_interface/model/ddb_ElementTypes.h"
#include "store_interface/model/odb_Odb.h"

namespace {

/// "3 elements ...: 5, 7, 9", "12 elements ...: 5, 7, 9, 11, 12, ...".
std::string Told(const mq_Count& count, const char* thing, const std::string& what) {
    std::string text = fnd_Counted(count.count, thing) + " " + what + ": ";
    for (std::size_t i = 0; i < count.first.size(); ++i) {
        text += (i == 0 ? "" : ", ") + std::to_string(count.first[i]);
    }
    return text + (count.count > static_cast<long long>(count.first.size()) ? ", ..." : "");
}

/// Connectors, springs, cohesive elements and gaskets may well have no size.
bool HasShape(std::string_view type) {
    using Need = ddb_SectionNeedEnm;
    const ddb_ElementFamily* family = ddb_FamilyOf(type);
    if (family == nullptr) return false;
    switch (family->section) {
    case Need::SOLID:
    case Need::SHELL:
    case Need::MEMBRANE:
    case Need::BEAM:
    case Need::TRUSS: return true;
    default: return false;
    }
}

} // namespace

mq_Quality dck_QualityOf(const odiK_Mesh& mesh) {
    const odiK_NodeData& nodes = mesh.Nodes();
    std::vector<int> labels;
    labels.reserve(static_cast<std::size_t>(nodes.NumNodes()));
    for (const int label : nodes.labels) labels.push_back(label);
    mq_Mesh arrays{labels, nodes.coordinates, {}};
    for (const odiK_ElementClass& elements : mesh.Classes()) {
        mq_Block block;
        const std::optional<ddb_ElementType> type = ddb_FindElementType(elements.type.View());
        block.labels = elements.labels;
        block.nodes = elements.connectivity;
        block.width = elements.nodesPerElement;
        block.plane = elements.shape.topologicalDimension == 2 && elements.shape.embeddingDimension == 2;
        block.hasShape = type && type->cell && HasShape(elements.type.View());
        if (block.hasShape) block.kind = *type->cell;
        arrays.blocks.push_back(block);
    }
    return mq_QualityOf(arrays);
}

void dck_TellQuality(const mq_Quality& quality, const std::string& place, fnd_Sink& sink) {
    if (quality.inverted.count > 0)
        sink.Add("inverted-elements", place, Told(quality.inverted, "element", "of negative or zero size"));
    if (quality.farMidSides.count > 0)
        sink.Add(
            "far-mid-sides", place,
            Told(quality.farMidSides, "element", "with mid-side nodes far from the middle of their edge"));
    if (quality.repeatedElements.count > 0)
        sink.Add("repeated-elements", place,
                 Told(quality.repeatedElements, "element", "with the nodes of another one"));
    if (quality.sharedFaces.count > 0)
        sink.Add("shared-faces", place,
                 Told(quality.sharedFaces, "element", "with a face that three or more share"));
    if (quality.repeatedNodes.count > 0)
        sink.Add("repeated-nodes", place, Told(quality.repeatedNodes, "node", "at the place of another one"));
    if (quality.unusedNodes.count > 0)
        sink.Add("unused-nodes", place, Told(quality.unusedNodes, "node", "of no element"));
}

void dck_CheckMesh(const odiK_Mesh& mesh, const std::string& place, fnd_Sink& sink) {
    dck_TellQuality(dck_QualityOf(mesh), place, sink);
}

void dck_CheckMeshes(const odb_Odb& store, const cow_String& modelName, fnd_Sink& sink) {
    const odiK_Model& model = *store.FindModel(modelName);
    const std::string root = Place("models", modelName);
    for (const auto& [name, part] : model.Parts()) {
        if (!part->mesh.IsNull()) dck_CheckMesh(*part->mesh, root + Place("parts", name) + "/mesh", sink);
    }
    for (const auto& [name, instance] : model.Instances()) {
        if (instance->ownMesh.IsNull()) continue;
        dck_CheckMesh(*instance->ownMesh, root + "/assembly" + Place("instances", name) + "/mesh", sink);
    }
}
