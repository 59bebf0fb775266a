#include "conditions/LoadTesting.h"
#include "conditions/oif_FieldBuilder.h"
#include "conditions/oif_InitialConditions.h"
#include "conditions/oif_PredefinedFields.h"

namespace {

/// What the keyword of a step behind the initial one, or that of the initial step, writes.
std::string Text(const OneField& field, const char* step, oif_Op op = oif_Op::MODIFY, int maxSize = 0,
                 double scale = 1.0) {
    const oif_FieldRow* row = oif_FindFieldRow(field.Record().DynTypeId());
    return Written(row->make(field.Card(step, op, scale), {maxSize, 0}).ConstGet());
}
std::string Initial(const OneField& field, const char* step = "S0", int maxTemperature = 0,
                    int maxGeneral = 0) {
    const oif_FieldRow* row = oif_FindFieldRow(field.Record().DynTypeId());
    return Written(row->makeInitial(field.Card(step), {maxTemperature, maxGeneral}).ConstGet());
}

const char kFromFile[] = R"("distributionType": "FROM_FILE")";
const char kFromFileAndUser[] = R"("distributionType": "FROM_FILE_AND_USER_DEFINED")";
const char kUser[] = R"("distributionType": "USER_DEFINED")";
const char kNamedField[] = R"("distributionType": "FIELD")";
const char kGeostatic[] = R"("distributionType": "GEOSTATIC")";

const std::string kNine = "[1, 2, 3, 4, 5, 6, 7, 8, 9]";

} // namespace

TEST(FieldTemperature, Values_StandOnOneLineScaled) {
    const OneField field("IG", "Temperature",
                         "\"S1\": {\"values\": " + kNine + ", \"amplitude\": \"my amp\"}");
    EXPECT_EQ(Text(field, "S1", oif_Op::NEW, 0, 2.0), "*Temperature, op=NEW, amplitude=\"my amp\"\n"
                                                      "A.N, 2., 4., 6., 8., 10., 12., 14., 16., 18.\n");
}

TEST(FieldTemperature, Data_IsFilledUpToTheLargestFieldByEmptyLines) {
    const OneField field("IG", "Temperature", R"("S1": {"values": [5]})");
    EXPECT_EQ(Text(field, "S1", oif_Op::MODIFY, 8), "*Temperature\nA.N, 5.\n");
    EXPECT_EQ(Text(field, "S1", oif_Op::MODIFY, 9), "*Temperature\nA.N, 5.\n\n");
    EXPECT_EQ(Text(field, "S1", oif_Op::MODIFY, 17), "*Temperature\nA.N, 5.\n\n\n");
}

TEST(FieldTemperature, WithoutValues_IsTheSetAlone) {
    const OneField field("IG", "Temperature", R"("S1": {})");
    EXPECT_EQ(Text(field, "S1", oif_Op::MODIFY, 9), "*Temperature\nA.N\n\n");
}

TEST(FieldTemperature, UserDefined_NamesItsSet) {
    const OneField field("IG", "Temperature", R"("S1": {"values": [5], "amplitude": "Ramp"})", kUser);
    EXPECT_EQ(Text(field, "S1", oif_Op::MODIFY, 20), "*Temperature, user\nA.N\n");
}

TEST(FieldTemperature, File_HasTheStepsThatWereSaid) {
    const OneField field(
        "IGG", "Temperature",
        R"("S1": {"magnitude": "a job", "beginStep": 1, "beginIncrement": 2, "endStep": 3, "endIncrement": 4},
                            "S2": {"beginStep": 0, "endStep": null, "magnitude": "b"})",
        kFromFile);
    EXPECT_EQ(Text(field, "S1"), "*Temperature, file=\"a job\", bstep=1, binc=2, estep=3, einc=4\n");
    EXPECT_EQ(Text(field, "S2"), "*Temperature, file=b, binc=2, einc=4\n");
}

TEST(FieldTemperature, FileAndUserDefined_SaysUserFirst) {
    const OneField field("IG", "Temperature", R"("S1": {"magnitude": "f", "interpolate": "MIDSIDE"})",
                         kFromFileAndUser);
    EXPECT_EQ(Text(field, "S1", oif_Op::NEW), "*Temperature, op=NEW, user, file=f, midside\n");
}

TEST(FieldTemperature, EndingOfAResultsFile_IsCutOffInAnyCapitals) {
    const auto file = [](const std::string& name) {
        return Text(OneField("IG", "Temperature", "\"S1\": {\"magnitude\": \"" + name + "\"}", kFromFile),
                    "S1");
    };
    EXPECT_EQ(file("job.fil"), "*Temperature, file=job\n");
    EXPECT_EQ(file("job.FiL"), "*Temperature, file=job\n");
    EXPECT_EQ(file("a.fil"), "*Temperature, file=a\n");
    EXPECT_EQ(file("a.fil.fil"), "*Temperature, file=a.fil\n");
    EXPECT_EQ(file(".fil"), "*Temperature, file=.fil\n");
    EXPECT_EQ(file("job.file"), "*Temperature, file=job.file\n");
    EXPECT_EQ(file("job.odb"), "*Temperature, file=job.odb\n");
    EXPECT_EQ(file(""), "*Temperature, file=\n");
}

TEST(FieldTemperature, Interpolation_HasTolerancesOtherThanTheDefaults) {
    const auto file = [](const std::string& state) {
        return Text(OneField("IG", "Temperature", R"("S1": {"magnitude": "f", )" + state + "}", kFromFile),
                    "S1");
    };
    EXPECT_EQ(file(R"("interpolate": "INTERPOLATE")"), "*Temperature, file=f, interpolate\n");
    EXPECT_EQ(
        file(R"("interpolate": "INTERPOLATE", "exteriorTolerance": 0.05, "absoluteExteriorTolerance": 0)"),
        "*Temperature, file=f, interpolate\n");
    EXPECT_EQ(
        file(R"("interpolate": "INTERPOLATE", "exteriorTolerance": 0, "absoluteExteriorTolerance": 0.05)"),
        "*Temperature, file=f, interpolate, absolute exterior tolerance=0.05, exterior tolerance=0.\n");
    EXPECT_EQ(file(R"("interpolate": "MIDSIDE", "exteriorTolerance": 0.1)"),
              "*Temperature, file=f, midside\n");
    EXPECT_EQ(file(R"("interpolate": "NONE", "exteriorTolerance": 0.1)"), "*Temperature, file=f\n");
    EXPECT_EQ(file(R"("exteriorTolerance": 0.1)"), "*Temperature, file=f\n");
}

TEST(FieldTemperature, FieldThatEnds_IsItsLineAloneWithOpNewAlways) {
    for (const char* end : {R"("deactivated": true)", R"("status": "DEACTIVATED")"}) {
        const OneField field("IGG", "Temperature",
                             std::string(R"("S1": {"values": [5], "amplitude": "Ramp"}, "S2": {)") + end +
                                 "}");
        EXPECT_EQ(Text(field, "S2", oif_Op::MODIFY, 20), "*Temperature, op=NEW\n");
    }
}

TEST(FieldTemperature, DistributionOfANamedField_IsTheLineAlone) {
    const OneField field("IG", "Temperature", R"("S1": {"values": [5], "amplitude": "Ramp"})", kNamedField);
    EXPECT_EQ(Text(field, "S1", oif_Op::MODIFY, 20), "*Temperature\n");
}

TEST(GeneralField, Values_StandEightToALineUnscaled) {
    const OneField field("IG", "GeneralField",
                         "\"S1\": {\"variable\": 3, \"values\": " + kNine + ", \"amplitude\": \"Ramp\"}");
    EXPECT_EQ(Text(field, "S1", oif_Op::NEW), "*Field, op=NEW, variable=3, number=9, amplitude=Ramp\n"
                                              "A.N, 1., 2., 3., 4., 5., 6., 7., 8.\n9.\n");
}

TEST(GeneralField, EightValues_LeaveNoEmptyLine) {
    const OneField field("IG", "GeneralField", R"("S1": {"values": [1, 2, 3, 4, 5, 6, 7, 8]})");
    EXPECT_EQ(Text(field, "S1"), "*Field, variable=1, number=8\nA.N, 1., 2., 3., 4., 5., 6., 7., 8.\n");
}

TEST(GeneralField, NumberThatWasGiven_FillsTheDataUp) {
    const OneField field("IGG", "GeneralField",
                         R"("S1": {"values": [1], "numberOfValues": 17}, "S2": {"values": [2]})");
    EXPECT_EQ(Text(field, "S1"), "*Field, variable=1, number=17\nA.N, 1.\n\n\n");
    // New values count by themselves.
    EXPECT_EQ(Text(field, "S2"), "*Field, variable=1, number=1\nA.N, 2.\n");
}

TEST(GeneralField, WithoutValues_IsTheSetAlone) {
    const OneField field("IG", "GeneralField", R"("S1": {"numberOfValues": 17})");
    EXPECT_EQ(Text(field, "S1"), "*Field, variable=1, number=17\nA.N\n");
}

TEST(GeneralField, File_SaysMidsideButNotInterpolate) {
    const auto file = [](const char* interpolate, const char* fields) {
        return Text(
            OneField(
                "IG", "GeneralField",
                std::string(
                    R"("S1": {"fileName": "f.fil", "beginStep": 1, "endIncrement": 4, "interpolate": ")") +
                    interpolate + "\"}",
                fields),
            "S1");
    };
    EXPECT_EQ(file("MIDSIDE", kFromFile), "*Field, variable=1, number=0, file=f, bstep=1, einc=4, midside\n");
    EXPECT_EQ(file("INTERPOLATE", kFromFileAndUser),
              "*Field, variable=1, number=0, user, file=f, bstep=1, einc=4\n");
}

TEST(GeneralField, UserDefinedAndNamedField_HaveNoValues) {
    EXPECT_EQ(Text(OneField("IG", "GeneralField", R"("S1": {"values": [1]})", kUser), "S1"),
              "*Field, variable=1, number=1, user\nA.N\n");
    EXPECT_EQ(Text(OneField("IG", "GeneralField", R"("S1": {"values": [1]})", kNamedField), "S1"),
              "*Field, variable=1, number=1\n");
}

TEST(GeneralField, FieldThatEnds_StillNamesItsVariable) {
    const OneField field("IGG", "GeneralField",
                         R"("S1": {"variable": 2, "values": [1]}, "S2": {"deactivated": true})");
    EXPECT_EQ(Text(field, "S2"), "*Field, op=NEW, variable=2, number=1\n");
}

TEST(PressureStress, EveryDistribution_HasItsForm) {
    const auto text = [](const char* fields, oif_Op op = oif_Op::MODIFY) {
        return Text(OneField("IG", "PressureStress",
                             R"("S1": {"magnitude": 5, "fileName": "f.FIL", "amplitude": "Ramp"})", fields),
                    "S1", op);
    };
    EXPECT_EQ(text("", oif_Op::NEW), "*Pressure stress, op=NEW, amplitude=Ramp\nA.N, 5.\n");
    EXPECT_EQ(text(kUser), "*Pressure stress, user\nA.N\n");
    EXPECT_EQ(text(kFromFile), "*Pressure stress, file=f\n");
    EXPECT_EQ(text(kFromFileAndUser), "*Pressure stress, user, file=f\n");
    EXPECT_EQ(text(kNamedField), "*Pressure stress\n");
    const OneField ends("IGG", "PressureStress", R"("S1": {"magnitude": 5}, "S2": {"deactivated": true})");
    EXPECT_EQ(Text(ends, "S2"), "*Pressure stress, op=NEW\n");
}

TEST(MassFlowRate, EveryDistribution_HasItsForm) {
    const auto text = [](const char* fields, oif_Op op = oif_Op::MODIFY) {
        return Text(OneField("IG", "MassFlowRate",
                             R"("S1": {"component1": 1, "component3": 3, "amplitude": "Ramp"})", fields),
                    "S1", op);
    };
    EXPECT_EQ(text("", oif_Op::NEW), "*Mass flow rate, op=NEW, amplitude=Ramp\nA.N, 1., 0., 3.\n");
    EXPECT_EQ(text(kUser), "*Mass flow rate, user\nA.N\n");
    EXPECT_EQ(text(kFromFile), "*Mass flow rate\n");
    const OneField ends("IGG", "MassFlowRate", R"("S1": {}, "S2": {"deactivated": true})");
    EXPECT_EQ(Text(ends, "S2"), "*Mass flow rate, op=NEW\n");
}

TEST(InitialConditions, Temperature_HasNoAmplitudeAndIsFilledUp) {
    const OneField field("I", "Temperature", R"("S0": {"values": [20, 30], "amplitude": "Ramp"})");
    EXPECT_EQ(Initial(field, "S0", 9), "*Initial Conditions, type=TEMPERATURE\nA.N, 20., 30.\n\n");
}

TEST(InitialConditions, TemperatureOfAFile_HasItsFirstStepOnly) {
    const char state[] =
        R"("S0": {"magnitude": "f.fil", "beginStep": 1, "beginIncrement": 2, "endStep": 3, "interpolate": "INTERPOLATE", "exteriorTolerance": 0.1})";
    EXPECT_EQ(Initial(OneField("I", "Temperature", state, kFromFile), "S0", 9),
              "*Initial Conditions, type=TEMPERATURE, file=f, step=1, inc=2, interpolate, exterior "
              "tolerance=0.1\n");
    EXPECT_EQ(Initial(OneField("I", "Temperature", R"("S0": {"magnitude": "f", "interpolate": "MIDSIDE"})",
                               kFromFileAndUser)),
              "*Initial Conditions, type=TEMPERATURE, file=f, midside\n");
    EXPECT_EQ(Initial(OneField("I", "Temperature", state, kUser), "S0", 9),
              "*Initial Conditions, type=TEMPERATURE, USER\n");
}

TEST(InitialConditions, OtherDistributions_AreWrittenAsUniform) {
    EXPECT_EQ(Initial(OneField("I", "Temperature", R"("S0": {"values": [5]})", kNamedField)),
              "*Initial Conditions, type=TEMPERATURE\nA.N, 5.\n");
    // Only a stress is geostatic.
    EXPECT_EQ(Initial(OneField("I", "Temperature", R"("S0": {"values": [5]})", kGeostatic)),
              "*Initial Conditions, type=TEMPERATURE\nA.N, 5.\n");
}

TEST(InitialConditions, GeneralField_HasBlanksAroundTheSignOfItsVariableOnPurpose) {
    const OneField field("I", "GeneralField", "\"S0\": {\"variable\": 2, \"values\": " + kNine + "}");
    EXPECT_EQ(Initial(field, "S0", 0, 17), "*Initial Conditions, type=FIELD, variable = 2\n"
                                           "A.N, 1., 2., 3., 4., 5., 6., 7., 8.\n9.\n\n");
    EXPECT_EQ(Initial(OneField("I", "GeneralField", R"("S0": {})"), "S0", 0, 9),
              "*Initial Conditions, type=FIELD, variable = 1\nA.N\n\n");
}

TEST(InitialConditions, GeneralFieldOfAFile_MayInterpolateWithoutTolerances) {
    const auto file = [](const char* interpolate, const char* fields) {
        return Initial(
            OneField("I", "GeneralField",
                     std::string(
                         R"("S0": {"fileName": "f", "beginStep": 1, "beginIncrement": 2, "interpolate": ")") +
                         interpolate + "\"}",
                     fields),
            "S0", 0, 9);
    };
    EXPECT_EQ(file("INTERPOLATE", kFromFile),
              "*Initial Conditions, type=FIELD, variable = 1, file=f, step=1, inc=2, interpolate\n");
    EXPECT_EQ(file("MIDSIDE", kFromFileAndUser),
              "*Initial Conditions, type=FIELD, variable = 1, file=f, step=1, inc=2, midside\n");
    EXPECT_EQ(file("NONE", kFromFile),
              "*Initial Conditions, type=FIELD, variable = 1, file=f, step=1, inc=2\n");
    EXPECT_EQ(file("MIDSIDE", kUser), "*Initial Conditions, type=FIELD, variable = 1, USER\n");
}

TEST(InitialConditions, Velocity_HasALineForEachComponentThatIsNotZero) {
    EXPECT_EQ(Initial(OneField("I", "Velocity", R"("S0": {})", R"("velocity1": 1, "velocity3": -3)")),
              "*Initial Conditions, type=VELOCITY\nA.N, 1, 1.\nA.N, 3, -3.\n");
}

TEST(InitialConditions, VelocityOfZero_IsSaidInFull) {
    EXPECT_EQ(Initial(OneField("I", "Velocity", R"("S0": {})")),
              "*Initial Conditions, type=VELOCITY\nA.N, 1, 0.\nA.N, 2, 0.\nA.N, 3, 0.\n");
}

TEST(InitialConditions, RotatingVelocity_LeavesZerosOfTheTranslationOutAndKeepsTheirPlaces) {
    EXPECT_EQ(
        Initial(OneField("I", "Velocity", R"("S0": {})",
                         R"("omega": 2, "velocity2": 5, "axisBegin": [0, 1, 2], "axisEnd": [0, 1, 3])")),
        "*Initial Conditions, type=ROTATING VELOCITY\nA.N, 2., , 5., , \n0., 1., 2., 0., 1., 3., \n");
}

TEST(InitialConditions, Stress_LeavesPlacesOfMissingComponentsEmpty) {
    EXPECT_EQ(Initial(OneField("I", "Stress", R"("S0": {})", R"("sigma11": 1, "sigma22": 0, "sigma13": 5)")),
              "*Initial Conditions, type=STRESS\nA.N, 1., 0., , , 5., \n");
}

TEST(InitialConditions, GeostaticStress_MayHaveASecondCoefficient) {
    const std::string fields =
        std::string(kGeostatic) +
        R"(, "stressMagnitude1": -1, "vCoordinate1": 0, "stressMagnitude2": -2, "vCoordinate2": -10, "lateralCoeff1": 0.5)";
    EXPECT_EQ(Initial(OneField("I", "Stress", R"("S0": {})", fields)),
              "*Initial Conditions, type=STRESS, GEOSTATIC\nA.N, -1., 0., -2., -10., 0.5\n");
    EXPECT_EQ(Initial(OneField("I", "Stress", R"("S0": {})", fields + R"(, "lateralCoeff2": 0)")),
              "*Initial Conditions, type=STRESS, GEOSTATIC\nA.N, -1., 0., -2., -10., 0.5, 0.\n");
}

TEST(InitialConditions, StressOfAFile_HasNoDataLines) {
    EXPECT_EQ(
        Initial(OneField("I", "Stress", R"("S0": {})",
                         std::string(kFromFile) + R"(, "fileName": "a.fil", "step": 2, "increment": 3)")),
        "*Initial Conditions, type=STRESS, file=a, step=2, inc=3\n");
    EXPECT_EQ(Initial(OneField("I", "Stress", R"("S0": {})",
                               std::string(kFromFileAndUser) + R"(, "fileName": "a")")),
              "*Initial Conditions, type=STRESS, file=a\n");
    EXPECT_EQ(Initial(OneField("I", "Stress", R"("S0": {})", std::string(kUser) + R"(, "step": 2)")),
              "*Initial Conditions, type=STRESS, USER\n");
}

TEST(InitialConditions, Hardening_EndsInSeparatorsWhereItHasABackstress) {
    const auto text = [](const char* fields) {
        return Initial(OneField("I", "Hardening", R"("S0": {})", fields));
    };
    EXPECT_EQ(text(R"("equivPlasticStrain": 0.1)"), "*Initial Conditions, type=HARDENING\nA.N, 0.1\n");
    EXPECT_EQ(text(R"("backstress": [1, 0, 3])"),
              "*Initial Conditions, type=HARDENING\nA.N, 0., 1., , 3., \n");
    EXPECT_EQ(text(R"("backstress": [1, 2, 3, 4, 0, 6])"),
              "*Initial Conditions, type=HARDENING\nA.N, 0., 1., 2., 3., 4., , 6., \n");
    EXPECT_EQ(text(kUser), "*Initial Conditions, type=HARDENING, USER\n");
    EXPECT_EQ(text(kFromFile), "*Initial Conditions, type=HARDENING\nA.N, 0.\n");
}

TEST(InitialConditions, Actuator_HasAsManyValuesAsAsked) {
    kinC_ActuatorSensor actuator;
    actuator.initialValues.Append(1.5);
    actuator.initialValues.Append(2.0);
    EXPECT_EQ(Written(oif_InitialConditions(actuator, "SENSOR", 3)),
              "*Initial Conditions, type=SOLUTION\nSENSOR, 1.5, 2., 0.\n");
    EXPECT_EQ(Written(oif_InitialConditions(actuator, "SENSOR", 1)),
              "*Initial Conditions, type=SOLUTION\nSENSOR, 1.5\n");
}

TEST(InitialConditions, OtherRecords_Raise) {
    const OneField field("I", "PressureStress", R"("S0": {})");
    EXPECT_EQ(Raised([&] { Written(oif_InitialConditions(field.Card("S0"), field.Record(), {})); }),
              "Unimplemented field for initial condition!");
    const oif_InitialConditions actuator(kinC_ActuatorSensor(), "SENSOR", 1);
    EXPECT_EQ(
        Raised([&] { Streamed([&](utl_Stream& stream) { actuator.WriteInitialConditionsCard(stream); }); }),
        "Unimplemented initial condition!");
}

namespace {

const std::string kBanner = "** \n** FIELDS\n** \n";

std::string Comment(const char* name, const char* type) {
    return std::string("** Name: ") + name + "   Type: " + type + "\n";
}

std::string StepOf(ConditionModel& model, const char* step, const char* loadCase = "") {
    return StepText<oif_FieldBuilder>(model, step, loadCase);
}

std::string Field(const char* name, const char* className, const std::string& states,
                  const char* fields = "") {
    return std::string("\"") + name + R"(": {"class": "kpfC_)" + className + R"(", "region": "A.N")" +
           fields + R"(, "states": {)" + states + "}}";
}

} // namespace

TEST(FieldBuilder, Temperature_IsAnInitialConditionFirstAndAFieldLater) {
    OneField model("IGG", "Temperature", R"("S0": {"values": [20]}, "S2": {"values": [30]})");
    EXPECT_EQ(StepOf(model, "S0"),
              kBanner + Comment("F", "Temperature") + "*Initial Conditions, type=TEMPERATURE\nA.N, 20.\n");
    EXPECT_EQ(StepOf(model, "S1"), "");
    EXPECT_EQ(StepOf(model, "S2"), kBanner + Comment("F", "Temperature") + "*Temperature\nA.N, 30.\n");
}

TEST(FieldBuilder, GeneralField_IsWrittenInEveryStepThatItLivesIn) {
    OneField model("IGGFGG", "GeneralField", R"("S0": {"values": [20]}, "S4": {"deactivated": true})");
    const std::string head = kBanner + Comment("F", "Field");
    EXPECT_EQ(StepOf(model, "S0"), head + "*Initial Conditions, type=FIELD, variable = 1\nA.N, 20.\n");
    EXPECT_EQ(StepOf(model, "S1"), head + "*Field, variable=1, number=1\nA.N, 20.\n");
    EXPECT_EQ(StepOf(model, "S2"), head + "*Field, variable=1, number=1\nA.N, 20.\n");
    EXPECT_EQ(StepOf(model, "S3"), "");
    EXPECT_EQ(StepOf(model, "S4"), head + "*Field, op=NEW, variable=1, number=1\n");
    EXPECT_EQ(StepOf(model, "S5"), "");
}

TEST(FieldBuilder, EndOfOneTemperature_WritesTheOthersAnew) {
    ConditionModel model(
        "IGG", R"("fields": {)" +
                   Field("a", "Temperature", R"("S1": {"values": [1]}, "S2": {"deactivated": true})") + ", " +
                   Field("b", "Temperature", R"("S1": {"values": [2]})") + ", " +
                   Field("c", "PressureStress", R"("S1": {"magnitude": 3})") + "}");
    EXPECT_EQ(StepOf(model, "S2"), kBanner + Comment("a", "Temperature") + "*Temperature, op=NEW\n" +
                                       Comment("b", "Temperature") + "*Temperature, op=NEW\nA.N, 2.\n");
}

TEST(FieldBuilder, SuppressedField_IsNotWrittenButSetsItsFamilysFlagOnPurpose) {
    ConditionModel model("IGG", R"("fields": {)" +
                                    Field("a", "Temperature",
                                          R"("S1": {"values": [1]}, "S2": {"deactivated": true})",
                                          R"(, "suppressed": true)") +
                                    ", " + Field("b", "Temperature", R"("S1": {"values": [2]})") + "}");
    EXPECT_EQ(StepOf(model, "S1"), kBanner + Comment("b", "Temperature") + "*Temperature\nA.N, 2.\n");
    EXPECT_EQ(StepOf(model, "S2"), kBanner + Comment("b", "Temperature") + "*Temperature, op=NEW\nA.N, 2.\n");
}

TEST(FieldBuilder, Data_IsFilledUpToTheLargestFieldOfTheInitialStep) {
    const std::string largest = "\"S0\": {\"values\": " + kNine + "}";
    ConditionModel model(
        "IG", R"("fields": {)" + Field("big", "Temperature", largest) + ", " +
                  Field("bigger", "GeneralField", R"("S0": {"values": [1], "numberOfValues": 17})") + ", " +
                  Field("field", "GeneralField", R"("S0": {"values": [7]})") + ", " +
                  Field("late", "Temperature",
                        R"("S1": {"values": [1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 16, 17]})") +
                  ", " + Field("small", "Temperature", R"("S0": {"values": [5]}, "S1": {"values": [6]})") +
                  "}");
    EXPECT_EQ(StepOf(model, "S0"),
              kBanner + Comment("big", "Temperature") + "*Initial Conditions, type=TEMPERATURE\n" +
                  "A.N, 1., 2., 3., 4., 5., 6., 7., 8., 9.\n\n" + Comment("bigger", "Field") +
                  "*Initial Conditions, type=FIELD, variable = 1\nA.N, 1.\n\n\n" + Comment("field", "Field") +
                  "*Initial Conditions, type=FIELD, variable = 1\nA.N, 7.\n\n\n" +
                  Comment("small", "Temperature") + "*Initial Conditions, type=TEMPERATURE\nA.N, 5.\n\n");
    EXPECT_EQ(StepOf(model, "S1"), kBanner + Comment("bigger", "Field") +
                                       "*Field, variable=1, number=17\nA.N, 1.\n\n\n" +
                                       Comment("field", "Field") + "*Field, variable=1, number=1\nA.N, 7.\n" +
                                       Comment("late", "Temperature") +
                                       "*Temperature\nA.N, 1., 2., 3., 4., 5., 6., 7., 8., 9., 10., 11., "
                                       "12., 13., 14., 15., 16., 17.\n\n" +
                                       Comment("small", "Temperature") + "*Temperature\nA.N, 6.\n\n");
}

TEST(FieldBuilder, FieldsOfOneKeyword_HaveItInTheInitialStepToo) {
    ConditionModel model(
        "IG", R"("fields": {)" +
                  Field("m", "MassFlowRate", R"("S0": {"component1": 1}, "S1": {"component1": 2})") + ", " +
                  Field("p", "PressureStress", R"("S0": {"magnitude": 1}, "S1": {"magnitude": 2})") + "}");
    EXPECT_EQ(StepOf(model, "S0"), kBanner + Comment("m", "Mass flow rate") +
                                       "*Mass flow rate\nA.N, 1., 0., 0.\n" +
                                       Comment("p", "Pressure stress") + "*Pressure stress\nA.N, 1.\n");
    EXPECT_EQ(StepOf(model, "S1"), kBanner + Comment("m", "Mass flow rate") +
                                       "*Mass flow rate\nA.N, 2., 0., 0.\n" +
                                       Comment("p", "Pressure stress") + "*Pressure stress\nA.N, 2.\n");
}

TEST(FieldBuilder, VelocityStressAndHardening_AreInitialConditionsInLaterStepsTooOnPurpose) {
    ConditionModel model(
        "IGG", R"("fields": {)" + Field("h", "Hardening", R"("S1": {}, "S2": {"deactivated": true})") + ", " +
                   Field("s", "Stress", R"("S0": {}, "S1": {})", R"(, "sigma11": 1)") + ", " +
                   Field("v", "Velocity", R"("S0": {}, "S1": {})", R"(, "velocity1": 1)") + "}");
    EXPECT_EQ(StepOf(model, "S1"),
              kBanner + Comment("h", "Hardening") + "*Initial Conditions, type=HARDENING\nA.N, 0.\n" +
                  Comment("s", "Stress") + "*Initial Conditions, type=STRESS\nA.N, 1., , , , , \n" +
                  Comment("v", "Velocity") + "*Initial Conditions, type=VELOCITY\nA.N, 1, 1.\n");
    EXPECT_EQ(StepOf(model, "S2"),
              kBanner + Comment("h", "Hardening") + "*Initial Conditions, type=HARDENING\nA.N, 0.\n");
}

TEST(FieldBuilder, LoadCases_TakeTheFieldsThatTheyName) {
    ConditionModel model(
        "IL{\"loadCases\": {\"c1\": {\"fields\": {\"a\": 0.5}}, \"c2\": {\"loadsAreStepLoads\": true}}}",
        R"("fields": {)" + Field("a", "Temperature", R"("S1": {"values": [1, 4]})") + ", " +
            Field("b", "Temperature", R"("S0": {"values": [2]})") + "}");
    EXPECT_EQ(StepOf(model, "S0"),
              kBanner + Comment("b", "Temperature") + "*Initial Conditions, type=TEMPERATURE\nA.N, 2.\n");
    // Unlike loads, fields never go to the step itself where there are load cases.
    EXPECT_EQ(StepOf(model, "S1"), "");
    EXPECT_EQ(StepOf(model, "S1", "c1"),
              "** Name: a   Type: Temperature   Scale factor: 0.5\n*Temperature\nA.N, 0.5, 2.\n");
    EXPECT_EQ(StepOf(model, "S1", "c2"), "");
}
