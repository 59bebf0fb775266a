#include "hostile/Findings.h"

namespace {

class SectionErrors : public testing::TestWithParam<FindingCase> {};

/// A model with a material M, a profile P and a section S of these.
std::string Section(const std::string& className, const std::string& members) {
    return Model(
        R"("materials": {"M": {"damping": {}}}, "beamProfiles": {"P": {"class": "CircularProfile", "r": 1}},
                    "sections": {"S": {"class": "kseC_)" +
        className + "\", " + members + "}}");
}

std::string GeneralBeam(const std::string& members) {
    return Section("BeamSection", R"("integration": "BEFORE_ANALYSIS", "profileName": "P", )" + members);
}

std::string Shell(const std::string& members) {
    return Section("HomogenousShellSection", R"("thickness": 1, "materialName": "M", )" + members);
}

std::string Composite(const std::string& kind, const std::string& members) {
    return Section("Composite" + kind + "Section",
                   R"("layers": [{"thickness": 1, "materialName": "M", )" + members + "}]");
}

std::string ArbitraryProfile(const std::string& members) {
    return Model(R"("beamProfiles": {"A": {"class": "ArbitraryProfile")" + members + "}}");
}

std::string Sensor(const std::string& members) {
    return Model(R"("interactions": {"A": {"class": "ActuatorSensor", )" + members + "}}");
}

const std::string noDeck = "found a shell of which no deck can be written: where elements have it, writing "
                           "fails with \"Shell general section unimplemented\"";

const FindingCase sectionCases[] = {
    {"BeamTableOfThreeColumnsForTwo",
     GeneralBeam(R"("materialTable": [[1, 2, 3]])"),
     {"@/sections/S/materialTable: found rows of 3, expected rows of 2: Young's modulus, torsional shear "
      "modulus"}},
    {"BeamTableOfTwoColumnsForThree",
     GeneralBeam(R"("materialTable": [[1, 2]], "temperatureDependency": true)"),
     {"@/sections/S/materialTable: found rows of 2, expected rows of 3: Young's modulus, torsional shear "
      "modulus, the cell of temperatureDependency"}},
    {"BeamTableWithoutItsFieldVariables",
     GeneralBeam(R"("materialTable": [[1, 2, 3]], "useFieldColumn": true, "dependencies": 2)"),
     {"@/sections/S/materialTable: found rows of 3, expected rows of 5: Young's modulus, torsional shear "
      "modulus, the cell of useFieldColumn, 2 field variables"}},
    {"BeamTableWithoutItsFieldVariable",
     GeneralBeam(R"("materialTable": [[1, 2]], "dependencies": 1)"),
     {"@/sections/S/materialTable: found rows of 2, expected rows of 3: Young's modulus, torsional shear "
      "modulus, 1 field variable"}},
    {"BeamDependenciesBeyondAnyTable",
     GeneralBeam(R"("materialTable": [[1, 2]], "dependencies": 2147483646)"),
     {"@/sections/S/materialTable: found rows of 2, expected rows of 2147483648: Young's modulus, torsional "
      "shear modulus, 2147483646 field variables"}},
    {"BeamDependenciesNegative",
     GeneralBeam(R"("dependencies": -1)"),
     {"@/sections/S/dependencies: found -1, expected 0 or more",
      "warning @/sections/S/materialTable: found no row, expected Young's modulus, torsional shear modulus: "
      "a "
      "section integrated before the analysis takes no others"}},
    {"SectionPointsOfThreeColumns",
     GeneralBeam(R"("sectionPoints": [[1, 2, 3]])"),
     {"@/sections/S/sectionPoints: found rows of 3, expected rows of 2: x, y",
      "warning @/sections/S/materialTable: found no row, expected Young's modulus, torsional shear modulus: "
      "a "
      "section integrated before the analysis takes no others"}},
    {"IntegratedBeamWithoutMaterial",
     Section("BeamSection", R"("profileName": "P")"),
     {"@/sections/S/materialName: found nothing, expected the material of a section integrated during the "
      "analysis"}},
    {"BeamWithoutProfile",
     Section("BeamSection", R"("materialName": "M")"),
     {"@/sections/S/profileName: found nothing, expected key in the model's profile map"}},
    {"BeamOfUnknownProfile",
     Section("BeamSection", R"("materialName": "M", "profileName": "Q")"),
     {"@/sections/S/profileName: found 'Q', expected the name of a profile; there is 'P'"}},

    {"ArbitraryProfileOfTwoColumns",
     ArbitraryProfile(R"(, "table": [[0, 0], [1, 0]])"),
     {"@/beamProfiles/A/table: found rows of 2, expected rows of 3: x, y, thickness"}},
    {"ArbitraryProfileOfOneRow",
     ArbitraryProfile(R"(, "table": [[0, 0, 1]])"),
     {"@/beamProfiles/A/table: found 1 row, expected at least 2, the ends of a segment"}},
    {"ArbitraryProfileWithoutTable",
     ArbitraryProfile(""),
     {"@/beamProfiles/A/table: found 0 rows, expected at least 2, the ends of a segment"}},

    {"ShellPointsNegative",
     Shell(R"("integrationPoints": -5)"),
     {"@/sections/S/integrationPoints: found -5, expected 0 or more"}},
    {"ShellTemperaturePointsNegative",
     Shell(R"("temperaturePoints": -1)"),
     {"@/sections/S/temperaturePoints: found -1, expected 0 or more"}},
    {"ShellLayerPointsNegative",
     Composite("Shell", R"("integrationPoints": -1)"),
     {"@/sections/S/layers/0/integrationPoints: found -1, expected 0 or more"}},
    {"SolidLayerPointsNegative",
     Composite("Solid", R"("integrationPoints": -1)"),
     {"@/sections/S/layers/0/integrationPoints: found -1, expected 0 or more"}},
    {"RebarWithoutNames",
     Shell(R"("rebars": {"layers": [{"area": 1, "name": "", "materialName": ""}]})"),
     {"@/sections/S/rebars/layers/0/name: found nothing, expected name of the layer, first item of its data "
      "line",
      "@/sections/S/rebars/layers/0/materialName: found nothing, expected material of the bars"}},
    {"ShellWithoutMaterial",
     Section("HomogenousShellSection", R"("thickness": 1)"),
     {"@/sections/S/materialName: found nothing, expected material"}},
    {"UserShell",
     Section("UserShellSection", R"("symmetric": false)"),
     {"warning @/sections/S/class: " + noDeck}},
    {"GeneralShell",
     Model(R"("sections": {"S": {"class": "GeneralShellSection"}})"),
     {"warning @/sections/S/class: " + noDeck}},

    {"SensorCountsNegative",
     Sensor(R"("coordinates": -1, "variables": -2)"),
     {"@/interactions/A/coordinates: found -1, expected 0 or more",
      "@/interactions/A/variables: found -2, expected 0 or more"}},

    // What decks can carry, however odd, is nobody's business here.
    {"OddValues_AreWarnedOfAndPass",
     Model(R"("materials": {"M": {"damping": {}}}, "beamProfiles": {
                "P": {"class": "ArbitraryProfile", "table": [[0, 0, 0], [0, 0, 0]]},
                "I": {"class": "IbeamProfile"}, "G": {"class": "GeneralizedProfile"}},
              "sections": {
                "Beam": {"class": "BeamSection", "profileName": "G", "materialName": "M",
                         "materialTable": [[1]], "centroid": [1], "shearCenter": [1, 2, 3]},
                "General": {"class": "BeamSection", "integration": "BEFORE_ANALYSIS", "profileName": "P",
                            "temperatureDependency": true},
                "Solid": {"class": "CompositeSolidSection", "symmetric": true},
                "Shell": {"class": "HomogenousShellSection", "thickness": -1, "materialName": "M",
                          "integrationPoints": 0, "thicknessModulus": -1, "rebars": {}},
                "Truss": {"class": "TrussSection", "area": 0, "materialName": "M"},
                "Point": {"class": "PointSection", "mass": -1}})"),
     {"warning @/sections/General/materialTable: found no row, expected Young's modulus, torsional shear "
      "modulus, the cell of temperatureDependency: a section integrated before the analysis takes no others",
      "warning @/sections/Shell/thickness: found -1.0, expected more than 0",
      "warning @/sections/Truss/area: found 0.0, expected more than 0",
      "warning @/beamProfiles/I/h: found 0.0, expected more than 0",
      "warning @/beamProfiles/I/b1: found 0.0, expected more than 0",
      "warning @/beamProfiles/I/b2: found 0.0, expected more than 0",
      "warning @/beamProfiles/I/t1: found 0.0, expected more than 0",
      "warning @/beamProfiles/I/t2: found 0.0, expected more than 0",
      "warning @/beamProfiles/I/t3: found 0.0, expected more than 0",
      "warning @/beamProfiles/G/area: found 0.0, expected more than 0"}},
};

} // namespace

TEST_P(SectionErrors, Section_WithSomethingWrong_TellsPlaceFoundAndExpected) {
    EXPECT_EQ(Findings(GetParam().text), GetParam().findings);
}

INSTANTIATE_TEST_SUITE_P(Cases, SectionErrors, testing::ValuesIn(sectionCases), FindingCaseName);
