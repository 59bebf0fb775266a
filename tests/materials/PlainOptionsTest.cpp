#include "materials/Materials.h"

// The pattern of all options that may depend on temperature and field variables, and of those with a table
// alone.

namespace {

struct DependentOption {
    const char* name;
    const char* keyword;
    std::string (*write)(const cow_2DArray<double>& table, bool temperature, int dependencies);
    /// Parameters that stand even with all defaults.
    const char* always;
};

void PrintTo(const DependentOption& option, std::ostream* out) {
    *out << option.name;
}

template <class Keyword, class Record>
constexpr auto kWriteDependent = [](const cow_2DArray<double>& table, bool temperature, int dependencies) {
    Record record;
    record.table = table;
    record.temperatureDependency = temperature;
    record.dependencies = dependencies;
    return Written(Keyword(record));
};

#define DEPENDENT(name, keyword, ...)                                                                        \
    DependentOption {                                                                                        \
#name, keyword, kWriteDependent < oif_##name, kmaC_##name>, __VA_ARGS__                              \
    }

const DependentOption kDependentOptions[] = {
    DEPENDENT(AcousticBulkModulus, "*Acoustic Bulk Modulus", ""),
    DEPENDENT(AcousticMedium, "*Acoustic Medium", ""),
    DEPENDENT(AcousticVolumetricDrag, "*Acoustic Volumetric Drag", ""),
    DEPENDENT(BrittleCracking, "*Brittle Cracking", ""),
    DEPENDENT(BrittleShear, "*Brittle Shear", ""),
    DEPENDENT(BulkFailure, "*Bulk Failure", ""),
    DEPENDENT(CapCreepCohesion, "*Cap Creep", ", mechanism=COHESION"),
    DEPENDENT(CapCreepConsolidation, "*Cap Creep", ", mechanism=CONSOLIDATION"),
    DEPENDENT(CapHardening, "*Cap Hardening", ""),
    DEPENDENT(CapPlasticity, "*Cap Plasticity", ""),
    DEPENDENT(CastIronPlasticity, "*Cast Iron Plasticity", ""),
    DEPENDENT(ClayHardening, "*Clay Hardening", ""),
    DEPENDENT(ClayPlasticity, "*Clay Plasticity", ""),
    DEPENDENT(Concrete, "*Concrete", ""),
    DEPENDENT(ConcreteCompressionDamage, "*Concrete Compression Damage", ""),
    DEPENDENT(ConcreteDamagedPlasticity, "*Concrete Damaged Plasticity", ""),
    DEPENDENT(ConcreteTensionDamage, "*Concrete Tension Damage", ""),
    DEPENDENT(Conductivity, "*Conductivity", ""),
    DEPENDENT(Creep, "*Creep", ""),
    DEPENDENT(CyclicHardening, "*Cyclic Hardening", ""),
    DEPENDENT(Density, "*Density", ""),
    DEPENDENT(Dielectric, "*Dielectric", ""),
    DEPENDENT(Diffusivity, "*Diffusivity", ""),
    DEPENDENT(DruckerPragerCreep, "*Drucker Prager Creep", ""),
    DEPENDENT(DruckerPragerHardening, "*Drucker Prager Hardening", ""),
    DEPENDENT(ElectricalConductivity, "*Electrical Conductivity", ""),
    DEPENDENT(Expansion, "*Expansion", ""),
    DEPENDENT(FailStrain, "*Fail Strain", ""),
    DEPENDENT(FailStress, "*Fail Stress", ""),
    DEPENDENT(FailureRatios, "*Failure Ratios", ""),
    DEPENDENT(FirstDirection, "*First Direction", ""),
    DEPENDENT(FluidBulkModulus, "*Fluid Bulk Modulus", ""),
    DEPENDENT(FluidExpansion, "*Fluid Expansion", ""),
    DEPENDENT(Foam, "*Crushable Foam", ""),
    DEPENDENT(FoamHardening, "*Crushable Foam Hardening", ""),
    DEPENDENT(JointShearRetention, "*ShearRetention", ""),
    DEPENDENT(MohrCoulomb, "*Mohr Coulomb", ""),
    DEPENDENT(MohrCoulombHardening, "*Mohr Coulomb Hardening", ""),
    DEPENDENT(Piezoelectric, "*Piezoelectric", ""),
    DEPENDENT(Plastic, "*Plastic", ""),
    DEPENDENT(PoreFluidExpansion, "*Expansion, Pore Fluid", ""),
    DEPENDENT(PorousElastic, "*Porous Elastic", ""),
    DEPENDENT(PorousMetalPlasticity, "*Porous Metal Plasticity", ""),
    DEPENDENT(Potential, "*Potential", ""),
    DEPENDENT(PressureEffect, "*Kappa", ", type=PRESS"),
    DEPENDENT(RateDependent, "*Rate Dependent", ""),
    DEPENDENT(Ratios, "*Ratios", ""),
    DEPENDENT(SecondDirection, "*Second Direction", ""),
    DEPENDENT(ShearRetention, "*Shear Retention", ""),
    DEPENDENT(Solubility, "*Solubility", ""),
    DEPENDENT(SoretEffect, "*Kappa", ""),
    DEPENDENT(SpecificHeat, "*Specific Heat", ""),
    DEPENDENT(Swelling, "*Swelling", ""),
    DEPENDENT(TensionStiffening, "*Tension Stiffening", ""),
    DEPENDENT(ThirdDirection, "*Third Direction", ""),
    DEPENDENT(Viscous, "*Viscous", ""),
    DEPENDENT(VoidNucleation, "*Void Nucleation", ""),
    DEPENDENT(VolumetricTestData, "*Volumetric Test Data", ""),
};

class DependentOptions : public testing::TestWithParam<DependentOption> {
protected:
    std::string Keyword() const { return GetParam().keyword; }
    std::string Always() const { return GetParam().always; }
};

struct TableOption {
    const char* name;
    const char* keyword;
    std::string (*write)(const cow_2DArray<double>& table);
};

void PrintTo(const TableOption& option, std::ostream* out) {
    *out << option.name;
}

template <class Keyword, class Record>
constexpr auto kWriteTable = [](const cow_2DArray<double>& table) {
    Record record;
    record.table = table;
    return Written(Keyword(record));
};

#define TABLE_ALONE(name, keyword)                                                                           \
    TableOption {                                                                                            \
#name, keyword, kWriteTable < oif_##name, kmaC_##name>                                               \
    }

const TableOption kTableOptions[] = {
    TABLE_ALONE(AnnealTemperature, "*Anneal Temperature"),
    TABLE_ALONE(CombinedTestData, "*Combined Test Data"),
    TABLE_ALONE(CycledPlastic, "*Cycled Plastic"),
    TABLE_ALONE(DeformationPlasticity, "*Deformation Plasticity"),
    TABLE_ALONE(DetonationPoint, "*DetonationPoint"),
    TABLE_ALONE(Gel, "*Gel"),
    TABLE_ALONE(Hypoelastic, "*Hypoelastic"),
    TABLE_ALONE(Hysteresis, "*Hysteresis"),
    TABLE_ALONE(LatentHeat, "*Latent Heat"),
    TABLE_ALONE(MoistureSwelling, "*Moisture Swelling"),
    TABLE_ALONE(PorousBulkModuli, "*Porous Bulk Moduli"),
    TABLE_ALONE(SaturationDependence, "*Permeability, Type=SATURATION"),
    TABLE_ALONE(ShearTestData, "*Shear Test Data"),
    TABLE_ALONE(SimpleShearTestData, "*Simple Shear Test Data"),
    TABLE_ALONE(TriaxialTestData, "*Triaxial Test Data"),
    TABLE_ALONE(Trs, "*Trs"),
    TABLE_ALONE(VelocityDependence, "*Permeability, Type=VELOCITY"),
};

class TableOptions : public testing::TestWithParam<TableOption> {};

} // namespace

TEST_P(DependentOptions, WithoutRows_WriteTheKeywordLineAlone) {
    EXPECT_EQ(GetParam().write(Table({}), false, 0), Keyword() + Always() + "\n");
}

TEST_P(DependentOptions, WithoutDependence_WriteTheDataAsTheyAre) {
    EXPECT_EQ(GetParam().write(Table({{5, 7}, {6, 8}}), false, 0), Keyword() + Always() + "\n5.,7.\n6.,8.\n");
}

TEST_P(DependentOptions, WithTemperature_SayNothingOfIt) {
    EXPECT_EQ(GetParam().write(Table({{5, 20}}), true, 0), Keyword() + Always() + "\n5.,20.\n");
}

TEST_P(DependentOptions, FieldsWithoutTemperature_StandBehindABlankColumn) {
    EXPECT_EQ(GetParam().write(Table({{5, 1, 2}}), false, 2),
              Keyword() + ", dependencies=2" + Always() + "\n5., ,1.,2.\n");
}

TEST_P(DependentOptions, FieldsWithTemperature_GetNoBlankColumn) {
    EXPECT_EQ(GetParam().write(Table({{5, 20, 1}}), true, 1),
              Keyword() + ", dependencies=1" + Always() + "\n5.,20., 1.\n");
}

TEST_P(DependentOptions, FieldsWithoutRows_WriteTheParameterAllTheSame) {
    EXPECT_EQ(GetParam().write(Table({}), false, 1), Keyword() + ", dependencies=1" + Always() + "\n");
}

TEST_P(DependentOptions, NegativeDependencies_WriteNoParameter) {
    EXPECT_EQ(GetParam().write(Table({{5}}), false, -1), Keyword() + Always() + "\n5.,\n");
}

INSTANTIATE_TEST_SUITE_P(Each, DependentOptions, testing::ValuesIn(kDependentOptions),
                         [](const auto& option) { return option.param.name; });

TEST_P(TableOptions, WithoutRows_WriteTheKeywordLineAlone) {
    EXPECT_EQ(GetParam().write(Table({})), std::string(GetParam().keyword) + "\n");
}

TEST_P(TableOptions, AnyColumns_GoOutAsTheyAre) {
    EXPECT_EQ(GetParam().write(Table({{5, 7, 30}})), std::string(GetParam().keyword) + "\n5., 7.,30.\n");
}

INSTANTIATE_TEST_SUITE_P(Each, TableOptions, testing::ValuesIn(kTableOptions),
                         [](const auto& option) { return option.param.name; });

TEST(AnnealTemperature, Fields_StandRightBehindTheTemperature) {
    const auto write = KEYWORD(AnnealTemperature, o.dependencies = 1; o.table = Table({{500, 3}}));
    EXPECT_EQ(write(), "*Anneal Temperature, dependencies=1\n500.,3.\n");
}

TEST(WriteOption, RecordWithoutAKeyword_RaisesItsName) {
    EXPECT_EQ(
        Raised([] { Streamed([](utl_Stream& stream) { oif_WriteOption(stream, kmaC_Regularization()); }); }),
        "oif_WriteOption: no keyword for kmaC_Regularization");
}

TEST(OptionLine, LineOf131Bytes_HoldsTheParameterTooAndOneByteMoreBreaksBehindTheComma) {
    // The text ahead, "*Hypoelastic" and ", " make 131 bytes, or 132.
    for (const int ahead : {117, 118}) {
        const std::string before(static_cast<std::size_t>(ahead), 'x');
        const std::string text = Streamed([&](utl_Stream& stream) {
            stream << before.c_str();
            oif_WriteOption(stream, With<kmaC_Hypoelastic>([](auto& o) { o.user = true; }));
        });
        EXPECT_EQ(text, before + (ahead == 117 ? "*Hypoelastic, user\n" : "*Hypoelastic, \nuser\n"));
    }
}

TEST(OptionLine, TextWithItsOwnComma_NeverBreaksOnPurpose) {
    const std::string before(200, 'x');
    const std::string text = Streamed([&](utl_Stream& stream) {
        stream << before.c_str();
        oif_WriteOption(stream, With<kmaC_Expansion>([](auto& o) { o.user = true; }));
    });
    EXPECT_EQ(text, before + "*Expansion, user\n");
}
