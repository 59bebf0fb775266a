#include "materials/Materials.h"

// Fluids and sorption, user materials, gaskets.

namespace {

std::string Gasket(void (*set)(kmaC_ThicknessBehavior&)) {
    return Written(oif_GasketThicknessBehavior(With<kmaC_ThicknessBehavior>(set)));
}
std::string Area(void (*set)(kmaC_ContactArea&)) {
    return Written(oif_GasketContactArea(With<kmaC_ContactArea>(set)));
}
std::string Membrane(void (*set)(kmaC_MembraneElastic&)) {
    return Written(oif_GasketElasticity(With<kmaC_MembraneElastic>(set)));
}
std::string TransverseShear(void (*set)(kmaC_TransShearElastic&)) {
    return Written(oif_GasketElasticity(With<kmaC_TransShearElastic>(set)));
}

#define CASE_OF(writer, ...) ([] { return writer([](auto& o) { __VA_ARGS__; }); })

const TextCase kCases[] = {
    {"AcousticMedium_VolumetricDrag_IsASecondBlock",
     KEYWORD(AcousticMedium, o.table = Table({{2200}}); o.volumetricDrag = true;
             o.volumetricDragTable = Table({{5, 10}})),
     "*Acoustic Medium\n2200.,\n*Acoustic Medium, Volumetric Drag\n5.,10.\n"},
    {"AcousticMedium_DragWithoutItsFlag_IsLeftOut",
     KEYWORD(AcousticMedium, o.volumetricDragTable = Table({{5, 10}})), "*Acoustic Medium\n"},
    {"AcousticMedium_BothBlocks_HaveDependenciesOfTheirOwn",
     KEYWORD(AcousticMedium, o.table = Table({{2200, 7}}); o.dependencies = 1; o.volumetricDrag = true;
             o.volumetricDragTable = Table({{5, 1, 8, 9}}); o.volumetricDragDependencies = 2),
     "*Acoustic Medium, dependencies=1\n2200., ,7.\n*Acoustic Medium, Volumetric Drag, dependencies=2\n"
     "5.,1., ,8.,9.\n"},
    {"AcousticMedium_TemperatureOfTheDrag_LeavesItWithoutABlank",
     KEYWORD(AcousticMedium, o.volumetricDrag = true; o.volumetricDragTable = Table({{5, 1, 8, 9}});
             o.volumetricDragDependencies = 1; o.volumetricDragTemperatureDependency = true),
     "*Acoustic Medium\n*Acoustic Medium, Volumetric Drag, dependencies=1\n5.,1.,8.,9.\n"},

    {"Sorption_Defaults_AreOneTabularBlock", KEYWORD(Sorption, o.absorptionTable = Table({{-10, 0.5}})),
     "*Sorption\n-10., 0.5\n"},
    {"Sorption_LogLaw_IsWritten", KEYWORD(Sorption, Number(o.lawAbsorption, 0)), "*Sorption, law=LOG\n"},
    {"Sorption_AllBlocks_StandInOrder",
     KEYWORD(Sorption, o.absorptionTable = Table({{1, 2}}); o.exsorption = true; Number(o.lawExsorption, 0);
             o.exsorptionTable = Table({{3, 4}}); o.scanning = 12.5),
     "*Sorption\n1.,2.\n*Sorption, type=Exsorption, law=LOG\n3.,4.\n*Sorption, type=Scanning\n12.5\n"},
    {"Sorption_ScanningOfZero_IsLeftOut",
     KEYWORD(Sorption, o.exsorption = true; o.exsorptionTable = Table({{3, 4}})),
     "*Sorption\n*Sorption, type=Exsorption\n3.,4.\n"},
    {"Sorption_ScanningWithoutExsorption_IsLeftOut",
     KEYWORD(Sorption, o.scanning = 12.5; o.exsorptionTable = Table({{3, 4}})), "*Sorption\n"},

    {"UserMaterial_Mechanical_HasNoType",
     KEYWORD(UserMaterial, o.mechanicalConstants = cow_List<double>(1, 2); o.thermalConstants.Append(3)),
     "*User Material, constants=2\n1.,2.\n"},
    {"UserMaterial_Thermal_HasItsOwnBlockAlone",
     KEYWORD(UserMaterial, Number(o.type, 1); o.mechanicalConstants = cow_List<double>(1, 2);
             o.thermalConstants.Append(3); o.unsymm = true),
     "*User Material, constants=1, type=THERMAL, unsymm\n3.,\n"},
    {"UserMaterial_Both_HaveTwoBlocksWithTypes",
     KEYWORD(UserMaterial, Number(o.type, 2); o.mechanicalConstants = cow_List<double>(1, 2);
             o.thermalConstants.Append(3); o.unsymm = true),
     "*User Material, constants=2, type=MECHANICAL, unsymm\n1.,2.\n"
     "*User Material, constants=1, type=THERMAL, unsymm\n3.,\n"},
    {"UserMaterial_AnyOtherType_IsBoth", KEYWORD(UserMaterial, Number(o.type, 3)),
     "*User Material, constants=0, type=MECHANICAL\n*User Material, constants=0, type=THERMAL\n"},
    {"UserMaterial_WithoutConstants_HasNoDataLine", KEYWORD(UserMaterial, o.unsymm = true),
     "*User Material, constants=0, unsymm\n"},
    {"UserMaterial_NineConstants_TakeTwoLines",
     KEYWORD(UserMaterial, for (int i = 1; i <= 9; ++i) o.mechanicalConstants.Append(i)),
     "*User Material, constants=9\n1.,2.,3.,4.,5.,6.,7.,8.\n9.,\n"},

    {"GasketElasticity_Membrane_HasItsComponent", CASE_OF(Membrane, o.table = Table({{10, 0.25}})),
     "*Gasket elasticity, component=MEMBRANE\n10., 0.25\n"},
    {"GasketElasticity_FieldsOfTheMembrane_GetNoBlankOnPurpose",
     CASE_OF(Membrane, o.table = Table({{10, 5}}); o.dependencies = 1),
     "*Gasket elasticity, dependencies=1, component=MEMBRANE\n10.,5.\n"},
    {"GasketElasticity_NegativeDependencies_AreWrittenSinceNotZero", CASE_OF(Membrane, o.dependencies = -1),
     "*Gasket elasticity, dependencies=-1, component=MEMBRANE\n"},
    {"GasketElasticity_TransverseShear_HasNoComponent",
     CASE_OF(TransverseShear, o.table = Table({{10, 5}}); o.dependencies = 1),
     "*Gasket elasticity, dependencies=1\n10.,5.\n"},
    {"GasketElasticity_ShearByForce_SaysSo", CASE_OF(TransverseShear, Number(o.variableUnits, 1)),
     "*Gasket elasticity, variable=FORCE\n"},
    {"GasketElasticity_ShearByAnyOtherUnits_SaysNothing",
     CASE_OF(TransverseShear, Number(o.variableUnits, 2)), "*Gasket elasticity\n"},

    {"GasketThickness_Defaults_AreLeftOut", CASE_OF(Gasket, o.table = Table({{1, 2}})),
     "*Gasket Thickness Behavior\n1.,2.\n"},
    {"GasketThickness_AllParameters_StandInOrder",
     CASE_OF(Gasket, Number(o.yieldOnsetMethod, 1); o.yieldOnset = 0.1; Number(o.variableUnits, 1);
             Number(o.type, 1); o.tensileStiffnessFactor = 0.01; o.dependencies = 1),
     "*Gasket Thickness Behavior, dependencies=1, tensile stiffness factor=0.01, type=DAMAGE, "
     "variable=FORCE, yield onset=0.1\n"},
    {"GasketThickness_RelativeDrop_IsTheSameFieldUnderAnotherName", CASE_OF(Gasket, o.yieldOnset = 0.2),
     "*Gasket Thickness Behavior, slope drop=0.2\n"},
    {"GasketThickness_AnyOtherType_IsDamageToo", CASE_OF(Gasket, Number(o.type, 2)),
     "*Gasket Thickness Behavior, type=DAMAGE\n"},
    {"GasketThickness_FieldsOfBothTables_GetNoBlankOnPurpose",
     CASE_OF(Gasket, o.table = Table({{1, 2, 3}}); o.dependencies = 1;
             o.unloadingTable = Table({{4, 5, 6, 7}}); o.unloadingDependencies = 2),
     "*Gasket Thickness Behavior, dependencies=1\n1.,2.,3.\n"
     "*Gasket Thickness Behavior, direction=UNLOADING, dependencies=2, type=DAMAGE\n4.,5.,6.,7.\n"},
    {"GasketThickness_UnloadingOfAnElasticPlasticOne_IsDamageOnPurpose",
     CASE_OF(Gasket, o.unloadingTable = Table({{4, 5, 6}}); Number(o.variableUnits, 1)),
     "*Gasket Thickness Behavior, variable=FORCE\n"
     "*Gasket Thickness Behavior, direction=UNLOADING, type=DAMAGE, variable=FORCE\n4.,5.,6.\n"},
    {"GasketThickness_WithoutUnloadingRows_HasOneBlock",
     CASE_OF(Gasket, o.unloadingDependencies = 2; Number(o.type, 1)),
     "*Gasket Thickness Behavior, type=DAMAGE\n"},
    {"GasketThickness_ContactArea_NeedsForce",
     CASE_OF(Gasket, Number(o.variableUnits, 1); o.contactArea = kmaC_ContactArea()),
     "*Gasket Thickness Behavior, variable=FORCE\n*Gasket contact area\n"},
    {"GasketThickness_ContactAreaOfStress_IsLeftOut", CASE_OF(Gasket, o.contactArea = kmaC_ContactArea()),
     "*Gasket Thickness Behavior\n"},

    {"GasketContactArea_WithoutFields_IsKeywordAndTable", CASE_OF(Area, o.table = Table({{1, 2}})),
     "*Gasket contact area\n1.,2.\n"},
    {"GasketContactArea_Dependencies_StandAheadOfTheFirstRowInItsLineOnPurpose",
     CASE_OF(Area, o.dependencies = 1; o.table = Table({{1, 2, 3}, {4, 5, 6}})),
     "*Gasket contact area\n, dependencies=11.,2.,3.\n4.,5.,6.\n"},
    {"GasketContactArea_DependenciesWithoutRows_LeaveTheLineOpenOnPurpose", CASE_OF(Area, o.dependencies = 1),
     "*Gasket contact area\n, dependencies=1"},
};

class OtherOptions : public testing::TestWithParam<TextCase> {};

} // namespace

TEST_P(OtherOptions, Of) {
    EXPECT_EQ(GetParam().write(), GetParam().expected);
}

INSTANTIATE_TEST_SUITE_P(Each, OtherOptions, testing::ValuesIn(kCases), TextCaseName);
