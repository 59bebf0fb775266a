#include "hostile/Findings.h"

namespace {

class FrameErrors : public testing::TestWithParam<FindingCase> {};

const std::string longName(81, 'n');

const FindingCase frameCases[] = {
    {"RootArray",
     "[1, 2]",
     {": found an array of 2 items, expected an object with the members \"format\" and \"models\""}},
    {"RootNumber", "3", {": found 3, expected an object with the members \"format\" and \"models\""}},
    {"EmptyRoot",
     "{}",
     {"/format: found nothing, expected 'qrx-model/1'",
      "/models: found nothing, expected an object of models"}},
    {"OtherFormat",
     R"({"format": "qrx-model/2", "models": {"Default Model": {}}})",
     {"/format: found 'qrx-model/2', expected 'qrx-model/1'"}},
    {"FormatAsNumber",
     R"({"format": 1, "models": {"Default Model": {}}})",
     {"/format: found 1, expected 'qrx-model/1'"}},
    {"UnknownRootMember",
     R"({"format": "qrx-model/1", "model": {}, "models": {"Default Model": {}}})",
     {"/model: found an unknown member 'model', expected one of $schema, format, parameters, models; did "
      "you mean 'models'?"}},
    {"ModelsAsArray",
     R"({"format": "qrx-model/1", "models": [{}]})",
     {"/models: found an array of 1 item, expected an object of models"}},
    {"NoModel",
     R"({"format": "qrx-model/1", "models": {}})",
     {"/models: found no model, expected one, since decks are written from it"}},
    {"DefaultModelMisspelt",
     R"({"format": "qrx-model/1", "models": {"Other": {}, "Default model ": {}}})",
     {"/models: found 2 models, none of them 'Default Model', expected one to write the deck from, by that "
      "name "
      "or chosen by its own; did you mean 'Default model '? there are 'Other', 'Default model '"}},
    {"SeveralModelsOfOtherNames",
     R"({"format": "qrx-model/1", "models": {"A": {}, "B": {}, "C": {}}})",
     {"/models: found 3 models, none of them 'Default Model', expected one to write the deck from, by that "
      "name "
      "or chosen by its own; there are 'A', 'B', 'C'"}},
    {"EmptyModelName",
     R"({"format": "qrx-model/1", "models": {"": {}, "Default Model": {}}})",
     {"/models/: found an empty name, expected a name that can stand in a deck"}},
    {"ModelAsNull",
     R"({"format": "qrx-model/1", "models": {"Default Model": null}})",
     {"@: found null, expected an object"}},
    {"ErrorInAnotherModel",
     R"({"format": "qrx-model/1", "models": {"Default Model": {}, "B/~": {"shellToSolid": 1}}})",
     {"/models/B~1~0/shellToSolid: found 1, expected true or false"}},
    {"UnknownModelMember",
     Model(R"("materail": {})"),
     {"@/materail: found an unknown member 'materail'; did you mean 'materials'? Expected one of "
      "solverInput, waveFormulation, ignore, datums, parts, assembly, materials, beamProfiles, amplitudes, "
      "fields, ... (26 more)"}},
    {"TwiceTheSameMember",
     Model(R"("restartJob": "a", "restartJob": "b")"),
     {"@/restartJob: the member 'restartJob' stands more than once, expected names that differ"}},

    {"DescriptionAsLines",
     Model(R"("description": ["a", "b"])"),
     {"@/description: found an array of 2 items, expected a string"}},
    {"TextAsNumber",
     Model(R"("solverInput": 5)"),
     {"@/solverInput: found 5, expected a string or an array of strings"}},
    {"TextWithANumberLine",
     Model(R"("topLevelSolverInput": ["*Heading", 5])"),
     {"@/topLevelSolverInput/1: found 5, expected a string"}},
    {"TextAsNull",
     Model(R"("solverInput": null)"),
     {"@/solverInput: found null, expected a string or an array of strings"}},
    {"NumberAsText",
     Model(R"("absoluteZero": "-273.15")"),
     {"@/absoluteZero: found '-273.15', expected a number"}},
    {"NumberAsNull",
     Model(R"("stefanBoltzmann": null)"),
     {"@/stefanBoltzmann: found null, expected a number"}},
    {"FlagAsNumber", Model(R"("endRestartStep": 1)"), {"@/endRestartStep: found 1, expected true or false"}},
    {"IntegerWithAFraction",
     Model(R"("restartIncrement": 1.0)"),
     {"@/restartIncrement: found 1.0, expected an integer of 32 bits"}},
    {"IntegerBeyond32Bits",
     Model(R"("restartIncrement": 2147483648)"),
     {"@/restartIncrement: found 2147483648, expected an integer of 32 bits"}},
    {"IntegerAsNull",
     Model(R"("restartIncrement": null)"),
     {"@/restartIncrement: found null, expected an integer of 32 bits"}},
    {"UnknownWave",
     Model(R"("waveFormulation": "TOTALLY")"),
     {"@/waveFormulation: found 'TOTALLY', expected one of NOT_SET, SCATTERED, TOTAL; did you mean "
      "'TOTAL'?"}},
    {"UnknownProduct",
     Model(R"("analysisProduct": "explizit")"),
     {"@/analysisProduct: found 'explizit', expected an integer of 32 bits or null, or one of STANDARD, "
      "IMPLICIT, EXPLICIT; did you mean 'EXPLICIT'?"}},
    {"LongTextIsShownInPart",
     Model(R"("absoluteZero": ")" + std::string(59, 'x') + "\xC3\xA9\xC3\xA9\""),
     {"@/absoluteZero: found '" + std::string(59, 'x') + "'..., expected a number"}},
    {"ControlCharactersAreShownAsHex",
     Model(R"("a\u001b[2J": 1)"),
     {"@/a\\x1B[2J: found an unknown member 'a\\x1B[2J', expected one of restartJob, globalJob, "
      "ignore, datums, parts, assembly, materials, steps, loads, fields, ... (26 more)"}},

    {"NameEmpty",
     Model(R"("parts": {"": {}})"),
     {"@/parts/: found an empty name, expected a name that can stand in a deck"}},
    {"NameWithAQuote",
     Model(R"("parts": {"a\"b": {}})"),
     {"@/parts/a\"b: found a name with a double quote, expected a name that can stand in a deck"}},
    {"NameWithALineEnd",
     Model(R"("parts": {"a\nb": {}})"),
     {"@/parts/a\\x0Ab: found a name with a control character, expected a name that can stand in a deck"}},
    {"NameTooLong",
     Model(R"("parts": {")" + longName + R"(": {}})"),
     {"@/parts/" + longName + ": found a name of 81 bytes, expected at most 80"}},
    {"NameWithANul",
     Model(R"("parts": {"a\u0000b": {}})"),
     {"@/parts/a\\x00b: found a name with a control character, expected a name that can stand in a deck"}},
    {"AssemblyNameEmpty",
     Model(R"("assembly": {"name": ""})"),
     {"@/assembly/name: found an empty name, expected a name that can stand in a deck"}},
    {"AssemblyNameAsNumber",
     Model(R"("assembly": {"name": 1})"),
     {"@/assembly/name: found 1, expected a name"}},

    {"DatumsAsObject", Model(R"("datums": {})"), {"@/datums: found an object, expected an array of datums"}},
    {"DatumAsText", Model(R"("datums": ["D"])"), {"@/datums/0: found 'D', expected an object"}},
    {"DatumWithoutName",
     Model(R"("datums": [{"origin": [0, 0, 0]}])"),
     {"@/datums/0/name: found nothing, expected the name of the datum"}},
    {"DatumNameWithAQuote",
     Model(R"("datums": [{"name": "\""}])"),
     {"@/datums/0/name: found a name with a double quote, expected a name that can stand in a deck"}},
    {"DatumNameTwice",
     Model(R"("datums": [{"name": "D"}, {"name": "D"}])"),
     {"@/datums/1/name: found a second datum named 'D', expected names that are unique"}},
    {"DatumOfUnknownType",
     Model(R"("datums": [{"name": "D", "type": "line"}])"),
     {"@/datums/0/type: found 'line', expected one of point, axis, plane, csys"}},
    {"DatumOfUnknownSystem",
     Model(R"("datums": [{"name": "D", "system": "polar"}])"),
     {"@/datums/0/system: found 'polar', expected one of rectangular, cylindrical, spherical"}},
    {"DatumUnknownMember",
     Model(R"("datums": [{"name": "D", "xaxis": [1, 0, 0]}])"),
     {"@/datums/0/xaxis: found an unknown member 'xaxis', expected one of name, type, system, origin, xAxis, "
      "yAxis, zAxis; did you mean 'xAxis'?"}},
    {"DatumAxisOfTwo",
     Model(R"("datums": [{"name": "D", "xAxis": [1, 0]}])"),
     {"@/datums/0/xAxis: found an array of 2 items, expected three numbers"}},
    {"DatumAxisWithNull",
     Model(R"("datums": [{"name": "D", "xAxis": [1, null, 0]}])"),
     {"@/datums/0/xAxis/1: found null, expected a number"}},
    {"DatumXAxisZero",
     Model(R"("datums": [{"name": "D", "xAxis": [0, 0, 0]}])"),
     {"@/datums/0/xAxis: found a direction of no length, expected one with a length"}},
    {"DatumYAxisZero",
     Model(R"("datums": [{"name": "D", "yAxis": [0, 0.0, 0]}])"),
     {"@/datums/0/yAxis: found a direction of no length, expected one with a length"}},
    {"DatumZAxisZero",
     Model(R"("datums": [{"name": "D", "type": "plane", "zAxis": [0, 0, 0]}])"),
     {"@/datums/0/zAxis: found a direction of no length, expected one with a length"}},
    {"DatumAxisTooLong",
     Model(R"("datums": [{"name": "D", "type": "axis", "xAxis": [1e200, 1e200, 0]}])"),
     {"@/datums/0/xAxis: found a direction whose length is beyond double precision, expected one with a "
      "length"}},
    {"DatumAxesParallel",
     Model(R"("datums": [{"name": "D", "xAxis": [1, 2, 3], "yAxis": [-2, -4, -6]}])"),
     {"@/datums/0/yAxis: found a direction parallel to xAxis, expected one that is not"}},

    {"PartsAsArray",
     Model(R"("parts": [])"),
     {"@/parts: found an array of 0 items, expected an object of parts"}},
    {"PartAsNull", Model(R"("parts": {"P": null})"), {"@/parts/P: found null, expected an object"}},
    {"PartUnknownMember",
     Model(R"("parts": {"P": {"meshs": {}}})"),
     {"@/parts/P/meshs: found an unknown member 'meshs'; did you mean 'mesh'? Expected one of "
      "solverInput, mesh, sectionAssignments, materialOrientations, beamOrientations"}},
    {"AssemblyAsArray",
     Model(R"("assembly": [])"),
     {"@/assembly: found an array of 0 items, expected an object"}},
    {"AssemblyUnknownMember",
     Model(R"("assembly": {"instance": {}})"),
     {"@/assembly/instance: found an unknown member 'instance'; did you mean 'instances'? Expected one "
      "of name, solverInput, instances, mesh, sets, sectionAssignments, connectorOrientations"}},
    {"InstancesAsArray",
     Model(R"("assembly": {"instances": []})"),
     {"@/assembly/instances: found an array of 0 items, expected an object of instances"}},
    {"InstanceAsText",
     Model(R"("parts": {"P": {}}, "assembly": {"instances": {"I": "P"}})"),
     {"@/assembly/instances/I: found 'P', expected an object"}},
    {"InstanceWithoutPart",
     Model(R"("assembly": {"instances": {"I": {}}})"),
     {"@/assembly/instances/I/part: found nothing, expected the name of a part"}},
    {"InstanceOfUnknownPart",
     Model(R"("parts": {"BRACKET": {}}, "assembly": {"instances": {"I": {"part": "BRAKET"}}})"),
     {"@/assembly/instances/I/part: found 'BRAKET', expected the name of a part; did you mean 'BRACKET'?"}},
    {"InstancePartAsNumber",
     Model(R"("assembly": {"instances": {"I": {"part": 1}}})"),
     {"@/assembly/instances/I/part: found 1, expected the name of a part"}},
    {"InstanceFlagAsText",
     Model(R"("parts": {"P": {}}, "assembly": {"instances": {"I": {"part": "P", "partInstance": "no"}}})"),
     {"@/assembly/instances/I/partInstance: found 'no', expected true or false"}},
    {"InstanceTranslationOfTwo",
     Model(R"("parts": {"P": {}}, "assembly": {"instances": {"I": {"part": "P", "translation": [1, 2]}}})"),
     {"@/assembly/instances/I/translation: found an array of 2 items, expected three numbers"}},
    {"InstanceRotationBeyondSingle",
     Model(
         R"("parts": {"P": {}}, "assembly": {"instances": {"I": {"part": "P", "rotation": [0, 0, -1e39]}}})"),
     {"@/assembly/instances/I/rotation/2: found -1e+39, expected a number of single precision"}},
    {"InstanceUnknownMember",
     Model(R"("parts": {"P": {}}, "assembly": {"instances": {"I": {"part": "P", "rotate": []}}})"),
     {"@/assembly/instances/I/rotate: found an unknown member 'rotate', expected one of part, "
      "partInstance, translation, rotation, solverInput, mesh, sectionAssignments, materialOrientations, "
      "beamOrientations"}},

    {"CyclicAsText",
     Model(R"("cyclicSymmetry": "CYCLIC")"),
     {"@/cyclicSymmetry: found 'CYCLIC', expected an object"}},
    {"CyclicPointBeyondSingle",
     Model(R"("cyclicSymmetry": {"symmetryType": "CYCLIC", "startPoint": [0, 1e40, 0]})"),
     {"@/cyclicSymmetry/startPoint/1: found 1e+40, expected a number of single precision"}},

    {"SyntaxInTheMiddle",
     "{\n  \"format\": \"qrx-model/1\",\n  \"models\": {,}}",
     {"3:14: found ',', expected a member name in double quotes"}},
    {"SyntaxAfterAByteOrderMark", "\xEF\xBB\xBF{\"format\" 1}", {"1:11: found '1', expected ':'"}},
    {"CommentLeftOpen",
     "{} /* end",
     {"1:4: invalid comment; missing closing '*/'; found '/*', expected the end of the file"}},
    {"EmptyFile", "", {"1:1: found the end of the file, expected a value"}},
    {"NestedTooDeep",
     std::string(1000, '['),
     {"1:201: arrays and objects are nested deeper than 200 levels"}},
};

} // namespace

TEST_P(FrameErrors, ModelFile_WrongInItsFrame_TellsPlaceFoundAndExpected) {
    EXPECT_EQ(Findings(GetParam().text), GetParam().findings);
}

INSTANTIATE_TEST_SUITE_P(Cases, FrameErrors, testing::ValuesIn(frameCases), FindingCaseName);

TEST(FrameErrors, ContentErrors_OfAllParts_ComeInOneGo) {
    EXPECT_EQ(Findings(Model(R"("absoluteZero": true, "datums": [{}], "parts": {"P": 1},
                                "assembly": {"instances": {"I": {"part": "X"}}}, "steps": [{"name": "S"}])")),
              (std::vector<std::string>{
                  "@/absoluteZero: found true, expected a number",
                  "@/datums/0/name: found nothing, expected the name of the datum",
                  "@/parts/P: found 1, expected an object",
                  "@/assembly/instances/I/part: found 'X', expected the name of a part",
                  "@/steps/0/class: found nothing, expected the class of the step",
              }));
}

TEST(FrameErrors, ContentErrors_BeyondFifty_AreNotTold) {
    std::string datums = R"("datums": [1)";
    for (int i = 1; i < 80; ++i) datums += ", 1";
    const std::vector<std::string> findings = Findings(Model(datums + "]"));
    ASSERT_EQ(findings.size(), 50u);
    EXPECT_EQ(findings.back(), "@/datums/49: found 1, expected an object");
}
