#include "materials/Materials.h"

// What options do to the columns of their tables beyond the blank temperature, and the order of sub-options.

namespace {

const TextCase kCases[] = {
    // Test data: a blank lateral strain, then a blank temperature, both ahead of the fields.
    {"BiaxialTestData_WithoutDependence_GetsNoBlank", KEYWORD(BiaxialTestData, o.table = Table({{1, 2}})),
     "*Biaxial Test Data\n1.,2.\n"},
    {"BiaxialTestData_WithTemperature_GetsABlankLateralStrain",
     KEYWORD(BiaxialTestData, o.table = Table({{1, 2, 20}}); o.temperatureDependency = true),
     "*Biaxial Test Data\n1., 2., ,20.\n"},
    {"BiaxialTestData_WithFieldsAlone_GetsBothBlanks",
     KEYWORD(BiaxialTestData, o.table = Table({{1, 2, 7}}); o.dependencies = 1),
     "*Biaxial Test Data, dependencies=1\n1.,2., , ,7.\n"},
    {"BiaxialTestData_WithLateralStrainAndFields_GetsTheTemperatureOnly",
     KEYWORD(BiaxialTestData, o.table = Table({{1, 2, 3, 7}}); o.dependencies = 1;
             o.lateralStrainGiven = true),
     "*Biaxial Test Data, dependencies=1\n1.,2.,3., ,7.\n"},
    {"BiaxialTestData_WithAllGiven_GetsNoBlank",
     KEYWORD(BiaxialTestData, o.table = Table({{1, 2, 3, 4, 7}}); o.dependencies = 1;
             o.lateralStrainGiven = true; o.temperatureDependency = true),
     "*Biaxial Test Data, dependencies=1\n1.,2.,3.,4.,7.\n"},
    {"PlanarTestData_WithFieldsAlone_GetsBothBlanks",
     KEYWORD(PlanarTestData, o.table = Table({{1, 2, 7}}); o.dependencies = 1),
     "*Planar Test Data, dependencies=1\n1.,2., , ,7.\n"},
    {"UniaxialTestData_WithTemperature_GetsABlankLateralStrain",
     KEYWORD(UniaxialTestData, o.table = Table({{1, 2, 20}}); o.temperatureDependency = true),
     "*Uniaxial Test Data\n1., 2., ,20.\n"},
    {"VolumetricTestData_WithTemperature_HasNoLateralStrain",
     KEYWORD(VolumetricTestData, o.table = Table({{1, 2, 20}}); o.temperatureDependency = true),
     "*Volumetric Test Data\n1., 2.,20.\n"},

    // Concrete: a rate column ahead of the temperature.
    {"ConcreteCompressionHardening_WithoutDependence_GetsNoBlank",
     KEYWORD(ConcreteCompressionHardening, o.table = Table({{1, 2}})),
     "*Concrete Compression Hardening\n1.,2.\n"},
    {"ConcreteCompressionHardening_WithTemperature_GetsABlankRate",
     KEYWORD(ConcreteCompressionHardening, o.table = Table({{1, 2, 20}}); o.temperatureDependency = true),
     "*Concrete Compression Hardening\n1., 2., ,20.\n"},
    {"ConcreteCompressionHardening_WithTemperatureAndFields_GetsTheRateAheadOfBoth",
     KEYWORD(ConcreteCompressionHardening, o.table = Table({{1, 2, 3, 4}}); o.temperatureDependency = true;
             o.dependencies = 1),
     "*Concrete Compression Hardening, dependencies=1\n1.,2., ,3.,4.\n"},
    {"ConcreteCompressionHardening_WithFieldsAlone_GetsTwoBlanks",
     KEYWORD(ConcreteCompressionHardening, o.table = Table({{1, 2, 7}}); o.dependencies = 1),
     "*Concrete Compression Hardening, dependencies=1\n1.,2., , ,7.\n"},
    {"ConcreteCompressionHardening_WithRateAndFields_GetsTheTemperatureOnly",
     KEYWORD(ConcreteCompressionHardening, o.table = Table({{1, 2, 3, 7}}); o.dependencies = 1;
             o.rateGiven = true),
     "*Concrete Compression Hardening, dependencies=1\n1.,2.,3., ,7.\n"},
    {"ConcreteCompressionHardening_WithRateAndTemperature_GetsNoBlank",
     KEYWORD(ConcreteCompressionHardening, o.table = Table({{1, 2, 3, 4}}); o.rateGiven = true;
             o.temperatureDependency = true),
     "*Concrete Compression Hardening\n1.,2.,3.,4.\n"},
    {"ConcreteTensionStiffening_WithTemperature_GetsABlankRate",
     KEYWORD(ConcreteTensionStiffening, o.table = Table({{1, 2, 20}}); o.temperatureDependency = true),
     "*Concrete Tension Stiffening\n1., 2., ,20.\n"},
    {"ConcreteTensionStiffening_WithFieldsAlone_GetsTwoBlanks",
     KEYWORD(ConcreteTensionStiffening, o.table = Table({{1, 2, 7}}); o.dependencies = 1),
     "*Concrete Tension Stiffening, dependencies=1\n1.,2., , ,7.\n"},

    // Cast iron
    {"CastIronCompHard_TwoColumns_GetNoThirdOneOnPurpose",
     KEYWORD(CastIronCompHard, o.table = Table({{1, 2}})), "*Cast Iron Compression Hardening\n1.,2.\n"},
    {"CastIronCompHard_Temperature_MovesBehindABlankThirdColumn",
     KEYWORD(CastIronCompHard, o.table = Table({{1, 2, 20}}); o.temperatureDependency = true),
     "*Cast Iron Compression Hardening\n1., 2., ,20.\n"},
    {"CastIronCompHard_FieldsAlone_GetBothBlanks",
     KEYWORD(CastIronCompHard, o.table = Table({{1, 2, 7}}); o.dependencies = 1),
     "*Cast Iron Compression Hardening, dependencies=1\n1.,2., , ,7.\n"},
    {"CastIronTensHard_ThreeColumns_GetABlankThirdOneUnasked",
     KEYWORD(CastIronTensHard, o.table = Table({{1, 2, 3}})), "*Cast Iron Tension Hardening\n1.,2., ,3.\n"},
    {"CastIronTensHard_Fields_AreTold", KEYWORD(CastIronTensHard, o.dependencies = 2),
     "*Cast Iron Tension Hardening, dependencies=2\n"},

    // The explosive law has an unused place.
    {"Eos_Type1_GetsABlankAheadOfTheLastColumn",
     KEYWORD(Eos, Number(o.type, 1); o.table = Table({{1, 2, 3, 4, 5, 6, 7}})),
     "*Eos, type=JWL\n1.,2.,3.,4.,5.,6., ,7.\n"},
    {"Eos_OtherTypes_GetNoBlank", KEYWORD(Eos, Number(o.type, 3); o.table = Table({{1, 2, 3}})),
     "*Eos, type=TABULAR\n1.,2.,3.\n"},

    {"Piezoelectric_EighteenCoefficients_TakeThreeLines",
     KEYWORD(Piezoelectric, o.table = Table({{1, 2, 3, 4, 5, 6, 7, 8, 9, 1, 2, 3, 4, 5, 6, 7, 8, 9}})),
     "*Piezoelectric\n1.,2.,3.,4.,5.,6.,7.,8.\n9.,1.,2.,3.,4.,5.,6.,7.\n8.,9.\n"},

    // Sub-options, set against their order
    {"BrittleCracking_SubOptions_Follow",
     KEYWORD(BrittleCracking, o.brittleShear = kmaC_BrittleShear(); o.table = Table({{1, 2}})),
     "*Brittle Cracking\n1.,2.\n*Brittle Shear\n"},
    {"CapPlasticity_SubOptions_StandInOrder",
     KEYWORD(CapPlasticity, o.capHardening = kmaC_CapHardening();
             o.capCreepConsolidation = kmaC_CapCreepConsolidation();
             o.capCreepCohesion = kmaC_CapCreepCohesion()),
     "*Cap Plasticity\n*Cap Creep, mechanism=COHESION\n*Cap Creep, mechanism=CONSOLIDATION\n"
     "*Cap Hardening\n"},
    {"CastIronPlasticity_SubOptions_StandInOrder",
     KEYWORD(CastIronPlasticity, o.castIronTensHard = kmaC_CastIronTensHard();
             o.castIronCompHard = kmaC_CastIronCompHard()),
     "*Cast Iron Plasticity\n*Cast Iron Compression Hardening\n*Cast Iron Tension Hardening\n"},
    {"ClayPlasticity_SubOptions_Follow", KEYWORD(ClayPlasticity, o.clayHardening = kmaC_ClayHardening()),
     "*Clay Plasticity\n*Clay Hardening\n"},
    {"Concrete_SubOptions_StandInOrder",
     KEYWORD(Concrete, o.tensionStiffening = kmaC_TensionStiffening();
             o.shearRetention = kmaC_ShearRetention(); o.failureRatios = kmaC_FailureRatios()),
     "*Concrete\n*Failure Ratios\n*Shear Retention\n*Tension Stiffening\n"},
    {"ConcreteDamagedPlasticity_SubOptions_StandInOrder",
     KEYWORD(ConcreteDamagedPlasticity, o.concreteTensionDamage = kmaC_ConcreteTensionDamage();
             o.concreteCompressionDamage = kmaC_ConcreteCompressionDamage();
             o.concreteTensionStiffening = kmaC_ConcreteTensionStiffening();
             o.concreteCompressionHardening = kmaC_ConcreteCompressionHardening()),
     "*Concrete Damaged Plasticity\n*Concrete Compression Hardening\n*Concrete Tension Stiffening\n"
     "*Concrete Compression Damage\n*Concrete Tension Damage\n"},
    {"Creep_SubOptions_StandInOrder", KEYWORD(Creep, o.potential = kmaC_Potential(); o.ornl = kmaC_Ornl()),
     "*Creep\n*Ornl\n*Potential\n"},
    {"Diffusivity_SubOptions_StandInOrder",
     KEYWORD(Diffusivity, o.pressureEffect = kmaC_PressureEffect(); o.soretEffect = kmaC_SoretEffect()),
     "*Diffusivity\n*Kappa\n*Kappa, type=PRESS\n"},
    {"Eos_SubOptions_Follow", KEYWORD(Eos, o.detonationPoint = With<kmaC_DetonationPoint>([](auto& point) {
                                               point.table = Table({{0, 0, 1, 2}});
                                           })),
     "*Eos, type=USUP\n*DetonationPoint\n0.,0.,1.,2.\n"},
    {"Foam_SubOptions_StandInOrder",
     KEYWORD(Foam, o.rateDependent = kmaC_RateDependent(); o.foamHardening = kmaC_FoamHardening()),
     "*Crushable Foam\n*Crushable Foam Hardening\n*Rate Dependent\n"},
    {"JointedMaterial_SubOptions_StandInOrder",
     KEYWORD(JointedMaterial, o.jointShearRetention = kmaC_JointShearRetention();
             o.thirdDirection = kmaC_ThirdDirection(); o.secondDirection = kmaC_SecondDirection();
             o.firstDirection = kmaC_FirstDirection(); o.bulkFailure = kmaC_BulkFailure()),
     "*Jointed Material\n*Bulk Failure\n*First Direction\n*Second Direction\n*Third Direction\n"
     "*ShearRetention\n"},
    {"MohrCoulomb_SubOptions_Follow",
     KEYWORD(MohrCoulomb, o.mohrCoulombHardening = kmaC_MohrCoulombHardening()),
     "*Mohr Coulomb\n*Mohr Coulomb Hardening\n"},
    {"MoistureSwelling_SubOptions_Follow", KEYWORD(MoistureSwelling, o.ratios = kmaC_Ratios()),
     "*Moisture Swelling\n*Ratios\n"},
    {"Permeability_SubOptions_StandInOrder",
     KEYWORD(Permeability, o.velocityDependence = kmaC_VelocityDependence();
             o.saturationDependence = kmaC_SaturationDependence()),
     "*Permeability, specific=0.\n*Permeability, Type=SATURATION\n*Permeability, Type=VELOCITY\n"},
    {"PorousMetalPlasticity_SubOptions_StandInOrder",
     KEYWORD(PorousMetalPlasticity, o.voidNucleation = kmaC_VoidNucleation();
             o.porousFailureCriteria = kmaC_PorousFailureCriteria()),
     "*Porous Metal Plasticity\n*Porous Failure Criteria\n          1.,           1.\n*Void Nucleation\n"},
    {"Swelling_SubOptions_Follow", KEYWORD(Swelling, o.ratios = kmaC_Ratios()), "*Swelling\n*Ratios\n"},
};

class OptionColumns : public testing::TestWithParam<TextCase> {};

} // namespace

TEST_P(OptionColumns, Of) {
    EXPECT_EQ(GetParam().write(), GetParam().expected);
}

INSTANTIATE_TEST_SUITE_P(Each, OptionColumns, testing::ValuesIn(kCases), TextCaseName);
