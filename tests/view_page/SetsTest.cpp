#include "view_page/PageTesting.h"

#include "view_page/vpg_Profiles.h"

#include "store_interface/records/sections/kbpC_BeamProfile.h"

namespace {

const nlohmann::json& SetNamed(const nlohmann::json& sets, const std::string& name) {
    for (const nlohmann::json& set : sets) {
        if (set["name"] == name) return set;
    }
    ADD_FAILURE() << "there is no set " << name;
    return sets;
}

const std::string kSets = R"(
    {"name": "TIP", "kind": "node", "labels": [3, 12]},
    {"name": "SECOND", "kind": "element", "labels": [2]},
    {"name": "LEFT", "kind": "surface", "internal": true, "facets": [[1, "S6"]]},
    {"name": "BETWEEN", "kind": "surface", "facets": [[1, "S4"], [2, "S1"]]})";

} // namespace

TEST(Sets, NameTheCellsThatTheSkinHasOfThem) {
    const PageOf page(MeshModel(kTwoCubes, 12, kTwoHexahedra, kSets));
    const auto& sets = page.header["meshes"][0]["sets"];
    EXPECT_EQ(page.Unrolled(SetNamed(sets, "SECOND")["cells"]), (Ints{5, 6, 7, 8, 9}));
    EXPECT_EQ(page.Unrolled(SetNamed(sets, "LEFT")["cells"]), (Ints{4}));
    EXPECT_EQ(SetNamed(sets, "LEFT")["internal"], true);
    EXPECT_EQ(page.Unrolled(SetNamed(sets, "TIP")["nodes"]), (Ints{2, 11}));
    EXPECT_EQ(SetNamed(sets, "TIP")["box"], (nlohmann::json{2.0, 0.0, 0.0, 2.0, 1.0, 1.0}));
}

TEST(Sets, OfAFacetOnNoSkin_MakeItACell) {
    const PageOf page(MeshModel(kTwoCubes, 12, kTwoHexahedra, kSets));
    const auto& mesh = page.header["meshes"][0];
    EXPECT_EQ(page.Unrolled(SetNamed(mesh["sets"], "BETWEEN")["cells"]), (Ints{5, 10}));
    ASSERT_EQ(mesh["blocks"].size(), 2U);
    EXPECT_EQ(mesh["blocks"][1]["role"], "facet");
    EXPECT_EQ(mesh["blocks"][1]["first"], 10);
    EXPECT_EQ(page.IntsOf(mesh["blocks"][1]["sides"]), (Ints{3}));
}

TEST(Sets, OfShells_TellTheirSidesApart) {
    const PageOf page(MeshModel("[0,0,0],[1,0,0],[2,0,0],[0,1,0],[1,1,0],[2,1,0]", 6,
                                R"({"type": "S4", "labels": [1, 2], "connectivity": [[1,2,5,4], [2,3,6,5]]})",
                                R"({"name": "S", "kind": "surface", "facets": [[1, "SPOS"], [2, "SNEG"]]})"));
    const auto& set = page.header["meshes"][0]["sets"][0];
    EXPECT_EQ(page.Unrolled(set["cells"]), (Ints{0}));
    EXPECT_EQ(page.Unrolled(set["negative"]), (Ints{1}));
}

TEST(Sets, OfPlaneElements_HaveTheirEdges) {
    const PageOf page(MeshModel("[0,0,0],[1,0,0],[1,1,0],[0,1,0]", 4,
                                R"({"type": "CPS4", "labels": [1], "connectivity": [[1,2,3,4]]})",
                                R"({"name": "S", "kind": "surface", "facets": [[1, "S2"]]})"));
    const auto& mesh = page.header["meshes"][0];
    EXPECT_EQ(page.Unrolled(mesh["sets"][0]["cells"]), (Ints{1}));
    EXPECT_EQ(mesh["blocks"][1]["cell"], "line2");
    EXPECT_EQ(page.IntsOf(mesh["blocks"][1]["connectivity"]), (Ints{1, 2}));
}

TEST(Sets, OfTheAssembly_LieInTheirInstances) {
    const PageOf page(
        R"("parts": {"P": {"mesh": {"nodes": {"labels": [1, 2], "coordinates": [[0, 0, 0], [1, 0, 0]]}}}},
        "assembly": {"instances": {"A": {"part": "P"}, "B": {"part": "P"}},
                     "sets": [{"name": "BOTH", "kind": "node", "members": [{"instance": "B", "labels": [2]},
                                                                           {"instance": "A", "labels": [1]}]}]})");
    const auto& set = page.header["sets"][0];
    EXPECT_EQ(set["count"], 2);
    ASSERT_EQ(set["parts"].size(), 2U);
    EXPECT_EQ(set["parts"][0]["instance"], 0);
    EXPECT_EQ(set["parts"][1]["instance"], 1);
    EXPECT_EQ(page.FloatsOf(page.header["meshes"][0]["positions"]).size(), 6U);
}

TEST(Sets, OfManyInnerNodes_ShowAThousandOfThem) {
    std::string labels;
    std::string places;
    for (int i = 1; i <= 1500; ++i) {
        labels += (i == 1 ? "" : ", ") + std::to_string(i);
        places += (i == 1 ? "[" : ", [") + std::to_string(i) + ", 0, 0]";
    }
    const PageOf page(
        MeshModel(places, 1500, "", R"({"name": "N", "kind": "node", "labels": [)" + labels + "]}"));
    const auto& set = page.header["meshes"][0]["sets"][0];
    EXPECT_EQ(set["count"], 1500);
    EXPECT_EQ(page.Unrolled(set["nodes"]).size(), 1000U);
    EXPECT_EQ(set["box"][3], 1500.0);
}

TEST(Sections, AreKnownOfEachCell_TheLastAssignmentCounts) {
    const PageOf page(
        R"("parts": {"P": {"mesh": {"nodes": {"labels": {"from": 1, "to": 12}, "coordinates": [)" +
        kTwoCubes + R"(]}, "elements": [)" + kTwoHexahedra + R"(],
            "sets": [{"name": "ALL", "kind": "element", "labels": [1, 2]}, {"name": "SECOND", "kind": "element", "labels": [2]}]},
            "sectionAssignments": [{"region": "ALL", "sectionName": "Steel"}, {"region": "SECOND", "sectionName": "Brass"}]}},
        "assembly": {"instances": {"I": {"part": "P"}, "J": {"part": "P"}}},
        "materials": {"M": {}},
        "sections": {"Brass": {"class": "kseC_HomogenousSolidSection", "materialName": "M"},
                     "Steel": {"class": "kseC_HomogenousSolidSection", "materialName": "M"}})");
    EXPECT_EQ(page.header["sections"][0]["name"], "Brass");
    EXPECT_EQ(page.header["sections"][0]["material"], "M");
    EXPECT_EQ(page.IntsOf(page.header["instances"][0]["sections"]), (Ints{1, 1, 1, 1, 1, 0, 0, 0, 0, 0}));
    // Instances of one part share the array.
    EXPECT_EQ(page.header["instances"][0]["sections"], page.header["instances"][1]["sections"]);
}

TEST(Sections, OfInstancesSetsGivenByTheAssembly_AreNotTheAssemblys) {
    // The instance's set is of its second class; the assembly's mesh has one class of two elements.
    const PageOf page(
        R"("parts": {"P": {"mesh": {"nodes": {"labels": [1, 2, 3], "coordinates": [[0, 0, 0], [1, 0, 0], [2, 0, 0]]},
            "elements": [{"type": "T3D2", "labels": [1], "connectivity": [[1, 2]]},
                         {"type": "B31", "labels": [2], "connectivity": [[2, 3]]}],
            "sets": [{"name": "BEAM", "kind": "element", "labels": [2]}]}}},
        "assembly": {"instances": {"I": {"part": "P"}},
                     "mesh": {"elements": [{"type": "CONN3D2", "labels": [1, 2], "connectivity": [["I.1", "I.2"], ["I.2", "I.3"]]}]},
                     "sectionAssignments": [{"region": "I.BEAM", "sectionName": "S"}]},
        "materials": {"M": {}},
        "sections": {"S": {"class": "kseC_TrussSection", "materialName": "M"}})");
    for (const auto& instance : page.header["instances"])
        EXPECT_FALSE(instance.contains("sections")) << instance;
}

TEST(Profiles, AreTheirOutlines) {
    kbpC_RectangularProfile rectangle;
    rectangle.a = 2.0;
    rectangle.b = 4.0;
    EXPECT_EQ(vpg_OutlineOf(rectangle), (vpg_Outline{{{-1, -2}, {1, -2}, {1, 2}, {-1, 2}, {-1, -2}}}));
    kbpC_IbeamProfile beam;
    beam.l = 3.0;
    beam.h = 6.0;
    beam.b1 = 4.0;
    beam.b2 = 2.0;
    beam.t1 = beam.t2 = beam.t3 = 1.0;
    EXPECT_EQ(vpg_OutlineOf(beam), (vpg_Outline{{{-2, -3},
                                                 {2, -3},
                                                 {2, -2},
                                                 {0.5, -2},
                                                 {0.5, 2},
                                                 {1, 2},
                                                 {1, 3},
                                                 {-1, 3},
                                                 {-1, 2},
                                                 {-0.5, 2},
                                                 {-0.5, -2},
                                                 {-2, -2},
                                                 {-2, -3}}}));
    kbpC_BoxProfile box;
    box.a = 4.0;
    box.b = 6.0;
    box.uniformThickness = true;
    box.t1 = 1.0;
    EXPECT_EQ(vpg_OutlineOf(box)[1], (vpg_Outline::value_type{{-1, -2}, {1, -2}, {1, 2}, {-1, 2}, {-1, -2}}));
    EXPECT_EQ(vpg_OutlineOf(kbpC_GeneralizedProfile()), vpg_Outline());
}
