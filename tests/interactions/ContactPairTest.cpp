#include "interactions/InteractionTesting.h"
#include "interactions/oif_ContactPair.h"
#include "store_interface/records/constraints/kcoC_Constraints.h"

namespace {

const std::string kSurfaces = R"("master": "I.MASTER", "slave": "I.SLAVE", )";
const std::string kProperty = R"("interactionProperties": {"P 1": {"class": "kinC_ContactProperty"}}, )";
const std::string kStates = R"("states": {"Initial": {"InteractionProperty": "P 1"}})";

/// The text of the pair C of the class, with these members, in the initial step.
std::string Pair(const std::string& className, const std::string& members, bool cpset = false,
                 const std::string& states = kStates, const cow_String& step = "Initial") {
    const bool isSelf = className.starts_with("Self");
    InteractionModel model(
        kProperty + StaticSteps(2) + ", " +
        Interactions(className, (isSelf ? R"("surface": "I.MASTER", )" : kSurfaces) + members + states));
    return Written(oif_ContactPair("C", model.Interaction(), step, model.Info(), cpset));
}

std::string Standard(const std::string& members, bool cpset = false) {
    return Pair("SurfaceToSurfaceContactStd", members, cpset);
}
std::string Explicit(const std::string& members, bool cpset = true) {
    return Pair("SurfaceToSurfaceContactXpl", members, cpset);
}

const std::string kLine = "I.SLAVE, I.MASTER\n";

const std::string kDeleted = R"("states": {"Initial": {"InteractionProperty": "P 1"},
                                           "Step-1": {"deactivated": true}})";

} // namespace

TEST(ContactPair, StandardByDefault_HasThePropertyAlone) {
    EXPECT_EQ(Standard(""), "*Contact Pair, interaction=\"P 1\"\n" + kLine);
    EXPECT_EQ(Standard("", true), "*Contact Pair, interaction=\"P 1\", cpset=C\n" + kLine);
}

TEST(ContactPair, StandardSliding_IsSmallOrLimited) {
    EXPECT_EQ(Standard(R"("sliding": 0, "limitSlideDistance": true, "slideDistance": 2, )"),
              "*Contact Pair, interaction=\"P 1\", small sliding\n" + kLine);
    EXPECT_EQ(Standard(R"("sliding": 1, "limitSlideDistance": true, "slideDistance": 2, )"),
              "*Contact Pair, interaction=\"P 1\", slide distance=2.\n" + kLine);
}

TEST(ContactPair, StandardThickness_IsSaidForSurfacesOrSmallSlidingOnly) {
    EXPECT_EQ(Standard(R"("formulation": 1, "thickness": true, )"),
              "*Contact Pair, interaction=\"P 1\", type=SURFACE TO SURFACE\n" + kLine);
    EXPECT_EQ(Standard(R"("formulation": 1, "thickness": false, )"),
              "*Contact Pair, interaction=\"P 1\", type=SURFACE TO SURFACE, no thickness\n" + kLine);
    EXPECT_EQ(Standard(R"("sliding": 0, "thickness": false, )"),
              "*Contact Pair, interaction=\"P 1\", small sliding, no thickness\n" + kLine);
    EXPECT_EQ(Standard(R"("sliding": 1, "thickness": false, )"),
              "*Contact Pair, interaction=\"P 1\"\n" + kLine);
}

TEST(ContactPair, StandardWithAllParameters_HasThemInOrderAndBreaksPastTheLimit) {
    EXPECT_EQ(
        Standard(R"("sliding": 0, "formulation": 1, "thickness": false, "autoHcrit": false, "hcrit": 0.5,
                          "smooth": 0.3, "extensionZone": 0.2, "geometricCorrection": "Corr 1.b", "adjust": 2,
                          "adjustTolerance": 0.25, "tied": true, )",
                 true),
        "*Contact Pair, interaction=\"P 1\", small sliding, type=SURFACE TO SURFACE, no thickness, "
        "hcrit=0.5, smooth=0.3, extension zone=0.2, geometric correction=\"Corr 1\".b, \n"
        "adjust=0.25, tied, cpset=C\n" +
            kLine);
}

TEST(ContactPair, StandardAdjust_HasFourForms) {
    EXPECT_EQ(Standard(R"("adjust": 0, "adjustTolerance": 3, )"),
              "*Contact Pair, interaction=\"P 1\"\n" + kLine);
    // The text 0.0, not the number.
    EXPECT_EQ(Standard(R"("adjust": 1, )"), "*Contact Pair, interaction=\"P 1\", adjust=0.0\n" + kLine);
    EXPECT_EQ(Standard(R"("adjust": 2, "adjustTolerance": 3, )"),
              "*Contact Pair, interaction=\"P 1\", adjust=3.\n" + kLine);
    EXPECT_EQ(Standard(R"("adjust": 3, "adjustRegion": "I.NODES", )"),
              "*Contact Pair, interaction=\"P 1\", adjust=I.NODES\n" + kLine);
}

TEST(ContactPair, StandardOnANodeSet_NamesItsSurface) {
    InteractionModel model(kProperty + StaticSteps(1) + ", " +
                           Interactions("SurfaceToSurfaceContactStd",
                                        R"("master": "I.MASTER", "slave": "I.NODES", )" + kStates));
    EXPECT_EQ(Written(oif_ContactPair("C", model.Interaction(), "Initial", model.Info(), false)),
              "*Contact Pair, interaction=\"P 1\"\nI_NODES_CNS_, I.MASTER\n");
}

TEST(ContactPair, WithoutAProperty_HasAnEmptyName) {
    EXPECT_EQ(Pair("SurfaceToSurfaceContactStd", "", false, R"("states": {"Initial": {}})"),
              "*Contact Pair, interaction=\n" + kLine);
}

TEST(ContactPair, OfNoStep_HasTheDefaultState) {
    EXPECT_EQ(Pair("SurfaceToSurfaceContactStd", "", false, R"("states": {})", ""),
              "*Contact Pair, interaction=\n" + kLine);
}

TEST(ContactPair, Explicit_HasConstraintWeightAndSliding) {
    EXPECT_EQ(Explicit(""),
              "*Contact Pair, interaction=\"P 1\", mechanical constraint=KINEMATIC, cpset=C\n" + kLine);
    EXPECT_EQ(
        Explicit(R"("mechanicalConstraint": 1, "weightingChoice": 1, "weight": 0.25, "sliding": 0, )"),
        "*Contact Pair, interaction=\"P 1\", mechanical constraint=PENALTY, weight=0.25, small sliding, "
        "cpset=C\n" +
            kLine);
    EXPECT_EQ(Explicit(R"("weightingChoice": 2, "weight": 0.25, )", false),
              "*Contact Pair, interaction=\"P 1\", mechanical constraint=KINEMATIC\n" + kLine);
}

TEST(ContactPair, ExplicitUnknownConstraint_LeavesTheParameterEmpty_Wanted) {
    EXPECT_EQ(Explicit(R"("mechanicalConstraint": 7, )"),
              "*Contact Pair, interaction=\"P 1\", mechanical constraint=, cpset=C\n" + kLine);
}

TEST(ContactPair, ExplicitLongLine_NeverBreaks_Wanted) {
    const std::string name(78, 'n');
    InteractionModel model(R"("interactionProperties": {")" + name +
                           R"(": {"class": "kinC_ContactProperty"}}, )" + StaticSteps(1) + ", " +
                           Interactions("SurfaceToSurfaceContactXpl",
                                        kSurfaces +
                                            R"("sliding": 0, "weightingChoice": 1, "states": {"Initial":
                                        {"InteractionProperty": ")" +
                                            name + R"("}})"));
    EXPECT_EQ(Written(oif_ContactPair("C", model.Interaction(), "Initial", model.Info(), true)),
              "*Contact Pair, interaction=" + name +
                  ", mechanical constraint=KINEMATIC, weight=0.5, small sliding, cpset=C\n" + kLine);
}

TEST(ContactPair, ExplicitDeleted_KeepsItsCpset) {
    EXPECT_EQ(Pair("SurfaceToSurfaceContactXpl", "", true, kDeleted, "Step-1"),
              "*Contact Pair, op=DELETE, cpset=C\n" + kLine);
}

TEST(ContactPair, SelfDeleted_HasNoCpset_Wanted) {
    EXPECT_EQ(Pair("SelfContactXpl", "", true, kDeleted, "Step-1"), "*Contact Pair, op=DELETE\nI.MASTER,\n");
}

TEST(ContactPair, ExplicitSelf_EndsItsDataLineInAComma) {
    EXPECT_EQ(Pair("SelfContactXpl", R"("mechanicalConstraint": 1, )", true),
              "*Contact Pair, interaction=\"P 1\", mechanical constraint=PENALTY, cpset=C\nI.MASTER,\n");
}

TEST(ContactPair, StandardSelf_HasItsCpsetFirst) {
    EXPECT_EQ(Pair("SelfContactStd", R"("smooth": 0.5, "formulation": 1, "thickness": false, )", true),
              "*Contact Pair, interaction=\"P 1\", cpset=C, smooth=0.5, type=SURFACE TO SURFACE, no "
              "thickness\nI.MASTER,\n");
    EXPECT_EQ(Pair("SelfContactStd", R"("thickness": false, )"),
              "*Contact Pair, interaction=\"P 1\"\nI.MASTER,\n");
}

TEST(ContactPair, StandardSelfPastTheLimit_BreaksBehindTheParameter_Wanted) {
    const std::string name(78, 'n');
    InteractionModel model(
        R"("interactionProperties": {")" + name + R"(": {"class": "kinC_ContactProperty"}}, )" +
        StaticSteps(1) + ", " +
        Interactions("SelfContactStd",
                     R"("surface": "I.MASTER", "smooth": 0.123456, "formulation": 1, "thickness": false,
                        "states": {"Initial": {"InteractionProperty": ")" +
                         name + R"("}})"));
    EXPECT_EQ(Written(oif_ContactPair("C", model.Interaction(), "Initial", model.Info(), false)),
              "*Contact Pair, interaction=" + name + ", smooth=0.123456, type=SURFACE TO SURFACE\n" +
                  ", no thickness\nI.MASTER,\n");
}

TEST(ContactPair, OfAMeshIndependentTie_NamesItsInteractionBare_Wanted) {
    InteractionModel model(StaticSteps(1));
    EXPECT_EQ(
        Written(oif_ContactPair("Tie 1", model.Region("MASTER"), model.Region("SLAVE"), 0.5, model.Info())),
        "*Contact Pair, tied, adjust=0.5, interaction=_Tie 1\nI.SLAVE, I.MASTER\n");
}

TEST(ContactPair, OfATie_HasItsToleranceAndMayHaveACpset) {
    InteractionModel model(StaticSteps(1));
    kcoC_Tie tie;
    tie.master = model.Region("MASTER");
    tie.slave = model.Region("NODES");
    tie.positionTolerance = 0.25;
    EXPECT_EQ(Written(oif_ContactPair("Tie 1", tie, "Initial", model.Info(), false)),
              "*Contact Pair, tied, interaction=_Tie 1\nI_NODES_CNS_, I.MASTER\n");
    tie.positionToleranceMethod = 1;
    EXPECT_EQ(
        Written(oif_ContactPair("Tie 1", tie, "Initial", model.Info(), true)),
        "*Contact Pair, tied, adjust=0.25, interaction=_Tie 1, cpset=\"Tie 1\"\nI_NODES_CNS_, I.MASTER\n");
}

TEST(ContactPair, ElasticFoundation_WritesNothing) {
    InteractionModel model(StaticSteps(1) + ", " + Interactions("ElasticFoundation", R"("states": {})"));
    EXPECT_EQ(Written(oif_ContactPair("C", model.Interaction(), "Initial", model.Info(), true)), "");
}

TEST(ContactPair, AnotherInteraction_Raises) {
    InteractionModel model(StaticSteps(1) + ", " + Interactions("CyclicSymmetry", R"("states": {})"));
    const oif_ContactPair pair("C", model.Interaction(), "Initial", model.Info(), true);
    EXPECT_EQ(Raised([&] { Written(pair); }), "Unimplemented interaction print");
}

namespace {

std::string Change(const std::string& className, const std::string& step, bool remove) {
    const bool isSelf = className.starts_with("Self");
    InteractionModel model(
        kProperty + StaticSteps(2) + ", " +
        Interactions(className, (isSelf ? R"("surface": "I.MASTER", )" : kSurfaces) + kDeleted));
    return Written(oif_ModelChange("C", model.Interaction(), cow_String(step), model.Info(), remove));
}

} // namespace

TEST(ModelChange, Pair_IsAddedOrRemoved) {
    EXPECT_EQ(Change("SurfaceToSurfaceContactStd", "Initial", false),
              "*Model Change, type=CONTACT PAIR, add\n" + kLine);
    EXPECT_EQ(Change("SurfaceToSurfaceContactStd", "Initial", true),
              "*Model Change, type=CONTACT PAIR, remove\n" + kLine);
}

TEST(ModelChange, EndedPair_IsRemovedWithoutBeingTold) {
    EXPECT_EQ(Change("SurfaceToSurfaceContactStd", "Step-1", false),
              "*Model Change, type=CONTACT PAIR, remove\n" + kLine);
    EXPECT_EQ(Change("SurfaceToSurfaceContactStd", "Step-2", false),
              "*Model Change, type=CONTACT PAIR, add\n" + kLine);
}

TEST(ModelChange, SelfContact_EndsItsDataLineInACommaAndABlank_Wanted) {
    EXPECT_EQ(Change("SelfContactStd", "Initial", false),
              "*Model Change, type=CONTACT PAIR, add\nI.MASTER, \n");
}

TEST(ModelChange, ExplicitPair_Raises) {
    for (const char* className : {"SurfaceToSurfaceContactXpl", "SelfContactXpl"}) {
        EXPECT_EQ(Raised([&] { Change(className, "Initial", false); }),
                  "No *Model Change for this interaction.");
    }
}

namespace {

std::string Interference(const std::string& state) {
    InteractionModel model(
        R"("amplitudes": {"A 1": {"class": "kamC_Tabular", "table": [[0, 0], [1, 1]]}}, )" + StaticSteps(1) +
        ", " +
        Interactions("SurfaceToSurfaceContactStd", kSurfaces + R"("states": {"Step-1": {)" + state + "}}"));
    const oif_ContactInterference keyword(model.Interaction(), "Step-1", model.Info());
    EXPECT_EQ(keyword.IsEmpty(), Written(keyword).empty());
    return Written(keyword);
}

} // namespace

TEST(ContactInterference, None_IsEmpty) {
    EXPECT_EQ(Interference(R"("interferenceValue": 0.1)"), "");
}

TEST(ContactInterference, ShrinkFit_HasNeitherValueNorAmplitude) {
    EXPECT_EQ(Interference(R"("interferenceType": 1, "interferenceValue": 0.1, "amplitude": "A 1")"),
              "*Contact Interference, shrink\nI.SLAVE, I.MASTER\n");
}

TEST(ContactInterference, UniformFitWithoutDirection_KeepsTheCommaBehindItsValue_Wanted) {
    EXPECT_EQ(Interference(R"("interferenceType": 2, "interferenceValue": 0.1, "direction": [1, 2, 3])"),
              "*Contact Interference\nI.SLAVE, I.MASTER, 0.1, \n");
}

TEST(ContactInterference, UniformFitWithDirection_HasThreeSingleReals) {
    EXPECT_EQ(Interference(R"("interferenceType": 2, "interferenceValue": -0.25, "amplitude": "A 1",
                              "directionType": 1, "direction": [0, 0.1, -1])"),
              "*Contact Interference, amplitude=\"A 1\"\nI.SLAVE, I.MASTER, -0.25, 0., 0.1, -1.\n");
}

TEST(ContactInterference, DirectionThatWasNeverGiven_IsZero) {
    EXPECT_EQ(Interference(R"("interferenceType": 2, "directionType": 1)"),
              "*Contact Interference\nI.SLAVE, I.MASTER, 0., 0., 0., 0.\n");
}

TEST(ContactInterference, AnotherClass_IsNotEmptyButWritesNothing_Wanted) {
    InteractionModel model(
        StaticSteps(1) + ", " +
        Interactions("SelfContactStd", R"("surface": "I.MASTER", "states": {"Step-1": {}})"));
    const oif_ContactInterference keyword(model.Interaction(), "Step-1", model.Info());
    EXPECT_FALSE(keyword.IsEmpty());
    EXPECT_EQ(Written(keyword), "");
}

namespace {

template <class Contact>
Contact WithClearance(kinC_ClearanceTypeEnm type) {
    Contact contact;
    contact.clearanceType = type;
    contact.halfThreadAngle = 30.0;
    contact.pitch = 1.25;
    return contact;
}

using Std = kinC_SurfaceToSurfaceContactStd;
using Xpl = kinC_SurfaceToSurfaceContactXpl;

} // namespace

TEST(Clearance, None_WritesNothing) {
    EXPECT_EQ(Written(oif_Clearance(WithClearance<Std>(kinC_ClearanceTypeEnm::NONE), "N", "M", "S")), "");
    EXPECT_EQ(Written(oif_Clearance({}, "N", "C")), "");
}

TEST(Clearance, SingleValue_NamesSurfacesOrTheCpset) {
    auto standard = WithClearance<Std>(kinC_ClearanceTypeEnm::SINGLE_VALUE);
    standard.initialClearance = 0.1;
    EXPECT_EQ(Written(oif_Clearance(standard, "", "I.M", "I.S")),
              "*Clearance, master=I.M, slave=I.S, value=0.1\n");
    auto explicitPair = WithClearance<Xpl>(kinC_ClearanceTypeEnm::SINGLE_VALUE);
    explicitPair.initialClearance = 0.1;
    EXPECT_EQ(Written(oif_Clearance(explicitPair, "", "C 1")), "*Clearance, cpset=\"C 1\", value=0.1\n");
}

TEST(Clearance, BoltWithoutDiametersAndClearance_LeavesTheirPlacesEmpty) {
    const auto contact = WithClearance<Std>(kinC_ClearanceTypeEnm::BOLT);
    EXPECT_EQ(Written(oif_Clearance(contact, "", "I.M", "I.S")),
              "*Clearance, master=I.M, slave=I.S, bolt, tabular\n30., 1.25, , \n, \n");
}

TEST(Clearance, BoltWithTheSmallestRealAsClearance_LeavesItsPlaceEmpty) {
    auto contact = WithClearance<Xpl>(kinC_ClearanceTypeEnm::BOLT);
    contact.initialClearance = std::numeric_limits<double>::min();
    EXPECT_EQ(Written(oif_Clearance(contact, "I.N", "C")),
              "*Clearance, cpset=C, bolt, tabular\n30., 1.25, , \nI.N, \n");
}

TEST(Clearance, BoltWithAll_HasTwoFullLines) {
    auto contact = WithClearance<Xpl>(kinC_ClearanceTypeEnm::BOLT);
    contact.majorBoltDiameter = 8.0;
    contact.meanBoltDiameter = 7.25;
    contact.initialClearance = 0.01;
    EXPECT_EQ(Written(oif_Clearance(contact, "I.N", "C")),
              "*Clearance, cpset=C, bolt, tabular\n30., 1.25, 8., 7.25\nI.N, 0.01\n");
}
