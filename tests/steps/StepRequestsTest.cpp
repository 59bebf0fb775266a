#include "steps/oif_StepRequests.h"

#include "steps/oif_LoadCase.h"
#include "steps/oif_MassScaling.h"
#include "steps/oif_ModalDamping.h"
#include "support/DeckTest.h"

namespace {

using Scaling = kprC_MassScaling;
using Type = kprC_MassScaling::MassScalingTypeEnm;

/// A region on the element set "E" of the assembly.
rgnC_Region AnyRegion() {
    static TestStore store;
    if (store.model.FindInstance("I") == nullptr) {
        store.AddPart("P", {1, 2}).mesh->AddElements("T3D2", {1}, 2, {1, 2});
        store.model.AddInstance("I", "P");
        const int labels[] = {1};
        const odiK_MemberInput members[] = {{"I", labels, {}}};
        store.model.AddAssemblySet("E", res_SetTypeEnm::ELEMENTS, members);
    }
    return store.model.Region("", "E");
}

Scaling On(Type type) {
    Scaling scaling;
    scaling.type = type;
    scaling.region = AnyRegion();
    return scaling;
}

std::string Fixed(const Scaling& scaling) {
    return Written(oif_FixedMassScaling(scaling, "E"));
}

std::string Variable(const Scaling& scaling) {
    return Written(oif_VariableMassScaling(scaling, "E"));
}

const std::string kRegionLine = "**               E\n";

Scaling SemiAutomatic() {
    Scaling scaling = On(Type::SEMI_AUTOMATIC);
    scaling.dt = 1e-5;
    scaling.factor = 2.0;
    scaling.frequencyKind = Scaling::FrequencyKindEnm::NUMBER_INTERVAL;
    scaling.numberInterval = 5;
    return scaling;
}

Scaling Rolling() {
    Scaling scaling = On(Type::AUTOMATIC);
    scaling.feedRate = 10.0;
    scaling.extrudedLength = 0.25;
    scaling.crossSection = 12.7;
    scaling.direction = Scaling::RollingDirectionEnm::Y;
    scaling.numberInterval = 3;
    return scaling;
}

template <class Damping, class Row>
std::string Damped(const std::vector<Row>& rows) {
    Damping damping;
    for (const Row& row : rows) damping.rows.Append(row);
    return Written(oif_ModalDamping(mdl_ObjCow<Damping>(damping)));
}

template <class Row, class... Values>
Row RowOf(std::initializer_list<double> reals, Values... modes) {
    Row row;
    if constexpr (sizeof...(modes) == 2) {
        const int both[] = {modes...};
        row.firstMode = both[0];
        row.lastMode = both[1];
    }
    const double* real = reals.begin();
    if constexpr (requires { row.low; }) row.low = *real++;
    if constexpr (requires { row.value; }) row.value = *real++;
    if constexpr (requires { row.alpha; }) {
        row.alpha = *real++;
        row.beta = *real++;
    }
    return row;
}

std::string Restarted(const kprC_Restart& restart) {
    return Written(oif_Restart(mdl_ObjCow<kprC_Restart>(restart)));
}

template <class Print, class Former>
std::string Printed(const Print& print, const Former& former) {
    return Written(oif_DiagnosticPrint(mdl_ObjCow<kprC_DiagnosticPrint>(print),
                                       mdl_ObjCow<kprC_DiagnosticPrint>(former)));
}

} // namespace

TEST(FixedMassScaling, Reinitialize_HasTheSetAndNothingElse) {
    Scaling scaling = SemiAutomatic();
    scaling.type = Type::REINITIALIZE;
    EXPECT_EQ(Fixed(scaling),
              "** Mass Scaling: Reinitialize Mass\n" + kRegionLine + "*Fixed Mass Scaling, elset=E\n");
}

TEST(FixedMassScaling, SemiAutomatic_HasTimeRuleFactorAndRecurrence) {
    EXPECT_EQ(Fixed(SemiAutomatic()),
              "** Mass Scaling: Semi-Automatic\n" + kRegionLine +
                  "*Fixed Mass Scaling, elset=E, dt=1e-05, type=below min, factor=2., number interval=5\n");
}

TEST(FixedMassScaling, SemiAutomaticAllDefault_IsTheBareKeyword) {
    EXPECT_EQ(Fixed(On(Type::SEMI_AUTOMATIC)),
              "** Mass Scaling: Semi-Automatic\n" + kRegionLine + "*Fixed Mass Scaling, elset=E\n");
}

TEST(FixedMassScaling, Frequency_StandsBeforeTheNumberOfIntervals) {
    Scaling scaling = SemiAutomatic();
    scaling.dt = 0.0;
    scaling.factor = 0.0;
    scaling.frequency = 7;
    EXPECT_EQ(Fixed(scaling), "** Mass Scaling: Semi-Automatic\n" + kRegionLine +
                                  "*Fixed Mass Scaling, elset=E, frequency=7\n");
    scaling.frequencyKind = Scaling::FrequencyKindEnm::NONE;
    EXPECT_EQ(Fixed(scaling),
              "** Mass Scaling: Semi-Automatic\n" + kRegionLine + "*Fixed Mass Scaling, elset=E\n");
}

TEST(FixedMassScaling, WholeModel_HasItsWordsInTheCommentAndNoSet) {
    Scaling scaling = On(Type::SEMI_AUTOMATIC);
    scaling.wholeModel = true;
    scaling.factor = 3.0;
    const std::string text = "** Mass Scaling: Semi-Automatic\n"
                             "**               Whole Model\n"
                             "*Fixed Mass Scaling, factor=3.\n";
    EXPECT_EQ(Fixed(scaling), text);
    scaling.wholeModel = false;
    scaling.region = {};
    EXPECT_EQ(Fixed(scaling), text);
}

TEST(FixedMassScaling, DtRules_AreLowerCaseWords) {
    const std::pair<Scaling::DtTypeEnm, const char*> rules[] = {
        {Scaling::DtTypeEnm::UNIFORM, "uniform"},
        {Scaling::DtTypeEnm::BELOW_MIN, "below min"},
        {Scaling::DtTypeEnm::SET_EQUAL_DT, "set equal dt"},
        {Scaling::DtTypeEnm::NONUNIFORM, "nonuniform"},
        {static_cast<Scaling::DtTypeEnm>(9), ""}};
    for (const auto& [rule, word] : rules) {
        Scaling scaling = On(Type::SEMI_AUTOMATIC);
        scaling.dt = 0.5;
        scaling.dtType = rule;
        EXPECT_EQ(Fixed(scaling), "** Mass Scaling: Semi-Automatic\n" + kRegionLine +
                                      "*Fixed Mass Scaling, elset=E, dt=0.5, type=" + word + "\n");
    }
}

TEST(FixedMassScaling, KindWithoutAFixedForm_IsAnEmptyLineOnPurpose) {
    EXPECT_EQ(Fixed(On(Type::AUTOMATIC)), "\n");
    EXPECT_EQ(Fixed(On(Type::DISABLE_THROUGHOUT_STEP)), "\n");
    EXPECT_EQ(Fixed(On(static_cast<Type>(9))), "\n");
}

TEST(VariableMassScaling, Disable_HasNeitherSetNorRegionLineOnPurpose) {
    EXPECT_EQ(Variable(On(Type::DISABLE_THROUGHOUT_STEP)),
              "** Mass Scaling: Disable Throughout Step\n*Variable Mass Scaling\n");
}

TEST(VariableMassScaling, SemiAutomatic_HasNoFactor) {
    EXPECT_EQ(Variable(SemiAutomatic()),
              "** Mass Scaling: Semi-Automatic\n" + kRegionLine +
                  "*Variable Mass Scaling, elset=E, dt=1e-05, type=below min, number interval=5\n");
    Scaling scaling = SemiAutomatic();
    scaling.frequency = 2;
    EXPECT_EQ(Variable(scaling),
              "** Mass Scaling: Semi-Automatic\n" + kRegionLine +
                  "*Variable Mass Scaling, elset=E, dt=1e-05, type=below min, frequency=2\n");
    scaling.frequencyKind = Scaling::FrequencyKindEnm::NONE;
    scaling.dt = 0.0;
    EXPECT_EQ(Variable(scaling),
              "** Mass Scaling: Semi-Automatic\n" + kRegionLine + "*Variable Mass Scaling, elset=E\n");
}

TEST(VariableMassScaling, Rolling_CutsTheCrossSectionAndLooksAtNoKindOfFrequency) {
    EXPECT_EQ(Variable(Rolling()),
              "** Mass Scaling: Automatic\n" + kRegionLine +
                  "*Variable Mass Scaling, elset=E, type=rolling, feed rate=10.,\n"
                  "extruded length=0.25, cross section=12, direction=2, number interval=3\n");
    Scaling scaling = Rolling();
    scaling.frequency = 4;
    scaling.wholeModel = true;
    EXPECT_EQ(Variable(scaling), "** Mass Scaling: Automatic\n"
                                 "**               Whole Model\n"
                                 "*Variable Mass Scaling, type=rolling, feed rate=10.,\n"
                                 "extruded length=0.25, cross section=12, direction=2, frequency=4\n");
}

TEST(VariableMassScaling, RollingDirections_AreOneToThreeAndNone) {
    const char* const texts[] = {", direction=1", ", direction=2", ", direction=3", ""};
    for (int i = 0; i < 4; ++i) {
        Scaling scaling = Rolling();
        scaling.direction = static_cast<Scaling::RollingDirectionEnm>(i);
        EXPECT_EQ(Variable(scaling), "** Mass Scaling: Automatic\n" + kRegionLine +
                                         "*Variable Mass Scaling, elset=E, type=rolling, feed rate=10.,\n"
                                         "extruded length=0.25, cross section=12" +
                                         texts[i] + ", number interval=3\n");
    }
}

TEST(VariableMassScaling, RollingDirectionOutsideTheList_RaisesBeforeAnythingIsWritten) {
    for (const int direction : {-1, 4}) {
        Scaling scaling = Rolling();
        scaling.direction = static_cast<Scaling::RollingDirectionEnm>(direction);
        std::string raised;
        const std::string text = Streamed([&](utl_Stream& stream) {
            raised = Raised([&] { oif_VariableMassScaling(scaling, "E").Write(stream); });
        });
        EXPECT_EQ(raised, "Corrupted Explicit Dynamics procedure");
        EXPECT_EQ(text, "");
    }
}

TEST(VariableMassScaling, CrossSectionBeyondInt_IsTheLargestInt) {
    Scaling scaling = Rolling();
    scaling.crossSection = 1e20;
    EXPECT_NE(Variable(scaling).find("cross section=2147483647,"), std::string::npos);
    scaling.crossSection = -1e20;
    EXPECT_NE(Variable(scaling).find("cross section=-2147483648,"), std::string::npos);
    scaling.crossSection = -3.9;
    EXPECT_NE(Variable(scaling).find("cross section=-3,"), std::string::npos);
}

TEST(VariableMassScaling, KindWithoutAVariableForm_IsAnEmptyLineOnPurpose) {
    EXPECT_EQ(Variable(On(Type::REINITIALIZE)), "\n");
    EXPECT_EQ(Variable(On(static_cast<Type>(9))), "\n");
}

TEST(ModalDamping, Composite_HasModesOnly) {
    using Row = kprC_CompositeDampingRow;
    EXPECT_EQ((Damped<kprC_CompositeDamping, Row>({RowOf<Row>({}, 1, 10), RowOf<Row>({}, 11, 20)})),
              "*Modal Damping, modal=COMPOSITE\n1, 10\n11, 20\n");
}

TEST(ModalDamping, Direct_HasNoOption) {
    using Row = kprC_ModeDampingRow;
    EXPECT_EQ((Damped<kprC_DirectDamping, Row>({RowOf<Row>({0.02}, 1, 10)})),
              "*Modal Damping\n1, 10, 0.02\n");
}

TEST(ModalDamping, Rayleigh_HasTwoFactors) {
    using Row = kprC_RayleighDampingRow;
    EXPECT_EQ((Damped<kprC_RayleighDamping, Row>({RowOf<Row>({3.0, 1e-5}, 1, 4)})),
              "*Modal Damping, rayleigh\n1, 4, 3., 1e-05\n");
}

TEST(ModalDamping, Structural_HasItsWord) {
    using Row = kprC_ModeDampingRow;
    EXPECT_EQ((Damped<kprC_StructuralDamping, Row>({RowOf<Row>({0.1}, 2, 3)})),
              "*Modal Damping, structural\n2, 3, 0.1\n");
}

TEST(ModalDamping, ByFrequency_HasFrequenciesInPlaceOfModes) {
    using Row = kprC_FrequencyDampingRow;
    using Rayleigh = kprC_RayleighFrequencyDampingRow;
    EXPECT_EQ(
        (Damped<kprC_DirectDampingByFrequency, Row>({RowOf<Row>({0.0, 0.01}), RowOf<Row>({100.0, 0.05})})),
        "*Modal Damping, definition=FREQUENCY RANGE\n0., 0.01\n100., 0.05\n");
    EXPECT_EQ((Damped<kprC_RayleighDampingByFrequency, Rayleigh>({RowOf<Rayleigh>({10.0, 0.1, 0.002})})),
              "*Modal Damping, rayleigh, definition=FREQUENCY RANGE\n10., 0.1, 0.002\n");
    EXPECT_EQ((Damped<kprC_StructuralDampingByFrequency, Row>({RowOf<Row>({10.0, 0.3})})),
              "*Modal Damping, structural, definition=FREQUENCY RANGE\n10., 0.3\n");
}

TEST(ModalDamping, NoRows_LeaveTheKeywordLine) {
    EXPECT_EQ((Damped<kprC_DirectDamping, kprC_ModeDampingRow>({})), "*Modal Damping\n");
}

TEST(ModalDamping, AbsentRecord_LeavesTheLineOpenOnPurpose) {
    EXPECT_EQ(Written(oif_ModalDamping(mdl_ObjCow<kprC_RayleighDamping>())), "*Modal Damping");
}

TEST(SelectEigenmodes, TenVectors_GenerateOneToTen) {
    EXPECT_EQ(Written(oif_SelectEigenmodes(10)), "*Select Eigenmodes, generate\n1, 10, 1\n");
}

TEST(LoadCase, Name_IsQuotedWhereNeeded) {
    EXPECT_EQ(Written(oif_LoadCase("LC-1")), "*Load Case, name=LC-1\n");
    EXPECT_EQ(Written(oif_LoadCase("dead load")), "*Load Case, name=\"dead load\"\n");
}

TEST(Restart, Explicit_HasIntervalsAndTimeMarks) {
    kprC_ExplicitRestart restart;
    EXPECT_EQ(Restarted(restart), "*Restart, write, number interval=1, time marks=NO\n");
    restart.overlay = true;
    restart.numberInterval = 20;
    restart.timeMarks = true;
    EXPECT_EQ(Restarted(restart), "*Restart, write, overlay, number interval=20, time marks=YES\n");
}

TEST(Restart, Standard_HasTheFrequencyWhereIntervalsAreBelowOne) {
    kprC_StandardRestart restart;
    EXPECT_EQ(Restarted(restart), "*Restart, write, frequency=1\n");
    restart.overlay = true;
    restart.frequency = 0;
    restart.numberInterval = -1;
    EXPECT_EQ(Restarted(restart), "*Restart, write, overlay, frequency=0\n");
    restart.numberInterval = 4;
    EXPECT_EQ(Restarted(restart), "*Restart, write, overlay, number interval=4, time marks=YES\n");
    restart.overlay = false;
    restart.timeMarks = false;
    EXPECT_EQ(Restarted(restart), "*Restart, write, number interval=4, time marks=NO\n");
}

TEST(Restart, Read_HasIncrementOrIntervalOrNeither) {
    EXPECT_EQ(Written(oif_Restart(2, 7, true, true)), "*Restart, read, step=2, inc=7, end step\n");
    EXPECT_EQ(Written(oif_Restart(2, 7, false, false)), "*Restart, read, step=2, interval=7\n");
    EXPECT_EQ(Written(oif_Restart(1, -2, true, true)), "*Restart, read, step=1, end step\n");
    EXPECT_EQ(Written(oif_Restart(1, -1, false, true)), "*Restart, read, step=1, inc=-1\n");
}

TEST(Monitor, Standard_HasAFrequencyAndAnExplicitOneHasNone) {
    kprC_StandardMonitor standard;
    standard.dof = 3;
    standard.frequency = 5;
    EXPECT_EQ(Written(oif_Monitor(mdl_ObjCow<kprC_Monitor>(standard), "I.N")),
              "*Monitor, dof=3, node=I.N, frequency=5\n");
    EXPECT_EQ(Written(oif_Monitor(mdl_ObjCow<kprC_Monitor>(kprC_Monitor()), "\"a b\"")),
              "*Monitor, dof=1, node=\"a b\"\n");
}

TEST(Monitor, NoSet_IsEmptyAndWritesNothing) {
    const oif_Monitor monitor(mdl_ObjCow<kprC_Monitor>(kprC_StandardMonitor()), "");
    EXPECT_TRUE(monitor.IsEmpty());
    EXPECT_EQ(Written(monitor), "");
    EXPECT_FALSE(oif_Monitor(mdl_ObjCow<kprC_Monitor>(kprC_StandardMonitor()), "N").IsEmpty());
}

TEST(DiagnosticPrint, SameAsBefore_WritesNothing) {
    EXPECT_EQ(Printed(kprC_ExplicitDiagnosticPrint(), kprC_ExplicitDiagnosticPrint()), "");
    EXPECT_EQ(Printed(kprC_StandardDiagnosticPrint(), kprC_StandardDiagnosticPrint()), "");
    EXPECT_EQ(Printed(kprC_PerturbationDiagnosticPrint(), kprC_StandardDiagnosticPrint()), "");
}

TEST(DiagnosticPrint, Explicit_HasWhatDiffers) {
    kprC_ExplicitDiagnosticPrint print;
    print.allke = print.criticalElement = print.etotal = print.dmass = false;
    EXPECT_EQ(Printed(print, kprC_ExplicitDiagnosticPrint()),
              "*Print, allke=NO, critical element=NO, etotal=NO, dmass=NO\n");
    EXPECT_EQ(Printed(kprC_ExplicitDiagnosticPrint(), print),
              "*Print, allke=YES, critical element=YES, etotal=YES, dmass=YES\n");
    kprC_ExplicitDiagnosticPrint former = print;
    former.etotal = true;
    EXPECT_EQ(Printed(print, former), "*Print, etotal=NO\n");
}

TEST(DiagnosticPrint, Standard_HasWhatDiffersAndNeverSolveOnPurpose) {
    kprC_StandardDiagnosticPrint print;
    print.contact = print.modelChange = print.solve = true;
    print.frequency = 10;
    EXPECT_EQ(Printed(print, kprC_StandardDiagnosticPrint()),
              "*Print, contact=YES, frequency=10, model change=YES\n");
    EXPECT_EQ(Printed(kprC_StandardDiagnosticPrint(), print),
              "*Print, contact=NO, frequency=1, model change=NO\n");
}

TEST(DiagnosticPrint, Perturbation_IsComparedWithTheStandardPrint) {
    kprC_PerturbationDiagnosticPrint print;
    print.frequency = 3;
    print.solve = true;
    EXPECT_EQ(Printed(print, kprC_StandardDiagnosticPrint()), "*Print, frequency=3, solve=YES\n");
    kprC_StandardDiagnosticPrint former;
    former.frequency = 3;
    former.solve = true;
    EXPECT_EQ(Printed(print, former), "");
    EXPECT_EQ(Printed(kprC_PerturbationDiagnosticPrint(), former), "*Print, frequency=1, solve=NO\n");
}

TEST(DiagnosticPrint, FormerPrintOfAnotherKind_GivesTheSolversDefaultsAsReference) {
    kprC_ExplicitDiagnosticPrint explicitPrint;
    explicitPrint.dmass = false;
    kprC_StandardDiagnosticPrint standard;
    standard.contact = true;
    kprC_PerturbationDiagnosticPrint perturbation;
    perturbation.solve = true;
    EXPECT_EQ(Printed(standard, explicitPrint), "*Print, contact=YES\n");
    EXPECT_EQ(Printed(perturbation, explicitPrint), "*Print, solve=YES\n");
    EXPECT_EQ(Printed(explicitPrint, standard), "*Print, dmass=NO\n");
}
