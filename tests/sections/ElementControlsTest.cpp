#include "sections/SectionTesting.h"
#include "sections/oif_ElementControls.h"

namespace {

using Params = bme_ElemCtrlParams;
using Hourglass = Params::HourglassEnm;

std::string Standard(const Params& params) {
    return Written(oif_SectionControls(params, "EC-1", true));
}

/// The parameters of controls that differ from the defaults in these.
template <class Change>
std::string Parameters(const Change& change) {
    Params params;
    change(params);
    const std::string text = Standard(params);
    const std::string head = "*Section Controls, name=EC-1";
    const std::string tail = "\n1., 1., 1.\n";
    if (!text.starts_with(head) || !text.ends_with(tail)) return "whole: " + text;
    return text.substr(head.size(), text.size() - head.size() - tail.size());
}

TEST(HourglassStiffness, AllZero_WritesNothing) {
    EXPECT_EQ(Written(oif_HourglassStiffness(Params())), "");
}

TEST(HourglassStiffness, AnyValue_WritesAllWithTheSecondPlaceBlank) {
    Params params;
    params.hourglassStiffness = 0.005;
    params.bendingHourglassStiffness = 2.0;
    params.drillingHourglassScaling = 3.0;
    EXPECT_EQ(Written(oif_HourglassStiffness(params)), "*Hourglass Stiffness\n0.005, , 2., 3.\n");
    params.hourglassStiffness = 0.0;
    params.bendingHourglassStiffness = 0.0;
    EXPECT_EQ(Written(oif_HourglassStiffness(params)), "*Hourglass Stiffness\n0., , 0., 3.\n");
}

TEST(SectionControls, Defaults_AreEmptyAndWriteNothing) {
    EXPECT_TRUE(oif_SectionControls(Params(), "EC-0", true).IsEmpty());
    EXPECT_TRUE(oif_SectionControls(Params(), "EC-0", false).IsEmpty());
    EXPECT_EQ(Standard(Params()), "");
}

TEST(SectionControls, HourglassStiffnessAlone_CountsForTheImplicitSolverOnly) {
    Params params;
    params.hourglassStiffness = 1.0;
    EXPECT_FALSE(oif_SectionControls(params, "EC-1", true).IsEmpty());
    EXPECT_EQ(Standard(params), "*Section Controls, name=EC-1\n1., 1., 1.\n");
    EXPECT_TRUE(oif_SectionControls(params, "EC-1", false).IsEmpty());
    EXPECT_EQ(Written(oif_SectionControls(params, "EC-1", false)), "");
}

TEST(SectionControls, DistortionControl_HasItsRatioOnlyWhenOn) {
    using Distortion = Params::DistortionControlEnm;
    EXPECT_EQ(Parameters([](Params& p) { p.distortionControl = Distortion::YES; }),
              ", DISTORTION CONTROL=YES");
    EXPECT_EQ(Parameters([](Params& p) {
                  p.distortionControl = Distortion::YES;
                  p.lengthRatio = 0.2;
              }),
              ", DISTORTION CONTROL=YES, length ratio=0.2");
    EXPECT_EQ(Parameters([](Params& p) {
                  p.distortionControl = Distortion::YES;
                  p.lengthRatio = 0.1 + 5e-7;
              }),
              ", DISTORTION CONTROL=YES");
    EXPECT_EQ(Parameters([](Params& p) {
                  p.distortionControl = Distortion::NO;
                  p.lengthRatio = 0.2;
              }),
              ", DISTORTION CONTROL=NO");
    // Not the defaults any more, though nothing of it is written.
    EXPECT_EQ(Parameters([](Params& p) { p.lengthRatio = 0.2; }), "");
}

TEST(SectionControls, KinematicSplit_IsWrittenForTwoOfItsValues) {
    using Split = Params::KinematicSplitEnm;
    EXPECT_EQ(Parameters([](Params& p) { p.kinematicSplit = Split::AVERAGE_STRAIN; }), "");
    EXPECT_EQ(Parameters([](Params& p) { p.kinematicSplit = Split::ORTHOGONAL; }),
              ", kinematic split=ORTHOGONAL");
    EXPECT_EQ(Parameters([](Params& p) { p.kinematicSplit = Split::CENTROID; }),
              ", kinematic split=CENTROID");
}

TEST(SectionControls, Hourglass_HasItsWord) {
    const std::pair<Hourglass, const char*> cases[] = {{Hourglass::RELAX_STIFFNESS, "RELAX STIFFNESS"},
                                                       {Hourglass::STIFFNESS, "STIFFNESS"},
                                                       {Hourglass::VISCOUS, "VISCOUS"},
                                                       {Hourglass::COMBINED, "COMBINED"},
                                                       {Hourglass::ENHANCED, "ENHANCED"}};
    for (const auto& [value, word] : cases) {
        EXPECT_EQ(Parameters([v = value](Params& p) { p.hourglass = v; }),
                  std::string(", hourglass=") + word);
    }
}

TEST(SectionControls, AccuracyAndStressRate_AreWrittenForOneValueEach) {
    using Accuracy = Params::SecondOrderAccuracyEnm;
    using Rate = Params::StressRateEnm;
    EXPECT_EQ(Parameters([](Params& p) { p.secondOrderAccuracy = Accuracy::YES; }),
              ", second order accuracy=YES");
    EXPECT_EQ(Parameters([](Params& p) { p.secondOrderAccuracy = Accuracy::NO; }), "");
    EXPECT_EQ(Parameters([](Params& p) { p.stressRate = Rate::SPIN; }), ", stress rate=SPIN");
    EXPECT_EQ(Parameters([](Params& p) { p.stressRate = Rate::JAUMANN; }), "");
}

TEST(SectionControls, WeightFactor_IsWrittenWithCombinedHourglassOnly) {
    EXPECT_EQ(Parameters([](Params& p) {
                  p.hourglass = Hourglass::COMBINED;
                  p.weightFactor = 0.25;
              }),
              ", hourglass=COMBINED, weight factor=0.25");
    EXPECT_EQ(Parameters([](Params& p) {
                  p.hourglass = Hourglass::COMBINED;
                  p.weightFactor = 0.5 - 5e-7;
              }),
              ", hourglass=COMBINED");
    EXPECT_EQ(Parameters([](Params& p) {
                  p.hourglass = Hourglass::VISCOUS;
                  p.weightFactor = 0.25;
              }),
              ", hourglass=VISCOUS");
}

TEST(SectionControls, AllParameters_StandInOneLineHoweverLong) {
    Params params;
    params.distortionControl = Params::DistortionControlEnm::YES;
    params.lengthRatio = 0.2;
    params.kinematicSplit = Params::KinematicSplitEnm::ORTHOGONAL;
    params.hourglass = Hourglass::COMBINED;
    params.secondOrderAccuracy = Params::SecondOrderAccuracyEnm::YES;
    params.stressRate = Params::StressRateEnm::SPIN;
    params.weightFactor = 0.25;
    params.displacementHourglass = 2.0;
    params.rotationalHourglass = 3.0;
    params.outOfPlaneHourglass = 4.0;
    EXPECT_EQ(Standard(params),
              "*Section Controls, name=EC-1, DISTORTION CONTROL=YES, length ratio=0.2, kinematic "
              "split=ORTHOGONAL, hourglass=COMBINED, second order accuracy=YES, stress rate=SPIN, weight "
              "factor=0.25\n"
              "2., 3., 4.\n");
}

TEST(SectionControls, BulkViscosity_FollowsWhenOneOfItsFactorsIsNotOne) {
    Params params;
    params.linearBulkViscosity = 0.5;
    EXPECT_EQ(Written(oif_SectionControls(params, "EC-2", false)),
              "*Section Controls, name=EC-2\n1., 1., 1., 0.5, 1.\n");
    params.linearBulkViscosity = 1.0;
    params.quadraticBulkViscosity = 2.0;
    EXPECT_EQ(Standard(params), "*Section Controls, name=EC-1\n1., 1., 1., 1., 2.\n");
    params.quadraticBulkViscosity = 1.0 + 5e-7;
    params.stressRate = Params::StressRateEnm::SPIN;
    EXPECT_EQ(Standard(params), "*Section Controls, name=EC-1, stress rate=SPIN\n1., 1., 1.\n");
}

} // namespace
