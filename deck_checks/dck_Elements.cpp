#include "deck_checks/dck_Checks.h"
#include "deck_checks/dck_Text.h"
#include "store_interface/model/ddb_ElementTypes.h"
#include "store_interface/model/odiK_Model.h"

namespace {

std::string CountOf(const ddb_ElementType& type) {
    const std::string least = std::to_string(type.minNodes);
    return type.minNodes == type.maxNodes ? least : least + " to " + std::to_string(type.maxNodes);
}

void FindOnClass(const odiK_ElementClass& elements, const std::string& place, fnd_Sink& sink) {
    if (elements.shape.unknown) return; // told already
    const auto type = ddb_FindElementType(elements.type.View());
    if (!type) {
        sink.Add("no-such-element-type", place + "/type", "found " + Quoted(elements.type), {},
                 "there are " + ddb_TypesLike(elements.type.View()));
        return;
    }
    const int found = elements.nodesPerElement;
    if (type->maxNodes == 0 || (found >= type->minNodes && found <= type->maxNodes)) return;
    sink.Add("wrong-node-count", place + "/connectivity",
             "found " + fnd_Counted(found, "node") + " in each element of type " + Quoted(elements.type),
             CountOf(*type));
}

/// Faces that the elements of their class don't have, such as S6 on a quadrilateral.
void FindOnFacets(const odiK_Mesh& mesh, const rgnC_SubsetData& subset, const std::string& place,
                  fnd_Sink& sink) {
    if (subset.classIndex < 0) return;
    const odiK_ElementClass& elements = mesh.Classes()[static_cast<std::size_t>(subset.classIndex)];
    const int sides = ddb_NumberedFacesOf(elements.type.View());
    if (sides < 0) return;
    int wrong = 0;
    int first = 0;
    for (int i = 0; i < subset.facetIds.Length(); ++i) {
        if (subset.facetIds[i] < sides) continue;
        if (wrong++ == 0) first = i;
    }
    if (wrong == 0) return;
    const int label = elements.labels[static_cast<std::size_t>(subset.subset[first])];
    sink.Add("no-such-side", place,
             "found face S" + std::to_string(subset.facetIds[first] + 1) + " on element " +
                 std::to_string(label) + " of type " + Quoted(elements.type) +
                 (wrong > 1 ? " and " + std::to_string(wrong - 1) + " more" : ""),
             "S1 to S" + std::to_string(sides));
}

void FindOnSetNames(const std::vector<cow_CountedHld<odiK_Set>>& sets, const std::string& place,
                    fnd_Sink& sink) {
    for (std::size_t i = 0; i < sets.size(); ++i) {
        const cow_String& name = sets[i]->name;
        if (name.View().find('.') == std::string_view::npos) continue;
        sink.Add("dotted-set-name", place + "/sets/" + std::to_string(i) + "/name", "found " + Quoted(name),
                 {}, "a solver reads it as the set of an instance: leave out the dot");
    }
}

void FindOnMesh(const odiK_Mesh& mesh, const std::string& place, fnd_Sink& sink) {
    for (std::size_t i = 0; i < mesh.Classes().size(); ++i) {
        FindOnClass(mesh.Classes()[i], place + "/elements/" + std::to_string(i), sink);
    }
    for (std::size_t i = 0; i < mesh.Sets().size(); ++i) {
        for (const rgnC_SubsetData& subset : mesh.Sets()[i]->subsets) {
            FindOnFacets(mesh, subset, place + "/sets/" + std::to_string(i), sink);
        }
    }
    FindOnSetNames(mesh.Sets(), place, sink);
}

} // namespace

void dck_CheckElements(const odiK_Model& model, fnd_Sink& sink) {
    for (const auto& [name, part] : model.Parts()) {
        if (!part->mesh.IsNull()) FindOnMesh(*part->mesh, Place("parts", name) + "/mesh", sink);
    }
    for (const auto& [name, instance] : model.Instances()) {
        if (instance->ownMesh.IsNull()) continue;
        FindOnMesh(*instance->ownMesh, "/assembly" + Place("instances", name) + "/mesh", sink);
    }
    const auto& own = model.ConstAssemblyMesh();
    if (!own.IsNull()) FindOnMesh(*own, "/assembly/mesh", sink);
    for (std::size_t i = 0; i < model.AssemblySets().size(); ++i) {
        for (const rgnC_SubsetData& subset : model.AssemblySets()[i]->subsets) {
            const auto instance = model.InstanceOfMesh(subset.meshIndex);
            const odiK_Mesh* mesh = instance.IsNull() ? own.Referent() : instance->Mesh().Referent();
            if (mesh != nullptr) FindOnFacets(*mesh, subset, "/assembly/sets/" + std::to_string(i), sink);
        }
    }
    FindOnSetNames(model.AssemblySets(), "/assembly", sink);
}
