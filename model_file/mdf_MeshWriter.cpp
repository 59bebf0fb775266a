#include "model_file/mdf_MeshWriter.h"

#include "platform/plt_Files.h"

#include <filesystem>

namespace {

template <class Labels>
void WriteLabels(mdf_Writer& out, const Labels& labels) {
    out.Key("labels");
    out.BeginArray(mdf_Layout::Wrapped);
    for (const int label : labels) out.Int(label);
    out.EndArray();
}

/// Entries that are no part instances have negative indices; null is the assembly.
const odiK_Instance* InstanceOf(const odiK_Model& model, int meshIndex) {
    if (meshIndex > 0) return model.InstanceOfMesh(meshIndex).Referent();
    for (const auto& [name, instance] : model.Instances()) {
        if (meshIndex < 0 && instance->meshIndex == meshIndex) return instance.Referent();
    }
    return nullptr;
}

/// The mesher's file as a model file in the folder names it: as it was named, where that leads to it.
std::filesystem::path PathOf(const mdf_MeshOrigin& origin, const std::filesystem::path& given,
                             const std::filesystem::path& folder) {
    const std::filesystem::path file = plt_Path(origin.path);
    // Behind a link to a folder "x/.." is another place than ".".
    for (const std::filesystem::path& path : {given.lexically_normal(), given}) {
        std::error_code error;
        if (std::filesystem::equivalent(folder / path, file, error)) return path;
    }
    return std::filesystem::proximate(file, folder);
}

} // namespace

void mdf_MeshWriter::WriteOrigin(const mdf_MeshOrigin& origin) {
    const std::filesystem::path given = plt_Path(origin.given.Find("file")->String());
    out_.BeginObject();
    for (const mdf_Member& member : origin.given.Members()) {
        out_.Key(member.name);
        if (member.name == "file" && given.is_relative()) {
            const std::filesystem::path folder = plt_Path(folder_.empty() ? "." : folder_);
            out_.String(PathOf(origin, given, folder).generic_string());
        } else {
            out_.Value(member.value);
        }
    }
    out_.EndObject();
}

void mdf_MeshWriter::WriteMesh(const odiK_Mesh& mesh) {
    for (const mdf_MeshOrigin& origin : origins_) {
        if (origin.mesh != &mesh) continue;
        WriteOrigin(origin);
        return;
    }
    out_.BeginObject();
    if (mesh.Nodes().NumNodes() > 0) WriteNodes(mesh.Nodes());
    if (!mesh.Classes().empty()) {
        out_.Key("elements");
        out_.BeginArray();
        for (const odiK_ElementClass& elements : mesh.Classes()) WriteElements(mesh.Nodes(), elements);
        out_.EndArray();
    }
    if (!mesh.Sets().empty()) {
        out_.Key("sets");
        out_.BeginArray();
        for (const auto& set : mesh.Sets()) {
            out_.BeginObject();
            WriteHead(*set);
            WriteMembers(mesh, *set, set->subsets);
            out_.EndObject();
        }
        out_.EndArray();
    }
    out_.EndObject();
}

void mdf_MeshWriter::WriteNodes(const odiK_NodeData& nodes) {
    out_.Key("nodes");
    out_.BeginObject();
    const auto count = static_cast<std::size_t>(nodes.NumNodes());
    WriteLabels(out_, nodes.labels);
    out_.Key("coordinates");
    out_.BeginArray();
    for (std::size_t i = 0; i < count; ++i) out_.Row({nodes.coordinates.data() + 3 * i, 3});
    out_.EndArray();
    out_.EndObject();
}

void mdf_MeshWriter::WriteElements(const odiK_NodeData& nodes, const odiK_ElementClass& elements) {
    out_.BeginObject();
    out_.Key("type");
    out_.String(elements.type.View());
    WriteLabels(out_, elements.labels);
    out_.Key("connectivity");
    out_.BeginArray();
    for (std::size_t i = 0; i < elements.connectivity.size();) {
        out_.BeginArray(mdf_Layout::OneLine);
        for (int j = 0; j < elements.nodesPerElement; ++j, ++i) WriteEnd(nodes, elements.connectivity[i]);
        out_.EndArray();
    }
    out_.EndArray();
    if (elements.controls != bme_ElemCtrlParams()) {
        out_.Key("controls");
        records_.WriteRecord(elements.controls, elements.controls.DynTypeId());
    }
    out_.EndObject();
}

void mdf_MeshWriter::WriteEnd(const odiK_NodeData& nodes, int node) {
    if (node < nodes.NumNodes()) {
        out_.Int(nodes.Label(node));
        return;
    }
    const odiK_ForeignNode& end = nodes.foreign[static_cast<std::size_t>(node - nodes.NumNodes())];
    out_.String(std::string(end.instanceName.View()) + "." + std::to_string(end.label));
}

void mdf_MeshWriter::WriteHead(const odiK_Set& set) {
    static const odiK_SetHead byDefault;
    for (const cls_Field& field : odiK_SetHead::Fields().All()) records_.WriteField(field, set, byDefault);
}

void mdf_MeshWriter::WriteMembers(const odiK_Mesh& mesh, const odiK_Set& set,
                                  std::span<const rgnC_SubsetData> subsets) {
    const bool facets = set.type == res_SetTypeEnm::FACETS;
    out_.Key(facets ? "facets" : "labels");
    out_.BeginArray(facets ? mdf_Layout::Lines : mdf_Layout::Wrapped);
    for (const rgnC_SubsetData& subset : subsets) {
        for (int i = 0; i < subset.subset.Length(); ++i) {
            const int entry = subset.subset[i];
            if (set.type == res_SetTypeEnm::NODES) {
                out_.Int(mesh.Nodes().Label(entry));
                continue;
            }
            const auto& elements = mesh.Classes()[static_cast<std::size_t>(subset.classIndex)];
            const int label = elements.labels[static_cast<std::size_t>(entry)];
            if (facets) {
                const int facet[2] = {label, subset.facetIds[i]};
                out_.Row(std::span<const int>(facet));
            } else {
                out_.Int(label);
            }
        }
    }
    out_.EndArray();
}

void mdf_MeshWriter::WriteAssemblySets() {
    out_.BeginArray();
    for (const auto& set : model_.AssemblySets()) {
        out_.BeginObject();
        WriteHead(*set);
        out_.Key("members");
        out_.BeginArray();
        for (const rgnC_SubsetData& subset : set->subsets) WriteEntry(*set, subset);
        out_.EndArray();
        out_.EndObject();
    }
    out_.EndArray();
}

void mdf_MeshWriter::WriteEntry(const odiK_Set& set, const rgnC_SubsetData& subset) {
    const odiK_Instance* owner = InstanceOf(model_, subset.meshIndex);
    out_.BeginObject();
    if (owner != nullptr) {
        out_.Key("instance");
        out_.String(owner->name.View());
    }
    const auto mesh = owner == nullptr ? model_.ConstAssemblyMesh() : owner->Mesh();
    WriteMembers(*mesh, set, std::span<const rgnC_SubsetData>(&subset, 1));
    out_.EndObject();
}
