#include "hostile/Findings.h"

namespace {

class LoadErrors : public testing::TestWithParam<FindingCase> {};

const char kSteps[] =
    R"("steps": [{"name": "I", "class": "InitialStep"}, {"name": "S", "class": "StaticStep"}], )";

std::string Load(const std::string& className, const std::string& members) {
    return Model(kSteps + (R"("loads": {"L": {"class": "kloC_)" + className + "\", " + members + "}}"));
}
std::string Field(const std::string& className, const std::string& members) {
    return Model(kSteps + (R"("fields": {"F": {"class": "kpfC_)" + className + "\", " + members + "}}"));
}
std::string Complex(const std::string& value) {
    return Load("Pressure", "\"complexMagnitude\": " + value);
}

const FindingCase loadCases[] = {
    {"ComplexOfThreeNumbers",
     Complex("[1, 2, 3]"),
     {"@/loads/L/complexMagnitude: found an array of 3 items, expected two numbers, or an object of "
      "\"form\", "
      "\"real\" and \"imag\""}},
    {"ComplexThatIsANumber",
     Complex("1"),
     {"@/loads/L/complexMagnitude: found 1, expected two numbers, or an object of \"form\", \"real\" and "
      "\"imag\""}},
    {"ComplexPartsThatAreNoNumbers",
     Complex(R"(["a", null])"),
     {"@/loads/L/complexMagnitude/0: found 'a', expected a number",
      "@/loads/L/complexMagnitude/1: found null, expected a number"}},
    {"ComplexObjectOfOtherMembers",
     Complex(R"({"magnitude": 1, "real": true})"),
     {"@/loads/L/complexMagnitude/magnitude: found an unknown member 'magnitude', expected one of form, "
      "real, imag; is it meant for '/models/Default Model/loads/L/states/.../magnitude'?",
      "@/loads/L/complexMagnitude/real: found true, expected a number"}},
    {"ComplexOfNoForm",
     Complex(R"({"form": "CARTESIAN"})"),
     {"@/loads/L/complexMagnitude/form: found 'CARTESIAN', expected one of RECTANGULAR (0), POLAR (1)"}},
    {"ComplexInEveryForm",
     Load("BodyForce", R"("complexComponent1": [1, -2.5], "complexComponent2": {},
                                "complexComponent3": {"form": "polar", "real": 1, "imag": 90})"),
     {}},
    {"PressureOfATotalForce",
     Load("Pressure", R"("distributionType": "TOTAL_FORCE")"),
     {"warning @/loads/L/distributionType: found TOTAL_FORCE, for which decks have no label"}},
    {"HydrostaticBodyForce",
     Load("BodyForce", R"("distributionType": "HYDROSTATIC")"),
     {"warning @/loads/L/distributionType: found HYDROSTATIC, which only pressures and pipe pressures can "
      "be; "
      "it counts as UNIFORM"}},
    {"HydrostaticPressures", Load("Pressure", R"("distributionType": "HYDROSTATIC")"), {}},
    {"HydrostaticPipePressures", Load("PipePressure", R"("distributionType": "HYDROSTATIC")"), {}},
    {"RotationWithoutAnAxis",
     Load("RotationalBodyForce", R"("point1": [1, 2, 3], "point2": [1, 2, 3], "centrifugal": false)"),
     {"warning @/loads/L/point2: found the first point again, so the axis has no direction",
      "warning @/loads/L/centrifugal: found neither a centrifugal nor a rotary load, so it has no label"}},
    {"TractionWithoutADirection",
     Load("ShellEdgeLoad", R"("vectorGiven": true)"),
     {"warning @/loads/L/direction: found two points that are one, so there is no direction"}},
    {"FluxOfADisplacement",
     Load("ConcentratedHeatFlux", R"("dof": 3)"),
     {"warning @/loads/L/dof: found 3, expected 11 or more"}},
    {"ConcentrationFluxOfADisplacement",
     Load("ConcentratedConcentrationFlux", R"("dof": 0)"),
     {"warning @/loads/L/dof: found 0, expected 11 or more"}},
    {"AmplitudeThatIsNotThere",
     Load("Moment", R"("states": {"S": {"amplitude": "A"}})"),
     {"@/loads/L/states/S/amplitude: found 'A', expected the name of an amplitude; there is none"}},
    {"TemperatureOfANamedField",
     Field("Temperature", R"("distributionType": "FIELD")"),
     {"warning @/fields/F/distributionType: found FIELD, which fields of this class have no form for"}},
    {"GeostaticTemperature",
     Field("Temperature", R"("distributionType": "GEOSTATIC")"),
     {"warning @/fields/F/distributionType: found GEOSTATIC, which fields of this class have no form for"}},
    {"VelocityFromAFile",
     Field("Velocity", R"("distributionType": "FROM_FILE")"),
     {"warning @/fields/F/distributionType: found FROM_FILE, which fields of this class have no form for"}},
    {"GeostaticStress", Field("Stress", R"("distributionType": "GEOSTATIC", "lateralCoeff2": null)"), {}},
    {"BackstressOfSeven",
     Field("Hardening", R"("backstress": [1, 2, 3, 4, 5, 6, 7])"),
     {"@/fields/F/backstress: found 7 components, expected 6 at most"}},
    {"FieldVariableZero",
     Field("GeneralField", R"("states": {"I": {"variable": 0, "numberOfValues": -1}})"),
     {"@/fields/F/states/I/numberOfValues: found -1, expected 0 or more",
      "@/fields/F/states/I/variable: found 0, expected 1 or more"}},
    {"ValuesThatAreNoList",
     Field("Temperature", R"("states": {"I": {"values": 20}})"),
     {"@/fields/F/states/I/values: found 20, expected an array"}},
    {"ValueThatIsNoNumber",
     Field("Temperature", R"("states": {"I": {"values": [20, "hot"]}})"),
     {"@/fields/F/states/I/values/1: found 'hot', expected a number"}},
    {"ValuesOfEveryForm",
     Field("Temperature",
           R"("states": {"I": {"values": [20, {"value": 5, "state": 2}]}, "S": {"values": null}})"),
     {}},
};

} // namespace

TEST_P(LoadErrors, Model_HasItsFindings) {
    EXPECT_EQ(Findings(GetParam().text), GetParam().findings);
}

INSTANTIATE_TEST_SUITE_P(All, LoadErrors, testing::ValuesIn(loadCases), FindingCaseName);
