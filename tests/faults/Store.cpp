#include "faults/Store.h"

#include <numeric>
#include <string>
#include <vector>

void FillStore(odb_Odb& odb, int nodes) {
    odiK_Model& model = odb.AddModel(odb_Odb::DefaultModelName());
    model.topLevelSolverInput = "*Heading\n";
    odiK_Part& part = model.AddPart("P");
    part.solverInput = "** part\n";
    part.mesh = cow_CountedHld<odiK_Mesh>(new odiK_Mesh());

    std::vector<int> labels(static_cast<std::size_t>(nodes));
    std::iota(labels.begin(), labels.end(), 1);
    std::vector<float> coordinates(3 * labels.size(), 0.25F);
    std::vector<int> elementLabels(labels.begin(), labels.end() - 1);
    std::vector<int> ends;
    for (const int label : elementLabels) ends.insert(ends.end(), {label, label + 1});
    part.mesh->SetNodes(labels, coordinates);
    part.mesh->AddElements("T3D2", elementLabels, 2, ends);
    part.mesh->AddNodeSet("ODD", {1, 3, 4});
    part.mesh->AddElementSet("ALL", elementLabels);
    part.mesh->AddSurface("ENDS", {{1, -1, "END1"}, {2, -1, "END2"}});

    model.AddInstance("A", "P");
    model.AddInstance("B", "P").translation[0] = 2.0F;
    const std::vector<int> tip = {2};
    const std::vector<odiK_MemberInput> members = {{"A", tip, {}}, {"B", tip, {}}};
    model.AddAssemblySet("TIPS", res_SetTypeEnm::NODES, members);
    kmaC_Material material;
    kmaC_Plastic plastic;
    plastic.rateDependentTable = true;
    plastic.table = kmaC_MaterialTable(2, 3);
    material.plastic = plastic;
    kmaC_Hyperelastic hyperelastic;
    hyperelastic.table = kmaC_MaterialTable(1, 9);
    material.hyperelastic = hyperelastic;
    model.materials.Insert("M", material);
    model.steps.Append("Initial", kprC_InitialStep());
}
