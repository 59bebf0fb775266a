#include "sections/SectionTesting.h"
#include "sections/oif_BeamSections.h"
#include "store_interface/records/sections/kseC_SolidSections.h"

namespace {

using Beam = kseC_BeamSection;

class OtherProfile final : public cls_RecordOf<OtherProfile, kbpC_BeamProfile> {
public:
    static constexpr cls_ClassInfo Class{"OtherProfile", "a profile of the tests"};
};

Beam Integrated() {
    Beam section;
    section.materialName = "Steel";
    return section;
}

Beam General() {
    Beam section;
    section.integration = Beam::IntegrationEnm::BEFORE_ANALYSIS;
    return section;
}

kbpC_CircularProfile Circle() {
    kbpC_CircularProfile circle;
    circle.r = 0.5;
    return circle;
}

std::string WrittenIntegrated(const Beam& section, const kbpC_BeamProfile& profile = Circle()) {
    return Written(oif_BeamSection("SET", mdl_ObjCow<kseC_Section>(section), {0.0, 0.0, -1.0}, profile));
}

std::string WrittenGeneral(const Beam& section, const kbpC_BeamProfile& profile = Circle()) {
    return Written(
        oif_BeamGeneralSection("SET", mdl_ObjCow<kseC_Section>(section), {0.0, 0.0, -1.0}, profile));
}

const std::string kCircle = "section=CIRC\n0.5\n0.,0.,-1.\n";

/// A profile and its lines.
struct ProfileCase {
    const char* name;
    mdl_ObjCow<kbpC_BeamProfile> profile;
    const char* lines;
};

void PrintTo(const ProfileCase& c, std::ostream* out) {
    *out << c.name;
}

class BeamProfiles : public testing::TestWithParam<ProfileCase> {};

TEST_P(BeamProfiles, InBothSections_HaveTheSameLines) {
    const std::string lines = GetParam().lines;
    const kbpC_BeamProfile& profile = GetParam().profile.ConstGet();
    EXPECT_EQ(WrittenIntegrated(Integrated(), profile),
              "*Beam Section, elset=SET, material=Steel, temperature=GRADIENTS, " + lines + "0.,0.,-1.\n");
    EXPECT_EQ(WrittenGeneral(General(), profile),
              "*Beam General Section, elset=SET, " + lines + "0.,0.,-1.\n");
}

template <class Profile, class... Members>
Profile With(std::initializer_list<double> values, Members... members) {
    Profile profile;
    const double* value = values.begin();
    ((profile.*members = *value++), ...);
    return profile;
}

using I = kbpC_IbeamProfile;
using Box = kbpC_BoxProfile;
using L = kbpC_LbeamProfile;
using T = kbpC_TbeamProfile;
using Trapezoid = kbpC_TrapezoidalProfile;

Box BoxOf(bool uniform) {
    Box box =
        With<Box>({1.0, 2.0, 0.1, 0.2, 0.3, 0.4}, &Box::a, &Box::b, &Box::t1, &Box::t2, &Box::t3, &Box::t4);
    box.uniformThickness = uniform;
    return box;
}

kbpC_PipeProfile Pipe() {
    kbpC_PipeProfile pipe;
    pipe.r = 2.0;
    pipe.t = 0.125;
    pipe.formulation = 1;
    return pipe;
}

kbpC_ArbitraryProfile Arbitrary(std::initializer_list<double> cells) {
    kbpC_ArbitraryProfile profile;
    profile.table = TableOf(3, cells);
    return profile;
}

const ProfileCase profileCases[] = {
    {"Circular", Circle(), "section=CIRC\n0.5\n"},
    {"Hexagonal",
     With<kbpC_HexagonalProfile>({3.0, 0.25}, &kbpC_HexagonalProfile::r, &kbpC_HexagonalProfile::t),
     "section=HEX\n3., 0.25\n"},
    {"PipeWithoutItsFormulation", Pipe(), "section=PIPE\n2., 0.125\n"},
    {"Ibeam",
     With<I>({1.0, 2.0, 3.0, 4.0, 5.0, 6.0, 7.0}, &I::l, &I::h, &I::b1, &I::b2, &I::t1, &I::t2, &I::t3),
     "section=I\n1., 2., 3., 4., 5., 6., 7.\n"},
    {"BoxOfFourThicknesses", BoxOf(false), "section=BOX\n1., 2., 0.1, 0.2, 0.3, 0.4\n"},
    {"BoxOfOneThickness", BoxOf(true), "section=BOX\n1., 2., 0.1, 0.1, 0.1, 0.1\n"},
    {"ArbitraryOfFourRows", Arbitrary({0, 0, 9, 1, 0, 0.1, 1, 2, 0.2, 0, 2, 0.3}),
     "section=ARBITRARY\n3, 0., 0., 1., 0., 0.1\n1., 2., 0.2\n0., 2., 0.3\n"},
    {"ArbitraryOfTwoRowsHasAnEmptyLineAsWanted", Arbitrary({0.5, -1, 9, 1, 2, 0.1}),
     "section=ARBITRARY\n1, 0.5, -1., 1., 2., 0.1\n\n"},
    {"Rectangular",
     With<kbpC_RectangularProfile>({0.1, 0.2}, &kbpC_RectangularProfile::a, &kbpC_RectangularProfile::b),
     "section=RECT\n0.1, 0.2\n"},
    {"Lbeam", With<L>({1.0, 2.0, 0.1, 0.2}, &L::a, &L::b, &L::t1, &L::t2), "section=L\n1., 2., 0.1, 0.2\n"},
    {"TbeamReadsAsAnIWithTwoZerosAsWanted",
     With<T>({1.0, 2.0, 3.0, 4.0, 5.0}, &T::b, &T::h, &T::l, &T::tf, &T::tw),
     "section=I\n3., 2., 0., 1., 0., 4., 5.\n"},
    {"Trapezoidal",
     With<Trapezoid>({1.0, 2.0, 3.0, 4.0}, &Trapezoid::a, &Trapezoid::b, &Trapezoid::c, &Trapezoid::d),
     "section=TRAPEZOID\n1., 2., 3., 4.\n"},
    // The keyword line then ends in its comma.
    {"OfAnotherClass", OtherProfile(), "\n"},
};

INSTANTIATE_TEST_SUITE_P(Cases, BeamProfiles, testing::ValuesIn(profileCases),
                         [](const auto& param) { return std::string(param.param.name); });

kbpC_GeneralizedProfile Generalized(double gammaO, double gammaW) {
    kbpC_GeneralizedProfile profile;
    profile.area = 1.0;
    profile.i11 = 2.0;
    profile.i12 = 3.0;
    profile.i22 = 4.0;
    profile.j = 5.0;
    profile.gammaO = gammaO;
    profile.gammaW = gammaW;
    return profile;
}

TEST(BeamSection, GeneralizedProfile_LeavesTheLineAtItsCommaAsWanted) {
    EXPECT_EQ(WrittenIntegrated(Integrated(), Generalized(6.0, 7.0)),
              "*Beam Section, elset=SET, material=Steel, temperature=GRADIENTS, \n0.,0.,-1.\n");
}

TEST(BeamGeneralSection, GeneralizedProfile_HasFiveOrSevenValues) {
    const std::string head = "*Beam General Section, elset=SET, section=GENERAL\n1., 2., 3., 4., 5.";
    EXPECT_EQ(WrittenGeneral(General(), Generalized(0.0, 0.0)), head + "\n0.,0.,-1.\n");
    EXPECT_EQ(WrittenGeneral(General(), Generalized(6.0, 0.0)), head + ", 6., 0.\n0.,0.,-1.\n");
    EXPECT_EQ(WrittenGeneral(General(), Generalized(0.0, 7.0)), head + ", 0., 7.\n0.,0.,-1.\n");
}

TEST(BeamSection, Direction_HasNoBlanksBetweenItsComponents) {
    EXPECT_EQ(Written(oif_BeamSection("SET", Integrated(), {1.0, 0.25, 1e-7}, Circle())),
              "*Beam Section, elset=SET, material=Steel, temperature=GRADIENTS, section=CIRC\n"
              "0.5\n1.,0.25,1e-07\n");
}

TEST(BeamSection, Parameters_StandInOrderAndLeaveOutWhatIsOfGeneralSections) {
    Beam section = Integrated();
    section.materialName = "My Steel";
    section.poisson = 0.3;
    section.temperatureVar = Beam::TemperatureVarEnm::VALUES;
    section.dependencies = 2;
    section.density = 7800.0;
    section.referenceTemperature = 20.0;
    section.alphaDamping = 1.0;
    section.materialTable = TableOf(2, {1, 2});
    section.sectionPoints = TableOf(2, {1, 2});
    section.centroid = ListOf({1.0, 2.0});
    section.shearCenter = ListOf({1.0, 2.0});
    EXPECT_EQ(WrittenIntegrated(section),
              "*Beam Section, elset=SET, material=\"My Steel\", poisson = 0.3, temperature=VALUES, " +
                  kCircle);
}

TEST(BeamSection, PoissonOfZero_IsNotWritten) {
    Beam section = Integrated();
    section.poisson = 0.0;
    EXPECT_EQ(WrittenIntegrated(section),
              "*Beam Section, elset=SET, material=Steel, temperature=GRADIENTS, " + kCircle);
    section = General();
    section.poisson = 0.0;
    EXPECT_EQ(WrittenGeneral(section), "*Beam General Section, elset=SET, " + kCircle);
}

TEST(BeamSection, ValuesBeyondTheKnown_WriteNeitherMaterialNorTemperature) {
    Beam section = Integrated();
    section.temperatureVar = static_cast<Beam::TemperatureVarEnm>(2);
    EXPECT_EQ(WrittenIntegrated(section), "*Beam Section, elset=SET, material=Steel, " + kCircle);
    section.integration = static_cast<Beam::IntegrationEnm>(2);
    EXPECT_EQ(WrittenIntegrated(section), "*Beam Section, elset=SET, " + kCircle);
    section.materialTable = TableOf(2, {1, 2});
    section.density = 1.0;
    EXPECT_EQ(WrittenGeneral(section), "*Beam General Section, elset=SET, " + kCircle);
}

TEST(BeamSection, SectionOfAnotherKind_WritesNothing) {
    EXPECT_EQ(Written(oif_BeamSection("SET", kseC_TrussSection(), {}, Circle())), "");
    EXPECT_EQ(Written(oif_BeamGeneralSection("SET", kseC_TrussSection(), {}, Circle())), "");
}

TEST(BeamSection, LongLine_BreaksBehindACommaAndNotInsideAParameter) {
    // "*Beam Section, elset=" has 21 bytes: 132 with the comma behind the set.
    const std::string set(109, 's');
    EXPECT_EQ(Written(oif_BeamSection(cow_String(set), Integrated(), {0.0, 0.0, -1.0}, Circle())),
              "*Beam Section, elset=" + set + ", \nmaterial=Steel, temperature=GRADIENTS, " + kCircle);
    // "temperature=GRADIENTS, " has 23, "material=Steel, " 16: the last comma falls on byte 132.
    const std::string shorter(70, 's');
    EXPECT_EQ(Written(oif_BeamSection(cow_String(shorter), Integrated(), {0.0, 0.0, -1.0}, Circle())),
              "*Beam Section, elset=" + shorter + ", material=Steel, temperature=GRADIENTS, \n" + kCircle);
}

TEST(BeamGeneralSection, Dependencies_StandBetweenTwoCommasAsWanted) {
    Beam section = General();
    section.dependencies = 2;
    EXPECT_EQ(WrittenGeneral(section), "*Beam General Section, elset=SET, , dependencies=2, " + kCircle);
}

TEST(BeamGeneralSection, Parameters_StandInOrder) {
    Beam section = General();
    section.dependencies = 1;
    section.poisson = 0.3;
    section.referenceTemperature = 20.0;
    section.density = 7.8e-9;
    section.temperatureVar = Beam::TemperatureVarEnm::VALUES;
    section.materialName = "Steel";
    EXPECT_EQ(WrittenGeneral(section), "*Beam General Section, elset=SET, , dependencies=1, poisson = 0.3, "
                                       "zero=20., density=7.8e-09, " +
                                           kCircle);
}

TEST(BeamGeneralSection, DensityAndTemperatureOfZero_AreNotWritten) {
    Beam section = General();
    section.density = 0.0;
    section.referenceTemperature = 0.0;
    EXPECT_EQ(WrittenGeneral(section), "*Beam General Section, elset=SET, " + kCircle);
}

TEST(BeamGeneralSection, MaterialTable_FollowsTheDirectionWithBlanksForTheCellsThatItLacks) {
    const auto tableLines = [](const cow_2DArray<double>& table, bool temperature, bool field) {
        Beam section = General();
        section.materialTable = table;
        section.temperatureDependency = temperature;
        section.useFieldColumn = field;
        const std::string text = WrittenGeneral(section);
        const std::string head = "*Beam General Section, elset=SET, " + kCircle;
        EXPECT_EQ(text.substr(0, head.size()), head);
        return text.substr(std::min(head.size(), text.size()));
    };
    // No column is ever added behind the last one.
    EXPECT_EQ(tableLines(TableOf(2, {210000, 80000}), false, false), "210000.,80000.\n");
    EXPECT_EQ(tableLines(TableOf(3, {210000, 80000, 1e-5}), true, false), "210000.,80000., 1e-05\n");
    EXPECT_EQ(tableLines(TableOf(3, {200, 80, 5}), false, true), "200.,80., , 5.\n");
    EXPECT_EQ(tableLines(TableOf(4, {200, 80, 5, 6}), true, true), "200.,80., 5., 6.\n");
    EXPECT_EQ(tableLines(TableOf(4, {200, 80, 1, 2}), false, false), "200.,80., , , 1., 2.\n");
    EXPECT_EQ(tableLines(TableOf(4, {200, 80, 5, 2}), true, false), "200.,80., 5., , 2.\n");
    EXPECT_EQ(tableLines(TableOf(4, {200, 80, 5, 2, 190, 75, 5, 3}), false, true),
              "200.,80., , 5., 2.\n190.,75., , 5., 3.\n");
    EXPECT_EQ(tableLines({}, true, true), "");
}

TEST(BeamGeneralSection, Damping_HasTheValuesThatAreNotZero) {
    const std::string head = "*Beam General Section, elset=SET, " + kCircle;
    Beam section = General();
    section.alphaDamping = 0.1;
    section.betaDamping = 0.2;
    section.compositeDamping = 0.3;
    EXPECT_EQ(WrittenGeneral(section), head + "*Damping, alpha=0.1, beta=0.2, composite=0.3\n");
    section.alphaDamping = 0.0;
    EXPECT_EQ(WrittenGeneral(section), head + "*Damping, beta=0.2, composite=0.3\n");
    section.betaDamping = 0.0;
    EXPECT_EQ(WrittenGeneral(section), head + "*Damping, composite=0.3\n");
    section.compositeDamping = 0.0;
    section.alphaDamping = -1.0;
    EXPECT_EQ(WrittenGeneral(section), head + "*Damping, alpha=-1.\n");
}

TEST(BeamGeneralSection, ShearCenterAndCentroid_AreWrittenUnlessZero) {
    const std::string head = "*Beam General Section, elset=SET, " + kCircle;
    Beam section = General();
    section.centroid = ListOf({0.0, 0.5});
    section.shearCenter = ListOf({0.25, 0.0});
    EXPECT_EQ(WrittenGeneral(section), head + "*Shear Center\n0.25, 0.\n*Centroid\n0., 0.5\n");
    section.centroid = ListOf({0.0, 0.0, 3.0});
    section.shearCenter = ListOf({2.0});
    EXPECT_EQ(WrittenGeneral(section), head + "*Shear Center\n2., 0.\n");
    section.shearCenter = {};
    EXPECT_EQ(WrittenGeneral(section), head);
}

TEST(BeamGeneralSection, SectionPoints_StandFourToALine) {
    const std::string head = "*Beam General Section, elset=SET, " + kCircle + "*Section Points\n";
    Beam section = General();
    section.sectionPoints = TableOf(2, {1, 2, 3, 4, 5, 6, 7, 8, 9, 10});
    EXPECT_EQ(WrittenGeneral(section), head + "1., 2., 3., 4., 5., 6., 7., 8.\n9., 10.\n");
    section.sectionPoints = TableOf(2, {1, 2, 3, 4, 5, 6, 7, 8});
    EXPECT_EQ(WrittenGeneral(section), head + "1., 2., 3., 4., 5., 6., 7., 8.\n");
    section.sectionPoints = TableOf(2, {1, 2});
    EXPECT_EQ(WrittenGeneral(section), head + "1., 2.\n");
}

TEST(BeamGeneralSection, AllBlocks_FollowInOrder) {
    Beam section = General();
    section.materialTable = TableOf(2, {200, 80});
    section.useFluidInertia = true;
    section.fluidValue1 = 1000.0;
    section.alphaDamping = 0.1;
    section.shearCenter = ListOf({1.0, 2.0});
    section.centroid = ListOf({3.0, 4.0});
    section.sectionPoints = TableOf(2, {5, 6});
    EXPECT_EQ(WrittenGeneral(section), "*Beam General Section, elset=SET, " + kCircle +
                                           "200.,80.\n"
                                           "*Beam Fluid Inertia\n1000., , , 0.\n"
                                           "*Damping, alpha=0.1\n"
                                           "*Shear Center\n1., 2.\n"
                                           "*Centroid\n3., 4.\n"
                                           "*Section Points\n5., 6.\n");
}

std::string FluidLines(Beam section) {
    section.useFluidInertia = true;
    const std::string text = WrittenIntegrated(section);
    const std::string head = "*Beam Section, elset=SET, material=Steel, temperature=GRADIENTS, " + kCircle;
    EXPECT_EQ(text.substr(0, head.size()), head);
    return text.substr(std::min(head.size(), text.size()));
}

TEST(BeamFluidInertia, FactorsAtTheirDefaults_EndTheLineBehindTheRadius) {
    Beam section = Integrated();
    section.fluidValue1 = 1000.0;
    section.fluidValue2 = 0.25;
    EXPECT_EQ(FluidLines(section), "*Beam Fluid Inertia\n1000., , , 0.25\n");
    section.fluidInertiaHalf = Beam::FluidInertiaEnm::HALF;
    section.fluidValue5 = 0.1;
    EXPECT_EQ(FluidLines(section), "*Beam Fluid Inertia, half\n1000., 0.1, , 0.25\n");
    section.fluidValue6 = -0.2;
    EXPECT_EQ(FluidLines(section), "*Beam Fluid Inertia, half\n1000., 0.1, -0.2, 0.25\n");
}

TEST(BeamFluidInertia, FactorsOffTheirDefaults_FollowWithABlankForTheOneThatIsNot) {
    Beam section = Integrated();
    section.fluidValue3 = 0.5;
    EXPECT_EQ(FluidLines(section), "*Beam Fluid Inertia\n0., , , 0., 0.5\n");
    section.fluidValue4 = 2.0;
    EXPECT_EQ(FluidLines(section), "*Beam Fluid Inertia\n0., , , 0., 0.5, 2.\n");
    section.fluidValue3 = 1.0;
    EXPECT_EQ(FluidLines(section), "*Beam Fluid Inertia\n0., , , 0., , 2.\n");
}

} // namespace
