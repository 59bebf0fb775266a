#include "hostile/Findings.h"

namespace {

/// A model with one material M of these options.
std::string Material(const std::string& options) {
    return Model(R"("materials": {"M": {)" + options + "}}");
}
std::string Section(const std::string& section, const std::string& more = "") {
    return Model(R"("materials": {"M": {"damping": {}}}, "sections": {"S": {)" + section + "}}" + more);
}
std::string Profile(const std::string& profile) {
    return Model(R"("beamProfiles": {"P": {)" + profile + "}}");
}

const FindingCase kCases[] = {
    {"EmptyMaterial_IsTold", Material(""), {"warning @/materials/M: found no option, expected one at least"}},
    {"IsotropicElasticityOfOneColumn_LacksPoissonsRatio",
     Material(R"("elastic": {"table": [[210000]]})"),
     {"warning @/materials/M/elastic/table: found rows of 1 of data, expected 2: Young's modulus, Poisson's "
      "ratio"}},
    {"IsotropicElasticityOfThreeColumns_HasOneTooMany",
     Material(R"("elastic": {"table": [[210000, 0.3, 20]]})"),
     {"warning @/materials/M/elastic/table: found rows of 3 of data, expected 2: Young's modulus, Poisson's "
      "ratio"}},
    {"TemperatureAndFields_AreNoData",
     Material(R"("elastic": {"temperatureDependency": true, "dependencies": 1,
                             "table": [[210000, 0.3, 20, 1]]})"),
     {}},
    {"ConstantsOfALamina_AreSix",
     Material(R"("elastic": {"type": "LAMINA", "table": [[1, 1, 0.3, 1, 1]]})"),
     {"warning @/materials/M/elastic/table: found rows of 5 of data, expected 6: E1, E2, nu12, G12, G13, "
      "G23"}},
    {"NegativeModulus_IsToldWithItsRow",
     Material(R"("elastic": {"temperatureDependency": true, "table": [[210000, 0.3, 20], [-1, 0.3, 100]]})"),
     {"warning @/materials/M/elastic/table: found -1.0 in row 2, column 1, expected more than 0"}},
    {"PoissonsRatioAboveAHalf_IsTold",
     Material(R"("elastic": {"table": [[210000, 0.51]]})"),
     {"warning @/materials/M/elastic/table: found 0.51 in row 1, column 2, expected Poisson's ratio above -1 "
      "and up to 0.5"}},
    {"PoissonsRatioOfAHalf_IsRight", Material(R"("elastic": {"table": [[210000, 0.5]]})"), {}},
    {"PoissonsRatioOfMinusOne_IsTold",
     Material(R"("elastic": {"table": [[210000, -1]]})"),
     {"warning @/materials/M/elastic/table: found -1.0 in row 1, column 2, expected Poisson's ratio above -1 "
      "and up to 0.5"}},
    {"DensityOfZero_IsTold",
     Material(R"("density": {"table": [[0]]})"),
     {"warning @/materials/M/density/table: found 0.0 in row 1, column 1, expected more than 0"}},
    {"ConductivityAndHeatCapacity_ArePositive",
     Material(R"("conductivity": {"table": [[-50]]}, "specificHeat": {"table": [[0]]})"),
     {"warning @/materials/M/conductivity/table: found -50.0 in row 1, column 1, expected more than 0",
      "warning @/materials/M/specificHeat/table: found 0.0 in row 1, column 1, expected more than 0"}},
    {"ExpansionMayBeNegative_ButHasItsColumns", Material(R"("expansion": {"table": [[-1e-6]]})"), {}},
    {"OrthotropicExpansion_HasThreeColumns",
     Material(R"("expansion": {"type": "ORTHOTROPIC", "table": [[1e-6]]})"),
     {"warning @/materials/M/expansion/table: found rows of 1 of data, expected 3: a11, a22, a33"}},
    {"DensityInKilogramsAndModulusInPascals_AreNoted",
     Material(R"("density": {"table": [[7850]]}, "elastic": {"table": [[2.1e11, 0.3]]})"),
     {"note @/materials/M/density: found a density of 7850.0 beside a modulus of 2.1e+11; these are numbers "
      "in "
      "kg, m and Pa: coordinates, thicknesses and loads have to be in m and N too"}},
    {"TonsAndMegapascals_AreNotNoted",
     Material(R"("density": {"table": [[7.85e-9]]}, "elastic": {"table": [[210000, 0.3]]})"),
     {}},
    {"ThicknessOfZero_IsTold",
     Section(R"("class": "kseC_HomogenousShellSection", "materialName": "M", "thickness": 0)"),
     {"warning @/sections/S/thickness: found 0.0, expected more than 0"}},
    {"AreaOfATruss_IsPositive",
     Section(R"("class": "kseC_TrussSection", "materialName": "M", "area": -2)"),
     {"warning @/sections/S/area: found -2.0, expected more than 0"}},
    {"GeneralBeamWithoutModuli_IsTold",
     Section(R"("class": "kseC_BeamSection", "integration": "BEFORE_ANALYSIS", "profileName": "P")",
             R"(, "beamProfiles": {"P": {"class": "kbpC_CircularProfile", "r": 1}})"),
     {"warning @/sections/S/materialTable: found no row, expected Young's modulus, torsional shear modulus: "
      "a "
      "section integrated before the analysis takes no others"}},
    {"ProfileWithoutDimensions_IsToldOfEach",
     Profile(R"("class": "kbpC_RectangularProfile", "a": 2)"),
     {"warning @/beamProfiles/P/b: found 0.0, expected more than 0"}},
    {"OriginOfAnISection_MayLieAtItsEdge",
     Profile(R"("class": "kbpC_IbeamProfile", "h": 100, "b1": 50, "b2": 50, "t1": 5, "t2": 5, "t3": 4)"),
     {}},
    {"BoxOfOneThickness_NeedsNoOthers",
     Profile(R"("class": "kbpC_BoxProfile", "a": 10, "b": 20, "uniformThickness": true, "t1": 1)"),
     {}},
};

class ValueRules : public testing::TestWithParam<FindingCase> {};

} // namespace

TEST_P(ValueRules, Of) {
    EXPECT_EQ(Findings(GetParam().text), GetParam().findings);
}

INSTANTIATE_TEST_SUITE_P(Each, ValueRules, testing::ValuesIn(kCases), FindingCaseName);
