#include "sections/SectionTesting.h"
#include "sections/oif_SolidSections.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/sections/kseC_BeamSection.h"
#include "store_interface/records/sections/kseC_SolidSections.h"

namespace {

/// Neither homogeneous nor composite.
class OtherSolid final : public cls_RecordOf<OtherSolid, kseC_SolidSection> {
public:
    static constexpr cls_ClassInfo Class{"OtherSolid", "a solid of the tests"};
};

kseC_CompositeSolidLayer Layer(double thickness, int points, const char* material, double angle) {
    kseC_CompositeSolidLayer layer;
    layer.thickness = thickness;
    layer.integrationPoints = points;
    layer.materialName = material;
    layer.orientationAngle = angle;
    return layer;
}

kseC_CompositeSolidSection ThreeLayers() {
    kseC_CompositeSolidSection section;
    section.layers = ListOf(
        {Layer(0.5, 3, "Steel", 45.0), Layer(1e-5, 1, "My Resin", 0.0), Layer(1234567.0, 5, "Steel", -22.5)});
    return section;
}

template <class Section>
Section Of(const char* material) {
    Section section;
    section.materialName = material;
    return section;
}

using Solid = kseC_HomogenousSolidSection;
using Truss = kseC_TrussSection;
using Membrane = kseC_MembraneSection;
using Gasket = kseC_GasketSection;

TEST(SolidSection, Homogeneous_HasMaterialBehindTheOtherParametersAndCommaBehindItsThickness) {
    EXPECT_EQ(Written(oif_SolidSection("SET", Of<Solid>("Steel"), "", "")),
              "*Solid Section, elset=SET, material=Steel\n1.,\n");
    Solid section = Of<Solid>("My Steel");
    section.thickness = 0.25;
    EXPECT_EQ(Written(oif_SolidSection("SET", section, "Ori-1", "EC-1")),
              "*Solid Section, elset=SET, orientation=Ori-1, controls=EC-1, material=\"My Steel\"\n0.25,\n");
}

TEST(SolidSection, NamesGivenPrintable_StandAsTheyAre) {
    EXPECT_EQ(Written(oif_SolidSection("My Set", Of<Solid>("Steel"), "My Ori", "My EC")),
              "*Solid Section, elset=My Set, orientation=My Ori, controls=My EC, material=Steel\n1.,\n");
}

TEST(SolidSection, Composite_HasLayersInNumbersWithoutPointAndBareMaterialNames) {
    EXPECT_EQ(Written(oif_SolidSection("SET", ThreeLayers(), "Ori-1", "EC-1")),
              "*Solid Section, elset=SET, composite, orientation=Ori-1, controls=EC-1\n"
              "0.5, 3, Steel, 45\n"
              "1e-05, 1, My Resin, 0\n"
              "1.23457e+06, 5, Steel, -22.5\n");
}

TEST(SolidSection, SymmetricComposite_WritesTheMiddleLayerTwiceAsWanted) {
    kseC_CompositeSolidSection section = ThreeLayers();
    section.symmetric = true;
    EXPECT_EQ(Written(oif_SolidSection("SET", section, "", "")), "*Solid Section, elset=SET, composite\n"
                                                                 "0.5, 3, Steel, 45\n"
                                                                 "1e-05, 1, My Resin, 0\n"
                                                                 "1.23457e+06, 5, Steel, -22.5\n"
                                                                 "1.23457e+06, 5, Steel, -22.5\n"
                                                                 "1e-05, 1, My Resin, 0\n"
                                                                 "0.5, 3, Steel, 45\n");
}

TEST(SolidSection, SymmetricCompositeOfTwoLayers_IsRepeatedOfOneLayerIsNot) {
    kseC_CompositeSolidSection section;
    section.symmetric = true;
    section.layers.Append(Layer(1.0, 1, "A", 0.0));
    EXPECT_EQ(Written(oif_SolidSection("SET", section, "", "")),
              "*Solid Section, elset=SET, composite\n1, 1, A, 0\n");
    section.layers.Append(Layer(2.0, 3, "B", 90.0));
    EXPECT_EQ(Written(oif_SolidSection("SET", section, "", "")),
              "*Solid Section, elset=SET, composite\n1, 1, A, 0\n2, 3, B, 90\n2, 3, B, 90\n1, 1, A, 0\n");
}

TEST(SolidSection, CompositeWithoutLayers_IsItsKeywordLine) {
    EXPECT_EQ(Written(oif_SolidSection("SET", kseC_CompositeSolidSection(), "", "")),
              "*Solid Section, elset=SET, composite\n");
}

TEST(SolidSection, Truss_IgnoresOrientationAndControlsAsWanted) {
    Truss section = Of<Truss>("My Steel");
    section.area = 0.02;
    EXPECT_EQ(Written(oif_SolidSection("SET", section, "Ori-1", "EC-1")),
              "*Solid Section, elset=SET, material=\"My Steel\"\n0.02,\n");
}

TEST(SolidSection, SectionOfAnotherKind_RaisesBeforeAnythingIsWritten) {
    EXPECT_EQ(Failing(oif_SolidSection("SET", kseC_BeamSection(), "Ori-1", "EC-1")),
              "|Neither solid nor truss section type");
}

TEST(SolidSection, UnknownSolid_RaisesBehindTheParameters) {
    cls_Classes().Add<OtherSolid>();
    EXPECT_EQ(Failing(oif_SolidSection("SET", OtherSolid(), "Ori-1", "EC-1")),
              "*Solid Section, elset=SET, orientation=Ori-1, controls=EC-1|Unknown solid section type");
}

TEST(SolidSection, LongLine_BreaksBehindTheCommaOfAParameter) {
    // "*Solid Section, elset=" has 22 bytes and ", " two: with 107 the line is at its limit, not past it.
    const std::string atLimit(107, 's');
    EXPECT_EQ(Written(oif_SolidSection(cow_String(atLimit), Of<Solid>("Steel"), "", "")),
              "*Solid Section, elset=" + atLimit + ", material=Steel\n1.,\n");
    const std::string pastLimit(108, 's');
    EXPECT_EQ(Written(oif_SolidSection(cow_String(pastLimit), Of<Solid>("Steel"), "Ori-1", "EC-1")),
              "*Solid Section, elset=" + pastLimit +
                  ", \norientation=Ori-1, controls=EC-1, material=Steel\n1.,\n");
}

TEST(MembraneSection, Plain_HasMaterialFirst) {
    EXPECT_EQ(Written(oif_MembraneSection("SET", Of<Membrane>("My Rubber"), "", "")),
              "*Membrane Section, elset=SET, material=\"My Rubber\"\n1.,\n");
}

TEST(MembraneSection, AllGiven_StandsInOrder) {
    Membrane section = Of<Membrane>("Rubber");
    section.thickness = 0.1;
    section.poissonDefinition = Membrane::PoissonDefinitionEnm::VALUE;
    section.poisson = 0.0;
    EXPECT_EQ(Written(oif_MembraneSection("SET", section, "Ori-1", "EC-1")),
              "*Membrane Section, elset=SET, material=Rubber, orientation=Ori-1, controls=EC-1, "
              "poisson=0.\n0.1,\n");
}

TEST(MembraneSection, PoissonByDefault_IsNotWritten) {
    Membrane section = Of<Membrane>("Rubber");
    section.poisson = 0.3;
    EXPECT_EQ(Written(oif_MembraneSection("SET", section, "", "")),
              "*Membrane Section, elset=SET, material=Rubber\n1.,\n");
}

TEST(MembraneSection, SectionOfAnotherKind_FailsTheClassCheck) {
    const std::string failing = Failing(oif_MembraneSection("SET", Of<Truss>("Steel"), "", ""));
    EXPECT_TRUE(
        failing.starts_with("|class check failed: found kseC_TrussSection, expected kseC_MembraneSection ("))
        << failing;
}

TEST(GasketSection, ThicknessUnset_LeavesTheFirstItemBlankAsWanted) {
    EXPECT_EQ(Written(oif_GasketSection("SET", Of<Gasket>("Seal"), false, "")),
              "*Gasket Section, elset=SET, material=Seal\n, 0., 0., 1.\n");
}

TEST(GasketSection, Behavior_NamesTheMaterialAsOne) {
    EXPECT_EQ(Written(oif_GasketSection("SET", Of<Gasket>("My Seal"), true, "")),
              "*Gasket Section, elset=SET, behavior=\"My Seal\"\n, 0., 0., 1.\n");
}

TEST(GasketSection, AllGiven_StandsInOrder) {
    Gasket section = Of<Gasket>("Seal");
    section.crossSection = 4.0;
    section.initialGap = 2.0;
    section.initialThickness = 1.5;
    section.initialVoid = 3.0;
    section.stabilizationStiffness = 1000.0;
    EXPECT_EQ(Written(oif_GasketSection("SET", section, true, "Ori-1")),
              "*Gasket Section, elset=SET, behavior=Seal, orientation=Ori-1, stabilization stiffness=1000.\n"
              "1.5, 2., 3., 4.\n");
}

TEST(GasketSection, LongLine_BreaksBeforeTheCommaOfMaterialAndStiffness) {
    Gasket section = Of<Gasket>("Seal");
    section.stabilizationStiffness = 1.0;
    // "*Gasket Section, elset=" has 23 bytes; ", material=" and the name 15.
    const std::string material(109, 's');
    EXPECT_EQ(Written(oif_GasketSection(cow_String(material), section, false, "")),
              "*Gasket Section, elset=" + material +
                  "\n, material=Seal, stabilization stiffness=1.\n, 0., 0., 1.\n");
    const std::string stiffness(94, 's');
    EXPECT_EQ(Written(oif_GasketSection(cow_String(stiffness), section, false, "")),
              "*Gasket Section, elset=" + stiffness +
                  ", material=Seal\n, stabilization stiffness=1.\n, 0., 0., 1.\n");
}

TEST(GasketSection, SectionOfAnotherKind_WritesNothing) {
    EXPECT_EQ(Written(oif_GasketSection("SET", Of<Truss>("Steel"), true, "Ori-1")), "");
}

} // namespace
