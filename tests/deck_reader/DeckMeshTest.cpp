#include "DeckTesting.h"
#include "model_file/mdf_ModelFile.h"
#include "store_interface/model/odb_Odb.h"
#include "support/TestFolder.h"

namespace {

constexpr const char* kDeck = R"(*Part, name=Beam
*Node
1, 0., 0., 0.
2, 1., 0., 0.
3, 2., 0.5, 0.
*Element, type=B31
7, 1, 2
*Element, type=B31
8, 2, 3
*Nset, nset=ALL, generate
1, 3, 1
*Elset, elset=ALL
7, 8
*Elset, elset=_TIP_END2, internal
8,
*Surface, type=ELEMENT, name=TIP
_TIP_END2, END2
*End Part
*Part, name=Point
*Node
5, 0., 0., 0.
*End Part
)";

/// Reads a model with a part whose mesh is the given JSON; the findings as texts.
std::unique_ptr<odb_Odb> Model(const TestFolder& folder, const std::string& mesh, Strings& findings) {
    folder.Put("old.inp", kDeck);
    mdf_Report report;
    auto odb = mdf_ReadModelText(
        R"({"format": "qrx-model/1", "models": {"Default Model": {"parts": {"P": {"mesh": )" + mesh +
            R"(}}, "assembly": {"instances": {"P-1": {"part": "P"}}},
                                     "steps": [{"name": "Initial", "class": "kprC_InitialStep"}]}}})",
        folder.Path("model.json"), report);
    for (const fnd_Finding& finding : report.findings) findings.push_back(finding.Text());
    return odb;
}

} // namespace

TEST(DeckMesh, TakesAPartOfADeck) {
    const TestFolder folder;
    Strings findings;
    const auto odb = Model(folder, R"({"file": "old.inp", "part": "BEAM", "scale": 2})", findings);
    ASSERT_NE(odb, nullptr) << findings[0];
    const odiK_Mesh& mesh = *odb->FindModel(odb_Odb::DefaultModelName())->Parts().begin()->second->mesh;
    EXPECT_EQ(mesh.Nodes().NumNodes(), 3);
    EXPECT_EQ(mesh.Nodes().coordinates, (std::vector<float>{0, 0, 0, 2, 0, 0, 4, 1, 0}));
    ASSERT_EQ(mesh.Classes().size(), 1U);
    EXPECT_EQ(mesh.Classes()[0].labels, (std::vector<int>{7, 8}));
    // The element set gives way to the node set of its name; the side of the surface comes with the surface.
    ASSERT_EQ(mesh.Sets().size(), 3U);
    EXPECT_EQ(mesh.Sets()[0]->name, "ALL");
    EXPECT_EQ(mesh.Sets()[1]->name, "ALL_ELEMENTS");
    EXPECT_EQ(mesh.Sets()[2]->name, "TIP");
    EXPECT_EQ(mesh.Sets()[2]->subsets[0].facetIds[0], 1);
}

TEST(DeckMesh, RenamesAndLeavesOut) {
    const TestFolder folder;
    Strings findings;
    const auto odb = Model(
        folder, R"({"file": "old.inp", "part": "Beam", "groups": {"all": "BOTH", "TIP": null}})", findings);
    ASSERT_NE(odb, nullptr) << findings[0];
    const odiK_Mesh& mesh = *odb->FindModel(odb_Odb::DefaultModelName())->Parts().begin()->second->mesh;
    ASSERT_EQ(mesh.Sets().size(), 2U);
    EXPECT_EQ(mesh.Sets()[0]->name, "BOTH");
}

TEST(DeckMesh, WhatCantBe_IsTold) {
    const TestFolder folder;
    for (const char* mesh : {R"({"file": "old.inp"})", R"({"file": "old.inp", "part": "Bean"})",
                             R"({"file": "old.inp", "part": "Beam", "elementTypes": {"line2": "B31"}})",
                             R"({"file": "none.inp"})"}) {
        Strings findings;
        EXPECT_EQ(Model(folder, mesh, findings), nullptr) << mesh;
        EXPECT_EQ(findings.size(), 1U) << mesh;
    }
}
