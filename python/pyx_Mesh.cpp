#include "python/pyx_Mesh.h"

#include <pybind11/stl.h>

#include "deck_checks/dck_Check.h"
#include "foundation/mq_MeshQuality.h"
#include "mesh_file/msf_Grid.h"
#include "model_file/mdf_MeshImport.h"
#include "model_file/mdf_Parser.h"
#include "python/pyx_Document.h"
#include "python/pyx_Run.h"
#include "python/pyx_Values.h"
#include "store_interface/findings/fnd_TextRules.h"
#include "store_interface/model/ddb_ElementTypes.h"

#include <limits>
#include <numeric>

namespace {

constexpr const char* kPart = "PART";

template <class T>
std::vector<T> Copied(const pyx_Mesh::Array<T>& array) {
    return std::vector<T>(array.data(), array.data() + array.size());
}

/// One number each, all of them integers of 32 bits.
std::vector<int> Integers(const py::object& given, const char* what) {
    const auto array = pyx_Mesh::Array<std::int64_t>::ensure(given);
    const auto asGiven = py::array::ensure(given);
    if (!array || !asGiven) PyErr_Clear();
    const char kind = asGiven ? asGiven.dtype().kind() : 'O';
    const bool isInteger = kind == 'i' || kind == 'u' || (asGiven && asGiven.size() == 0);
    if (!array || array.ndim() != 1 || !isInteger) {
        pyx_RaiseWrong("wrong-value", std::string("/") + what,
                       array && array.ndim() != 1
                           ? "found an array of " + std::to_string(array.ndim()) + " dimensions"
                           : "found something else",
                       "an array of integers");
    }
    std::vector<int> numbers(static_cast<std::size_t>(array.size()));
    for (std::size_t i = 0; i < numbers.size(); ++i) {
        const std::int64_t number = array.data()[i];
        if (number < std::numeric_limits<int>::min() || number > std::numeric_limits<int>::max())
            pyx_RaiseWrong("wrong-label", std::string("/") + what + "/" + std::to_string(i),
                           "found " + std::to_string(number), "an integer of 32 bits");
        numbers[i] = static_cast<int>(number);
    }
    return numbers;
}

std::vector<int> LabelsOr(const py::object& given, std::size_t count, int first, const char* what) {
    if (!given.is_none()) return Integers(given, what);
    std::vector<int> labels(count);
    std::iota(labels.begin(), labels.end(), first);
    return labels;
}

std::string ShapeText(const py::array& array) {
    return "found an array of shape " + py::cast<std::string>(py::str(array.attr("shape")));
}

/// What findings there are of the mesh that is being made; raises them.
class MeshFindings {
public:
    explicit MeshFindings(std::string place) : place_(std::move(place)) {}
    fnd_Sink& Sink() { return list_; }
    void Raise() {
        for (fnd_Finding& finding : list_.findings) finding.place = place_ + finding.place;
        pyx_RaiseErrors(list_.findings);
    }

private:
    fnd_List list_;
    std::string place_;
};

void SetNodes(odiK_Mesh& mesh, const pyx_Mesh::Array<float>& points, const py::object& labels) {
    if (points.ndim() != 2 || points.shape(1) != 3)
        pyx_RaiseWrong("length-mismatch", "/points", ShapeText(points), "N rows of three coordinates");
    const auto count = static_cast<std::size_t>(points.shape(0));
    std::vector<float> coordinates = Copied(points);
    std::vector<int> given = LabelsOr(labels, count, 1, "point_labels");
    MeshFindings problems("/points");
    {
        const py::gil_scoped_release released;
        for (std::size_t i = 0; i < coordinates.size(); ++i) {
            if (coordinates[i] - coordinates[i] == 0.0F) continue;
            problems.Sink().Add("wrong-value", "/" + std::to_string(i / 3) + "/" + std::to_string(i % 3),
                                "found a coordinate beyond single precision, or none",
                                "a coordinate of single precision");
            break;
        }
        mesh.SetNodes(std::move(given), std::move(coordinates), problems.Sink());
    }
    problems.Raise();
}

bme_ElemCtrlParams ControlsOf(const py::object& given, const fnd_Path& path) {
    bme_ElemCtrlParams controls;
    if (given.is_none()) return controls;
    const pyx_Document document(given);
    mdf_Value json;
    std::vector<fnd_Finding> errors;
    mdf_Parse(document.Text(), json, errors);
    mdf_Report report;
    mdf_Diagnostics diagnostics(report);
    odiK_Model empty(odb_Odb::DefaultModelName());
    mdf_RecordReader(empty, diagnostics).ReadRecord(controls, json, path, {"class"});
    pyx_RaiseErrors(report.findings);
    return controls;
}

/// The places of an array's rows, which must be places of nodes.
std::vector<int> Connectivity(const py::object& given, int numNodes, const std::string& place, int& width) {
    const auto asGiven = py::array::ensure(given);
    const char kind = asGiven ? asGiven.dtype().kind() : 'O';
    if (!asGiven || asGiven.ndim() != 2 || asGiven.shape(1) == 0 ||
        (kind != 'i' && kind != 'u' && asGiven.size() != 0)) {
        PyErr_Clear();
        pyx_RaiseWrong("length-mismatch", place,
                       asGiven ? ShapeText(asGiven) + " of " + py::cast<std::string>(py::str(asGiven.dtype()))
                               : "found something else",
                       "rows of integers, the places of nodes from 0");
    }
    width = static_cast<int>(asGiven.shape(1));
    std::vector<int> nodes(static_cast<std::size_t>(asGiven.size()));
    std::size_t wrong = nodes.size();
    const auto take = [&](const auto& array) {
        const auto* from = array.data();
        const py::gil_scoped_release released;
        for (std::size_t i = 0; i < nodes.size(); ++i) {
            nodes[i] = static_cast<int>(from[i]);
            if (from[i] < 0 || from[i] >= numNodes) {
                wrong = i;
                break;
            }
        }
    };
    if (asGiven.dtype().kind() == 'i' && asGiven.itemsize() <= 4) {
        take(pyx_Mesh::Array<std::int32_t>::ensure(asGiven));
    } else {
        take(pyx_Mesh::Array<std::int64_t>::ensure(asGiven));
    }
    if (wrong == nodes.size()) return nodes;
    const auto columns = static_cast<std::size_t>(width);
    pyx_RaiseWrong("no-such-label",
                   place + "/" + std::to_string(wrong / columns) + "/" + std::to_string(wrong % columns),
                   "found " +
                       py::cast<std::string>(py::str(py::array(asGiven).attr("flat")[py::int_(wrong)])),
                   "the place of a node, 0 to " + std::to_string(numNodes - 1));
}

void CheckType(const std::string& type, int width, const std::string& place) {
    fnd_List list;
    const fnd_Path top;
    fnd_CheckName(type, top, list);
    for (fnd_Finding& finding : list.findings) finding.place = place;
    pyx_RaiseErrors(list.findings);
    const std::optional<ddb_ElementType> known = ddb_FindElementType(type);
    if (!known) {
        if (ddb_FamilyOf(type) == nullptr) return; // a point or user element
        pyx_RaiseWrong("unknown-element-type", place, "found " + fnd_Quoted(type), "an element type",
                       ddb_TypesLike(type));
    }
    if ((known->minNodes == 0 || width >= known->minNodes) &&
        (known->maxNodes == 0 || width <= known->maxNodes))
        return;
    pyx_RaiseWrong("length-mismatch", place, "found rows of " + std::to_string(width) + " nodes",
                   std::to_string(known->minNodes) +
                       (known->maxNodes != known->minNodes ? " to " + std::to_string(known->maxNodes) : "") +
                       " for elements of type " + type);
}

mdf_Value Parsed(const pyx_Document& document) {
    mdf_Value json;
    std::vector<fnd_Finding> errors;
    mdf_Parse(document.Text(), json, errors);
    pyx_RaiseErrors(errors);
    return json;
}

msf_NumberArray NumbersOf(const py::array& array, msf_NumberArray::Type type) {
    msf_NumberArray numbers;
    numbers.type = type;
    numbers.count = static_cast<std::size_t>(array.size());
    numbers.data = static_cast<const char*>(array.data());
    return numbers;
}

std::string FaceName(const ddb_ElementShape& shape, int facet) {
    const ddb_FaceRule rule = ddb_FaceRuleOf(shape);
    if (rule.rule == ddb_FaceRuleEnm::SHELL && facet < 2) return facet == 0 ? "SPOS" : "SNEG";
    if (rule.rule == ddb_FaceRuleEnm::SHELL || *rule.prefix == '\0') return std::to_string(facet);
    return rule.prefix + std::to_string(facet + 1);
}

/// A view on numbers in the mesh that keeps it alive.
template <class T>
py::array View(const py::object& owner, const std::vector<T>& numbers, std::vector<py::ssize_t> shape) {
    py::array_t<T> view(std::move(shape), numbers.data(), owner);
    view.attr("setflags")(py::arg("write") = false);
    return view;
}

template <class T>
py::array_t<T> ArrayOf(const std::vector<T>& numbers) {
    return py::array_t<T>(static_cast<py::ssize_t>(numbers.size()), numbers.data());
}

py::dict CountOf(const mq_Count& count) {
    py::dict told;
    told["count"] = count.count;
    told["first"] = py::cast(std::vector<int>(count.first));
    return told;
}

} // namespace

pyx_Mesh pyx_Mesh::OfArrays(const Array<float>& points, const py::object& labels, const py::list& blocks) {
    const cow_CountedHld<odiK_Mesh> mesh(new odiK_Mesh());
    SetNodes(*mesh, points, labels);
    for (std::size_t i = 0; i < blocks.size(); ++i) {
        const py::tuple block = blocks[i];
        const auto type = block[0].cast<std::string>();
        const std::string place = "/cells/" + std::to_string(i);
        int width = 0;
        std::vector<int> nodes = Connectivity(block[1], mesh->Nodes().NumNodes(), place, width);
        CheckType(type, width, place);
        std::vector<int> own = LabelsOr(block[2], nodes.size() / static_cast<std::size_t>(width),
                                        mesh->NumElements() + 1, "labels");
        const fnd_Path top;
        const bme_ElemCtrlParams controls = ControlsOf(block[3], fnd_Path(top, "controls"));
        MeshFindings problems(place);
        mesh->AddElementsByIndex(cow_String(type), std::move(own), width, std::move(nodes), controls,
                                 problems.Sink());
        problems.Raise();
    }
    MeshFindings problems("");
    {
        const py::gil_scoped_release released;
        mesh->FinishElements(problems.Sink());
    }
    problems.Raise();
    return pyx_Mesh(mesh);
}

pyx_Mesh pyx_Mesh::OfFile(py::handle request) {
    const std::string text = R"({"format": "qrx-model/1", "models": {")" +
                             std::string(odb_Odb::DefaultModelName()) + R"(": {"parts": {")" + kPart +
                             R"(": {"mesh": )" + pyx_Document(request).Text() + "}}}}}";
    mdf_Report report;
    std::unique_ptr<odb_Odb> store;
    pyx_Released([&] { store = mdf_ReadModelText(text, "", report); });
    for (fnd_Finding& finding : report.findings) finding.place.clear();
    if (report.unreadable) pyx_RaiseUnreadable(report.findings);
    if (store == nullptr) throw pyx_Wrong{report.findings};
    const auto& part = store->DeckModel()->Parts().begin()->second;
    return pyx_Mesh(part->mesh, report.meshOrigins.front());
}

pyx_Mesh pyx_Mesh::OfGrid(const Array<double>& points, const Array<std::uint8_t>& types,
                          const Array<std::int64_t>& connectivity, const Array<std::int64_t>& offsets,
                          const py::list& groups, const py::list& arrays, py::handle request) {
    if (points.ndim() != 2 || points.shape(1) != 3)
        pyx_RaiseWrong("length-mismatch", "/points", ShapeText(points), "N rows of three coordinates");
    using Type = msf_NumberArray::Type;
    msf_VtkGrid grid;
    grid.points = NumbersOf(points, Type::FLOAT64);
    grid.types = NumbersOf(types, Type::UINT8);
    grid.connectivity = NumbersOf(connectivity, Type::INT64);
    grid.offsets = NumbersOf(offsets, Type::INT64);
    std::vector<Array<std::int64_t>> kept;
    for (const py::handle each : arrays) {
        const auto named = py::reinterpret_borrow<py::tuple>(each);
        kept.push_back(named[1].cast<Array<std::int64_t>>());
        grid.cellArrays.push_back(NumbersOf(kept.back(), Type::INT64));
        grid.cellArrays.back().name = named[0].cast<std::string>();
    }
    std::vector<msf_GridGroup> taken;
    for (const py::handle each : groups) {
        const auto group = py::reinterpret_borrow<py::tuple>(each);
        const auto places = group[2].cast<Array<std::int64_t>>();
        taken.push_back({group[0].cast<std::string>(),
                         group[1].cast<bool>(),
                         {places.data(), places.data() + places.size()}});
    }
    const mdf_Value json = Parsed(pyx_Document(request));
    mdf_Report report;
    mdf_Diagnostics diagnostics(report);
    odiK_Model empty(odb_Odb::DefaultModelName());
    mdf_RecordReader records(empty, diagnostics);
    mdf_MeshFileRequest asked;
    mdf_MeshFileReader(records, diagnostics).ReadRequest(asked, json, fnd_Path());
    pyx_RaiseErrors(report.findings);
    const cow_CountedHld<odiK_Mesh> mesh(new odiK_Mesh());
    mdf_MeshOrigin origin;
    pyx_Released([&] {
        msf_Mesh source;
        msf_Problem problem;
        if (!msf_TakeGrid(grid, taken, asked.options, source, problem)) {
            diagnostics.Add("mesh-file", problem.place, problem.found, problem.expected);
        } else if (mdf_MeshImport(std::move(source), asked, origin, diagnostics).Fill(*mesh)) {
            mesh->FinishElements(diagnostics);
        }
    });
    pyx_RaiseErrors(report.findings);
    pyx_Mesh made(mesh);
    made.notes_ = origin.notes;
    return made;
}

void pyx_Mesh::AddSet(const std::string& name, const std::string& kind, const py::object& members,
                      bool internal) {
    odiK_SetInput input;
    input.name = cow_String(name);
    const omu_EnumRow* row = omu_EnumTableOf(res_SetTypeEnm()).RowOfWord(kind);
    if (row == nullptr)
        pyx_RaiseWrong("wrong-value", "/kind", "found " + fnd_Quoted(kind), "'node', 'element' or 'surface'");
    input.type = static_cast<res_SetTypeEnm>(row->value);
    input.internal = internal;
    std::vector<int> labels;
    std::vector<std::string> faces;
    std::vector<odiK_FacetInput> facets;
    if (input.type == res_SetTypeEnm::FACETS) {
        const auto pair = members.cast<py::tuple>();
        labels = Integers(pair[0], "labels");
        faces = pair[1].cast<std::vector<std::string>>();
        for (std::size_t i = 0; i < labels.size(); ++i) {
            const std::string& face = faces[i];
            const bool isNumber = face.size() == 1 && face[0] >= '0' && face[0] <= '9';
            facets.push_back(
                isNumber ? odiK_FacetInput{labels[i], face[0] - '0', {}}
                         : odiK_FacetInput{labels[i], -1, face.empty() ? std::string_view("?") : face});
        }
    } else {
        labels = Integers(members, "labels");
    }
    input.labels = labels;
    input.facets = facets;
    MeshFindings problems("");
    const fnd_Path top;
    fnd_CheckName(name, fnd_Path(top, "name"), problems.Sink());
    problems.Raise();
    // Found before the mesh is touched: a set that is refused leaves it as it was.
    std::vector<rgnC_SubsetData> tried;
    mesh_->AppendSubsets(input, 0, tried, "", problems.Sink());
    problems.Raise();
    mesh_->AddSet(input, problems.Sink());
    problems.Raise();
    origin_.reset();
}

odiK_Set& pyx_Mesh::Set(const std::string& name) const {
    const int place = mesh_->FindSet(cow_String(name));
    if (place < 0) throw py::key_error(name);
    return *mesh_->Sets()[static_cast<std::size_t>(place)];
}

py::list pyx_Mesh::SetHeads() const {
    py::list heads;
    for (const auto& set : mesh_->Sets()) {
        py::ssize_t members = 0;
        for (const rgnC_SubsetData& subset : set->subsets) members += subset.subset.Length();
        heads.append(py::make_tuple(std::string(set->name.View()),
                                    omu_EnumTableOf(set->type).Row(static_cast<int>(set->type))->name,
                                    set->internal, members));
    }
    return heads;
}

py::object pyx_Mesh::Places(const std::string& name) const {
    const odiK_Set& set = Set(name);
    std::vector<int> places;
    for (const rgnC_SubsetData& subset : set.subsets) {
        const int first =
            set.type == res_SetTypeEnm::NODES
                ? 0
                : mesh_->Classes()[static_cast<std::size_t>(subset.classIndex)].firstElementIndex;
        for (const int entry : subset.subset) places.push_back(first + entry);
    }
    return ArrayOf(places);
}

py::object pyx_Mesh::Labels(const std::string& name) const {
    const odiK_Set& set = Set(name);
    std::vector<int> labels;
    for (const rgnC_SubsetData& subset : set.subsets) {
        for (const int entry : subset.subset) {
            labels.push_back(set.type == res_SetTypeEnm::NODES
                                 ? mesh_->Nodes().Label(entry)
                                 : mesh_->Classes()[static_cast<std::size_t>(subset.classIndex)]
                                       .labels[static_cast<std::size_t>(entry)]);
        }
    }
    return ArrayOf(labels);
}

py::tuple pyx_Mesh::Facets(const std::string& name) const {
    const odiK_Set& set = Set(name);
    py::list faces;
    for (const rgnC_SubsetData& subset : set.subsets) {
        const ddb_ElementShape& shape = mesh_->Classes()[static_cast<std::size_t>(subset.classIndex)].shape;
        for (int i = 0; i < subset.subset.Length(); ++i) faces.append(FaceName(shape, subset.facetIds[i]));
    }
    return py::make_tuple(Labels(name), faces);
}

py::dict pyx_Mesh::Quality() const {
    mq_Quality quality;
    pyx_Released([&] { quality = dck_QualityOf(*mesh_); });
    fnd_List told;
    dck_TellQuality(quality, "", told);
    py::dict all;
    all["inverted"] = CountOf(quality.inverted);
    all["far_mid_sides"] = CountOf(quality.farMidSides);
    all["repeated_nodes"] = CountOf(quality.repeatedNodes);
    all["repeated_elements"] = CountOf(quality.repeatedElements);
    all["unused_nodes"] = CountOf(quality.unusedNodes);
    all["shared_faces"] = CountOf(quality.sharedFaces);
    all["findings"] = pyx_TuplesOf(told.findings);
    return all;
}

void pyx_Mesh::Add(py::module_& module) {
    py::class_<pyx_Mesh>(module, "Mesh")
        .def_static("of_arrays", &OfArrays)
        .def_static("of_file", &OfFile)
        .def_static("of_grid", &OfGrid)
        .def("add_set", &pyx_Mesh::AddSet)
        .def("set_heads", &pyx_Mesh::SetHeads)
        .def("labels", &pyx_Mesh::Labels)
        .def("places", &pyx_Mesh::Places)
        .def("facets", &pyx_Mesh::Facets)
        .def("quality", &pyx_Mesh::Quality)
        .def_property_readonly("notes", [](const pyx_Mesh& mesh) { return mesh.notes_; })
        .def_property_readonly("path",
                               [](const pyx_Mesh& mesh) -> py::object {
                                   if (!mesh.origin_) return py::none();
                                   return py::str(mesh.origin_->path);
                               })
        .def_property_readonly("num_points",
                               [](const pyx_Mesh& mesh) { return mesh.mesh_->Nodes().NumNodes(); })
        .def_property_readonly("num_cells", [](const pyx_Mesh& mesh) { return mesh.mesh_->NumElements(); })
        .def_property_readonly("points",
                               [](const py::object& self) {
                                   const odiK_NodeData& nodes = self.cast<const pyx_Mesh&>().mesh_->Nodes();
                                   return View(self, nodes.coordinates, {nodes.NumNodes(), 3});
                               })
        .def_property_readonly("point_labels",
                               [](const pyx_Mesh& mesh) {
                                   std::vector<int> labels;
                                   for (const int label : mesh.mesh_->Nodes().labels) labels.push_back(label);
                                   return ArrayOf(labels);
                               })
        .def_property_readonly(
            "same_as",
            [](const pyx_Mesh& mesh) { return reinterpret_cast<std::uintptr_t>(mesh.mesh_.Referent()); })
        .def_property_readonly("blocks", [](const py::object& self) {
            py::list blocks;
            for (const odiK_ElementClass& elements : self.cast<const pyx_Mesh&>().mesh_->Classes()) {
                const py::ssize_t width = elements.nodesPerElement;
                blocks.append(
                    py::make_tuple(std::string(elements.type.View()),
                                   View(self, elements.connectivity, {elements.NumElements(), width}),
                                   View(self, elements.labels, {elements.NumElements()}),
                                   pyx_Values().Record(elements.controls)));
            }
            return blocks;
        });
}
