#include "mesh/oif_Element.h"
#include "mesh/oif_Node.h"
#include "support/DeckTest.h"

#include <numeric>

namespace {

/// The text of an instance's elements, on nodes 1 to 30.
std::string ElementsOf(const std::function<void(odiK_Mesh&)>& fill, int nodes = 30) {
    TestStore store;
    std::vector<int> labels(static_cast<std::size_t>(nodes));
    std::iota(labels.begin(), labels.end(), 1);
    odiK_Part& part = store.AddPart("P", labels);
    fill(*part.mesh);
    store.model.AddInstance("I", "P");
    return Written(oif_ElementFromMesh(store.Instance("I"), store.Info()));
}

std::vector<int> Range(int from, int to) {
    std::vector<int> labels(static_cast<std::size_t>(to - from + 1));
    std::iota(labels.begin(), labels.end(), from);
    return labels;
}

} // namespace

TEST(Node, NoNodes_NoKeyword) {
    TestStore store;
    store.AddPart("P", {});
    store.model.AddPart("Q");
    store.model.AddInstance("I", "P");
    store.model.AddInstance("J", "Q");
    EXPECT_EQ(Written(oif_Node(store.Instance("I"), store.Info())), "");
    EXPECT_EQ(Written(oif_Node(store.Instance("J"), store.Info())), "");
    EXPECT_EQ(Written(oif_Node()), "");
}

TEST(Node, Coordinates_StaySinglePrecisionWithSevenDigits) {
    TestStore store;
    odiK_Part& part = store.model.AddPart("P");
    part.mesh.Reset(new odiK_Mesh());
    part.mesh->SetNodes({1, 12345678}, {0.1F, -0.0F, 1e-5F, 1234567.9F, 16777216.0F, -629.0F});
    store.model.AddInstance("I", "P");
    EXPECT_EQ(Written(oif_Node(store.Instance("I"), store.Info())),
              "*Node\n"
              "      1,          0.1,          -0.,        1e-05\n"
              "12345678,     1234568., 1.677722e+07,        -629.\n");
}

TEST(Node, AssemblyForm_WritesTheAssemblysOwnNodes) {
    TestStore store;
    EXPECT_EQ(Written(oif_Node(store.View().rootAssembly(), store.Info())), "");
    store.model.AssemblyMesh().SetNodes({5}, {1, 2, 3});
    EXPECT_EQ(Written(oif_Node(store.View().rootAssembly(), store.Info())),
              "*Node\n      5,           1.,           2.,           3.\n");
}

TEST(Node, FindSmallestReal_IsATenBillionth) {
    EXPECT_DOUBLE_EQ(oif_Node::FindSmallestReal(500.0), 5e-8);
}

TEST(Element, NoElements_NoKeyword) {
    EXPECT_EQ(ElementsOf([](odiK_Mesh&) {}), "");
}

TEST(Element, LargestNodeLabelNine_FieldIsTwoWide) {
    EXPECT_EQ(ElementsOf([](odiK_Mesh& mesh) {
                  mesh.AddElements("T3D2", {1, 10}, 2, {1, 9, 2, 3});
              }),
              "*Element, type=T3D2\n"
              " 1, 1, 9\n"
              "10, 2, 3\n");
}

TEST(Element, LargeNodeLabel_RunsOverItsSevenPlaces) {
    TestStore store;
    odiK_Part& part = store.AddPart("P", {1, 12345678, 1234567});
    part.mesh->AddElements("B31", {3}, 2, {1, 12345678});
    part.mesh->AddElements("B32", {4}, 2, {1, 1234567});
    store.model.AddInstance("I", "P");
    EXPECT_EQ(Written(oif_ElementFromMesh(store.Instance("I"), store.Info())), "*Element, type=B31\n"
                                                                               "3,      1,12345678\n"
                                                                               "*Element, type=B32\n"
                                                                               "4,      1,1234567\n");
}

TEST(Element, TwentyNodes_GoOnIndentedInASecondLine) {
    EXPECT_EQ(ElementsOf([](odiK_Mesh& mesh) { mesh.AddElements("C3D20", {100}, 20, Range(1, 20)); }),
              "*Element, type=C3D20\n"
              "100,  1,  2,  3,  4,  5,  6,  7,  8,  9, 10, 11, 12, 13, 14, 15,\n"
              "     16, 17, 18, 19, 20\n");
}

TEST(Element, SixteenNodes_TheLastStandsAloneWithoutIndentOnPurpose) {
    EXPECT_EQ(ElementsOf([](odiK_Mesh& mesh) { mesh.AddElements("X16", {1}, 16, Range(1, 16)); }),
              "*Element, type=X16\n"
              "1,  1,  2,  3,  4,  5,  6,  7,  8,  9, 10, 11, 12, 13, 14, 15,\n"
              " 16\n");
}

TEST(Element, FifteenNodes_FillTheLineWithoutComma) {
    EXPECT_EQ(ElementsOf([](odiK_Mesh& mesh) { mesh.AddElements("C3D15", {1}, 15, Range(1, 15)); }),
              "*Element, type=C3D15\n"
              "1,  1,  2,  3,  4,  5,  6,  7,  8,  9, 10, 11, 12, 13, 14, 15\n");
}

TEST(Element, TwoClassesOfOneType_ShareOneKeywordLine) {
    EXPECT_EQ(ElementsOf([](odiK_Mesh& mesh) {
                  mesh.AddElements("T3D2", {7}, 2, {1, 2});
                  mesh.AddElements("S3", {8}, 3, {1, 2, 3});
                  mesh.AddElements("T3D2", {10}, 2, {2, 3});
              }),
              "*Element, type=T3D2\n"
              "7, 1, 2\n"
              "10, 2, 3\n"
              "*Element, type=S3\n"
              "8, 1, 2, 3\n");
}

TEST(Element, Types_StandInTheWalkOrderOfTheTree) {
    // "S4R" is the root ('S' and 'R': even/odd); at depth 0 the bit of "C3D8" ('C', 0x43) is 1, of "B31"
    // ('B', 0x42) 0, of "M3D4" ('M', 0x4D) 1. So "B31" is the left child and is walked before the right
    // subtree, which "C3D8" begins; at depth 1 the last byte of "M3D4" ('4', 0x34) has bit 0: left of "C3D8".
    EXPECT_EQ(ElementsOf([](odiK_Mesh& mesh) {
                  mesh.AddElements("S4R", {1}, 4, {1, 2, 3, 4});
                  mesh.AddElements("C3D8", {2}, 8, {1, 2, 3, 4, 5, 6, 7, 8});
                  mesh.AddElements("M3D4", {3}, 4, {1, 2, 3, 4});
                  mesh.AddElements("B31", {4}, 2, {1, 2});
              }),
              "*Element, type=S4R\n1, 1, 2, 3, 4\n"
              "*Element, type=B31\n4, 1, 2\n"
              "*Element, type=C3D8\n2, 1, 2, 3, 4, 5, 6, 7, 8\n"
              "*Element, type=M3D4\n3, 1, 2, 3, 4\n");
}

TEST(Element, SurfaceElements_AreLeftOutByTheirCapitals) {
    EXPECT_EQ(ElementsOf([](odiK_Mesh& mesh) {
                  mesh.AddElements("XSURF3", {1}, 2, {1, 2});
                  mesh.AddElements("xsurf3", {2}, 2, {1, 2});
              }),
              "*Element, type=xsurf3\n2, 1, 2\n");
}

TEST(Element, NodeIndexOutsideTheLabels_Raises) {
    TestStore store;
    odiK_Part& part = store.AddPart("P", {1, 2});
    fnd_Raise problems;
    part.mesh->AddElementsByIndex("T3D2", {1}, 2, {0, 5}, {}, problems);
    store.model.AddInstance("I", "P");
    EXPECT_EQ(Raised([&] { Written(oif_ElementFromMesh(store.Instance("I"), store.Info())); }),
              "cow_List: index 5 is out of range, expected 0 to 1");
}

TEST(Element, SingleForm_WritesTwoNumbers) {
    EXPECT_EQ(Written(oif_Element(7, 12, "MASS", "")), "*Element, type=MASS\n7, 12\n");
    EXPECT_EQ(Written(oif_Element(7, 12, "MASS", "E")), "*Element, type=MASS, elset=E\n7, 12\n");
}

TEST(Element, ClassForm_HasAKeywordLineOfItsOwn) {
    TestStore store;
    store.AddPart("P", {5, 6}).mesh->AddElements("T3D2", {1}, 2, {5, 6});
    store.model.AddInstance("I", "P");
    const ddb_ElementClass elements = store.Instance("I").elementData().elementClass(0);
    // Without a mesh the node indices go out.
    EXPECT_EQ(Written(oif_Element(0, 0, elements, "E")), "*Element, type=T3D2, elset=E\n1, 0, 1\n");
}

TEST(AssemblyElement, ElementsOfAnInstance_ShowTheInstanceToo) {
    TestStore store;
    store.AddPart("P", {1, 2}).mesh->AddElements("T3D2", {5}, 2, {1, 2});
    store.model.AddInstance("my inst", "P");
    const int labels[] = {5};
    const odiK_MemberInput members[] = {{"my inst", labels, {}}};
    store.model.AddAssemblySet("OWN", res_SetTypeEnm::ELEMENTS, members);
    EXPECT_EQ(Written(oif_AssemblyElement(store.model.Region("", "OWN"), "OWN", store.Info())),
              "*Element, type=CONN3D2\n5, \"my inst\".1, \"my inst\".2\n");
}

TEST(AssemblyElement, Ends_ShowTheirInstance) {
    TestStore store;
    store.AddPart("P", {1, 2});
    store.model.AddInstance("I-1", "P");
    store.model.AddInstance("my inst", "P");
    odiK_Mesh& mesh = store.model.AssemblyMesh();
    mesh.SetNodes({9}, {0, 0, 0});
    fnd_Raise problems;
    const int first = mesh.AddForeignNode("I-1", 2);
    const int second = mesh.AddForeignNode("my inst", 1);
    mesh.AddElementsByIndex("CONN3D2", {3, 4}, 2, {first, second, 0, first}, {}, problems);
    const int labels[] = {3, 4};
    const odiK_MemberInput members[] = {{"", labels, {}}};
    store.model.AddAssemblySet("WIRES", res_SetTypeEnm::ELEMENTS, members);
    const rgnC_Region region = store.model.Region("", "WIRES");
    EXPECT_EQ(Written(oif_AssemblyElement(region, "WIRES", store.Info())), "*Element, type=CONN3D2\n"
                                                                           "3, I-1.2, \"my inst\".1\n"
                                                                           "4, 9, I-1.2\n");
}
