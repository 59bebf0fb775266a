#include "assembly/oif_InstanceBuilder.h"
#include "assembly/oif_PartBuilder.h"
#include "support/DeckTest.h"

#include <numbers>

namespace {

constexpr float kQuarter = static_cast<float>(std::numbers::pi / 2.0);

std::string Placed(const float (&translation)[3], const float (&rotation)[3]) {
    TestStore store;
    store.AddPart("P", {});
    odiK_Instance& instance = store.model.AddInstance("I", "P");
    std::copy(std::begin(translation), std::end(translation), instance.translation);
    std::copy(std::begin(rotation), std::end(rotation), instance.rotation);
    return Written(oif_Instance(store.Instance("I")));
}

const std::string kHead = "*Instance, name=I, part=P\n";

} // namespace

TEST(Part, Name_GoesThroughTheQuoting) {
    EXPECT_EQ(Written(oif_Part("a b")), "*Part, name=\"a b\"\n");
    EXPECT_EQ(Written(oif_Part("ab")), "*Part, name=ab\n");
}

TEST(Instance, AtTheOrigin_HasNoDataLine) {
    EXPECT_EQ(Placed({0, 0, 0}, {0, 0, 0}), kHead);
}

TEST(Instance, Moved_HasOneDataLine) {
    EXPECT_EQ(Placed({1, -2.5F, 0}, {0, 0, 0}), kHead + "          1.,         -2.5,           0.\n");
}

TEST(Instance, TurnedOnly_HasALineOfZerosFirstOnPurpose) {
    // The angle is the float nearest to a quarter turn, in degrees.
    EXPECT_EQ(Placed({0, 0, 0}, {0, 0, kQuarter}),
              kHead + "          0.,           0.,           0.\n"
                      "          0.,           0.,           0.,           0.,           0.,           1., "
                      "90.0000025044782\n");
}

TEST(Instance, MovedAndTurned_TurnsAboutTheMovedPoint) {
    EXPECT_EQ(Placed({10, 20, 30}, {kQuarter, 0, 0}),
              kHead + "         10.,          20.,          30.\n"
                      "         10.,          20.,          30.,          11.,          20.,          30., "
                      "90.0000025044782\n");
}

TEST(Instance, TurnBelowTheTolerance_IsNone) {
    EXPECT_EQ(Placed({0, 0, 0}, {0, 0, 1e-13F}), kHead);
    EXPECT_EQ(Placed({1, 0, 0}, {0, 0, 1e-13F}), kHead + "          1.,           0.,           0.\n");
}

TEST(Instance, MoveBelowTheTolerance_IsNone) {
    EXPECT_EQ(Placed({1e-13F, 0, 0}, {0, 0, 0}), kHead);
}

TEST(PartBuilder, TwoInstancesOfOnePart_OpenItOnce) {
    TestStore store;
    store.AddPart("P", {});
    store.AddPart("Unused", {});
    store.model.AddInstance("a", "P");
    store.model.AddInstance("b", "P");
    oif_PartBuilder builder(store.Info());
    builder.Build();
    EXPECT_EQ(builder.PartDefinition("P").Length(), 1);
    EXPECT_TRUE(builder.PartDefinition("Unused").IsEmpty());
}

TEST(InstanceBuilder, SectionThatIsNoConnectorSection_WritesNothingInTheAssembly) {
    TestStore store;
    store.AddPart("P", {1});
    store.model.AddInstance("I", "P");
    ptoC_SectionAssignment assignment;
    assignment.sectionName = "absent";
    store.model.AssemblyObject().sectionAssignments.Append(assignment);
    oif_InstanceBuilder builder(store.Info());
    builder.Build();
    EXPECT_TRUE(builder.AssemblyDefinition().IsEmpty());
    EXPECT_EQ(builder.InstanceDefinition("I").Length(), 3);
}

TEST(InstanceBuilder, AssignmentOfAnotherClass_Raises) {
    TestStore store;
    store.model.AssemblyObject().sectionAssignments.Append(ptoC_BeamOrientation());
    oif_InstanceBuilder builder(store.Info());
    EXPECT_EQ(Raised([&] {
                  builder.Build();
              }).rfind("class check failed: found ptoC_BeamOrientation, expected ptoC_SectionAssignment", 0),
              0U);
}
