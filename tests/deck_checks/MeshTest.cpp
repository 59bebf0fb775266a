#include "deck_checks/dck_Check.h"
#include "support/DeckTest.h"

namespace {

/// "code place: text" of what is said of the meshes of a store.
std::vector<std::string> Found(const odb_Odb& store) {
    fnd_List list;
    dck_CheckMeshes(store, odb_Odb::DefaultModelName(), list);
    std::vector<std::string> found;
    for (const fnd_Finding& finding : list.findings)
        found.push_back(std::string(finding.code->name) + " " + finding.place + ": " + finding.Text());
    return found;
}

odiK_Part& Cube(TestStore& store, const cow_String& type, const std::vector<int>& nodes) {
    odiK_Part& part = store.model.AddPart("CUBE");
    part.mesh.Reset(new odiK_Mesh());
    part.mesh->SetNodes({1, 2, 3, 4, 5, 6, 7, 8},
                        {0, 0, 0, 1, 0, 0, 1, 1, 0, 0, 1, 0, 0, 0, 1, 1, 0, 1, 1, 1, 1, 0, 1, 1});
    part.mesh->AddElements(type, {9}, static_cast<int>(nodes.size()), nodes);
    return part;
}

} // namespace

TEST(MeshCheck, MeshThatIsRight_IsPassedOver) {
    TestStore store;
    Cube(store, "C3D8R", {1, 2, 3, 4, 5, 6, 7, 8});
    EXPECT_TRUE(Found(store.odb).empty());
}

TEST(MeshCheck, ElementInsideOut_IsAWarningWithItsLabel) {
    TestStore store;
    Cube(store, "C3D8", {5, 6, 7, 8, 1, 2, 3, 4});
    EXPECT_EQ(Found(store.odb),
              (std::vector<std::string>{"inverted-elements /models/Default Model/parts/CUBE/mesh: 1 element "
                                        "of negative or zero size: 9"}));
}

TEST(MeshCheck, CohesiveElementsAndConnectors_MayHaveNoSize) {
    TestStore store;
    Cube(store, "COH3D8", {1, 2, 3, 4, 1, 2, 3, 4});
    EXPECT_EQ(Found(store.odb),
              (std::vector<std::string>{
                  "unused-nodes /models/Default Model/parts/CUBE/mesh: 4 nodes of no element: 5, 6, 7, 8"}));
}

TEST(MeshCheck, PlaneElementsTurnedRound_AreInverted) {
    TestStore store;
    Cube(store, "CPS4", {1, 4, 3, 2});
    const std::vector<std::string> found = Found(store.odb);
    ASSERT_EQ(found.size(), 2u);
    EXPECT_EQ(
        found[0],
        "inverted-elements /models/Default Model/parts/CUBE/mesh: 1 element of negative or zero size: 9");
}

TEST(MeshCheck, MeshOfAnInstance_IsLookedAtInItsPlace) {
    TestStore store;
    Cube(store, "C3D8", {1, 2, 3, 4, 5, 6, 7, 8});
    odiK_Instance instance;
    instance.name = "CUBE-1";
    instance.partName = "CUBE";
    instance.ownMesh.Reset(new odiK_Mesh());
    instance.ownMesh->SetNodes({1}, {0, 0, 0});
    store.model.AddEntry(std::move(instance));
    EXPECT_EQ(
        Found(store.odb),
        (std::vector<std::string>{
            "unused-nodes /models/Default Model/assembly/instances/CUBE-1/mesh: 1 node of no element: 1"}));
}
