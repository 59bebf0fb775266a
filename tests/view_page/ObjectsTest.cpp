#include "view_page/PageTesting.h"

#include "store_interface/propagation/kprC_PropagatingObject.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/conditions/kbcC_BC.h"
#include "store_interface/records/conditions/kloC_Load.h"
#include "store_interface/records/conditions/kpfC_Field.h"
#include "store_interface/records/constraints/kcoC_Constraint.h"
#include "store_interface/records/interactions/kinC_Interaction.h"
#include "view_page/vpg_Marks.h"

#include <algorithm>

namespace {

const std::string kSets = R"({"name": "TIP", "kind": "node", "labels": [3]},
                             {"name": "RIGHT", "kind": "surface", "facets": [[2, "S4"]]})";
const std::string kSteps = R"("steps": [{"name": "Initial", "class": "kprC_InitialStep"},
                                        {"name": "One", "class": "kprC_StaticStep"},
                                        {"name": "Two", "class": "kprC_StaticStep", "description": "more"},
                                        {"name": "Three", "class": "kprC_StaticStep"}])";

PageOf PageWith(const std::string& objects) {
    return PageOf(MeshModel(kTwoCubes, 12, kTwoHexahedra, kSets, kSteps + ", " + objects));
}

std::string StatusOf(const PageOf& page, const nlohmann::json& object, std::size_t step) {
    return page.header["statuses"][object["steps"][step][0].get<std::size_t>()]["words"];
}

} // namespace

TEST(Objects, TellStatusStateAndLinesOfEachStep) {
    const PageOf page = PageWith(R"("loads": {"Push": {"class": "kloC_ConcentratedForce", "region": "I.TIP",
        "states": {"One": {"component1": 5}, "Three": {"component1": null, "component2": -1}}}})");
    const auto& push = page.Object("Push");
    EXPECT_EQ(push["label"], "Concentrated force");
    EXPECT_EQ(push["mark"], "force");
    EXPECT_EQ(push["regions"], (nlohmann::json::parse(R"([{"role": "region", "instance": 0, "set": 0}])")));
    EXPECT_EQ(StatusOf(page, push, 0), "not yet active");
    EXPECT_EQ(StatusOf(page, push, 1), "created");
    EXPECT_EQ(StatusOf(page, push, 2), "propagated");
    EXPECT_EQ(StatusOf(page, push, 3), "modified");
    EXPECT_EQ(push["states"][push["steps"][1][1].get<std::size_t>()]["components"],
              (nlohmann::json{5.0, 0.0, 0.0}));
    EXPECT_EQ(push["states"][push["steps"][3][1].get<std::size_t>()]["components"],
              (nlohmann::json{0.0, -1.0, 0.0}));
    EXPECT_EQ(push["steps"][2][2], -1);
    EXPECT_EQ(push["cards"][push["steps"][1][2].get<std::size_t>()],
              (nlohmann::json::parse(R"([{"loadCase": "",
                  "text": "** Name: Push   Type: Concentrated force\n*Cload\nI.TIP, 1, 5.\n"}])")));
}

TEST(Objects, OfBoundaryConditions_HoldSixComponents) {
    const PageOf page = PageWith(R"("boundaryConditions": {
        "A": {"class": "kbcC_TypeBC", "region": "I.TIP", "states": {"Initial": {"typeName": "YSYMM"}}},
        "B": {"class": "kbcC_DisplacementBC", "region": "I.TIP", "states": {"One": {"u1": 0, "ur3": 0.5}}}})");
    EXPECT_EQ(page.Object("A")["states"][0]["components"],
              (nlohmann::json::parse("[null, 0.0, null, 0.0, null, 0.0]")));
    const auto& b = page.Object("B");
    EXPECT_EQ(b["states"][b["steps"][1][1].get<std::size_t>()]["components"],
              (nlohmann::json::parse("[0.0, null, null, null, null, 0.5]")));
    EXPECT_EQ(b["cards"][0][0]["text"],
              "** Name: B Type: Displacement/Rotation\n*Boundary\nI.TIP, 1, 1\nI.TIP, 6, 6, 0.5\n");
}

TEST(Objects, OfOneState_HoldItOnce) {
    const PageOf page = PageWith(R"("loads": {"P": {"class": "kloC_Pressure", "region": "I.RIGHT",
        "states": {"One": {"magnitude": 2}}}})");
    const auto& pressure = page.Object("P");
    EXPECT_EQ(pressure["mark"], "pressure");
    EXPECT_EQ(pressure["steps"][2][1], pressure["steps"][3][1]);
}

TEST(Objects, OfConstraints_HaveNoStatusAndTheirLinesInAllSteps) {
    const PageOf page = PageWith(
        R"("constraints": {"C": {"class": "kcoC_Coupling", "refNode": "I.TIP", "surface": "I.RIGHT"}})");
    const auto& coupling = page.Object("C");
    EXPECT_EQ(coupling["mark"], "couple");
    ASSERT_EQ(coupling["steps"].size(), 4U);
    for (const auto& step : coupling["steps"]) EXPECT_EQ(step, (nlohmann::json{-1, -1, 0}));
    EXPECT_EQ(coupling["cards"][0][0]["text"].get<std::string>().substr(0, 17), "** Constraint: C\n");
}

TEST(Objects, OfLoadCases_HaveTheirLinesInEach) {
    const PageOf page(MeshModel(kTwoCubes, 12, kTwoHexahedra, kSets,
                                R"("steps": [{"name": "Initial", "class": "kprC_InitialStep"},
        {"name": "Bend", "class": "kprC_StaticLinearPerturbationStep",
         "loadCases": {"A": {"loads": {"Push": 1.0}}, "B": {"loads": {"Push": -2.0}}}}],
        "loads": {"Push": {"class": "kloC_ConcentratedForce", "region": "I.TIP", "states": {"Bend": {"component1": 5}}}})"));
    const auto& card = page.Object("Push")["cards"][0];
    ASSERT_EQ(card.size(), 2U);
    EXPECT_EQ(card[1]["loadCase"], "B");
    EXPECT_EQ(card[1]["text"],
              "** Name: Push   Type: Concentrated force   Scale factor: -2\n*Cload\nI.TIP, 1, -10.\n");
    EXPECT_EQ(page.header["steps"][1]["loadCases"], (nlohmann::json{"A", "B"}));
}

TEST(Objects, OfAModelThatNoDeckCanTell_Raise) {
    const auto odb = StoreOf(MeshModel(kTwoCubes, 12, kTwoHexahedra, kSets, kSteps + R"(, "loads": {
        "U": {"class": "kloC_UnwrittenLoad", "states": {"One": {}}}})"));
    EXPECT_THROW(vpg_DataOf(*odb, "t"), QRXBasException);
}

TEST(Marks, HaveARowForEachClassOfObjects) {
    const unsigned families[] = {kbcC_BC::TypeId(), kloC_Load::TypeId(), kpfC_Field::TypeId(),
                                 kinC_Interaction::TypeId(), kcoC_Constraint::TypeId()};
    std::size_t classes = 0;
    for (const unsigned family : families) {
        for (const cls_ClassEntry* entry : cls_Classes().ConcreteClasses(family)) {
            ++classes;
            EXPECT_EQ(std::ranges::count(vpg_MarkRows(), entry->info.Id(), &vpg_MarkRow::typeId), 1)
                << entry->info.name;
        }
    }
    EXPECT_EQ(classes, vpg_MarkRows().size());
}

TEST(Html, NamesThatLookLikeTags_StayText) {
    const std::string name = "</script><img onerror=alert(1)>";
    const PageOf page(R"("description": ")" + name + R"(", "parts": {")" + name +
                      R"(": {"mesh": {"nodes": {"labels": [1], "coordinates": [[0, 0, 0]]},
                                      "sets": [{"name": ")" +
                      name + R"(", "kind": "node", "labels": [1]}]}}},
        "assembly": {"name": ")" +
                      name + R"(", "instances": {")" + name + R"(": {"part": ")" + name + R"("}},
                     "sets": [{"name": ")" +
                      name + R"(", "kind": "node", "members": [{"instance": ")" + name +
                      R"(", "labels": [1]}]}]},
        "sections": {")" +
                      name + R"(": {"class": "kseC_HomogenousSolidSection", "materialName": ")" + name +
                      R"("}},
        "materials": {")" +
                      name + R"(": {}},
        "datums": [{"name": ")" +
                      name + R"("}],
        "steps": [{"name": "Initial", "class": "kprC_InitialStep"},
                  {"name": ")" +
                      name + R"(", "class": "kprC_StaticStep", "description": ")" + name + R"("}],
        "loads": {")" +
                      name + R"(": {"class": "kloC_ConcentratedForce", "region": ")" + name + R"(",
                                     "states": {")" +
                      name + R"(": {"component1": 1}}}})");
    EXPECT_EQ(page.header["objects"][0]["name"], name);
    vpg_PageData data;
    data.header = page.header.dump();
    ASSERT_NE(data.header.find("</script>"), std::string::npos);
    if (vpg_PageText().empty()) GTEST_SKIP() << "this build has no page";
    const std::string html = vpg_Html(data, name);
    EXPECT_EQ(html.find("<img"), std::string::npos);
    EXPECT_NE(html.find("<title>&lt;/script&gt;&lt;img onerror=alert(1)&gt;</title>"), std::string::npos);
    // The page's own three scripts end, and no other.
    std::size_t ends = 0;
    for (std::size_t at = html.find("</script"); at != std::string::npos; at = html.find("</script", at + 1))
        ++ends;
    EXPECT_EQ(ends, 3U);
}

TEST(Html, OfAnEmptyPage_IsSmall) {
    if (vpg_PageText().empty()) GTEST_SKIP() << "this build has no page";
    EXPECT_LT(vpg_PageText().size(), 700'000U);
}
