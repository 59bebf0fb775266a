#include "store_interface/model/odiK_Mesh.h"

#include "store/StoreTesting.h"

#include <gtest/gtest.h>

#include <limits>

namespace {

/// Nodes 1 to 8 on a line.
odiK_Mesh MeshWithNodes() {
    odiK_Mesh mesh;
    std::vector<float> coordinates;
    for (int i = 0; i < 8; ++i) coordinates.insert(coordinates.end(), {static_cast<float>(i), 0.0F, 0.0F});
    mesh.SetNodes({1, 2, 3, 4, 5, 6, 7, 8}, coordinates);
    return mesh;
}

/// Trusses 1 to 3, a brick 10, a shell 20 and a mass 30.
odiK_Mesh MeshWithElements() {
    odiK_Mesh mesh = MeshWithNodes();
    mesh.AddElements("T3D2", {1, 2, 3}, 2, {1, 2, 2, 3, 3, 4});
    mesh.AddElements("C3D8", {10}, 8, {1, 2, 3, 4, 5, 6, 7, 8});
    mesh.AddElements("S4", {20}, 4, {1, 2, 3, 4});
    mesh.AddElements("MASS", {30}, 1, {8});
    return mesh;
}

struct Subset {
    int classIndex;
    Ints entries;
    Ints facets;
    friend bool operator==(const Subset&, const Subset&) = default;
};

std::vector<Subset> SubsetsOf(const odiK_Set& set) {
    std::vector<Subset> subsets;
    for (const rgnC_SubsetData& subset : set.subsets) {
        subsets.push_back({subset.classIndex, Items(subset.subset), Items(subset.facetIds)});
    }
    return subsets;
}

TEST(Mesh, Nodes_KeepOrderLabelsAndSinglePrecision) {
    odiK_Mesh mesh;
    mesh.SetNodes({7, 3}, {0.1F, 1.0F, 2.0F, 3.0F, 4.0F, 5.0F});
    EXPECT_EQ(mesh.Nodes().NumNodes(), 2);
    EXPECT_EQ(mesh.Nodes().Label(0), 7);
    EXPECT_EQ(mesh.Nodes().Label(1), 3);
    EXPECT_EQ(mesh.FindNode(3), 1);
    EXPECT_EQ(mesh.FindNode(4), -1);
    EXPECT_EQ(mesh.Nodes().coordinates, (std::vector<float>{0.1F, 1.0F, 2.0F, 3.0F, 4.0F, 5.0F}));
    EXPECT_EQ(Raised([&] { mesh.Nodes().Label(2); }), "cow_List: index 2 is out of range, expected 0 to 1");
    EXPECT_EQ(Raised([&] { mesh.Nodes().Label(-1); }), "cow_List: index -1 is out of range, expected 0 to 1");
}

TEST(Mesh, BadNodes_AreNamedAllTogether) {
    odiK_Mesh mesh;
    CollectedProblems problems;
    mesh.SetNodes({1, 0, 2, -4}, std::vector<float>(12), problems);
    EXPECT_EQ(problems.all, (Strings{"/labels/1: found 0, expected a positive label",
                                     "/labels/3: found -4, expected a positive label"}));
    problems.all.clear();
    mesh.SetNodes({1, 2, 1, 2}, std::vector<float>(12), problems);
    EXPECT_EQ(problems.all,
              (Strings{"/labels/2: node label 1 stands twice, expected labels that are unique in the mesh",
                       "/labels/3: node label 2 stands twice, expected labels that are unique in the mesh"}));
    problems.all.clear();
    mesh.SetNodes({1, 2, 3}, std::vector<float>(6), problems);
    EXPECT_EQ(problems.all, Strings{"/coordinates: found 2 points for 3 labels, expected one for each"});
}

TEST(Mesh, BadNodesOfAProgram_RaiseAtTheFirst) {
    odiK_Mesh mesh;
    EXPECT_EQ(Raised([&] {
                  mesh.SetNodes({0, -1}, std::vector<float>(6));
              }),
              "/labels/0: found 0, expected a positive label");
    EXPECT_EQ(Raised([&] { mesh.SetNodes({1}, {}); }),
              "/coordinates: found 0 points for 1 label, expected one for each");
}

TEST(Mesh, Elements_HoldNodeIndicesByClass) {
    const odiK_Mesh mesh = MeshWithElements();
    ASSERT_EQ(mesh.Classes().size(), 4U);
    EXPECT_EQ(mesh.NumElements(), 6);
    const odiK_ElementClass& trusses = mesh.Classes()[0];
    EXPECT_EQ(trusses.type, "T3D2");
    EXPECT_EQ(trusses.nodesPerElement, 2);
    EXPECT_EQ(trusses.labels, (Ints{1, 2, 3}));
    EXPECT_EQ(trusses.connectivity, (Ints{0, 1, 1, 2, 2, 3}));
    EXPECT_EQ(trusses.shape.topologicalDimension, 1);
    EXPECT_EQ(trusses.firstElementIndex, 0);
    EXPECT_EQ(mesh.Classes()[1].firstElementIndex, 3);
    EXPECT_EQ(mesh.Classes()[3].firstElementIndex, 5);
    int classIndex = -1;
    int place = -1;
    EXPECT_TRUE(mesh.FindElement(3, classIndex, place));
    EXPECT_EQ(classIndex, 0);
    EXPECT_EQ(place, 2);
    EXPECT_TRUE(mesh.FindElement(20, classIndex, place));
    EXPECT_EQ(classIndex, 2);
    EXPECT_EQ(place, 0);
    EXPECT_FALSE(mesh.FindElement(4, classIndex, place));
}

TEST(Mesh, ElementsAddedAfterALookUp_AreFoundToo) {
    odiK_Mesh mesh = MeshWithNodes();
    mesh.AddElements("T3D2", {1}, 2, {1, 2});
    int classIndex = -1;
    int place = -1;
    EXPECT_FALSE(mesh.FindElement(2, classIndex, place));
    mesh.AddElements("T3D2", {}, 2, {});
    mesh.AddElements("T3D2", {2}, 2, {1, 2});
    EXPECT_TRUE(mesh.FindElement(2, classIndex, place));
    EXPECT_EQ(classIndex, 2);
    EXPECT_EQ(place, 0);
}

TEST(Mesh, BadElements_AreNamedAndNotAdded) {
    odiK_Mesh mesh = MeshWithNodes();
    CollectedProblems problems;
    mesh.AddElements("T3D2", {1, 2}, 2, {1, 9, 99, 2}, {}, problems);
    EXPECT_EQ(problems.all,
              (Strings{"/connectivity/0/1: found node 9, expected the label of a node of this mesh",
                       "/connectivity/1/0: found node 99, expected the label of a node of this mesh"}));
    problems.all.clear();
    mesh.AddElements("T3D2", {0, -1}, 2, {1, 2, 2, 3}, {}, problems);
    EXPECT_EQ(problems.all, (Strings{"/labels/0: found 0, expected a positive label",
                                     "/labels/1: found -1, expected a positive label"}));
    problems.all.clear();
    mesh.AddElements("T3D2", {1, 2}, 2, {1, 2, 3}, {}, problems);
    EXPECT_EQ(problems.all, Strings{"/connectivity: found 3 nodes, expected 2 for each of 2 labels"});
    EXPECT_TRUE(mesh.Classes().empty());
    EXPECT_EQ(mesh.NumElements(), 0);
}

TEST(Mesh, NodesForElementsWithoutAny_AreAnErrorOfTheirCount) {
    odiK_Mesh mesh = MeshWithNodes();
    EXPECT_EQ(Raised([&] {
                  mesh.AddElements("T3D2", {1}, 0, {99, 98});
              }),
              "/connectivity: found 2 nodes, expected 0 for each of 1 label");
    EXPECT_TRUE(mesh.Classes().empty());
}

TEST(Mesh, ElementLabelThatStandsTwice_IsNamedWithItsClass) {
    odiK_Mesh mesh = MeshWithNodes();
    mesh.AddElements("T3D2", {1, 2}, 2, {1, 2, 2, 3});
    mesh.AddElements("B31", {3, 2, 3}, 2, {1, 2, 2, 3, 3, 4});
    CollectedProblems problems;
    mesh.FinishElements(problems);
    EXPECT_EQ(problems.all,
              (Strings{"/elements/1/labels/1: element label 2 stands twice, expected labels that "
                       "are unique in the mesh",
                       "/elements/1/labels/2: element label 3 stands twice, expected labels that "
                       "are unique in the mesh"}));
}

TEST(Mesh, Controls_StayWithTheirClass) {
    odiK_Mesh mesh = MeshWithNodes();
    bme_ElemCtrlParams controls;
    controls.lengthRatio = 0.3;
    mesh.AddElements("C3D8", {1}, 8, {1, 2, 3, 4, 5, 6, 7, 8}, controls);
    mesh.AddElements("T3D2", {2}, 2, {1, 2});
    EXPECT_EQ(mesh.Classes()[0].controls.lengthRatio, 0.3);
    EXPECT_EQ(mesh.Classes()[1].controls.lengthRatio, 0.1);
}

TEST(Mesh, ForeignNodes_ComeBehindItsOwn) {
    odiK_Mesh mesh;
    mesh.SetNodes({1, 2}, std::vector<float>(6));
    EXPECT_EQ(mesh.AddForeignNode("I-1", 17), 2);
    EXPECT_EQ(mesh.AddForeignNode("I-2", 17), 3);
    CollectedProblems problems;
    mesh.AddElementsByIndex("CONN3D2", {1, 2}, 2, {0, 2, 2, 3}, {}, problems);
    EXPECT_EQ(problems.all, Strings());
    EXPECT_EQ(mesh.Nodes().NumNodes(), 2);
    EXPECT_EQ(mesh.Nodes().Label(2), 17);
    EXPECT_EQ(mesh.Nodes().foreign[1].instanceName, "I-2");
    EXPECT_EQ(mesh.Classes()[0].connectivity, (Ints{0, 2, 2, 3}));
    EXPECT_EQ(Raised([&] { mesh.Nodes().Label(4); }), "cow_List: index 4 is out of range, expected 0 to 3");
}

TEST(Mesh, NodeSet_IsOneSubsetInTheOrderGiven) {
    odiK_Mesh mesh = MeshWithElements();
    mesh.AddNodeSet("N", {8, 1, 3}, true);
    ASSERT_EQ(mesh.Sets().size(), 1U);
    const odiK_Set& set = *mesh.Sets()[0];
    EXPECT_EQ(set.name, "N");
    EXPECT_EQ(set.type, res_SetTypeEnm::NODES);
    EXPECT_TRUE(set.internal);
    EXPECT_EQ(SubsetsOf(set), (std::vector<Subset>{{-1, {7, 0, 2}, {}}}));
    EXPECT_EQ(mesh.FindSet("N"), 0);
    EXPECT_EQ(mesh.FindSet("n"), -1);
}

TEST(Mesh, ElementSet_HasASubsetForEachRunOfOneClass) {
    odiK_Mesh mesh = MeshWithElements();
    mesh.AddElementSet("E", {3, 1, 10, 2, 20, 30});
    EXPECT_EQ(SubsetsOf(*mesh.Sets()[0]),
              (std::vector<Subset>{{0, {2, 0}, {}}, {1, {0}, {}}, {0, {1}, {}}, {2, {0}, {}}, {3, {0}, {}}}));
    EXPECT_EQ(mesh.Sets()[0]->type, res_SetTypeEnm::ELEMENTS);
    EXPECT_FALSE(mesh.Sets()[0]->internal);
}

TEST(Mesh, ElementSetOfRuns_IsThatOfTheirLabels) {
    odiK_Mesh mesh = MeshWithElements();
    fnd_Raise problems;
    const odiK_ElementRun runs[] = {{0, 0, 1}, {0, 1, 3}, {1, 0, 0}, {2, 0, 1}, {0, 2, 3}};
    mesh.AddSet({"RUNS", res_SetTypeEnm::ELEMENTS, false, {}, {}, runs}, problems);
    EXPECT_EQ(SubsetsOf(*mesh.Sets()[0]),
              (std::vector<Subset>{{0, {0, 1, 2}, {}}, {2, {0}, {}}, {0, {2}, {}}}));
    mesh.AddElementSet("LABELS", {1, 2, 3, 20, 3});
    EXPECT_EQ(SubsetsOf(*mesh.Sets()[1]), SubsetsOf(*mesh.Sets()[0]));
}

TEST(Mesh, RunBeyondItsClass_Raises) {
    odiK_Mesh mesh = MeshWithElements();
    const auto raised = [&mesh](odiK_ElementRun run) {
        return Raised([&] {
            fnd_Raise problems;
            mesh.AddSet({"RUNS", res_SetTypeEnm::ELEMENTS, false, {}, {}, {&run, 1}}, problems);
        });
    };
    EXPECT_EQ(raised({0, 0, 4}), "odiK_Mesh: end of a run 4 is out of range, expected 0 to 3");
    EXPECT_EQ(raised({0, -1, 2}), "odiK_Mesh: end of a run -1 is out of range, expected 0 to 3");
    EXPECT_EQ(raised({0, 2, 1}), "odiK_Mesh: end of a run 1 is out of range, expected 0 to 3");
    EXPECT_EQ(raised({4, 0, 1}), "odiK_Mesh: class 4 is out of range, expected 0 to 3");
    EXPECT_TRUE(mesh.Sets().empty());
}

TEST(Mesh, Surface_TakesFaceNamesAndIds) {
    odiK_Mesh mesh = MeshWithElements();
    mesh.AddSurface("S", {{10, -1, "S6"},
                          {10, 0, ""},
                          {20, -1, "SNEG"},
                          {20, 6, ""},
                          {1, -1, "END2"},
                          {2, -1, "END1"},
                          {30, 3, ""}});
    EXPECT_EQ(
        SubsetsOf(*mesh.Sets()[0]),
        (std::vector<Subset>{{1, {0, 0}, {5, 0}}, {2, {0, 0}, {1, 6}}, {0, {0, 1}, {1, 0}}, {3, {0}, {3}}}));
    EXPECT_EQ(mesh.Sets()[0]->type, res_SetTypeEnm::FACETS);
}

TEST(Mesh, EmptySet_HasNoSubset) {
    odiK_Mesh mesh = MeshWithElements();
    mesh.AddNodeSet("N", {});
    mesh.AddElementSet("E", {});
    EXPECT_TRUE(mesh.Sets()[0]->subsets.empty());
    EXPECT_TRUE(mesh.Sets()[1]->subsets.empty());
}

TEST(Mesh, BadMembersOfASet_AreNamedAllTogether) {
    odiK_Mesh mesh = MeshWithElements();
    CollectedProblems problems;
    const int labels[] = {1, 99, 2, 0};
    mesh.AddSet({"N", res_SetTypeEnm::NODES, false, labels, {}}, problems);
    mesh.AddSet({"E", res_SetTypeEnm::ELEMENTS, false, labels, {}}, problems);
    EXPECT_EQ(problems.all, (Strings{"/labels/1: found 99, expected the label of a node of the mesh",
                                     "/labels/3: found 0, expected the label of a node of the mesh",
                                     "/labels/1: found 99, expected the label of an element of the mesh",
                                     "/labels/3: found 0, expected the label of an element of the mesh"}));
    problems.all.clear();
    const odiK_FacetInput facets[] = {{99, 0, ""},   {10, -1, "SPOS"}, {10, 6, ""},  {20, 2, ""},
                                      {1, -1, "S1"}, {30, -1, "S1"},   {10, -1, ""}, {10, -1, "S\n*Step"}};
    mesh.AddSet({"S", res_SetTypeEnm::FACETS, false, {}, facets}, problems);
    EXPECT_EQ(problems.all,
              (Strings{"/facets/0/0: found 99, expected the label of an element of the mesh",
                       "/facets/1/1: found 'SPOS', expected a face of an element of type C3D8",
                       "/facets/2/1: found 6, expected a face of an element of type C3D8",
                       "/facets/3/1: found 2, expected a face of an element of type S4",
                       "/facets/4/1: found 'S1', expected a face of an element of type T3D2",
                       "/facets/5/1: found 'S1', expected a face of an element of type MASS",
                       "/facets/6/1: found -1, expected a face of an element of type C3D8",
                       "/facets/7/1: found 'S\\x0A*Step', expected a face of an element of type C3D8"}));
}

TEST(Mesh, SecondSetOfAName_IsRefused) {
    odiK_Mesh mesh = MeshWithElements();
    mesh.AddNodeSet("A", {1});
    EXPECT_EQ(Raised([&] { mesh.AddElementSet("A", {1}); }),
              "/name: found a second set named 'A', expected names that are unique in the mesh");
    mesh.AddElementSet("a", {1});
    EXPECT_EQ(mesh.Sets().size(), 2U);
}

TEST(Findings, OfAProgramThatFillsAStore_RaiseErrorsAndPassWarnings) {
    fnd_Raise problems;
    EXPECT_EQ(Raised([&] { problems.Add("empty-set", "/a", "text"); }), "nothing raised");
    EXPECT_EQ(
        Raised([&] { problems.Add("wrong-label", "/a", "found 0", "a positive label", "count from 1"); }),
        "/a: found 0, expected a positive label; count from 1");
    EXPECT_EQ(Raised([&] { problems.Add("wrong-label", "", "text"); }), "text");
}

} // namespace
