#include "interactions/InteractionTesting.h"
#include "store_interface/records/interactions/kinC_ContactExp.h"

using Status = mdl_PropagationStatusEnm;

namespace {

const std::string kTwo = R"("master": "I.NODES", "slave": "I.MASTER", )";

InteractionModel Pair(const std::string& states, const std::string& members = kTwo) {
    return InteractionModel(
        StaticSteps(3) + ", " +
        Interactions("SurfaceToSurfaceContactXpl", members + "\"states\": {" + states + "}"));
}

std::string NamesOf(const cow_List<rgnC_Region>& regions) {
    std::string names;
    for (int i = 0; i < regions.Length(); ++i) names += std::string(regions[i].SetName().View()) + " ";
    return names;
}

} // namespace

TEST(ContactState, OpDelete_IsTrueInTheStepThatEndsThePair) {
    InteractionModel model = Pair(R"("Step-1": {}, "Step-2": {"deactivated": true})");
    const auto& pair = model.As<kinC_ContactPair>();
    EXPECT_FALSE(pair.ConstGetState("Step-1").opDelete);
    EXPECT_TRUE(pair.ConstGetState("Step-2").opDelete);
    EXPECT_FALSE(pair.ConstGetState("Step-3").opDelete);
}

TEST(ContactState, OpDeleteThatIsGiven_StandsAndIsNotCarriedOver) {
    InteractionModel model =
        Pair(R"("Step-1": {"opDelete": true}, "Step-3": {"deactivated": true, "opDelete": false})");
    const auto& pair = model.As<kinC_ContactPair>();
    EXPECT_TRUE(pair.ConstGetState("Step-1").opDelete);
    EXPECT_FALSE(pair.ConstGetState("Step-2").opDelete);
    EXPECT_FALSE(pair.ConstGetState("Step-3").opDelete);
}

TEST(InteractionState, OfAnUnknownStep_IsADefaultOneOfStatusZero) {
    InteractionModel model = Pair(R"("Step-1": {"opDelete": true})");
    const auto& pair = model.As<kinC_SurfaceToSurfaceContactXpl>();
    EXPECT_EQ(pair.GetPropStatus("Nowhere"), Status::NOT_YET_ACTIVE);
    EXPECT_FALSE(pair.HasStep(""));
    EXPECT_FALSE(pair.IsModified(""));
    EXPECT_FALSE(pair.ConstGetState("").opDelete);
}

TEST(InteractionState, HasStep_HoldsWhereverItIsInForce) {
    InteractionModel model = Pair(R"("Initial": {}, "Step-2": {"deactivated": true})");
    EXPECT_TRUE(model.Interaction().HasStep("Initial"));
    EXPECT_TRUE(model.Interaction().HasStep("Step-1"));
    EXPECT_FALSE(model.Interaction().HasStep("Step-2"));
    EXPECT_FALSE(model.Interaction().HasStep("Step-3"));
    EXPECT_TRUE(model.Interaction().IsModified("Initial"));
    EXPECT_FALSE(model.Interaction().IsModified("Step-1"));
    EXPECT_TRUE(model.Interaction().IsModified("Step-2"));
}

TEST(InteractionState, Insert_ReplacesTheStateOfOneCopyAndNoStatus) {
    InteractionModel model = Pair(R"("Step-1": {})");
    kinC_SurfaceToSurfaceContactXpl copy = model.As<kinC_SurfaceToSurfaceContactXpl>();
    kinC_SurfaceToSurfaceContactXplState state = copy.ConstGetState("Step-2");
    state.opDelete = true;
    copy.Insert("Step-2", state);
    EXPECT_TRUE(copy.ConstGetState("Step-2").opDelete);
    EXPECT_FALSE(copy.ConstGetState("Step-3").opDelete);
    EXPECT_EQ(copy.GetPropStatus("Step-2"), Status::PROPAGATED);
    EXPECT_FALSE(model.As<kinC_ContactPair>().ConstGetState("Step-2").opDelete);
}

TEST(InteractionState, InsertOfAnotherClassOrStep_Raises) {
    InteractionModel model = Pair(R"("Step-1": {})");
    kinC_SurfaceToSurfaceContactXpl copy = model.As<kinC_SurfaceToSurfaceContactXpl>();
    EXPECT_NE(Raised([&] { copy.Insert("Step-1", kinC_SelfContactXplState()); }), "nothing raised");
    EXPECT_NE(Raised([&] { copy.Insert("Nowhere", kinC_SurfaceToSurfaceContactXplState()); }),
              "nothing raised");
}

TEST(ContactNodeSets, OfAPair_AreItsNodeSetsAlone) {
    EXPECT_EQ(NamesOf(Pair("").Interaction().ConstGetContactNodeSets()), "NODES ");
    EXPECT_EQ(
        NamesOf(
            Pair("", R"("master": "I.NODES", "slave": "I.NODES", )").Interaction().ConstGetContactNodeSets()),
        "NODES NODES ");
    EXPECT_EQ(NamesOf(Pair("", R"("master": "I.ALL", "clearanceRegion": "I.NODES", )")
                          .Interaction()
                          .ConstGetContactNodeSets()),
              "");
}

TEST(ContactNodeSets, OfASuppressedPair_AreNone) {
    EXPECT_EQ(NamesOf(Pair("", kTwo + R"("suppressed": true, )").Interaction().ConstGetContactNodeSets()),
              "");
}

TEST(ContactNodeSets, OfSelfContactAndGeneralContact_ComeFromAllTheirSurfaces) {
    InteractionModel self(StaticSteps(1) + ", " +
                          Interactions("SelfContactStd", R"("surface": "I.NODES", "states": {})"));
    EXPECT_EQ(NamesOf(self.Interaction().ConstGetContactNodeSets()), "NODES ");
    const std::string pair = R"([{"first": "I.MASTER", "second": "I.NODES"}], )";
    InteractionModel general(
        StaticSteps(1) + ", " +
        Interactions("ContactExp", R"("inclusionPairs": )" + pair + R"("exclusionPairs": )" + pair +
                                       R"("propertyAssignmentPairs": )" + pair +
                                       R"("surfacePropertyAssignmentPairs": )" + pair +
                                       R"("formulationAssignmentPairs": )" + pair + R"("states": {})"));
    EXPECT_EQ(NamesOf(general.Interaction().ConstGetContactNodeSets()), "NODES NODES NODES NODES NODES ");
}

TEST(ContactNodeSets, OfAFilmOnNodes_AreNone) {
    InteractionModel model(StaticSteps(1) + ", " +
                           Interactions("ConcFilmCondition", R"("surface": "I.NODES", "states": {})"));
    EXPECT_EQ(NamesOf(model.Interaction().ConstGetContactNodeSets()), "");
}
