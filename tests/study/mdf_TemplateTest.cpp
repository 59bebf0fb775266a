#include "model_file/mdf_Template.h"

#include <gtest/gtest.h>

#include <sstream>

namespace {

constexpr const char* kModel = R"({"format": "qrx-model/1", "models": {"Default Model": {
  "parts": {"P": {"mesh": {"nodes": {"labels": [1, 2], "coordinates": [[0, 0, 0], [1, 0, 0]]},
                           "sets": [{"name": "TIP", "kind": "node", "labels": [2]}]}}},
  "assembly": {"instances": {"P-1": {"part": "P"}}},
  "steps": [{"name": "Initial", "class": "kprC_InitialStep"}, {"name": "Pull", "class": "kprC_StaticStep"}],
  "loads": {"F": {"class": "kloC_ConcentratedForce", "region": "P-1.TIP", "states": {"Pull": {"component1": 1}}},
            "G": {"class": "kloC_ConcentratedForce", "region": "P-1.TIP", "states": {"Pull": {"component2": 1}}}}}}})";

constexpr const char* kForce = "/models/Default Model/loads/F/states/Pull/component1";
constexpr const char* kNode = "/models/Default Model/parts/P/mesh/nodes/coordinates/1/0";

std::unique_ptr<mdf_Template> Read(std::vector<std::string> places = {kForce}) {
    mdf_Report report;
    auto made = mdf_Template::OfText(
        kModel, "model.json", [&](const auto&) { return places; }, report);
    EXPECT_TRUE(made != nullptr);
    return made;
}

const odiK_Model& ModelOf(const odb_Odb& store) {
    return *store.FindModel(odb_Odb::DefaultModelName());
}

std::string TextOf(const odb_Odb& store) {
    std::ostringstream text;
    mdf_WriteModelFile(store, text);
    return text.str();
}

std::unique_ptr<odb_Odb> VariantOf(mdf_Template& base, const std::string& pointer, mdf_Value value) {
    mdf_Report report;
    const mdf_Change change{pointer, std::move(value)};
    return base.Variant(std::span(&change, 1), report);
}

} // namespace

TEST(mdf_Template, AVariantOfARecord_SharesAllElse) {
    const auto base = Read();
    const auto variant = VariantOf(*base, kForce, mdf_Value(7));
    ASSERT_TRUE(variant);
    const odiK_Model& before = ModelOf(base->Store());
    const odiK_Model& after = ModelOf(*variant);
    EXPECT_EQ(before.Parts().begin()->second, after.Parts().begin()->second);
    EXPECT_EQ(before.Instances().begin()->second, after.Instances().begin()->second);
    EXPECT_EQ(before.loads.FindRecord("G"), after.loads.FindRecord("G"));
    EXPECT_NE(before.loads.FindRecord("F"), after.loads.FindRecord("F"));
    EXPECT_TRUE(after.IsComplete());
}

TEST(mdf_Template, AVariantOfTheTree_SharesTheMesh) {
    const auto base = Read();
    const auto variant = VariantOf(*base, "/models/Default Model/steps/1/name", mdf_Value("Pull"));
    ASSERT_TRUE(variant);
    EXPECT_EQ(ModelOf(base->Store()).Parts().begin()->second->mesh,
              ModelOf(*variant).Parts().begin()->second->mesh);
}

TEST(mdf_Template, AVariantOfTheMesh_HasItsOwn) {
    const auto base = Read({kNode});
    const auto variant = VariantOf(*base, kNode, mdf_Value(2.5));
    ASSERT_TRUE(variant);
    const auto& mesh = ModelOf(*variant).Parts().begin()->second->mesh;
    EXPECT_NE(ModelOf(base->Store()).Parts().begin()->second->mesh, mesh);
    EXPECT_EQ(mesh->Nodes().coordinates[3], 2.5F);
    EXPECT_EQ(ModelOf(base->Store()).Parts().begin()->second->mesh->Nodes().coordinates[3], 1.0F);
}

TEST(mdf_Template, Variants_LeaveTheTemplateAsItWas) {
    const auto base = Read({kForce, kNode});
    const std::string text = TextOf(base->Store());
    VariantOf(*base, kForce, mdf_Value(7));
    VariantOf(*base, kNode, mdf_Value(7));
    EXPECT_EQ(VariantOf(*base, kForce, mdf_Value("x")), nullptr);
    EXPECT_EQ(TextOf(base->Store()), text);
    EXPECT_EQ(TextOf(*VariantOf(*base, kForce, mdf_Value(1))), text);
}

TEST(mdf_Template, ATwin_HasTheMeshesInCommonAndNothingElse) {
    const auto base = Read();
    const auto twin = base->Twin();
    EXPECT_EQ(TextOf(twin->Store()), TextOf(base->Store()));
    const odiK_Model& one = ModelOf(base->Store());
    const odiK_Model& other = ModelOf(twin->Store());
    EXPECT_EQ(one.Parts().begin()->second->mesh, other.Parts().begin()->second->mesh);
    EXPECT_NE(one.Parts().begin()->second, other.Parts().begin()->second);
    EXPECT_NE(one.loads.FindRecord("G"), other.loads.FindRecord("G"));
}

TEST(mdf_Template, PlacesThatCantBeChanged_AreTold) {
    const auto base = Read();
    EXPECT_FALSE(base->ProblemOf(kForce));
    EXPECT_EQ(base->ProblemOf("/format")->expected, "a JSON pointer to a value of a model");
    const auto problem = base->ProblemOf("/models/Default Model/loads/F/states/Pull/componnt1");
    ASSERT_TRUE(problem);
    EXPECT_EQ(problem->found,
              "found no 'componnt1' in '/models/Default Model/loads/F/states/Pull' of the template");
    EXPECT_EQ(problem->hint, "did you mean 'component1'?");
    // The mesh was not kept for places that nobody named.
    EXPECT_TRUE(base->ProblemOf(kNode));
}
