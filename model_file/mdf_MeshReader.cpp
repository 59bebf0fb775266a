#include "model_file/mdf_MeshReader.h"

#include "model_file/mdf_MeshFile.h"
#include "store_interface/findings/fnd_TextRules.h"

#include <cmath>
#include <limits>

namespace {

std::size_t NumNodes(const cow_CountedHld<odiK_Mesh>& mesh) {
    return mesh.IsNull() ? 0 : static_cast<std::size_t>(mesh->Nodes().NumNodes());
}

std::size_t NumElements(const cow_CountedHld<odiK_Mesh>& mesh) {
    return mesh.IsNull() ? 0 : static_cast<std::size_t>(mesh->NumElements());
}

} // namespace

cow_CountedHld<odiK_Mesh> mdf_MeshReader::ReadMesh(mdf_Value& json, const fnd_Path& path) {
    if (json.IsInt() && json.Int() >= 0 && static_cast<std::size_t>(json.Int()) < given_.size())
        return given_[static_cast<std::size_t>(json.Int())];
    if (shelf_ == nullptr) return ReadNewMesh(json, path);
    const mdf_MeshShelf::Key key = shelf_->KeyOf(json, path, diagnostics_.FileName());
    if (mdf_MeshShelf::IsOfFile(key)) diagnostics_.NoteMeshFile(json.Find("file")->String());
    if (const std::shared_ptr<const mdf_MeshShelf::Entry> known = shelf_->Find(key)) {
        for (const fnd_Finding& finding : known->findings) diagnostics_.Take(finding);
        return known->mesh;
    }
    const int errors = diagnostics_.NumErrors();
    const std::size_t before = diagnostics_.Report().findings.size();
    cow_CountedHld<odiK_Mesh> mesh = ReadNewMesh(json, path);
    if (diagnostics_.NumErrors() != errors) return mesh;
    const std::vector<fnd_Finding>& said = diagnostics_.Report().findings;
    return shelf_->Keep(key, {mesh, {said.begin() + static_cast<std::ptrdiff_t>(before), said.end()}});
}

cow_CountedHld<odiK_Mesh> mdf_MeshReader::ReadNewMesh(mdf_Value& json, const fnd_Path& path) {
    cow_CountedHld<odiK_Mesh> mesh(new odiK_Mesh());
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object");
        return mesh;
    }
    if (json.Find("file") != nullptr) {
        if (!mdf_MeshFileReader(records_, diagnostics_).Read(*mesh, json, path)) {
            incomplete_.insert(mesh.Referent());
            lacksMesh_ = true;
        }
    } else {
        mdf_CheckMembers(diagnostics_, json, {"nodes", "elements", "sets"}, path);
        ReadNodesAndElements(*mesh, json, path, false);
    }
    if (mdf_Value* sets = json.Find("sets")) ReadSets(*mesh, *sets, fnd_Path(path, "sets"));
    return mesh;
}

void mdf_MeshReader::ReadNodesAndElements(odiK_Mesh& mesh, mdf_Value& json, const fnd_Path& path,
                                          bool inAssembly) {
    const int before = diagnostics_.NumErrors();
    if (mdf_Value* nodes = json.Find("nodes")) ReadNodes(mesh, *nodes, fnd_Path(path, "nodes"));
    if (diagnostics_.NumErrors() != before && mesh.Nodes().NumNodes() == 0) incomplete_.insert(&mesh);
    if (mdf_Value* elements = json.Find("elements")) {
        const std::size_t classes = elements->Size();
        ReadElements(mesh, *elements, fnd_Path(path, "elements"), inAssembly);
        if (mesh.Classes().size() != classes) incomplete_.insert(&mesh);
    }
    fnd_Below problems(diagnostics_, path);
    mesh.FinishElements(problems);
}

void mdf_MeshReader::ReadAssemblyMesh(mdf_Value& json, const fnd_Path& path) {
    odiK_Mesh& mesh = model_.AssemblyMesh();
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object");
        return;
    }
    if (json.Find("sets") != nullptr) {
        diagnostics_.Add("sets-in-assembly-mesh", fnd_Path(path, "sets"), "found sets",
                         "them in the member \"sets\" of the assembly");
    }
    mdf_CheckMembers(diagnostics_, json, {"nodes", "elements", "sets"}, path);
    ReadNodesAndElements(mesh, json, path, true);
}

void mdf_MeshReader::ReadNodes(odiK_Mesh& mesh, mdf_Value& json, const fnd_Path& path) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object");
        return;
    }
    mdf_CheckMembers(diagnostics_, json, {"labels", "coordinates"}, path);
    mdf_Value* coordinates = json.Find("coordinates");
    mdf_Value* labelsJson = json.Find("labels");
    if (labelsJson == nullptr || coordinates == nullptr) {
        diagnostics_.Add("missing-field", path, "found no labels or no coordinates", "both");
        return;
    }
    const fnd_Path coordinatesPath(path, "coordinates");
    if (!coordinates->IsArray()) {
        diagnostics_.Expected(coordinatesPath, *coordinates, "an array of points [x, y, z]");
        return;
    }
    const std::size_t count = coordinates->Size();
    std::vector<int> labels;
    if (!ReadLabels(labels, *labelsJson, fnd_Path(path, "labels"), count)) return;

    std::vector<float> xyz(3 * count);
    bool good = true;
    const auto put = [&](std::size_t place, double value) {
        xyz[place] = static_cast<float>(value);
        if (!std::isinf(xyz[place])) return;
        good = false;
        const fnd_Path row(coordinatesPath, place / 3);
        diagnostics_.Expected(fnd_Path(row, place % 3), mdf_Value(value), "a coordinate of single precision");
    };
    if (coordinates->Kind() == mdf_Kind::Matrix && coordinates->UniformRowLength() == 3) {
        const mdf_MatrixData rows = coordinates->TakeMatrix();
        for (std::size_t i = 0; i < 3 * count; ++i) put(i, rows.ints.empty() ? rows.reals[i] : rows.ints[i]);
    } else {
        for (std::size_t i = 0; i < count; ++i) {
            const fnd_Path row(coordinatesPath, i);
            const mdf_Value point = coordinates->Item(i);
            if (!point.IsArray() || point.Size() != 3) {
                diagnostics_.Expected(row, point, "three coordinates");
                good = false;
                continue;
            }
            for (std::size_t j = 0; j < 3; ++j) {
                if (point.Item(j).IsNumber()) {
                    put(3 * i + j, point.Item(j).Real());
                } else {
                    diagnostics_.Expected(fnd_Path(row, j), point.Item(j), "a number");
                    good = false;
                }
            }
        }
    }
    if (!good) return;
    fnd_Below problems(diagnostics_, path);
    mesh.SetNodes(std::move(labels), std::move(xyz), problems);
}

bool mdf_MeshReader::ReadLabels(std::vector<int>& labels, mdf_Value& json, const fnd_Path& path,
                                std::size_t most) {
    if (json.Kind() == mdf_Kind::IntArray) {
        labels = json.TakeInts();
        return true;
    }
    if (json.IsArray()) {
        for (std::size_t i = 0; i < json.Size(); ++i) {
            const mdf_Value label = json.Item(i);
            if (!label.IsInt()) diagnostics_.Expected(fnd_Path(path, i), label, "a label");
        }
        return false;
    }
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an array of labels, or {\"from\": ..., \"to\": ..., \"by\": ...}");
        return false;
    }
    mdf_CheckMembers(diagnostics_, json, {"from", "to", "by"}, path);
    int range[3] = {0, 0, 1};
    const char* const names[3] = {"from", "to", "by"};
    for (int i = 0; i < 3; ++i) {
        const fnd_Path place(path, std::string_view(names[i]));
        const mdf_Value* number = json.Find(names[i]);
        if (number == nullptr && i < 2) {
            diagnostics_.Add("missing-field", place, "found nothing", "a label");
            return false;
        }
        if (number == nullptr) continue;
        if (!number->IsInt() || number->Int() <= 0) {
            diagnostics_.Expected(place, *number, "a positive integer");
            return false;
        }
        range[i] = number->Int();
    }
    if (range[0] > range[1]) {
        diagnostics_.Add("wrong-label", path,
                         "found a range from " + std::to_string(range[0]) + " to " + std::to_string(range[1]),
                         "from not above to");
        return false;
    }
    const std::size_t count = static_cast<std::size_t>((range[1] - range[0]) / range[2]) + 1;
    if (count > most) {
        diagnostics_.Add("wrong-label", path, "found a range of " + std::to_string(count) + " labels",
                         "at most " + std::to_string(most));
        return false;
    }
    labels.reserve(count);
    for (long long label = range[0]; label <= range[1]; label += range[2])
        labels.push_back(static_cast<int>(label));
    return true;
}

void mdf_MeshReader::ReadElements(odiK_Mesh& mesh, mdf_Value& json, const fnd_Path& path, bool inAssembly) {
    if (!json.IsArray()) {
        diagnostics_.Expected(path, json, "an array of element classes");
        return;
    }
    if (json.Kind() != mdf_Kind::Array) {
        if (!json.Empty()) diagnostics_.Expected(fnd_Path(path, std::size_t{0}), json.Item(0), "an object");
        return;
    }
    for (std::size_t i = 0; i < json.Size(); ++i) {
        ReadElementClass(mesh, json.Items()[i], fnd_Path(path, i), inAssembly);
    }
}

void mdf_MeshReader::ReadElementClass(odiK_Mesh& mesh, mdf_Value& json, const fnd_Path& path,
                                      bool inAssembly) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object");
        return;
    }
    mdf_CheckMembers(diagnostics_, json, {"type", "labels", "connectivity", "controls"}, path);
    const mdf_Value* type = json.Find("type");
    mdf_Value* labelsJson = json.Find("labels");
    mdf_Value* connectivity = json.Find("connectivity");
    if (type == nullptr || labelsJson == nullptr || connectivity == nullptr) {
        diagnostics_.Add("missing-field", path, "found an element class without type, labels or connectivity",
                         "all three");
        return;
    }
    if (!type->IsString()) {
        diagnostics_.Expected(fnd_Path(path, "type"), *type, "the label of an element type");
        return;
    }
    if (!fnd_CheckName(type->String(), fnd_Path(path, "type"), diagnostics_)) return;
    if (ddb_ShapeOfLabel(type->String()).unknown) {
        diagnostics_.Add("unknown-element-type", fnd_Path(path, "type"),
                         fnd_Quoted(type->String()) +
                             " is no known element type; it is taken for a point element");
    }
    bme_ElemCtrlParams controls;
    if (const mdf_Value* given = json.Find("controls")) {
        records_.ReadRecord(controls, *given, fnd_Path(path, "controls"));
    }
    const fnd_Path connectivityPath(path, "connectivity");
    if (!connectivity->IsArray()) {
        diagnostics_.Expected(connectivityPath, *connectivity, "an array of rows of node labels");
        return;
    }
    const std::size_t count = connectivity->Size();
    std::vector<int> labels;
    if (!ReadLabels(labels, *labelsJson, fnd_Path(path, "labels"), count)) return;
    if (labels.size() != count) {
        const auto counted = [](std::size_t number, const char* thing) {
            return std::to_string(number) + " " + thing + (number == 1 ? "" : "s");
        };
        diagnostics_.Add("length-mismatch", connectivityPath,
                         "found " + counted(count, "row") + " for " + counted(labels.size(), "label"),
                         "one for each");
        return;
    }
    int width = 0;
    std::vector<int> nodes;
    fnd_Below problems(diagnostics_, path);
    if (inAssembly) {
        if (!ReadScopedConnectivity(mesh, *connectivity, connectivityPath, count, width, nodes)) return;
        if (IsIncomplete(&mesh)) return;
        mesh.AddElementsByIndex(cow_String(type->String()), std::move(labels), width, std::move(nodes),
                                controls, problems);
    } else {
        if (!ReadConnectivity(*connectivity, connectivityPath, count, width, nodes)) return;
        if (IsIncomplete(&mesh)) return;
        mesh.AddElements(cow_String(type->String()), std::move(labels), width, std::move(nodes), controls,
                         problems);
    }
}

bool mdf_MeshReader::ReadConnectivity(mdf_Value& json, const fnd_Path& path, std::size_t numElements,
                                      int& width, std::vector<int>& nodes) {
    if (json.Kind() == mdf_Kind::Matrix && json.UniformRowLength() > 0 && json.AllInts()) {
        mdf_MatrixData rows = json.TakeMatrix();
        width = rows.rowLength;
        nodes = std::move(rows.ints);
        return true;
    }
    bool good = true;
    for (std::size_t i = 0; i < numElements; ++i) {
        const fnd_Path rowPath(path, i);
        const mdf_Value row = json.Item(i);
        if (i == 0 && row.IsArray()) width = static_cast<int>(row.Size());
        if (!row.IsArray() || row.Empty() || row.Size() != static_cast<std::size_t>(width)) {
            diagnostics_.Expected(rowPath, row,
                                  width > 0
                                      ? "a row of " + std::to_string(width) + " node labels, as the first one"
                                      : "a row of node labels");
            good = false;
            continue;
        }
        for (std::size_t j = 0; j < row.Size(); ++j) {
            if (row.Item(j).IsInt()) continue;
            diagnostics_.Expected(fnd_Path(rowPath, j), row.Item(j), "a node label");
            good = false;
        }
    }
    return good && numElements == 0;
}

bool mdf_MeshReader::ReadScopedConnectivity(odiK_Mesh& mesh, const mdf_Value& json, const fnd_Path& path,
                                            std::size_t numElements, int& width, std::vector<int>& nodes) {
    bool good = true;
    for (std::size_t i = 0; i < numElements; ++i) {
        const fnd_Path rowPath(path, i);
        const mdf_Value row = json.Item(i);
        if (i == 0 && row.IsArray()) width = static_cast<int>(row.Size());
        if (!row.IsArray() || row.Empty() || row.Size() != static_cast<std::size_t>(width)) {
            diagnostics_.Expected(rowPath, row,
                                  width > 0 ? "a row of " + std::to_string(width) + " nodes, as the first one"
                                            : "a row of nodes");
            good = false;
            continue;
        }
        for (std::size_t j = 0; j < row.Size(); ++j) {
            const int node = ReadScopedNode(mesh, row.Item(j), fnd_Path(rowPath, j));
            good = good && node >= 0;
            nodes.push_back(node);
        }
    }
    return good;
}

int mdf_MeshReader::ReadScopedNode(odiK_Mesh& mesh, const mdf_Value& json, const fnd_Path& path) {
    if (json.IsInt()) {
        const int node = mesh.FindNode(json.Int());
        if (node < 0 && !IsIncomplete(&mesh))
            diagnostics_.Expected(path, json, "the label of a node of the assembly's own mesh");
        return node;
    }
    // The instance's name runs to the last dot.
    const std::size_t dot = json.IsString() ? json.String().rfind('.') : std::string::npos;
    if (dot == std::string::npos) {
        diagnostics_.Expected(path, json, "a node label, or \"INSTANCE.LABEL\"");
        return -1;
    }
    const std::string name = json.String().substr(0, dot);
    const std::string digits = json.String().substr(dot + 1);
    const odiK_Instance* instance = model_.FindInstance(cow_String(name));
    if (instance == nullptr) {
        records_.Places().ReportNoInstance(name, path);
        return -1;
    }
    if (!instance->isPartInstance) {
        diagnostics_.Add("no-such-name", path, "found " + fnd_Quoted(name) + ", which is no part instance",
                         "one");
        return -1;
    }
    const bool isNumber =
        !digits.empty() && digits.size() <= 10 && digits.find_first_not_of("0123456789") == std::string::npos;
    const long long label = isNumber ? std::stoll(digits) : 0;
    const auto nodes = instance->Mesh();
    if (IsIncomplete(nodes.Referent())) return -1;
    if (label < 1 || label > std::numeric_limits<int>::max() || nodes.IsNull() ||
        nodes->FindNode(static_cast<int>(label)) < 0) {
        diagnostics_.Add("no-such-label", path, "found node " + fnd_Quoted(digits),
                         "the label of a node of instance " + fnd_Quoted(name));
        return -1;
    }
    return mesh.AddForeignNode(instance->name, static_cast<int>(label));
}

bool mdf_MeshReader::ReadSetHead(odiK_SetHead& head, const mdf_Value& json, const fnd_Path& path,
                                 mdf_CapitalsCheck& capitals) {
    const int errorsBefore = diagnostics_.NumErrors();
    for (const cls_Field& field : odiK_SetHead::Fields().All())
        records_.ReadField(head, field, json.Find(field.name), fnd_Path(path, std::string_view(field.name)));
    if (head.name.IsEmpty()) return false;
    const std::string name(head.name.View());
    capitals.Enter(name, fnd_Path(path, "name"), "set", diagnostics_);
    const bool good = diagnostics_.NumErrors() == errorsBefore;
    if (!good) records_.References().NoteWrong(name);
    return good;
}

bool mdf_MeshReader::ReadMembers(Members& members, res_SetTypeEnm type, mdf_Value& json, const fnd_Path& path,
                                 std::size_t mostLabels) {
    const bool facets = type == res_SetTypeEnm::FACETS;
    const char* const member = facets ? "facets" : "labels";
    mdf_Value* given = json.Find(member);
    const fnd_Path place(path, std::string_view(member));
    if (given == nullptr) {
        diagnostics_.Add("missing-field", place, "found nothing",
                         std::string("the ") + member + " of the set");
        return false;
    }
    if (!facets) {
        if (!ReadLabels(members.labels, *given, place, mostLabels)) return false;
        members.empty = members.labels.empty();
        return true;
    }
    members.facetText = std::move(*given);
    if (!ReadFacets(members.facets, members.facetText, place)) return false;
    members.empty = members.facets.empty();
    return true;
}

bool mdf_MeshReader::ReadFacets(std::vector<odiK_FacetInput>& facets, const mdf_Value& json,
                                const fnd_Path& path) {
    if (!json.IsArray()) {
        diagnostics_.Expected(path, json, "an array of facets [label, face]");
        return false;
    }
    facets.reserve(json.Size());
    if (json.Kind() == mdf_Kind::FacetArray) {
        for (std::size_t i = 0; i < json.Size(); ++i) {
            if (json.FacetHasName(i)) {
                facets.push_back({json.FacetLabel(i), -1, json.FacetName(i)});
            } else {
                facets.push_back({json.FacetLabel(i), json.FacetId(i), {}});
            }
        }
    } else if (json.Kind() == mdf_Kind::Matrix && json.UniformRowLength() == 2 && json.AllInts()) {
        const std::span<const int> numbers = json.Ints();
        for (std::size_t i = 0; i < json.Size(); ++i)
            facets.push_back({numbers[2 * i], numbers[2 * i + 1], {}});
    } else {
        for (std::size_t i = 0; i < json.Size(); ++i) {
            const mdf_Value facet = json.Item(i);
            const bool good = facet.IsArray() && facet.Size() == 2 && facet.Item(0).IsInt() &&
                              (facet.Item(1).IsInt() || facet.Item(1).IsString());
            if (!good) diagnostics_.Expected(fnd_Path(path, i), facet, "a facet [label, face]");
        }
        return json.Empty();
    }
    for (std::size_t i = 0; i < facets.size(); ++i) {
        // An empty name would read as a number.
        if (facets[i].face.data() == nullptr || !facets[i].face.empty()) continue;
        diagnostics_.Add("no-such-face", fnd_Path(path, i), "found an empty face", "a face name or a number");
        return false;
    }
    return true;
}

template <class Reader>
void mdf_MeshReader::ForEachSet(mdf_Value& json, const fnd_Path& path, const Reader& read) {
    if (!json.IsArray() || (json.Kind() != mdf_Kind::Array && !json.Empty())) {
        diagnostics_.Expected(path, json, "an array of sets");
        return;
    }
    mdf_CapitalsCheck capitals;
    for (std::size_t i = 0; i < json.Size(); ++i) {
        mdf_Value& set = json.Items()[i];
        const fnd_Path place(path, i);
        odiK_SetHead head;
        if (!set.IsObject()) {
            diagnostics_.Expected(place, set, "an object");
        } else if (ReadSetHead(head, set, place, capitals)) {
            read(set, place, head);
        }
    }
}

void mdf_MeshReader::ReadSets(odiK_Mesh& mesh, mdf_Value& json, const fnd_Path& path) {
    ForEachSet(json, path, [&](mdf_Value& set, const fnd_Path& place, const odiK_SetHead& head) {
        const bool facets = head.type == res_SetTypeEnm::FACETS;
        mdf_CheckMembers(diagnostics_, set,
                         mdf_MembersOf(odiK_SetHead::Fields(), {facets ? "facets" : "labels"}), place);
        fnd_Below problems(diagnostics_, place);
        if (IsIncomplete(&mesh)) {
            mesh.AddSet({head.name, head.type, head.internal, {}, {}}, problems);
            return;
        }
        const int most = head.type == res_SetTypeEnm::NODES ? mesh.Nodes().NumNodes() : mesh.NumElements();
        Members members;
        if (!ReadMembers(members, head.type, set, place, static_cast<std::size_t>(most))) {
            records_.References().NoteWrong(head.name.View());
            return;
        }
        if (members.empty)
            diagnostics_.Add("empty-set", place, "the set is empty, and will not stand in the deck");
        mesh.AddSet({head.name, head.type, head.internal, members.labels, members.facets}, problems);
    });
}

void mdf_MeshReader::ReadAssemblySets(mdf_Value& json, const fnd_Path& path) {
    ForEachSet(json, path, [&](mdf_Value& set, const fnd_Path& place, const odiK_SetHead& head) {
        mdf_CheckMembers(diagnostics_, set, mdf_MembersOf(odiK_SetHead::Fields(), {"members"}), place);
        mdf_Value* entries = set.Find("members");
        const fnd_Path entriesPath(place, "members");
        if (entries == nullptr || !entries->IsArray() ||
            (entries->Kind() != mdf_Kind::Array && !entries->Empty())) {
            diagnostics_.Add("missing-field", entriesPath,
                             "found " + (entries == nullptr ? std::string("nothing") : mdf_Shown(*entries)),
                             "an array of members");
            records_.References().NoteWrong(head.name.View());
            return;
        }
        if (entries->Empty())
            diagnostics_.Add("empty-set", place, "the set is empty, and will not stand in the deck");
        std::vector<Members> members(entries->Size());
        std::vector<odiK_MemberInput> inputs;
        bool good = true;
        for (std::size_t m = 0; m < entries->Size(); ++m) {
            odiK_MemberInput& input = inputs.emplace_back();
            good = ReadEntry(input, members[m], head.type, entries->Items()[m], fnd_Path(entriesPath, m)) &&
                   good;
        }
        if (!good) {
            records_.References().NoteWrong(head.name.View());
            return;
        }
        fnd_Below problems(diagnostics_, place);
        model_.AddAssemblySet(head.name, head.type, head.internal, inputs, problems);
    });
}

bool mdf_MeshReader::ReadEntry(odiK_MemberInput& input, Members& members, res_SetTypeEnm type,
                               mdf_Value& json, const fnd_Path& path) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object");
        return false;
    }
    const bool facets = type == res_SetTypeEnm::FACETS;
    mdf_CheckMembers(diagnostics_, json, {"instance", facets ? "facets" : "labels"}, path);
    const mdf_Value* instance = json.Find("instance");
    const fnd_Path instancePath(path, "instance");
    if (instance != nullptr && (!instance->IsString() || instance->String().empty())) {
        diagnostics_.Expected(instancePath, *instance, "the name of an instance");
        return false;
    }
    if (instance != nullptr) input.instanceName = cow_String(instance->String());
    const odiK_Instance* owner = model_.FindInstance(input.instanceName);
    if (instance != nullptr && owner == nullptr) {
        records_.Places().ReportNoInstance(instance->String(), instancePath);
        return false;
    }
    const auto mesh = owner == nullptr ? model_.ConstAssemblyMesh() : owner->Mesh();
    if (IsIncomplete(mesh.Referent())) return false;
    const std::size_t most = type == res_SetTypeEnm::NODES ? NumNodes(mesh) : NumElements(mesh);
    if (!ReadMembers(members, type, json, path, most)) return false;
    if (members.empty) {
        diagnostics_.Add("empty-entry", path, "found an entry without members", "at least one");
        return false;
    }
    input.labels = members.labels;
    input.facets = members.facets;
    return true;
}
