#include "model_file/mdf_ModelFile.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <sstream>
#include <string>

namespace {

std::string Written(const odb_Odb& odb) {
    std::ostringstream out;
    RC_ASSERT(mdf_WriteModelFile(odb, out));
    return out.str();
}

int Upto(int most) {
    return *rc::gen::inRange(0, most + 1);
}

double AnyNumber() {
    return *rc::gen::element(0.0, -0.0, 1.0, 0.1, -2.5, 1e-30, 3.0e38, 12345.678);
}

/// A new name, some with dots, blanks and capitals.
cow_String AnyName(int number) {
    const std::string stem = *rc::gen::element<std::string>("N", "n-", "a.b.", "x y ", "\xC3\xA9", "*", "_");
    return cow_String(std::string_view(stem + std::to_string(number)));
}

std::vector<int> Some(const std::vector<int>& labels) {
    std::vector<int> some;
    if (labels.empty()) return some;
    const int count = Upto(4);
    for (int i = 0; i < count; ++i) some.push_back(*rc::gen::elementOf(labels));
    return some;
}

std::vector<int> NewLabels(int count, int& last) {
    std::vector<int> labels;
    for (int i = 0; i < count; ++i) labels.push_back(last += 1 + Upto(3));
    if (count > 1 && Upto(1) == 1) std::swap(labels.front(), labels.back());
    return labels;
}

struct Labels {
    std::vector<int> nodes;
    std::vector<int> elements;
};

std::vector<odiK_FacetInput> SomeFacets(const Labels& labels) {
    std::vector<odiK_FacetInput> facets;
    // 0 and 1 are faces of elements of every shape.
    for (const int label : Some(labels.elements)) facets.push_back({label, Upto(1), {}});
    return facets;
}

Labels FillMesh(odiK_Mesh& mesh) {
    Labels labels;
    int last = 0;
    labels.nodes = NewLabels(Upto(6), last);
    std::vector<float> coordinates;
    for (std::size_t i = 0; i < 3 * labels.nodes.size(); ++i)
        coordinates.push_back(static_cast<float>(AnyNumber()));
    mesh.SetNodes(labels.nodes, coordinates);
    last = 0;
    const int classes = labels.nodes.empty() ? 0 : Upto(3);
    for (int c = 0; c < classes; ++c) {
        const std::vector<int> added = NewLabels(Upto(3), last);
        const int width = 1 + Upto(3);
        std::vector<int> nodes;
        for (std::size_t i = 0; i < added.size() * static_cast<std::size_t>(width); ++i)
            nodes.push_back(*rc::gen::elementOf(labels.nodes));
        bme_ElemCtrlParams controls;
        if (Upto(2) == 0) controls.lengthRatio = AnyNumber();
        const auto type = *rc::gen::element<std::string>("C3D8", "S4", "T3D2", "MASS", "odd type", "CPS4");
        mesh.AddElements(cow_String(std::string_view(type)), added, width, nodes, controls);
        labels.elements.insert(labels.elements.end(), added.begin(), added.end());
    }
    const int sets = Upto(4);
    for (int s = 0; s < sets; ++s) {
        const cow_String name = AnyName(s);
        const bool internal = Upto(1) == 1;
        switch (Upto(2)) {
        case 0: mesh.AddNodeSet(name, Some(labels.nodes), internal); break;
        case 1: mesh.AddElementSet(name, Some(labels.elements), internal); break;
        default: mesh.AddSurface(name, SomeFacets(labels), internal); break;
        }
    }
    return labels;
}

void AddDatums(odiK_Model& model) {
    const int count = Upto(3);
    for (int i = 0; i < count; ++i) {
        odiK_Datum datum;
        datum.name = AnyName(i);
        datum.type = static_cast<dtu_DatumType>(1 + Upto(3));
        datum.csysType = static_cast<dtu_DatumCsysType>(1 + Upto(2));
        datum.origin = gsl_Point(AnyNumber(), AnyNumber(), AnyNumber());
        const auto part = [] { return *rc::gen::element(-1.0, 0.3, 0.7, 5.0); };
        datum.xAxis = gsl_Vector(part(), part(), part());
        datum.yAxis = gsl_Vector(part(), -part(), 17.0);
        if (datum.type == dtu_DatumType::CSYS && Upto(1) == 1) datum.zAxis = gsl_Vector();
        if (datum.type == dtu_DatumType::PLANE) datum.zAxis = gsl_Vector(part(), part(), 0.0);
        model.AddDatum(datum);
    }
}

/// Parts, instances with and without own meshes, an assembly mesh between instances, and sets of the
/// assembly.
void FillModel(odiK_Model& model) {
    AddDatums(model);
    std::vector<cow_String> names;
    std::vector<Labels> partLabels;
    const int parts = Upto(3);
    for (int p = 0; p < parts; ++p) {
        names.push_back(AnyName(p));
        odiK_Part& part = model.AddPart(names.back());
        partLabels.emplace_back();
        if (Upto(4) == 0) continue;
        part.mesh.Reset(new odiK_Mesh());
        partLabels.back() = FillMesh(*part.mesh);
    }
    std::vector<std::pair<cow_String, Labels>> owners;
    const int instances = parts == 0 ? 0 : Upto(3);
    for (int i = 0; i < instances; ++i) {
        const auto part = static_cast<std::size_t>(Upto(parts - 1));
        const bool isInstance = Upto(3) != 0;
        const cow_String name = AnyName(i);
        odiK_Instance& instance =
            isInstance ? model.AddInstance(name, names[part]) : model.AddOtherEntry(name, names[part]);
        for (float& value : instance.translation) value = static_cast<float>(AnyNumber());
        instance.rotation[Upto(2)] = static_cast<float>(AnyNumber());
        Labels labels = partLabels[part];
        if (Upto(3) == 0) {
            instance.ownMesh.Reset(new odiK_Mesh());
            labels = FillMesh(*instance.ownMesh);
        }
        owners.emplace_back(name, labels);
    }
    model.SealInstances();
    for (const auto& [name, labels] : owners) {
        if (labels.nodes.empty() || !model.FindInstance(name)->isPartInstance) continue;
        odiK_Mesh& mesh = model.AssemblyMesh();
        const int first = mesh.AddForeignNode(name, labels.nodes.front());
        const int second = mesh.AddForeignNode(name, labels.nodes.back());
        fnd_Raise problems;
        mesh.AddElementsByIndex("CONN3D2", {mesh.NumElements() + 1}, 2, {first, second}, {}, problems);
    }
    const int sets = owners.empty() ? 0 : Upto(4);
    for (int s = 0; s < sets; ++s) {
        const auto type = static_cast<res_SetTypeEnm>(Upto(2));
        std::vector<std::vector<int>> labels(2);
        std::vector<std::vector<odiK_FacetInput>> facets(2);
        std::vector<odiK_MemberInput> members;
        for (std::size_t m = 0; m < 2; ++m) {
            const auto& [name, known] =
                owners[static_cast<std::size_t>(Upto(static_cast<int>(owners.size()) - 1))];
            labels[m] = Some(type == res_SetTypeEnm::NODES ? known.nodes : known.elements);
            facets[m] = SomeFacets(known);
            members.push_back({name, labels[m], facets[m]});
        }
        model.AddAssemblySet(AnyName(s), type, members, Upto(1) == 1);
    }
}

} // namespace

RC_GTEST_PROP(mdf_ModelFile, AnyModel_WrittenReadAndWrittenAgain_StaysTheSame, ()) {
    odb_Odb odb;
    odiK_Model& model = odb.AddModel(odb_Odb::DefaultModelName());
    FillModel(model);
    model.Complete();
    const std::string first = Written(odb);
    mdf_Report report;
    const auto copy = mdf_ReadModelText(first, "m.json", report);
    std::string errors;
    for (const fnd_Finding& finding : report.findings) {
        if (finding.IsError()) errors += report.Line(finding) + "\n";
    }
    RC_LOG() << first;
    RC_ASSERT(errors.empty());
    RC_ASSERT(Written(*copy) == first);
    RC_CLASSIFY(!model.AssemblySets().empty(), "assembly sets");
    RC_CLASSIFY(!model.ConstAssemblyMesh().IsNull(), "assembly mesh");
}
