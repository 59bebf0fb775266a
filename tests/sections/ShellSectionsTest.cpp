#include "sections/SectionTesting.h"
#include "sections/oif_ShellSections.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/sections/kseC_SolidSections.h"

namespace {

using Shell = kseC_HomogenousShellSection;
using Composite = kseC_CompositeShellSection;
using Geometry = kseC_GeometryShellSection;

class OtherShell final : public cls_RecordOf<OtherShell, kseC_GeometryShellSection> {
public:
    static constexpr cls_ClassInfo Class{"OtherShell", "a shell of the tests"};
};

Shell Steel() {
    Shell shell;
    shell.thickness = 0.01;
    shell.materialName = "Steel";
    return shell;
}

kseC_CompositeShellLayer Layer(double thickness, int points, const char* material, const char* orientation,
                               double angle) {
    kseC_CompositeShellLayer layer;
    layer.thickness = thickness;
    layer.integrationPoints = points;
    layer.materialName = material;
    layer.orientationName = orientation;
    layer.orientationAngle = angle;
    return layer;
}

Composite TwoLayers() {
    Composite shell;
    shell.layers = ListOf({Layer(0.5, 3, "My Ply", "", 45.0), Layer(0.25, 5, "Core", "My Ori", 90.0)});
    return shell;
}

kseC_RebarLayer Rebar(const char* name, const char* orientation) {
    kseC_RebarLayer layer;
    layer.name = name;
    layer.area = 0.5;
    layer.spacing = 0.25;
    layer.angularSpacing = 7.5;
    layer.position = -0.125;
    layer.materialName = "Steel";
    layer.orientationName = orientation;
    layer.orientationAngle = 30.0;
    return layer;
}

kseC_RebarLayers Rebars(std::initializer_list<kseC_RebarLayer> layers) {
    kseC_RebarLayers rebars;
    rebars.layers = ListOf(layers);
    return rebars;
}

void SetAllOptions(Geometry& shell) {
    shell.temperatureMode = Geometry::TemperatureModeEnm::POINTWISE;
    shell.temperaturePoints = 7;
    shell.integrationRule = Geometry::IntegrationRuleEnm::GAUSS;
    shell.poissonDefinition = Geometry::PoissonDefinitionEnm::VALUE;
    shell.poisson = 0.4;
    shell.thicknessModulus = 2500.0;
}

TEST(ShellSection, Homogeneous_HasThicknessAndIntegrationPoints) {
    EXPECT_EQ(Written(oif_ShellSection("SET", Steel(), "", "", 0.0)),
              "*Shell Section, elset=SET, material=Steel\n0.01, 5\n");
}

TEST(ShellSection, HomogeneousOfGeneralKeyword_EndsItsLineBehindTheCommaAsWanted) {
    Shell shell = Steel();
    shell.useGeneralKeyword = true;
    shell.materialName = "My Steel";
    EXPECT_EQ(Written(oif_ShellSection("SET", shell, "", "", 0.0)),
              "*Shell General Section, elset=SET, material=\"My Steel\"\n0.01, \n");
}

TEST(ShellSection, HomogeneousWithEverything_StandsInOrder) {
    Shell shell = Steel();
    SetAllOptions(shell);
    // 132 bytes with the comma behind the Poisson's ratio.
    EXPECT_EQ(Written(oif_ShellSection("SET", shell, "Ori-1", "EC-1", -0.5)),
              "*Shell Section, elset=SET, orientation=Ori-1, controls=EC-1, temperature=7, material=Steel, "
              "section integration=GAUSS, poisson=0.4, \n"
              "thickness modulus=2500., offset=-0.5, stack direction=ORIENTATION\n"
              "0.01, 5\n");
}

TEST(ShellSection, OptionsAtTheirDefaults_AreNotWritten) {
    Shell shell = Steel();
    shell.temperaturePoints = 9;
    shell.poisson = 0.1;
    EXPECT_EQ(Written(oif_ShellSection("SET", shell, "Ori-1", "", 0.0)),
              "*Shell Section, elset=SET, orientation=Ori-1, material=Steel\n0.01, 5\n");
}

TEST(ShellSection, ModulusThatIsNotPositive_LeavesTheStackDirectionAloneAsWanted) {
    Shell shell = Steel();
    shell.thicknessModulus = 0.0;
    EXPECT_EQ(Written(oif_ShellSection("SET", shell, "Ori-1", "", 0.0)),
              "*Shell Section, elset=SET, orientation=Ori-1, material=Steel, stack "
              "direction=ORIENTATION\n0.01, 5\n");
    shell.thicknessModulus = -1.0;
    EXPECT_EQ(Written(oif_ShellSection("SET", shell, "", "", 0.0)),
              "*Shell Section, elset=SET, material=Steel\n0.01, 5\n");
}

TEST(ShellSection, ModulusWithoutOrientation_HasNoStackDirection) {
    Shell shell = Steel();
    shell.thicknessModulus = 10.0;
    EXPECT_EQ(Written(oif_ShellSection("SET", shell, "", "", 0.0)),
              "*Shell Section, elset=SET, material=Steel, thickness modulus=10.\n0.01, 5\n");
}

TEST(ShellSection, Composite_HasOrientationOrAngleOfEachLayer) {
    EXPECT_EQ(Written(oif_ShellSection("SET", TwoLayers(), "", "", 0.0)),
              "*Shell Section, elset=SET, composite\n"
              "0.5, 3, \"My Ply\", 45.\n"
              "0.25, 5, Core, \"My Ori\"\n");
}

TEST(ShellSection, CompositeOfGeneralKeyword_LeavesTheIntegrationPointsBlank) {
    Composite shell = TwoLayers();
    shell.useGeneralKeyword = true;
    EXPECT_EQ(Written(oif_ShellSection("SET", shell, "", "", 0.0)),
              "*Shell General Section, elset=SET, composite\n"
              "0.5, , \"My Ply\", 45.\n"
              "0.25, , Core, \"My Ori\"\n");
}

TEST(ShellSection, CompositeWithEverything_StandsInOrderWithoutMaterial) {
    Composite shell = TwoLayers();
    SetAllOptions(shell);
    // 127 bytes with the comma behind the Poisson's ratio, 152 with that behind the modulus.
    EXPECT_EQ(Written(oif_ShellSection("SET", shell, "Ori-1", "EC-1", 0.5)),
              "*Shell Section, elset=SET, composite, orientation=Ori-1, controls=EC-1, temperature=7, "
              "section integration=GAUSS, poisson=0.4, thickness modulus=2500., \n"
              "offset=0.5, stack direction=ORIENTATION\n"
              "0.5, 3, \"My Ply\", 45.\n"
              "0.25, 5, Core, \"My Ori\"\n");
}

TEST(ShellSection, Rebars_FollowTheDataLines) {
    Shell shell = Steel();
    shell.rebars = Rebars({Rebar("R1", "")});
    EXPECT_EQ(Written(oif_ShellSection("SET", shell, "Ori-1", "", 0.0)),
              "*Shell Section, elset=SET, orientation=Ori-1, material=Steel\n"
              "0.01, 5\n"
              "*Rebar Layer\n"
              "R1, 0.5, 0.25, -0.125, Steel, 30., 1\n");
    Composite composite = TwoLayers();
    composite.rebars = Rebars({Rebar("R1", "Ori-2")});
    EXPECT_EQ(Written(oif_ShellSection("SET", composite, "", "", 0.0)),
              "*Shell Section, elset=SET, composite\n"
              "0.5, 3, \"My Ply\", 45.\n"
              "0.25, 5, Core, \"My Ori\"\n"
              "*Rebar Layer, orientation=Ori-2\n"
              "R1, 0.5, 0.25, -0.125, Steel, , 1\n");
}

TEST(ShellSection, UserShell_RaisesBehindTheParametersAndHasNoOrientation) {
    kseC_UserShellSection shell;
    EXPECT_EQ(Failing(oif_ShellSection("SET", shell, "Ori-1", "EC-1", 0.5)),
              "*Shell General Section, elset=SET, controls=EC-1|Shell general section unimplemented");
    shell.symmetric = false;
    EXPECT_EQ(Failing(oif_ShellSection("SET", shell, "", "", 0.0)),
              "*Shell General Section, elset=SET, unsymm|Shell general section unimplemented");
}

TEST(ShellSection, GeneralOrUnknownShell_RaisesBeforeAnythingIsWritten) {
    EXPECT_EQ(Failing(oif_ShellSection("SET", kseC_GeneralShellSection(), "Ori-1", "EC-1", 0.5)),
              "|Shell general section unimplemented");
    cls_Classes().Add<OtherShell>();
    EXPECT_EQ(Failing(oif_ShellSection("SET", OtherShell(), "Ori-1", "EC-1", 0.5)),
              "|Shell general section unimplemented");
}

TEST(ShellSection, SectionThatIsNoShell_FailsTheClassCheck) {
    const std::string failing = Failing(oif_ShellSection("SET", kseC_TrussSection(), "", "", 0.0));
    EXPECT_TRUE(
        failing.starts_with("|class check failed: found kseC_TrussSection, expected kseC_ShellSection ("))
        << failing;
}

TEST(ShellGeneralSection, UserShell_AlwaysRaisesBehindTheParameters) {
    EXPECT_EQ(Failing(oif_ShellGeneralSection("SET", kseC_UserShellSection(), "", "", 0.5)),
              "*Shell General Section, elset=SET|Shell general section unimplemented");
}

TEST(ShellGeneralSection, OffsetOfZero_IsTheOnlyOneWrittenAsWanted) {
    kseC_UserShellSection shell;
    shell.symmetric = false;
    EXPECT_EQ(Failing(oif_ShellGeneralSection("SET", shell, "Ori-1", "EC-1", 0.0)),
              "*Shell General Section, elset=SET, orientation=Ori-1, controls=EC-1, unsymm, offset=0."
              "|Shell general section unimplemented");
    EXPECT_EQ(Failing(oif_ShellGeneralSection("SET", shell, "Ori-1", "EC-1", -0.5)),
              "*Shell General Section, elset=SET, orientation=Ori-1, controls=EC-1, unsymm"
              "|Shell general section unimplemented");
}

TEST(ShellGeneralSection, ShellOfAnotherKind_WritesNothing) {
    EXPECT_EQ(Written(oif_ShellGeneralSection("SET", Steel(), "Ori-1", "EC-1", 0.0)), "");
}

TEST(RebarLayer, NoLayers_WriteNothing) {
    EXPECT_EQ(Written(oif_RebarLayer({}, "Ori-1", false)), "");
}

TEST(RebarLayer, LayersOfBothKinds_CommonOnesComeFirst) {
    EXPECT_EQ(Written(oif_RebarLayer(Rebars({Rebar("Own 1", "My Ori"), Rebar("A", ""), Rebar("Own2", "Ori-3"),
                                             Rebar("B b", "")}),
                                     "Ori 1", false)),
              "*Rebar Layer, orientation=\"Ori 1\"\n"
              "A, 0.5, 0.25, -0.125, Steel, 30., 1\n"
              "\"B b\", 0.5, 0.25, -0.125, Steel, 30., 1\n"
              "*Rebar Layer, orientation=\"My Ori\"\n"
              "\"Own 1\", 0.5, 0.25, -0.125, Steel, , 1\n"
              "*Rebar Layer, orientation=Ori-3\n"
              "Own2, 0.5, 0.25, -0.125, Steel, , 1\n");
}

TEST(RebarLayer, AllWithTheirOwnOrientation_HaveNoCommonKeyword) {
    EXPECT_EQ(Written(oif_RebarLayer(Rebars({Rebar("A", "Ori-2")}), "Ori-1", false)),
              "*Rebar Layer, orientation=Ori-2\n"
              "A, 0.5, 0.25, -0.125, Steel, , 1\n");
}

TEST(RebarLayer, Angular_HasTheAngularSpacing) {
    kseC_RebarLayers rebars = Rebars({Rebar("A", ""), Rebar("B", "Ori-2")});
    rebars.spacingType = kseC_RebarLayers::SpacingTypeEnm::ANGULAR;
    rebars.layers.Get(0).materialName = "My Steel";
    EXPECT_EQ(Written(oif_RebarLayer(rebars, "Ori-1", false)),
              "*Rebar Layer, angular spacing, orientation=Ori-1\n"
              "A, 0.5, 7.5, -0.125, \"My Steel\", 30., 1\n"
              "*Rebar Layer, angular spacing, orientation=Ori-2\n"
              "B, 0.5, 7.5, -0.125, Steel, , 1\n");
}

TEST(RebarLayer, SpacingBeyondTheKnown_HasTheAngularSpacingWithoutItsParameter) {
    kseC_RebarLayers rebars = Rebars({Rebar("A", "")});
    rebars.spacingType = static_cast<kseC_RebarLayers::SpacingTypeEnm>(2);
    EXPECT_EQ(Written(oif_RebarLayer(rebars, "", false)),
              "*Rebar Layer\nA, 0.5, 7.5, -0.125, Steel, 30., 1\n");
}

TEST(RebarLayer, PositionOmitted_LeavesItsPlaceBlank) {
    EXPECT_EQ(Written(oif_RebarLayer(Rebars({Rebar("A", ""), Rebar("B", "Ori-2")}), "", true)),
              "*Rebar Layer\n"
              "A, 0.5, 0.25, , Steel, 30., 1\n"
              "*Rebar Layer, orientation=Ori-2\n"
              "B, 0.5, 0.25, , Steel, , 1\n");
}

template <class Record>
Record Stiffness(double k11, double k22) {
    Record record;
    record.k11 = k11;
    record.k22 = k22;
    return record;
}

TEST(TransverseShear, OfShell_HasThreeValues) {
    auto stiffness = Stiffness<kseC_TransverseShearShell>(1.0, 2.0);
    stiffness.k12 = 3.5;
    EXPECT_EQ(Written(oif_TransverseShear(stiffness)), "*Transverse Shear\n1., 2., 3.5\n");
}

TEST(TransverseShear, OfBeam_HasTwoValues) {
    EXPECT_EQ(Written(oif_TransverseShear(Stiffness<kseC_TransverseShearBeam>(1.0, 2.0))),
              "*Transverse Shear\n1., 2.\n");
}

TEST(TransverseShear, ZeroOfOneDirection_TakesTheValueOfTheOther) {
    EXPECT_EQ(Written(oif_TransverseShear(Stiffness<kseC_TransverseShearShell>(0.0, 2.0))),
              "*Transverse Shear\n2., 2., 0.\n");
    EXPECT_EQ(Written(oif_TransverseShear(Stiffness<kseC_TransverseShearBeam>(3.0, 0.0))),
              "*Transverse Shear\n3., 3.\n");
    EXPECT_EQ(Written(oif_TransverseShear(Stiffness<kseC_TransverseShearShell>(0.0, 0.0))),
              "*Transverse Shear\n0., 0., 0.\n");
}

} // namespace
