#include "output/oif_Output.h"
#include "support/DeckTest.h"

namespace {

using Type = korC_OdbRequest::TypeEnm;

constexpr unsigned kExplicitStep = 0x23C0069;
constexpr unsigned kFrequencyStep = 0x23C006A;
constexpr unsigned kHeatStep = 0x23C006C;
constexpr unsigned kImplicitDynamicStep = 0x23C006D;
constexpr unsigned kModalStep = 0x23C006F;
constexpr unsigned kStaticStep = 0x23C0073;
constexpr unsigned kRiksStep = 0x23C0074;

const korC_OdbChannel kField(true);
const korC_OdbChannel kHistory(false);

std::string Frequency(const korC_OdbChannel& channel, int frequency, unsigned stepType, bool pre = false,
                      bool all = false, const char* filter = "") {
    return Written(oif_Output(channel, Type::FREQUENCY, frequency, pre, all, stepType, filter));
}
std::string Intervals(const korC_OdbChannel& channel, int count, bool marks, double time, unsigned stepType) {
    return Written(
        oif_Output(channel, Type::NUMBER_INTERVAL, count, marks, false, false, time, stepType, ""));
}
std::string Modes(int count) {
    cls_xpListInt modes;
    for (int i = 1; i <= count; ++i) modes.Append(i);
    return Written(oif_Output(kField, Type::MODE_LIST, modes, false, false, kFrequencyStep, ""));
}

korC_OdbRequest RequestOf(std::initializer_list<const char*> variables) {
    korC_OdbRequest request;
    for (const char* variable : variables) request.variables.Append(variable);
    return request;
}
std::string Node(std::initializer_list<const char*> variables, const char* set = "") {
    return Written(oif_NodeOutput(RequestOf(variables), kStaticStep, set, false, false, true));
}
std::string Element(const korC_OdbRequest& request, bool rebar = false, const char* set = "",
                    const korC_OdbChannel& channel = kField, bool pre = false) {
    return Written(oif_ElementOutput(channel, request, kStaticStep, set, pre, false, rebar));
}

} // namespace

TEST(Output, UsualFrequency_IsNotWritten) {
    EXPECT_EQ(Frequency(kField, 1, kStaticStep), "*Output, field\n");
    EXPECT_EQ(Frequency(kHistory, 1, kStaticStep), "*Output, history\n");
    EXPECT_EQ(Frequency(kField, 10, kStaticStep), "*Output, field, frequency=10\n");
}

TEST(Output, UsualFrequencyOfDynamics_IsEveryTenthIncrement) {
    for (const unsigned step : {kImplicitDynamicStep, kModalStep}) {
        EXPECT_EQ(Frequency(kField, 10, step), "*Output, field\n");
        EXPECT_EQ(Frequency(kField, 1, step), "*Output, field, frequency=1\n");
    }
}

TEST(Output, FrequencyWhereAnotherKindIsUsual_IsAlwaysWritten) {
    EXPECT_EQ(Frequency(kHistory, 1, kExplicitStep), "*Output, history, frequency=1\n");
    EXPECT_EQ(Frequency(kField, 1, kFrequencyStep), "*Output, field, frequency=1\n");
}

TEST(Output, VariableParameterAndFilter_StandAheadOfTheFrequency) {
    EXPECT_EQ(Frequency(kField, 5, kStaticStep, true, false, "my filter"),
              "*Output, field, variable=PRESELECT, filter=my filter, frequency=5\n");
    EXPECT_EQ(Frequency(kField, 5, kStaticStep, false, true), "*Output, field, variable=ALL, frequency=5\n");
}

TEST(Output, FrequencyOfZero_SaysNothingElse) {
    EXPECT_EQ(Frequency(kField, 0, kStaticStep, true, true, "F"), "*Output, field, frequency=0\n");
    EXPECT_EQ(Frequency(kHistory, 0, kExplicitStep, true, true, "F"), "*Output, history, frequency=0\n");
}

TEST(Output, NumberOfIntervals_IsWrittenUnlessUsualInAnExplicitStep) {
    EXPECT_EQ(Intervals(kField, 20, true, 0.0, kStaticStep), "*Output, field, number interval=20\n");
    EXPECT_EQ(Intervals(kHistory, 200, true, 0.0, kStaticStep), "*Output, history, number interval=200\n");
    EXPECT_EQ(Intervals(kField, 20, false, 1.0, kExplicitStep), "*Output, field\n");
    EXPECT_EQ(Intervals(kField, 200, false, 1.0, kExplicitStep), "*Output, field, number interval=200\n");
    EXPECT_EQ(Intervals(kHistory, 200, false, 1.0, kExplicitStep), "*Output, history\n");
}

TEST(Output, IntervalsOfExplicitHistory_BecomeATimeInterval) {
    EXPECT_EQ(Intervals(kHistory, 4, false, 0.5, kExplicitStep), "*Output, history, time interval=0.125\n");
    // Without a time there is no interval at all.
    EXPECT_EQ(Intervals(kHistory, 4, false, 0.0, kExplicitStep), "*Output, history\n");
    EXPECT_EQ(Intervals(kHistory, 0, false, 0.5, kExplicitStep), "*Output, history\n");
}

TEST(Output, TimeMarks_AreWrittenWhenUnusual) {
    EXPECT_EQ(Intervals(kField, 4, true, 0.0, kStaticStep), "*Output, field, number interval=4\n");
    EXPECT_EQ(Intervals(kField, 4, false, 0.0, kStaticStep),
              "*Output, field, number interval=4, time marks=NO\n");
    EXPECT_EQ(Intervals(kField, 4, true, 1.0, kExplicitStep),
              "*Output, field, number interval=4, time marks=YES\n");
}

TEST(Output, TimeMarksThatTheProcedureDoesNotKnow_AreNotWritten) {
    EXPECT_EQ(Intervals(kField, 4, false, 0.0, kRiksStep), "*Output, field, number interval=4\n");
    // Explicit steps know them for fields only.
    EXPECT_EQ(Intervals(kHistory, 4, true, 1.0, kExplicitStep), "*Output, history, time interval=0.25\n");
}

TEST(Output, TimeIntervalAndTimePoints) {
    EXPECT_EQ(Written(oif_Output(kField, Type::TIME_INTERVAL, 0.25, true, true, false, kStaticStep, "")),
              "*Output, field, variable=PRESELECT, time interval=0.25\n");
    EXPECT_EQ(Written(oif_Output(kHistory, Type::TIME_INTERVAL, 2.0, false, false, false, kHeatStep, "")),
              "*Output, history, time interval=2., time marks=NO\n");
    EXPECT_EQ(Written(oif_Output(kField, Type::TIME_POINTS, cow_String("my points"), false, false, false,
                                 kStaticStep, "")),
              "*Output, field, time points=my points, time marks=NO\n");
}

TEST(Output, NoModes_StandForAll) {
    EXPECT_EQ(Modes(0), "*Output, field\n");
}

TEST(Output, ModeListThatIsNotFull_EndsInAComma) {
    EXPECT_EQ(Modes(1), "*Output, field, mode list\n1, \n");
    EXPECT_EQ(Modes(17), "*Output, field, mode list\n"
                         "1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 16\n17, \n");
}

TEST(Output, FullModeList_EndsInAnEmptyLine) {
    EXPECT_EQ(Modes(16), "*Output, field, mode list\n"
                         "1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 16\n\n");
}

TEST(Output, IsAlwaysActive) {
    EXPECT_TRUE(oif_Output(kField, Type::FREQUENCY, 0, false, false, kStaticStep, "").Active());
}

TEST(NodeOutput, OneName_HasACommaBehindIt) {
    EXPECT_EQ(Node({"U"}), "*Node Output\nU, \n");
    EXPECT_EQ(Node({"U", "RF"}), "*Node Output\nU, RF\n");
}

TEST(NodeOutput, NineNames_LeaveTheLastOneAloneAndWithoutAComma) {
    EXPECT_EQ(Node({"U", "UT", "UR", "V", "RF", "RT", "CF", "U1"}, "I.N"),
              "*Node Output, nset=I.N\nU, UT, UR, RF, RT, CF, U1\n");
    EXPECT_EQ(Node({"U", "UT", "UR", "RF", "RT", "RM", "CF", "U1"}),
              "*Node Output\nU, UT, UR, RF, RT, RM, CF, U1\n");
    EXPECT_EQ(Node({"U", "UT", "UR", "RF", "RT", "RM", "CF", "U1", "U2"}),
              "*Node Output\nU, UT, UR, RF, RT, RM, CF, U1\nU2\n");
}

TEST(NodeOutput, NamesOfOtherKindsAndRepeatedOnes_AreLeftOut) {
    EXPECT_EQ(Node({"S", "U", "ALLKE", "U", "NOSUCH", "NT"}), "*Node Output\nU, \n");
    EXPECT_EQ(Node({"S"}), "");
}

TEST(NodeOutput, VariableParameter_ReplacesTheNames) {
    EXPECT_EQ(Written(oif_NodeOutput(RequestOf({"U"}), kStaticStep, "N", true, false, true)),
              "*Node Output, nset=N, variable=PRESELECT\n");
    EXPECT_EQ(Written(oif_NodeOutput(RequestOf({}), kStaticStep, "", false, true, true)),
              "*Node Output, variable=ALL\n");
}

TEST(NodeOutput, ThatNeedsNoVariables_StandsBare) {
    EXPECT_EQ(Written(oif_NodeOutput(RequestOf({}), kFrequencyStep, "", false, false, false)),
              "*Node Output\n");
    EXPECT_EQ(Written(oif_NodeOutput(RequestOf({"S"}), kStaticStep, "N", false, false, false)),
              "*Node Output, nset=N\n");
    EXPECT_EQ(Written(oif_NodeOutput(RequestOf({"U"}), kStaticStep, "N", false, false, false)),
              "*Node Output, nset=N\nU, \n");
}

TEST(ElementOutput, TellsDirectionsInAFieldChannelOnly) {
    korC_OdbRequest request = RequestOf({"S"});
    EXPECT_EQ(Element(request, false, "I.E"), "*Element Output, elset=I.E, directions=YES\nS, \n");
    request.directions = false;
    EXPECT_EQ(Element(request), "*Element Output, directions=NO\nS, \n");
    EXPECT_EQ(Element(request, false, "", kHistory), "*Element Output\nS, \n");
}

TEST(ElementOutput, Components_StandByTheirOwnNames) {
    EXPECT_EQ(Element(RequestOf({"S11", "MISES"}), false, "", kHistory), "*Element Output\nS11, MISES\n");
}

TEST(ElementOutput, PlasticStrain_BringsItsEquivalent) {
    EXPECT_EQ(Element(RequestOf({"PE", "S"})), "*Element Output, directions=YES\nPE, S, PEEQ\n");
    EXPECT_EQ(Element(RequestOf({"PEEQ", "PE"})), "*Element Output, directions=YES\nPEEQ, PE\n");
    EXPECT_EQ(Element(RequestOf({"PE"})), "*Element Output, directions=YES\nPE, PEEQ\n");
    EXPECT_EQ(Element(RequestOf({"PE"}), false, "", kField, true),
              "*Element Output, directions=YES, variable=PRESELECT\n");
}

TEST(ElementOutput, RebarVariables_NeedRebar) {
    EXPECT_EQ(Element(RequestOf({"S", "RBFOR"})), "*Element Output, directions=YES\nS, \n");
    EXPECT_EQ(Element(RequestOf({"S", "RBFOR"}), true), "*Element Output, rebar, directions=YES\nS, RBFOR\n");
    EXPECT_EQ(Element(RequestOf({"RBFOR"})), "");
}

TEST(ElementOutput, ComponentsForRebar_BecomeTheirVariableWanted) {
    EXPECT_EQ(Element(RequestOf({"S11", "S22", "E11"}), true, "", kHistory),
              "*Element Output, rebar\nS, E\n");
}

TEST(ElementOutput, SectionPoints_StandAheadOfTheNames) {
    korC_OdbRequest request = RequestOf({"S", "E"});
    request.sectionPoints = {1, 5};
    EXPECT_EQ(Element(request), "*Element Output, directions=YES\n1, 5\nS, E\n");
    EXPECT_EQ(Element(request, false, "", kField, true),
              "*Element Output, directions=YES, variable=PRESELECT\n1, 5\n");
}

TEST(ElementOutput, SeventeenSectionPoints_TakeTwoKeywords) {
    korC_OdbRequest request = RequestOf({"S"});
    for (int i = 1; i <= 16; ++i) request.sectionPoints.Append(i);
    const std::string first = "*Element Output, directions=YES\n"
                              "1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 16\nS, \n";
    EXPECT_EQ(Element(request), first);
    request.sectionPoints.Append(17);
    EXPECT_EQ(Element(request), first + "*Element Output, directions=YES\n17\nS, \n");
}

TEST(ElementOutput, VariableOfElementsAndContact_GoesToBothButNotWithInteractions) {
    korC_OdbRequest request = RequestOf({"HFL"});
    EXPECT_EQ(Written(oif_ElementOutput(kField, request, kHeatStep, "", false, false, false)),
              "*Element Output, directions=YES\nHFL, \n");
    EXPECT_EQ(Written(oif_ContactOutput(request, kHeatStep, false, false, "", "", "", "", false)),
              "*Contact Output\nHFL, \n");
    request.interactions.Append("pair");
    EXPECT_EQ(Written(oif_ElementOutput(kField, request, kHeatStep, "", false, false, false)), "");
    // A component of it belongs to contact alone.
    EXPECT_EQ(Written(oif_ElementOutput(kHistory, RequestOf({"HFL1"}), kHeatStep, "", false, false, false)),
              "");
}

TEST(ContactOutput, NamesWhereItIsAndWhoTouches) {
    const korC_OdbRequest request = RequestOf({"CSTRESS", "CDISP"});
    EXPECT_EQ(Written(oif_ContactOutput(request, kStaticStep, false, false, "M", "S", "", "N", false)),
              "*Contact Output, nset=N, master=M, slave=S\nCSTRESS, CDISP\n");
    EXPECT_EQ(Written(oif_ContactOutput(request, kStaticStep, true, false, "M", "", "", "", false)),
              "*Contact Output, master=M, variable=PRESELECT\n");
    EXPECT_EQ(Written(oif_ContactOutput(request, kExplicitStep, false, true, "", "", "my pair", "N", false)),
              "*Contact Output, cpset=\"my pair\", variable=ALL\n");
    EXPECT_EQ(Written(oif_ContactOutput(request, kExplicitStep, false, true, "", "", "p", "N", true)),
              "*Contact Output, nset=N, cpset=p, variable=ALL\n");
    EXPECT_EQ(
        Written(oif_ContactOutput(RequestOf({"S"}), kStaticStep, false, false, "M", "S", "", "", false)), "");
}

TEST(ContactOutput, ASurface_GoesByItsOwnNameWithoutQuotes) {
    TestStore store;
    odiK_Part& part = store.AddPart("P", {1, 2, 3, 4});
    part.mesh->AddElements("S4R", {1}, 4, {1, 2, 3, 4});
    part.mesh->AddSurface("my skin", {{1, -1, "SPOS"}});
    store.model.AddInstance("I", "P");
    korC_OdbRequest request = RequestOf({"CSTRESS"});
    request.region = store.model.Region("I", "my skin");
    EXPECT_EQ(
        Written(oif_ContactOutput(request, kStaticStep, false, false, "", "", "", "I.\"my skin\"", false)),
        "*Contact Output, surface=my skin\nCSTRESS, \n");
    EXPECT_EQ(Written(oif_ContactOutput(request, kExplicitStep, false, false, "", "", "", "I.X", false)),
              "*Contact Output\nCSTRESS, \n");
    EXPECT_EQ(Written(oif_ContactOutput(request, kExplicitStep, false, false, "", "", "", "I.X", true)),
              "*Contact Output, surface=my skin\nCSTRESS, \n");
}

TEST(ContactOutput, ComponentsOfOneVariable_BecomeThatVariableOnce) {
    EXPECT_EQ(Written(oif_ContactOutput(RequestOf({"CPRESS", "CSHEAR1", "COPEN"}), kStaticStep, false, false,
                                        "", "", "", "", true)),
              "*Contact Output\nCSTRESS, CDISP\n");
}

TEST(NodeOutput, LongSetName_PutsTheVariableParameterOnALineOfItsOwnWanted) {
    const std::string set = std::string(80, 'i') + "." + std::string(80, 's');
    EXPECT_EQ(Written(oif_NodeOutput(RequestOf({}), kStaticStep, set.c_str(), true, false, true)),
              "*Node Output, nset=" + set + "\n, variable=PRESELECT\n");
    EXPECT_EQ(Node({"U"}, set.c_str()), "*Node Output, nset=" + set + "\nU, \n");
}

TEST(ElementOutput, LongSetName_KeepsRebarAndDirectionsOnTheLine) {
    const std::string set = std::string(80, 'i') + "." + std::string(80, 's');
    EXPECT_EQ(Element(RequestOf({}), true, set.c_str(), kField, true),
              "*Element Output, elset=" + set + ", rebar, directions=YES\n, variable=PRESELECT\n");
}

TEST(ContactOutput, LongNames_BreakTheLineBehindTheComma) {
    const std::string name = std::string(80, 'i') + "." + std::string(80, 's');
    EXPECT_EQ(Written(oif_ContactOutput(RequestOf({"CSTRESS"}), kStaticStep, false, false, name.c_str(), "S",
                                        "pair", "N", false)),
              "*Contact Output, nset=N, master=" + name + ", \nslave=S, cpset=pair\nCSTRESS, \n");
}

TEST(IntegratedOutput, SectionName_BreaksNoLine) {
    korC_OdbRequest request = RequestOf({"SOF"});
    const std::string name(140, 'c');
    request.section = name.c_str();
    EXPECT_EQ(Written(oif_IntegratedOutput(request, kStaticStep, false, false)),
              "*Integrated Output, section=" + name + "\nSOF, \n");
}

TEST(OtherOutput, EachKindListsItsOwn) {
    const korC_OdbRequest all = RequestOf({"U", "S", "ALLKE", "DT", "SOF", "GU", "RADFL"});
    EXPECT_EQ(Written(oif_EnergyOutput(all, kStaticStep, "E", false, false)),
              "*Energy Output, elset=E\nALLKE, \n");
    EXPECT_EQ(Written(oif_IncrementationOutput(all, kExplicitStep, false, false)),
              "*Incrementation Output\nDT, \n");
    korC_OdbRequest section = all;
    section.section = "cut 1";
    EXPECT_EQ(Written(oif_IntegratedOutput(section, kStaticStep, false, false)),
              "*Integrated Output, section=cut 1\nSOF, \n");
    EXPECT_EQ(Written(oif_ModalOutput(all, kModalStep, false)), "*Modal Output\nGU, \n");
    EXPECT_EQ(Written(oif_RadiationOutput(all, kHeatStep, "E", false)),
              "*Radiation Output, elset=E\nRADFL, \n");
}

TEST(OtherOutput, VariableParameters) {
    const korC_OdbRequest none = RequestOf({});
    EXPECT_EQ(Written(oif_EnergyOutput(none, kStaticStep, "", true, false)),
              "*Energy Output, variable=PRESELECT\n");
    EXPECT_EQ(Written(oif_EnergyOutput(none, kStaticStep, "E", false, true)),
              "*Energy Output, elset=E, variable=ALL\n");
    EXPECT_EQ(Written(oif_IncrementationOutput(none, kExplicitStep, true, false)),
              "*Incrementation Output, variable=PRESELECT\n");
    EXPECT_EQ(Written(oif_IncrementationOutput(none, kExplicitStep, false, true)),
              "*Incrementation Output, variable=ALL\n");
    korC_OdbRequest section;
    section.section = "cut";
    EXPECT_EQ(Written(oif_IntegratedOutput(section, kStaticStep, true, false)),
              "*Integrated Output, section=cut, variable=PRESELECT\n");
    EXPECT_EQ(Written(oif_ModalOutput(none, kModalStep, true)), "*Modal Output, variable=ALL\n");
    EXPECT_EQ(Written(oif_RadiationOutput(none, kHeatStep, "", true)), "*Radiation Output, variable=ALL\n");
}

TEST(OtherOutput, NothingToAskFor_WritesNothing) {
    const korC_OdbRequest none = RequestOf({"U"});
    EXPECT_EQ(Written(oif_EnergyOutput(none, kStaticStep, "E", false, false)), "");
    EXPECT_EQ(Written(oif_IncrementationOutput(none, kExplicitStep, false, false)), "");
    EXPECT_EQ(Written(oif_IntegratedOutput(none, kStaticStep, false, false)), "");
    EXPECT_EQ(Written(oif_ModalOutput(none, kModalStep, false)), "");
    EXPECT_EQ(Written(oif_RadiationOutput(none, kHeatStep, "E", false)), "");
}

TEST(OtherOutput, SixteenNames_FillALine) {
    const korC_OdbRequest energies =
        RequestOf({"ALLAE", "ALLCD", "ALLDMD", "ALLEE", "ALLFD", "ALLIE", "ALLJD", "ALLKE", "ALLKL", "ALLPD",
                   "ALLQB", "ALLSD", "ALLSE", "ALLVD", "ALLWK", "ETOTAL", "ALLKE"});
    const std::string sixteen = "*Energy Output\nALLAE, ALLCD, ALLDMD, ALLEE, ALLFD, ALLIE, ALLJD, ALLKE, "
                                "ALLKL, ALLPD, ALLQB, ALLSD, ALLSE, ALLVD, ALLWK, ETOTAL\n";
    EXPECT_EQ(Written(oif_EnergyOutput(energies, kStaticStep, "", false, false)), sixteen);
}
