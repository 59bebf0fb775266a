#include "steps/oif_StepControls.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"
#include "store_interface/records/steps/kprC_ThermalSteps.h"
#include "support/DeckTest.h"

namespace {

const std::string kReset = "*Controls, reset\n";
const std::string kTime = "*Controls, parameters=time incrementation\n";

std::string Typical(const kprC_TypicalControls& controls) {
    return Written(oif_TypicalControls(controls, false));
}

cow_List<double> ListOf(std::initializer_list<double> values) {
    cow_List<double> list;
    for (const double value : values) list.Append(value);
    return list;
}

/// Makes the protected operations reachable.
class OpenControls final : public qkw_KeywordOf<OpenControls, oif_Controls> {
public:
    OpenControls() : qkw_KeywordOf(false) {}
    std::string Field(const cow_List<double>& values, const cow_List<double>& defaults) const {
        return Streamed([&](utl_Stream& stream) { PrintFieldData(stream, values, defaults); });
    }
    std::string Data(const cow_List<double>& values, const cow_List<double>& defaults, int first, int last,
                     int excluded) const {
        return Streamed([&](utl_Stream& stream) {
            PrintControlsData(stream, values, defaults, first, last, excluded, false);
        });
    }

private:
    const kprC_PrimaryControls& Record() const override { return record_; }
    void WriteBlocks(utl_Stream&) const override {}
    kprC_TypicalControls record_;
};

} // namespace

template <class Pair>
class ControlsOfClass : public testing::Test {};

template <class K, class R>
struct KeywordOfRecord {
    using Keyword = K;
    using Record = R;
};

using AllControls = testing::Types<KeywordOfRecord<oif_TypicalControls, kprC_TypicalControls>,
                                   KeywordOfRecord<oif_HeatTransferControls, kprC_HeatTransferControls>,
                                   KeywordOfRecord<oif_MassDiffusionControls, kprC_MassDiffusionControls>,
                                   KeywordOfRecord<oif_CTDControls, kprC_CTDControls>,
                                   KeywordOfRecord<oif_PoreControls, kprC_PoreControls>,
                                   KeywordOfRecord<oif_ElectricalControls, kprC_ElectricalControls>,
                                   KeywordOfRecord<oif_CTEControls, kprC_CTEControls>>;
TYPED_TEST_SUITE(ControlsOfClass, AllControls);

TYPED_TEST(ControlsOfClass, AllDefault_ResetAlone) {
    const typename TypeParam::Record record;
    EXPECT_EQ(Written(typename TypeParam::Keyword(record, false)), kReset);
}

TYPED_TEST(ControlsOfClass, UseDefault_WritesNothing) {
    typename TypeParam::Record record;
    record.useDefault = true;
    record.resetOnly = true;
    record.discontinuous = true;
    EXPECT_EQ(Written(typename TypeParam::Keyword(record, false)), "");
}

TYPED_TEST(ControlsOfClass, ResetOnly_WritesOneLine) {
    typename TypeParam::Record record;
    record.resetOnly = true;
    record.lineSearch.Put(0, 5.0);
    EXPECT_EQ(Written(typename TypeParam::Keyword(record, false)), kReset);
}

TYPED_TEST(ControlsOfClass, QuasiNewton_IsKeptAndNeverWritten) {
    typename TypeParam::Record record;
    record.quasiNewtonMaxIterations = 9;
    const typename TypeParam::Keyword keyword(record, true);
    EXPECT_TRUE(keyword.QuasiNewton());
    EXPECT_FALSE(typename TypeParam::Keyword(record, false).QuasiNewton());
    EXPECT_EQ(Written(keyword), kReset);
}

TEST(Controls, OneTimeEntry_StandsAmongTenSeparators) {
    kprC_TypicalControls controls;
    controls.timeIncrementation.Put(3, 20.0);
    EXPECT_EQ(Typical(controls), kReset + kTime + ", , , 20, , , , , , , \n");
}

TEST(Controls, IntegerEntries_AreComparedAsTheyAreAndWrittenCut) {
    kprC_TypicalControls controls;
    controls.timeIncrementation.Put(0, 4.9);
    controls.timeIncrementation.Put(6, -12.9);
    controls.timeIncrementation.Put(10, 1e12);
    EXPECT_EQ(Typical(controls), kReset + kTime + "4, , , , , , -12, , , , 2147483647\n");
}

TEST(Controls, RealTimeEntries_BeginANewLineOfEight) {
    kprC_TypicalControls controls;
    controls.timeIncrementation.Put(11, 0.3);
    EXPECT_EQ(Typical(controls), kReset + kTime + ", , , , , , , , , , \n0.3, , , , , , , \n");
    controls.timeIncrementation.Put(11, 0.25);
    controls.timeIncrementation.Put(26, 0.9);
    // Entries 11 to 26 are two lines of eight: the eighth of a line has no separator behind it.
    EXPECT_EQ(Typical(controls),
              kReset + kTime + ", , , , , , , , , , \n, , , , , , , \n, , , , , , , 0.9\n");
}

TEST(Controls, TimeEntriesBeyondTheDefaults_AreWritten) {
    kprC_TypicalControls controls;
    controls.timeIncrementation.Append(7.5);
    EXPECT_EQ(Typical(controls),
              kReset + kTime + ", , , , , , , , , , \n, , , , , , , \n, , , , , , , \n7.5\n");
}

TEST(Controls, TimeListOfAProgramThatIsTooShort_LeavesAnEmptySecondLineOnPurpose) {
    kprC_TypicalControls controls;
    controls.timeIncrementation = ListOf({5.0, 8.0});
    EXPECT_EQ(Typical(controls), kReset + kTime + "5, , , , , , , , , , \n\n");
}

TEST(Controls, Discontinuous_HasItsOwnDefaults) {
    kprC_TypicalControls controls;
    controls.discontinuous = true;
    controls.timeIncrementation = kprC_PrimaryControls::timeIncrementationDef(true);
    EXPECT_EQ(Typical(controls), kReset + "*Controls, analysis=discontinuous\n");
    controls.timeIncrementation = kprC_PrimaryControls::timeIncrementationDef(false);
    EXPECT_EQ(Typical(controls),
              kReset + "*Controls, analysis=discontinuous\n" + kTime + "4, 8, , , , , , , , , \n");
}

TEST(Controls, Constraints_AreRealsEightALine) {
    kprC_TypicalControls controls;
    controls.constraints.Put(0, 2.0);
    EXPECT_EQ(Typical(controls), kReset + "*Controls, parameters=constraints\n2., , , , , , , \n");
    controls.constraints.Put(8, 0.5);
    EXPECT_EQ(Typical(controls), kReset + "*Controls, parameters=constraints\n2., , , , , , , \n0.5\n");
}

TEST(Controls, LineSearch_HasFiveEntries) {
    kprC_TypicalControls controls;
    controls.lineSearch.Put(0, 5.0);
    controls.lineSearch.Put(4, 0.2);
    EXPECT_EQ(Typical(controls), kReset + "*Controls, parameters=line search\n5., , , , 0.2\n");
}

TEST(Controls, TypicalFields_StandInTheirOrderBehindThePrimaryBlocks) {
    kprC_TypicalControls controls;
    controls.lineSearch.Put(1, 0.5);
    controls.constraints.Put(1, 1e-6);
    controls.timeIncrementation.Put(1, 9.0);
    controls.displacement.Put(10, 1e-9);
    controls.hydrostaticFluidPressure.Put(0, 0.01);
    controls.rotation.Put(7, 0.0);
    EXPECT_EQ(Typical(controls), kReset + kTime + ", 9, , , , , , , , , \n" +
                                     "*Controls, parameters=constraints\n, 1e-06, , , , , , \n"
                                     "*Controls, parameters=line search\n, 0.5, , , \n"
                                     "*Controls, parameters=field, field=displacement\n"
                                     ", , , , , , , \n, , 1e-09\n"
                                     "*Controls, parameters=field, field=hydrostatic fluid pressure\n"
                                     "0.01, , , , , , , \n"
                                     "*Controls, parameters=field, field=rotation\n"
                                     ", , , , , , , 0.\n");
}

TEST(Controls, FieldListLongerThanItsDefaults_IsAnEmptyLineOnPurpose) {
    kprC_TypicalControls controls;
    controls.displacement.Put(0, 0.5);
    controls.displacement.Append(1.0);
    EXPECT_EQ(Typical(controls), kReset + "*Controls, parameters=field, field=displacement\n\n");
}

TEST(Controls, HeatTransfer_HasTemperature) {
    kprC_HeatTransferControls controls;
    controls.temperature.Put(1, 0.05);
    controls.lineSearch.Put(0, 4.0);
    EXPECT_EQ(Written(oif_HeatTransferControls(controls, false)),
              kReset + "*Controls, parameters=line search\n4., , , , \n"
                       "*Controls, parameters=field, field=temperature\n, 0.05, , , , , , \n");
}

TEST(Controls, MassDiffusion_HasNoPrimaryBlockOnPurpose) {
    kprC_MassDiffusionControls controls;
    controls.discontinuous = true;
    controls.lineSearch.Put(0, 4.0);
    controls.concentration.Put(9, 1.0);
    EXPECT_EQ(Written(oif_MassDiffusionControls(controls, false)),
              kReset + "*Controls, parameters=field, field=concentration\n, , , , , , , \n, 1.\n");
}

TEST(Controls, CoupledRecords_HaveTheirOwnFieldLast) {
    kprC_CTDControls ctd;
    ctd.temperature.Put(0, 0.1);
    ctd.rotation.Put(0, 0.2);
    EXPECT_EQ(Written(oif_CTDControls(ctd, false)),
              kReset + "*Controls, parameters=field, field=rotation\n0.2, , , , , , , \n"
                       "*Controls, parameters=field, field=temperature\n0.1, , , , , , , \n");
    kprC_PoreControls pore;
    pore.poreFluidPressure.Put(0, 0.1);
    EXPECT_EQ(Written(oif_PoreControls(pore, false)),
              kReset + "*Controls, parameters=field, field=pore fluid pressure\n0.1, , , , , , , \n");
    kprC_ElectricalControls electrical;
    electrical.electricalPotential.Put(0, 0.1);
    EXPECT_EQ(Written(oif_ElectricalControls(electrical, false)),
              kReset + "*Controls, parameters=field, field=electrical potential\n0.1, , , , , , , \n");
    kprC_CTEControls cte;
    cte.electricalPotential.Put(0, 0.1);
    cte.temperature.Put(0, 0.2);
    EXPECT_EQ(Written(oif_CTEControls(cte, false)),
              kReset + "*Controls, parameters=field, field=temperature\n0.2, , , , , , , \n"
                       "*Controls, parameters=field, field=electrical potential\n0.1, , , , , , , \n");
}

TEST(Controls, FieldData_NeedsFourEntriesAndEqualLengths) {
    const OpenControls controls;
    EXPECT_EQ(controls.Field(ListOf({1, 2, 3}), ListOf({9, 9, 9})), "\n");
    EXPECT_EQ(controls.Field(ListOf({1, 2, 3, 4}), ListOf({9, 9, 9})), "\n");
    EXPECT_EQ(controls.Field(ListOf({1, 2, 3, 4}), ListOf({1, 9, 9, 4})), ", 2., 3., , , , , \n");
    EXPECT_EQ(controls.Field({}, {}), "\n");
}

TEST(Controls, Data_StopsBehindTheLastLineWithAnEntry) {
    const OpenControls controls;
    cow_List<double> defaults;
    defaults.Fill(20, 0.0);
    cow_List<double> values = defaults;
    EXPECT_EQ(controls.Data(values, defaults, 0, 19, -1), "");
    values.Put(8, 1.0);
    EXPECT_EQ(controls.Data(values, defaults, 0, 19, -1), ", , , , , , , \n1., , , , , , , ");
    EXPECT_EQ(controls.Data(values, defaults, 0, 8, -1), ", , , , , , , \n1.");
    EXPECT_EQ(controls.Data(values, defaults, 8, 19, -1), "1., , , , , , , ");
    EXPECT_EQ(controls.Data(values, defaults, 0, 19, 8), "");
    values.Put(19, 2.0);
    EXPECT_EQ(controls.Data(values, defaults, 16, 19, -1), ", , , 2.");
}

TEST(SolverControls, Values_OfZeroLeaveTheirPlaces) {
    kprC_LinearCtrl controls;
    EXPECT_EQ(Written(oif_SolverControls(controls)), "*Solver Controls, reset\n*Solver Controls\n, \n");
    controls.relativeTolerance = 1e-6;
    EXPECT_EQ(Written(oif_SolverControls(controls)), "*Solver Controls, reset\n*Solver Controls\n1e-06, \n");
    controls.maxIterations = 300;
    EXPECT_EQ(Written(oif_SolverControls(controls)),
              "*Solver Controls, reset\n*Solver Controls\n1e-06, 300\n");
    controls.relativeTolerance = 0.0;
    EXPECT_EQ(Written(oif_SolverControls(controls)), "*Solver Controls, reset\n*Solver Controls\n, 300\n");
}

TEST(SolverControls, ResetOnlyAndUseDefault_CutTheText) {
    kprC_LinearCtrl controls;
    controls.maxIterations = 300;
    controls.resetOnly = true;
    EXPECT_EQ(Written(oif_SolverControls(controls)), "*Solver Controls, reset\n");
    controls.useDefault = true;
    EXPECT_EQ(Written(oif_SolverControls(controls)), "");
}

TEST(SolutionTechnique, Separated_IsWrittenInTheTwoCoupledProceduresOnly) {
    using Technique = kprC_Step::SolutionTechniqueEnm;
    const auto written = [](auto step, Technique technique) {
        step.solutionTechnique = technique;
        return Written(oif_SolutionTechnique(step));
    };
    const std::string line = "*Solution Technique, type=SEPARATED\n";
    EXPECT_EQ(written(kprC_CoupledTempDisplacementStep(), Technique::SEPARATED), line);
    EXPECT_EQ(written(kprC_CoupledThermalElectricStep(), Technique::SEPARATED), line);
    for (const Technique technique : {Technique::FULL_NEWTON, Technique::QUASI_NEWTON}) {
        EXPECT_EQ(written(kprC_CoupledTempDisplacementStep(), technique), "");
        EXPECT_EQ(written(kprC_CoupledThermalElectricStep(), technique), "");
    }
    for (const Technique technique :
         {Technique::FULL_NEWTON, Technique::SEPARATED, Technique::QUASI_NEWTON}) {
        EXPECT_EQ(written(kprC_StaticStep(), technique), "");
        EXPECT_EQ(written(kprC_SoilsStep(), technique), "");
        EXPECT_EQ(written(kprC_GeostaticStep(), technique), "");
        EXPECT_EQ(written(kprC_StaticRiksStep(), technique), "");
        EXPECT_EQ(written(kprC_ViscoStep(), technique), "");
    }
}
