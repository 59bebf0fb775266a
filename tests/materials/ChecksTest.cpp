#include "hostile/Findings.h"

namespace {

/// A model with one material M of these options.
std::string Material(const std::string& options) {
    return Model(R"("materials": {"M": {)" + options + "}}");
}

const FindingCase kCases[] = {
    {"RowsOfTwoLengths_AreToldTheColumnsToo",
     Material(R"("density": {"temperatureDependency": true, "dependencies": 1, "table": [[1, 2, 3], [3]]})"),
     {"@/materials/M/density/table/1: found an array of 1 item, expected a row of 3 numbers, as the first "
      "one",
      "@/materials/M/density/table: the columns of this table are at least 3: 1 of data, the temperature, "
      "1 field variable"}},
    {"RowsOfTwoLengthsOfASorption_HaveNoLeastColumns",
     Material(R"("sorption": {"absorptionTable": [[1, 2], [3]]})"),
     {"@/materials/M/sorption/absorptionTable/1: found an array of 1 item, expected a row of 2 numbers, as "
      "the first one"}},
    {"TemperatureWithoutItsColumn_IsToldWhatIsMissing",
     Material(R"("density": {"temperatureDependency": true, "table": [[7.8e-9]]})"),
     {"@/materials/M/density/table: found 1 column, expected at least 2: 1 of data, the temperature"}},
    {"FieldsWithoutColumns_AreToldWhatIsMissing",
     Material(R"("elastic": {"dependencies": 2, "table": [[210000, 0.3]]})"),
     {"@/materials/M/elastic/table: found 2 columns, expected at least 3: 1 of data, 2 field variables"}},
    {"TemperatureAndOneField_AreBothTold",
     Material(R"("conductivity": {"temperatureDependency": true, "dependencies": 1, "table": [[1, 20]]})"),
     {"@/materials/M/conductivity/table: found 2 columns, expected at least 3: 1 of data, the temperature, "
      "1 field variable"}},
    {"AsManyColumnsAsNeeded_AreEnough",
     Material(R"("conductivity": {"temperatureDependency": true, "dependencies": 1, "table": [[1, 20, 5]]})"),
     {}},
    {"EmptyTable_IsAlwaysAllowed",
     Material(R"("density": {"temperatureDependency": true, "dependencies": 3, "table": []})"),
     {}},
    {"MoreFieldsThanNumbersCount_AreStillTold",
     Material(R"("density": {"temperatureDependency": true, "dependencies": 2147483647, "table": [[1]]})"),
     {"@/materials/M/density/table: found 1 column, expected at least 2147483649: 1 of data, the "
      "temperature, 2147483647 field variables"}},
    {"RatesWithoutTheirColumn_AreToldWhatIsMissing",
     Material(R"("plastic": {"rateDependentTable": true, "temperatureDependency": true,
                             "table": [[250, 0, 20]]})"),
     {"@/materials/M/plastic/table: found 3 columns, expected at least 4: 2 of data, the plastic strain "
      "rate, the temperature"}},
    {"ConcreteRatesWithoutTheirColumn_AreToldWhatIsMissing",
     Material(R"("concreteDamagedPlasticity": {"concreteTensionStiffening": {"rateGiven": true,
                                                                           "table": [[3, 0]]}})"),
     {"@/materials/M/concreteDamagedPlasticity/concreteTensionStiffening/table: found 2 columns, expected "
      "at least 3: 2 of data, the strain rate"}},
    {"LateralStrainWithoutItsColumn_IsToldWhatIsMissing",
     Material(R"("hyperelastic": {"testData": true, "uniaxialTestData": {"lateralStrainGiven": true,
                                                                         "table": [[1, 0.5]]}})"),
     {"@/materials/M/hyperelastic/uniaxialTestData/table: found 2 columns, expected at least 3: 2 of data, "
      "the lateral strain"}},
    {"StrainRangeOfStabilizedData_NeedsItsColumn",
     Material(R"("plastic": {"hardening": "COMBINED", "dataType": "STABILIZED",
                             "strainRangeDependency": true, "table": [[250, 0]]})"),
     {"@/materials/M/plastic/table: found 2 columns, expected at least 3: 2 of data, the strain range"}},
    {"StrainRangeOfOtherData_NeedsNoColumn",
     Material(R"("plastic": {"strainRangeDependency": true, "table": [[250, 0]]})"),
     {}},
    {"DragTable_CountsItsOwnFields",
     Material(R"("acousticMedium": {"volumetricDrag": true, "volumetricDragTemperatureDependency": true,
                                    "volumetricDragDependencies": 1, "volumetricDragTable": [[1, 2]],
                                    "table": [[2200]]})"),
     {"@/materials/M/acousticMedium/volumetricDragTable: found 2 columns, expected at least 3: 1 of data, "
      "the temperature, 1 field variable"}},
    {"UnloadingTable_CountsItsOwnFields",
     Model(R"("materials": {"M": {"thicknessBehavior": {"unloadingDependencies": 1,
                                                        "unloadingTable": [[1]]}}},
              "sections": {"S": {"class": "kseC_GasketSection", "materialName": "M"}})"),
     {"@/materials/M/thicknessBehavior/unloadingTable: found 1 column, expected at least 2: 1 of data, "
      "1 field variable"}},
    {"AnnealTemperature_CountsItsFields",
     Material(R"("plastic": {"annealTemperature": {"dependencies": 1, "table": [[500]]}})"),
     {"@/materials/M/plastic/annealTemperature/table: found 1 column, expected at least 2: 1 of data, "
      "1 field variable"}},
    {"ContactAreaWithFields_NeedsARow",
     Model(R"("materials": {"M": {"thicknessBehavior": {"variableUnits": "FORCE",
                                                        "contactArea": {"dependencies": 1}}}},
              "sections": {"S": {"class": "kseC_GasketSection", "materialName": "M"}})"),
     {"@/materials/M/thicknessBehavior/contactArea/table: found no row, expected at least 1: the first row "
      "stands in one line with \"dependencies=\""}},

    {"NegativeDependencies_AreRefused",
     Material(R"("density": {"dependencies": -1, "table": [[1]]})"),
     {"@/materials/M/density/dependencies: found -1, expected 0 or more"}},
    {"NegativeCountsOfVariables_AreRefused",
     Material(
         R"("depvar": {"deleteVar": -2, "numVariables": -1}, "userOutputVariables": {"numVariables": -3})"),
     {"@/materials/M/depvar/numVariables: found -1, expected 0 or more",
      "@/materials/M/depvar/deleteVar: found -2, expected 0 or more",
      "@/materials/M/userOutputVariables/numVariables: found -3, expected 0 or more"}},
    {"NegativeNmax_IsRefused",
     Material(R"("viscoelastic": {"nmax": -1})"),
     {"@/materials/M/viscoelastic/nmax: found -1, expected 0 or more"}},
    {"NegativeSmoothing_IsRefused",
     Material(R"("hyperelastic": {"testData": true, "planarTestData": {"smoothing": -1}})"),
     {"@/materials/M/hyperelastic/planarTestData/smoothing: found -1, expected 0 or more"}},
    {"SmoothingUnset_IsAllowed",
     Material(R"("hyperelastic": {"testData": true, "planarTestData": {"smoothing": null}})"),
     {}},
    {"OrderOfZero_IsRefused",
     Material(R"("hyperfoam": {"n": 0, "table": [[1, 2]]})"),
     {"@/materials/M/hyperfoam/n: found 0, expected 1 or more"}},
    {"NoBackstress_IsRefused",
     Material(R"("plastic": {"numBackstresses": 0})"),
     {"@/materials/M/plastic/numBackstresses: found 0, expected 1 or more"}},
    {"NegativeProperties_AreRefused",
     Material(R"("hyperelastic": {"type": "USER", "properties": -1})"),
     {"@/materials/M/hyperelastic/properties: found -1, expected 0 or more"}},
    {"OptionThatNoDeckCarries_IsAnUnknownMember",
     Material(R"("userDefinedFields": {})"),
     {"@/materials/M/userDefinedFields: found an unknown member 'userDefinedFields'; did you mean "
      "'userDefinedField'? Expected one of creep, density, dielectric, diffusivity, elastic, "
      "moistureSwelling, poreFluidExpansion, swelling, userDefinedField, userMaterial, ... (41 more)"}},

    {"HardeningWithRates_IsWarnedOf",
     Material(R"("plastic": {"rateDependentTable": true, "hardening": "KINEMATIC", "dataType": "STABILIZED",
                             "table": [[250, 0, 1]]})"),
     {"warning @/materials/M/plastic/hardening: a table with rates is written without it, so this will not "
      "stand in the deck",
      "warning @/materials/M/plastic/dataType: a table with rates is written without it, so this will not "
      "stand in the deck"}},
    {"RatesWithoutRows_AreWarnedOf",
     Material(R"("plastic": {"rateDependentTable": true},
                 "druckerPrager": {"druckerPragerHardening": {"rateDependentTable": true}})"),
     {"warning @/materials/M/druckerPrager/druckerPragerHardening/table: there are no rows to make a block "
      "for each rate, so this law will not stand in the deck",
      "warning @/materials/M/plastic/table: there are no rows to make a block for each rate, so this law "
      "will not stand in the deck"}},
    {"HyperelasticWithoutData_IsWarnedOf",
     Material(R"("hyperelastic": {"type": "YEOH"})"),
     {"warning @/materials/M/hyperelastic/table: there are no constants, so this law will have no data"}},
    {"HyperelasticUserWithoutConstants_IsAllRight", Material(R"("hyperelastic": {"type": "USER"})"), {}},
    {"HyperelasticTestsWithoutTestData_AreWarnedOf",
     Material(R"("hyperelastic": {"table": [[1, 2, 3]], "biaxialTestData": {}, "volumetricTestData": {}})"),
     {"warning @/materials/M/hyperelastic/biaxialTestData: testData is false, so this will not stand in the "
      "deck",
      "warning @/materials/M/hyperelastic/volumetricTestData: testData is false, so this will not stand in "
      "the deck"}},
    {"HyperelasticConstantsWithTestData_AreWarnedOf",
     Material(R"("hyperelastic": {"testData": true, "table": [[1, 2, 3]], "planarTestData": {}})"),
     {"warning @/materials/M/hyperelastic/table: testData is true, so this will not stand in the deck"}},
    {"HyperelasticTestDataWithoutTests_IsWarnedOf",
     Material(R"("hyperelastic": {"testData": true})"),
     {"warning @/materials/M/hyperelastic/testData: there is no test that would be written, so this law "
      "will have no data"}},
    {"MarlowTestsThatAreNotChosen_AreWarnedOf",
     Material(R"("hyperelastic": {"type": "MARLOW", "testData": true, "marlowDeviatoricData": "PLANAR",
                                  "planarTestData": {}, "uniaxialTestData": {}, "volumetricTestData": {}})"),
     {"warning @/materials/M/hyperelastic/uniaxialTestData: a Marlow material leaves it out, so this will "
      "not stand in the deck",
      "warning @/materials/M/hyperelastic/volumetricTestData: a Marlow material leaves it out, so this will "
      "not stand in the deck"}},
    {"MarlowWithoutTestData_IsWarnedOf",
     Material(R"("hyperelastic": {"type": "MARLOW"})"),
     {"warning @/materials/M/hyperelastic/testData: a Marlow material has no constants, so without test "
      "data its law will not stand in the deck"}},
    {"HyperelasticOfNoLaw_IsWarnedOf",
     Material(R"("hyperelastic": {"type": "UNKNOWN", "table": [[1]]})"),
     {"warning @/materials/M/hyperelastic/type: \"unknown\" will stand in the deck, which names no law"}},
    {"HyperfoamTestsWithoutTestData_AreWarnedOf",
     Material(R"("hyperfoam": {"simpleShearTestData": {}})"),
     {"warning @/materials/M/hyperfoam/simpleShearTestData: testData is false, so this will not stand in "
      "the deck",
      "warning @/materials/M/hyperfoam/table: there are no constants, so this law will have no data"}},
    {"ContactAreaOfStress_IsWarnedOf",
     Model(R"("materials": {"M": {"thicknessBehavior": {"contactArea": {}}}},
              "sections": {"S": {"class": "kseC_GasketSection", "materialName": "M"}})"),
     {"warning @/materials/M/thicknessBehavior/contactArea: variableUnits is not FORCE, so this will not "
      "stand in the deck"}},
    {"ExsorptionWithoutItsFlag_IsWarnedOf",
     Material(R"("sorption": {"exsorptionTable": [[1, 2]], "scanning": 3})"),
     {"warning @/materials/M/sorption/exsorptionTable: exsorption is false, so this will not stand in the "
      "deck",
      "warning @/materials/M/sorption/scanning: exsorption is false, so this will not stand in the deck"}},
    {"DragWithoutItsFlag_IsWarnedOf",
     Material(R"("acousticMedium": {"volumetricDragTable": [[1, 2]]})"),
     {"warning @/materials/M/acousticMedium/volumetricDragTable: volumetricDrag is false, so this will not "
      "stand in the deck"}},
};

class MaterialChecks : public testing::TestWithParam<FindingCase> {};

} // namespace

TEST_P(MaterialChecks, Of) {
    EXPECT_EQ(Findings(GetParam().text), GetParam().findings);
}

INSTANTIATE_TEST_SUITE_P(Each, MaterialChecks, testing::ValuesIn(kCases), FindingCaseName);

TEST(MaterialModelFile, OptionsWithKeywordsButNoPlaceInAMaterial_AreUnknownMembers) {
    for (const std::string name : {"brittleCracking", "jointedMaterial", "fluidDensity", "fluidBulkModulus",
                                   "fluidExpansion", "acousticBulkModulus", "acousticVolumetricDrag"}) {
        const auto findings = Findings(Material("\"" + name + "\": {}"));
        ASSERT_EQ(findings.size(), 1u);
        EXPECT_EQ(findings[0].find("@/materials/M/" + name + ": found an unknown member '" + name + "'"), 0u);
    }
}

TEST(MaterialModelFile, GasketSectionOfAMaterialThatIsNotThere_IsRefused) {
    const auto findings =
        Findings(Model(R"("sections": {"S": {"class": "kseC_GasketSection", "materialName": "RING"}})"));
    ASSERT_EQ(findings.size(), 1u);
    EXPECT_EQ(findings[0].find("@/sections/S/materialName: found 'RING'"), 0u);
}
