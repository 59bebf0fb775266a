#include "materials/Materials.h"

// Every parameter of every option: at its default, given, and where there is one, at a number that has no
// word. Enumerations are given by their numbers.

namespace {

const TextCase kCases[] = {
    // Test data
    {"BiaxialTestData_SmoothingUnset_IsLeftOut", KEYWORD(BiaxialTestData, o.smoothing = cls_UnsetInt),
     "*Biaxial Test Data\n"},
    {"BiaxialTestData_Smoothing_StandsAheadOfDependencies",
     KEYWORD(BiaxialTestData, o.smoothing = 3; o.dependencies = 1),
     "*Biaxial Test Data, smooth=3, dependencies=1\n"},
    {"PlanarTestData_Smoothing_StandsAheadOfDependencies",
     KEYWORD(PlanarTestData, o.smoothing = 0; o.dependencies = 2),
     "*Planar Test Data, smooth=0, dependencies=2\n"},
    {"UniaxialTestData_Smoothing_StandsAheadOfDependencies",
     KEYWORD(UniaxialTestData, o.smoothing = 5; o.dependencies = 1),
     "*Uniaxial Test Data, smooth=5, dependencies=1\n"},
    {"VolumetricTestData_AllParameters_EndWithDependencies",
     KEYWORD(VolumetricTestData, o.volinf = 0.5; o.smoothing = 2; o.dependencies = 1),
     "*Volumetric Test Data, volinf=0.5, smooth=2, dependencies=1\n"},
    {"CombinedTestData_BothLimits_StandShearFirst",
     KEYWORD(CombinedTestData, o.shrinf = 0.25; o.volinf = 0.5),
     "*Combined Test Data, shrinf=0.25, volinf=0.5\n"},
    {"CombinedTestData_OneLimit_StandsAlone", KEYWORD(CombinedTestData, o.volinf = 0.0),
     "*Combined Test Data, volinf=0.\n"},
    {"ShearTestData_Limit_IsWritten", KEYWORD(ShearTestData, o.shrinf = 0.0),
     "*Shear Test Data, shrinf=0.\n"},
    {"TriaxialTestData_AllConstants_StandInOrder", KEYWORD(TriaxialTestData, o.pt = -1; o.b = 2.5; o.a = 0),
     "*Triaxial Test Data, a=0., b=2.5, pt=-1.\n"},
    {"TriaxialTestData_OneConstant_StandsAlone", KEYWORD(TriaxialTestData, o.b = 1.5),
     "*Triaxial Test Data, b=1.5\n"},
    {"Trs_Definition1_IsArrhenius", KEYWORD(Trs, Number(o.definition, 1)), "*Trs, definition=ARRHENIUS\n"},
    {"Trs_Definition2_IsUser", KEYWORD(Trs, Number(o.definition, 2)), "*Trs, definition=USER\n"},
    {"Trs_DefinitionWithoutAWord_LeavesTheNameAlone", KEYWORD(Trs, Number(o.definition, 9)),
     "*Trs, definition=\n"},

    // Elasticity
    {"Hypoelastic_User_IsAWord", KEYWORD(Hypoelastic, o.user = true), "*Hypoelastic, user\n"},
    {"PorousElastic_ShearModulus_IsWritten", KEYWORD(PorousElastic, Number(o.shear, 0); o.dependencies = 1),
     "*Porous Elastic, dependencies=1, shear=G\n"},

    // Plasticity and creep
    {"RateDependent_Type1_IsYieldRatio", KEYWORD(RateDependent, Number(o.type, 1); o.dependencies = 1),
     "*Rate Dependent, dependencies=1, type=YIELD RATIO\n"},
    {"RateDependent_Type2_IsJohnsonCook", KEYWORD(RateDependent, Number(o.type, 2)),
     "*Rate Dependent, type=JOHNSON COOK\n"},
    {"RateDependent_TypeWithoutAWord_WritesNothing", KEYWORD(RateDependent, Number(o.type, 3)),
     "*Rate Dependent\n"},
    {"CyclicHardening_Parameters_IsAWord", KEYWORD(CyclicHardening, o.parameters = true; o.dependencies = 1),
     "*Cyclic Hardening, dependencies=1, parameters\n"},
    {"Ornl_Defaults_WriteTheKeywordAlone", KEYWORD(Ornl, o.a = 0.3), "*Ornl\n"},
    {"Ornl_AllParameters_StandInOrder", KEYWORD(Ornl, o.reset = true; o.h = 1000; o.a = 0.25),
     "*Ornl, a=0.25, h=1000., reset\n"},
    {"Creep_Law1_IsTime", KEYWORD(Creep, Number(o.law, 1); o.dependencies = 1),
     "*Creep, dependencies=1, law=TIME\n"},
    {"Creep_Law2_IsHyperb", KEYWORD(Creep, Number(o.law, 2)), "*Creep, law=HYPERB\n"},
    {"Creep_Law3_IsUser", KEYWORD(Creep, Number(o.law, 3)), "*Creep, law=USER\n"},
    {"Creep_LawWithoutAWord_LeavesTheNameAlone", KEYWORD(Creep, Number(o.law, 7)), "*Creep, law=\n"},
    {"Viscous_Law1_IsTime", KEYWORD(Viscous, Number(o.law, 1); o.dependencies = 1),
     "*Viscous, dependencies=1, law=TIME\n"},
    {"Viscous_Law2_IsUser", KEYWORD(Viscous, Number(o.law, 2)), "*Viscous, law=USER\n"},
    {"Viscous_AnyOtherLaw_IsUserToo", KEYWORD(Viscous, Number(o.law, -4)), "*Viscous, law=USER\n"},
    {"Swelling_Law1_IsUser", KEYWORD(Swelling, Number(o.law, 1); o.dependencies = 1),
     "*Swelling, dependencies=1, law=USER\n"},
    {"PorousMetalPlasticity_RelativeDensity_IsWritten",
     KEYWORD(PorousMetalPlasticity, o.relativeDensity = 0.95; o.dependencies = 1),
     "*Porous Metal Plasticity, dependencies=1, relative density=0.95\n"},

    // Soils and foams
    {"CapCreepCohesion_Law1_StandsAheadOfTheMechanism",
     KEYWORD(CapCreepCohesion, Number(o.law, 1); o.dependencies = 1),
     "*Cap Creep, dependencies=1, law=TIME, mechanism=COHESION\n"},
    {"CapCreepCohesion_Law2_IsSinghm", KEYWORD(CapCreepCohesion, Number(o.law, 2)),
     "*Cap Creep, law=SINGHM, mechanism=COHESION\n"},
    {"CapCreepConsolidation_Law3_IsUser", KEYWORD(CapCreepConsolidation, Number(o.law, 3)),
     "*Cap Creep, law=USER, mechanism=CONSOLIDATION\n"},
    {"DruckerPragerCreep_Law2_IsSinghm", KEYWORD(DruckerPragerCreep, Number(o.law, 2); o.dependencies = 1),
     "*Drucker Prager Creep, dependencies=1, law=SINGHM\n"},
    {"MohrCoulomb_Defaults_AreLeftOut", KEYWORD(MohrCoulomb, o.meridionalEccentricity = 0.1),
     "*Mohr Coulomb\n"},
    {"MohrCoulomb_Eccentricities_HaveABlankAheadOfTheEqualsSignOnPurpose",
     KEYWORD(MohrCoulomb, o.deviatoricEccentricity = 0.6; o.meridionalEccentricity = 0.2; o.dependencies = 1),
     "*Mohr Coulomb, dependencies=1, deviatoric Eccentricity =0.6, eccentricity =0.2\n"},
    {"Foam_Hardening1_IsIsotropic", KEYWORD(Foam, Number(o.hardening, 1); o.dependencies = 1),
     "*Crushable Foam, dependencies=1, hardening=ISOTROPIC\n"},
    {"ClayPlasticity_AllParameters_StandInOrder",
     KEYWORD(ClayPlasticity, Number(o.hardening, 1); o.intercept = 1.5; o.dependencies = 1),
     "*Clay Plasticity, dependencies=1, hardening=TABULAR, intercept=1.5\n"},

    // Concrete
    {"BrittleCracking_Type1_IsDisplacement", KEYWORD(BrittleCracking, Number(o.type, 1); o.dependencies = 1),
     "*Brittle Cracking, dependencies=1, type=DISPLACEMENT\n"},
    {"BrittleCracking_Type2_IsGfi", KEYWORD(BrittleCracking, Number(o.type, 2)),
     "*Brittle Cracking, type=GFI\n"},
    {"BrittleShear_Type1_IsPowerlaw", KEYWORD(BrittleShear, Number(o.type, 1); o.dependencies = 1),
     "*Brittle Shear, dependencies=1, type=POWERLAW\n"},
    {"BrittleShear_AnyOtherType_LeavesTheSeparatorAloneOnPurpose", KEYWORD(BrittleShear, Number(o.type, 2)),
     "*Brittle Shear, \n"},
    {"TensionStiffening_Type0_IsDisplacement",
     KEYWORD(TensionStiffening, Number(o.type, 0); o.dependencies = 1),
     "*Tension Stiffening, dependencies=1, type=DISPLACEMENT\n"},
    {"ConcreteCompressionDamage_TensionRecovery_IsWritten",
     KEYWORD(ConcreteCompressionDamage, o.tensionRecovery = 0.4; o.dependencies = 1),
     "*Concrete Compression Damage, dependencies=1, tension recovery=0.4\n"},
    {"ConcreteTensionDamage_DefaultRecovery_IsLeftOut",
     KEYWORD(ConcreteTensionDamage, o.compressionRecovery = 1.0), "*Concrete Tension Damage\n"},
    {"ConcreteTensionDamage_AllParameters_StandInOrder",
     KEYWORD(ConcreteTensionDamage, o.compressionRecovery = 0; Number(o.type, 1); o.dependencies = 1),
     "*Concrete Tension Damage, dependencies=1, type=DISPLACEMENT, compression recovery=0.\n"},
    {"ConcreteTensionStiffening_Type2_IsGfi",
     KEYWORD(ConcreteTensionStiffening, Number(o.type, 2); o.dependencies = 1),
     "*Concrete Tension Stiffening, dependencies=1, type=GFI\n"},

    // Heat and electricity
    {"Conductivity_Type1_IsOrtho", KEYWORD(Conductivity, Number(o.type, 1); o.dependencies = 1),
     "*Conductivity, dependencies=1, type=ORTHO\n"},
    {"Conductivity_Type2_IsAniso", KEYWORD(Conductivity, Number(o.type, 2)), "*Conductivity, type=ANISO\n"},
    {"Conductivity_TypeWithoutAWord_WritesNothing", KEYWORD(Conductivity, Number(o.type, 3)),
     "*Conductivity\n"},
    {"Dielectric_Type1_IsOrtho", KEYWORD(Dielectric, Number(o.type, 1)), "*Dielectric, type=ORTHO\n"},
    {"Dielectric_Type2_IsAniso", KEYWORD(Dielectric, Number(o.type, 2)), "*Dielectric, type=ANISO\n"},
    {"ElectricalConductivity_Type1_IsOrtho", KEYWORD(ElectricalConductivity, Number(o.type, 1)),
     "*Electrical Conductivity, type=ORTHO\n"},
    {"ElectricalConductivity_Type2_IsAniso", KEYWORD(ElectricalConductivity, Number(o.type, 2)),
     "*Electrical Conductivity, type=ANISO\n"},
    {"Expansion_DefaultZero_IsLeftOut", KEYWORD(Expansion, o.zero = 0.0), "*Expansion\n"},
    {"Expansion_AllParameters_StandInOrder",
     KEYWORD(Expansion, o.zero = 20; o.user = true; Number(o.type, 2); o.dependencies = 1),
     "*Expansion, dependencies=1, type=ANISO, user, zero=20.\n"},
    {"Expansion_Type1_IsOrtho", KEYWORD(Expansion, Number(o.type, 1)), "*Expansion, type=ORTHO\n"},
    {"Piezoelectric_Type0_IsE", KEYWORD(Piezoelectric, Number(o.type, 0); o.dependencies = 1),
     "*Piezoelectric, dependencies=1, type=E\n"},
    {"Piezoelectric_AnyOtherType_LeavesTheNameAloneOnPurpose", KEYWORD(Piezoelectric, Number(o.type, 2)),
     "*Piezoelectric, type=\n"},
    {"InelasticHeatFraction_Always_WritesItsLine", KEYWORD(InelasticHeatFraction, o.fraction = 0.9),
     "*Inelastic Heat Fraction\n         0.9,\n"},
    {"JouleHeatFraction_Always_WritesItsLine", KEYWORD(JouleHeatFraction, o.fraction = 1.0),
     "*Joule Heat Fraction\n          1.,\n"},
    {"HeatGeneration_Always_IsTheKeywordAlone", KEYWORD(HeatGeneration, (void)o), "*Heat Generation\n"},

    // Pores and diffusion
    {"Permeability_SpecificWeight_StandsEvenAtItsDefault", KEYWORD(Permeability, o.specificWeight = 0.0),
     "*Permeability, specific=0.\n"},
    {"Permeability_Type1_IsTheFullWord", KEYWORD(Permeability, o.specificWeight = 9810; Number(o.type, 1)),
     "*Permeability, specific=9810., type=ORTHOTROPIC\n"},
    {"Permeability_Type2_IsTheFullWord", KEYWORD(Permeability, Number(o.type, 2)),
     "*Permeability, specific=0., type=ANISOTROPIC\n"},
    {"PoreFluidExpansion_Zero_IsWritten", KEYWORD(PoreFluidExpansion, o.zero = -10; o.dependencies = 1),
     "*Expansion, Pore Fluid, dependencies=1, zero=-10.\n"},
    {"Diffusivity_LawAndType_StandInOrder",
     KEYWORD(Diffusivity, Number(o.type, 1); Number(o.law, 1); o.dependencies = 1),
     "*Diffusivity, dependencies=1, law=FICK, type=ORTHO\n"},
    {"Diffusivity_Type2_IsAniso", KEYWORD(Diffusivity, Number(o.type, 2)), "*Diffusivity, type=ANISO\n"},
    {"SoretEffect_Always_SharesItsKeywordWithoutAType", KEYWORD(SoretEffect, (void)o), "*Kappa\n"},
    {"PressureEffect_Always_HasItsType", KEYWORD(PressureEffect, o.dependencies = 1),
     "*Kappa, dependencies=1, type=PRESS\n"},

    // Fluids
    {"FluidDensity_Defaults_AreLeftOut", KEYWORD(FluidDensity, o.temperature = 0.0), "*Fluid Density\n"},
    {"FluidDensity_BothParameters_StandInOrderAndHaveNoDataLine",
     KEYWORD(FluidDensity, o.pressure = 0.1; o.temperature = 20),
     "*Fluid Density, temperature=20., pressure=0.1\n"},
    {"FluidExpansion_Zero_IsWritten", KEYWORD(FluidExpansion, o.zero = 20; o.dependencies = 1),
     "*Fluid Expansion, dependencies=1, zero=20.\n"},
    {"Eos_Type0_HasItsWordToo", KEYWORD(Eos, Number(o.type, 0)), "*Eos, type=USUP\n"},
    {"Eos_Type1_IsJwl", KEYWORD(Eos, Number(o.type, 1)), "*Eos, type=JWL\n"},
    {"Eos_Type2_IsIdealGas", KEYWORD(Eos, Number(o.type, 2)), "*Eos, type=IDEAL GAS\n"},
    {"Eos_Type3_IsTabular", KEYWORD(Eos, Number(o.type, 3)), "*Eos, type=TABULAR\n"},

    // General
    {"Damping_Defaults_WriteTheKeywordAlone", KEYWORD(Damping, o.alpha = 0.0), "*Damping\n"},
    {"Damping_AllParameters_StandInOrder", KEYWORD(Damping, o.composite = 0.05; o.beta = 1e-05; o.alpha = 12),
     "*Damping, alpha=12., beta=1e-05, composite=0.05\n"},
    {"Depvar_Count_StandsInAFieldOfSeven", KEYWORD(Depvar, o.numVariables = 12), "*Depvar\n     12,\n"},
    {"Depvar_Delete_IsWritten", KEYWORD(Depvar, o.numVariables = 3; o.deleteVar = 2),
     "*Depvar, delete=2\n      3,\n"},
    {"UserOutputVariables_Count_StandsInAFieldOfSeven", KEYWORD(UserOutputVariables, o.numVariables = 0),
     "*User Output Variables\n      0,\n"},
    {"UserDefinedField_Always_IsTheKeywordAlone", KEYWORD(UserDefinedField, (void)o),
     "*User Defined Field\n"},
    {"PorousFailureCriteria_Always_WritesBothFractions",
     KEYWORD(PorousFailureCriteria, o.failureFraction = 0.25; o.criticalFraction = 0.2),
     "*Porous Failure Criteria\n        0.25,          0.2\n"},
};

class OptionParameters : public testing::TestWithParam<TextCase> {};

} // namespace

TEST_P(OptionParameters, Of) {
    EXPECT_EQ(GetParam().write(), GetParam().expected);
}

INSTANTIATE_TEST_SUITE_P(Each, OptionParameters, testing::ValuesIn(kCases), TextCaseName);

TEST(Parameters, MoreThanSixDigits_AreLostThereToo) {
    EXPECT_EQ((WrittenWith<oif_Expansion, kmaC_Expansion>([](auto& o) { o.zero = 293.15678; })),
              "*Expansion, zero=293.157\n");
}
