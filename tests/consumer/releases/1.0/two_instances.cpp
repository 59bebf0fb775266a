// Builds a model of two stacked blocks in memory, without a model file, and writes its deck.
//
//   two_instances [JOB]      writes JOB.inp; the job is "two_instances" unless given

#include "deck/oif_Writer.h"
#include "foundation/nex_Exception.h"
#include "foundation/qio_Device.h"
#include "store_interface/model/odb_Odb.h"

#include <cstdio>
#include <cstring>
#include <vector>

namespace {

// A part holds a mesh that any number of instances can show. Everything in a mesh is told by the user's
// labels: nodes first, then elements, then the sets that name them.
void AddBlock(odiK_Model& model) {
    odiK_Part& part = model.AddPart("BLOCK");
    part.mesh = cow_CountedHld<odiK_Mesh>(new odiK_Mesh());
    odiK_Mesh& mesh = *part.mesh;

    const std::vector<float> lowerFace = {0, 0, 0, 20, 0, 0, 20, 20, 0, 0, 20, 0};
    std::vector<float> coordinates = lowerFace;
    for (std::size_t i = 0; i < lowerFace.size(); ++i) {
        coordinates.push_back(i % 3 == 2 ? 10.5F : lowerFace[i]);
    }
    mesh.SetNodes({1, 2, 3, 4, 5, 6, 7, 8}, coordinates);
    mesh.AddElements("C3D8", {1}, 8, {1, 2, 3, 4, 5, 6, 7, 8});
    mesh.AddNodeSet("BASE", {1, 2, 3, 4});
    mesh.AddElementSet("ALL", {1});
    // A facet is an element and the name of one of its faces; S2 of a hexahedron is its upper face.
    mesh.AddSurface("TOP", {{1, -1, "S2"}});
}

// Instances place the part in the assembly: a rotation vector through the origin, then a translation.
void AddInstances(odiK_Model& model) {
    model.AddInstance("lower", "BLOCK");
    odiK_Instance& upper = model.AddInstance("upper", "BLOCK");
    upper.translation[2] = 10.5F;
    upper.rotation[2] = 1.0F; // radians about the z axis
}

// Sets of the assembly may have members in several instances.
void AddAssemblySets(odiK_Model& model) {
    const std::vector<int> lowerTips = {5, 6};
    const std::vector<int> upperTips = {7, 8};
    const std::vector<odiK_MemberInput> tips = {{"lower", lowerTips, {}}, {"upper", upperTips, {}}};
    model.AddAssemblySet("TIPS", res_SetTypeEnm::NODES, tips);

    const std::vector<odiK_FacetInput> lowerFace = {{1, -1, "S2"}};
    const std::vector<odiK_FacetInput> upperFace = {{1, -1, "S1"}};
    const std::vector<odiK_MemberInput> joint = {{"lower", {}, lowerFace}, {"upper", {}, upperFace}};
    model.AddAssemblySet("JOINT", res_SetTypeEnm::FACETS, joint);
}

int WriteDeck(const char* job) {
    odb_Odb odb;
    // Decks are written from the model of this name, whatever else a store holds.
    odiK_Model& model = odb.AddModel(odb_Odb::DefaultModelName());
    model.topLevelSolverInput = "*Heading\nTwo stacked blocks\n";
    // Parts come first, then instances, then what refers to them.
    AddBlock(model);
    AddInstances(model);
    AddAssemblySets(model);
    model.steps.Append("Initial", kprC_InitialStep());

    oif_Writer(odb).WriteInputFile(job);

    // The writer is silent about the file system; the device's report tells whether the whole deck arrived.
    const qio_Report& report = qio_LastReport();
    if (!report.opened || report.error != 0) {
        std::fprintf(stderr, "%s.inp: %s\n", job, std::strerror(report.error));
        return 3;
    }
    std::printf("%s.inp: %lld bytes\n", job, report.bytes);
    return 0;
}

} // namespace

int main(int argc, char** argv) {
    try {
        return WriteDeck(argc > 1 ? argv[1] : "two_instances");
    } catch (const QRXBasException& failure) {
        // Wrong data in the store, or a model that can't be told in a deck.
        std::fprintf(stderr, "%s\n%s\n", failure.what(), failure.Context());
        return 4;
    }
}
