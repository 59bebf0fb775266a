#include "ProcedureCases.h"
#include "steps/oif_ModalProcedures.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"

namespace {

using Frequency = kprC_FrequencyStep;
using Solver = Frequency::EigensolverEnm;
using Coupling = Frequency::AcousticCouplingEnm;
using ComplexFrequency = kprC_ComplexFrequencyStep;
using Spectrum = kprC_ResponseSpectrumStep;
using Direct = kprC_SteadyStateDirectStep;
using Modal = kprC_SteadyStateModalStep;
using Subspace = kprC_SteadyStateSubspaceStep;
using Projection = Subspace::ProjectionEnm;

oif_Frequency Keyword(const Frequency& record) {
    static TestStore store;
    return {record, store.Info()};
}

std::string Modes(const Frequency& record) {
    return Written(Keyword(record));
}

template <class Row>
Row Range(double lower, double upper, int points, double bias) {
    Row row;
    row.lower = lower;
    row.upper = upper;
    row.points = points;
    row.bias = bias;
    return row;
}

/// A step with a range of three points and one of four.
template <class Step, class Row>
Step WithRanges() {
    Step step;
    step.frequencies.Append(Range<Row>(0.5, 10.0, 3, 2.0));
    step.frequencies.Append(Range<Row>(10.0, 1000.0, 4, 1.5));
    return step;
}

} // namespace

TEST(Frequency, LanczosWithoutLimits_WritesFiveSeparators) {
    ExpectTexts<Frequency>({{"defaults", [](Frequency&) {},
                             "*Frequency, eigensolver=Lanczos, sim=NO, acoustic coupling=on, "
                             "normalization=displacement\n, , , , , \n"}},
                           Keyword);
}

TEST(Frequency, Lanczos_FollowsTheRecord) {
    ExpectTexts<Frequency>(
        {
            {"everything",
             [](Frequency& s) {
                 s.numEigen = 12;
                 s.minEigen = 0.5;
                 s.maxEigen = 300.0;
                 s.shift = -2.0;
                 s.blockSize = 8;
                 s.maxBlocks = 35;
                 s.sim = true;
                 s.dampingProjection = false;
                 s.acousticCoupling = Coupling::PROJECTION;
                 s.normalization = Frequency::NormalizationEnm::MASS;
                 s.propertyEvaluationFrequency = 60.0;
                 s.residualModes = true;
             },
             "*Frequency, eigensolver=Lanczos, sim, damping projection=off, acoustic coupling=projection, "
             "normalization=mass, property evaluation = 60., residual modes\n"
             "12, 0.5, 300., -2., 8, 35\n"},
            {"own substructuring with damping projected",
             [](Frequency& s) {
                 s.sim = true;
                 s.acousticCoupling = Coupling::OFF;
             },
             "*Frequency, eigensolver=Lanczos, sim, acoustic coupling=off, normalization=displacement\n"
             ", , , , , \n"},
            {"damping projection without own substructuring",
             [](Frequency& s) { s.dampingProjection = false; },
             "*Frequency, eigensolver=Lanczos, sim=NO, acoustic coupling=on, normalization=displacement\n"
             ", , , , , \n"},
            {"coupling of no known kind", [](Frequency& s) { s.acousticCoupling = Coupling{3}; },
             "*Frequency, eigensolver=Lanczos, sim=NO, normalization=displacement\n, , , , , \n"},
            {"normalization of no known kind",
             [](Frequency& s) { s.normalization = Frequency::NormalizationEnm{2}; },
             "*Frequency, eigensolver=Lanczos, sim=NO, acoustic coupling=on, normalization=mass\n"
             ", , , , , \n"},
            {"what only other solvers take",
             [](Frequency& s) {
                 s.residualModeValues.Append(1);
                 s.firstCutoffMultiplier = 3.0;
                 s.vectors = 5;
             },
             "*Frequency, eigensolver=Lanczos, sim=NO, acoustic coupling=on, normalization=displacement\n"
             ", , , , , \n"},
        },
        Keyword);
}

TEST(Frequency, Subspace_AlwaysWritesVectorsAndIterations) {
    ExpectTexts<Frequency>(
        {
            {"no limits", [](Frequency& s) { s.eigensolver = Solver::SUBSPACE; },
             "*Frequency, eigensolver=subspace, normalization=displacement\n, , , 18, 30\n"},
            {"everything",
             [](Frequency& s) {
                 s.eigensolver = Solver::SUBSPACE;
                 s.numEigen = 6;
                 s.minEigen = 1.0;
                 s.maxEigen = 50.0;
                 s.shift = 0.0;
                 s.vectors = 14;
                 s.maxIterations = 99;
                 s.sim = true;
                 s.dampingProjection = false;
                 s.residualModes = true;
                 s.residualModeValues.Append(1);
                 s.normalization = Frequency::NormalizationEnm::MASS;
                 s.propertyEvaluationFrequency = 0.0;
             },
             "*Frequency, eigensolver=subspace, normalization=mass, property evaluation = 0.\n"
             "6, 50., 0., 14, 99\n"},
        },
        Keyword);
}

TEST(Frequency, Ams_FollowsTheRecord) {
    ExpectTexts<Frequency>(
        {
            {"defaults", [](Frequency& s) { s.eigensolver = Solver::AMS; },
             "*Frequency, eigensolver=AMS, normalization=displacement\n, , , , , , \n"},
            {"coupling off and damping not projected",
             [](Frequency& s) {
                 s.eigensolver = Solver::AMS;
                 s.acousticCoupling = Coupling::OFF;
                 s.dampingProjection = false;
             },
             "*Frequency, eigensolver=AMS, normalization=displacement, acoustic coupling=off, "
             "damping projection=off\n, , , , , , \n"},
            {"everything",
             [](Frequency& s) {
                 s.eigensolver = Solver::AMS;
                 s.numEigen = 20;
                 s.minEigen = 1.0;
                 s.maxEigen = 500.0;
                 s.substructureCutoffMultiplier = 6.0;
                 s.firstCutoffMultiplier = 1.8;
                 s.secondCutoffMultiplier = 1.2;
                 s.acousticRangeFactor = 2.0;
                 s.acousticCoupling = Coupling::PROJECTION;
                 s.propertyEvaluationFrequency = 60.0;
                 s.residualModes = true;
                 s.residualModeSets.Append("Bar-1.N");
                 s.residualModeSets.Append("my nodes");
                 s.residualModeSets.Append("unused");
                 s.residualModeValues.Append(1);
                 s.residualModeValues.Append(3);
             },
             "*Frequency, eigensolver=AMS, normalization=displacement, property evaluation = 60., "
             "residual modes, acoustic coupling=projection\n"
             "20, 1., 500., 6., 1.8, 1.2, 2.\n"
             "Bar-1.N, 1\n"
             "\"my nodes\", 3\n"},
            {"modes listed but not asked for",
             [](Frequency& s) {
                 s.eigensolver = Solver::AMS;
                 s.residualModeSets.Append("N");
                 s.residualModeValues.Append(1);
             },
             "*Frequency, eigensolver=AMS, normalization=displacement\n, , , , , , \n"},
        },
        Keyword);
}

TEST(Frequency, CouplingThatIsOn_IsSaidForLanczosButNotForAmsOnPurpose) {
    Frequency record;
    record.acousticCoupling = Coupling::ON;
    EXPECT_NE(Modes(record).find("acoustic coupling=on"), std::string::npos);
    record.eigensolver = Solver::AMS;
    EXPECT_EQ(Modes(record).find("acoustic coupling"), std::string::npos);
}

TEST(Frequency, AmsWithNodeSet_NamesItFromTheAssembly) {
    TestStore store;
    store.AddPart("P", {1}).mesh->AddNodeSet("some nodes", {1});
    store.model.AddInstance("I", "P");
    Frequency record;
    record.eigensolver = Solver::AMS;
    record.nsetRegion = store.model.Region("I", "some nodes");
    EXPECT_EQ(Written(oif_Frequency(record, store.Info())),
              "*Frequency, eigensolver=AMS, normalization=displacement, nset=I.\"some nodes\"\n"
              ", , , , , , \n");
    record.eigensolver = Solver::LANCZOS;
    EXPECT_EQ(Written(oif_Frequency(record, store.Info())).find("nset"), std::string::npos);
}

TEST(Frequency, MoreResidualModesThanSets_Raise) {
    Frequency record;
    record.eigensolver = Solver::AMS;
    record.residualModes = true;
    record.residualModeValues.Append(1);
    const auto [text, raised] = WrittenUntilRaised(Keyword(record));
    EXPECT_EQ(text,
              "*Frequency, eigensolver=AMS, normalization=displacement, residual modes\n, , , , , , \n");
    EXPECT_EQ(raised.find("cow_List: index 0 is out of range"), 0U) << raised;
}

TEST(Frequency, UnknownSolver_WritesNoDataLine) {
    Frequency record;
    record.eigensolver = Solver{3};
    record.residualModes = true;
    EXPECT_EQ(Modes(record), "*Frequency, normalization=displacement\n");
}

TEST(ComplexFrequency, DataLine_FollowsTheRecord) {
    ExpectTexts<oif_ComplexFrequency, ComplexFrequency>({
        {"defaults", [](ComplexFrequency&) {}, "*Complex Frequency, friction damping=NO\n, , , \n"},
        {"friction damping", [](ComplexFrequency& s) { s.frictionDamping = true; },
         "*Complex Frequency, friction damping=YES\n, , , \n"},
        {"upper limit below the default", [](ComplexFrequency& s) { s.maxEigen = 9e17; },
         "*Complex Frequency, friction damping=NO\n, , 9e+17, \n"},
        {"lower limit brings the upper one", [](ComplexFrequency& s) { s.minEigen = 1.0; },
         "*Complex Frequency, friction damping=NO\n, 1., 1e+18, \n"},
        {"everything",
         [](ComplexFrequency& s) {
             s.numEigen = 5;
             s.minEigen = 1.0;
             s.maxEigen = 100.0;
             s.shift = -3.0;
         },
         "*Complex Frequency, friction damping=NO\n5, 1., 100., -3.\n"},
    });
}

TEST(ModalDynamics, Continue_NeedsTheFlagAndAStepThatCanBeContinued) {
    struct Case {
        bool flag;
        unsigned previous;
        const char* word;
    };
    for (const Case& each : {Case{true, 0x23C0075, "YES"}, Case{true, 0x23C006F, "YES"},
                             Case{true, 0x23C006A, "NO"}, Case{true, 0x23C0073, "NO"}, Case{true, 0, "NO"},
                             Case{false, 0x23C0075, "NO"}, Case{false, 0x23C006F, "NO"}}) {
        kprC_ModalDynamicsStep record;
        record.continueAnalysis = each.flag;
        record.timeIncrement = 0.01;
        record.timePeriod = 2.0;
        EXPECT_EQ(Written(oif_ModalDynamics(record, each.previous)),
                  std::string("*Modal dynamic, continue=") + each.word + "\n0.01, 2.\n")
            << each.flag << " behind " << std::hex << each.previous;
    }
}

TEST(RandomResponse, Ranges_HaveBiasFromFourPointsOnAndTheScale) {
    auto record = WithRanges<kprC_RandomResponseStep, kprC_RandomResponseFrequency>();
    EXPECT_EQ(Written(oif_RandomResponse(record)), "*Random Response\n"
                                                   "0.5, 10., 3, , \n"
                                                   "10., 1000., 4, 1.5, \n");
    record.frequencyScale = kprC_Step::FrequencyScaleEnm::LINEAR;
    EXPECT_EQ(Written(oif_RandomResponse(record)), "*Random Response\n"
                                                   "0.5, 10., 3, , 1\n"
                                                   "10., 1000., 4, 1.5, 1\n");
}

TEST(RandomResponse, NoRanges_WriteTheKeywordAlone) {
    EXPECT_EQ(Written(oif_RandomResponse(kprC_RandomResponseStep())), "*Random Response\n");
}

TEST(ResponseSpectrum, Parameters_FollowTheRecord) {
    ExpectTexts<oif_ResponseSpectrum, Spectrum>({
        {"defaults", [](Spectrum&) {}, "*Response spectrum, sum=ABS\n"},
        {"algebraic",
         [](Spectrum& s) {
             s.comp = Spectrum::CompEnm::ALGEBRAIC;
             s.sum = Spectrum::SumEnm::CQC;
         },
         "*Response spectrum, comp=ALGEBRAIC, sum=CQC\n"},
        {"square root",
         [](Spectrum& s) {
             s.comp = Spectrum::CompEnm::SRSS;
             s.sum = Spectrum::SumEnm::NRL;
         },
         "*Response spectrum, comp=SRSS, sum=NRL\n"},
        {"of no known kind",
         [](Spectrum& s) {
             s.comp = Spectrum::CompEnm{3};
             s.sum = Spectrum::SumEnm::SRSS;
         },
         "*Response spectrum, sum=SRSS\n"},
        {"ten percent", [](Spectrum& s) { s.sum = Spectrum::SumEnm::TENP; },
         "*Response spectrum, sum=TENP\n"},
    });
}

TEST(ResponseSpectrum, Components_HaveNoBlankBehindTheNameOnPurpose) {
    kprC_ResponseSpectrumComponent component;
    component.spectrumName = "El Centro";
    component.x = 1.0;
    component.z = -0.5;
    component.scale = 9.81;
    Spectrum record;
    record.components.Append(component);
    component.spectrumName = "S";
    component.y = 2.0;
    record.components.Append(component);
    EXPECT_EQ(Written(oif_ResponseSpectrum(record)), "*Response spectrum, sum=ABS\n"
                                                     "El Centro,1., 0., -0.5, 9.81\n"
                                                     "S,1., 2., -0.5, 9.81\n");
}

TEST(ResponseSpectrum, UnknownSummation_RaisesBehindTheParametersName) {
    Spectrum record;
    record.sum = Spectrum::SumEnm{5};
    const auto [text, raised] = WrittenUntilRaised(oif_ResponseSpectrum(record));
    EXPECT_EQ(text, "*Response spectrum, sum=");
    EXPECT_EQ(raised, "Unknown response spectrum summation type");
}

TEST(SteadyStateDirect, Parameters_FollowTheRecord) {
    auto record = WithRanges<Direct, kprC_SteadyStateDirectFrequency>();
    EXPECT_EQ(Written(oif_SteadyStateDirect(record)), "*Steady State Dynamics, direct\n"
                                                      "0.5, 10., 3, , \n"
                                                      "10., 1000., 4, 1.5, \n");
    record.complex = false;
    record.subdivideUsingEigenfrequencies = true;
    record.frequencyScale = kprC_Step::FrequencyScaleEnm::LINEAR;
    EXPECT_EQ(Written(oif_SteadyStateDirect(record)),
              "*Steady State Dynamics, direct=REAL ONLY, interval=EIGENFREQUENCY\n"
              "0.5, 10., 3, , 1\n"
              "10., 1000., 4, 1.5, 1\n");
}

TEST(SteadyStateModal, Ranges_HaveNoFieldBehindTheBias) {
    auto record = WithRanges<Modal, kprC_SteadyStateModalFrequency>();
    EXPECT_EQ(Written(oif_SteadyStateModal(record)), "*Steady State Dynamics\n"
                                                     "0.5, 10., 3, \n"
                                                     "10., 1000., 4, 1.5\n");
    record.frequencyScale = kprC_Step::FrequencyScaleEnm::LINEAR;
    record.subdivideUsingEigenfrequencies = false;
    EXPECT_EQ(Written(oif_SteadyStateModal(record)),
              "*Steady State Dynamics, frequency scale=LINEAR, interval=RANGE\n"
              "0.5, 10., 3, \n"
              "10., 1000., 4, 1.5\n");
}

TEST(SteadyStateSubspace, Parameters_FollowTheRecord) {
    ExpectTexts<oif_SteadyStateSubspace, Subspace>({
        {"defaults", [](Subspace&) {}, "*Steady State Dynamics, subspace projection, friction damping=NO\n"},
        {"constant", [](Subspace& s) { s.projection = Projection::CONSTANT; },
         "*Steady State Dynamics, subspace projection=CONSTANT, friction damping=NO\n"},
        {"by eigenfrequency", [](Subspace& s) { s.projection = Projection::EIGENFREQUENCY; },
         "*Steady State Dynamics, subspace projection=EIGENFREQUENCY, friction damping=NO\n"},
        {"by range", [](Subspace& s) { s.projection = Projection::RANGE; },
         "*Steady State Dynamics, subspace projection=RANGE, friction damping=NO\n"},
        {"of no known kind", [](Subspace& s) { s.projection = Projection{5}; },
         "*Steady State Dynamics, subspace projection, friction damping=NO\n"},
        {"everything, by property change",
         [](Subspace& s) {
             s.projection = Projection::PROPERTY_CHANGE;
             s.dampingChange = 0.2;
             s.stiffnessChange = 0.3;
             s.complex = false;
             s.frequencyScale = kprC_Step::FrequencyScaleEnm::LINEAR;
             s.subdivideUsingEigenfrequencies = false;
             s.frictionDamping = true;
         },
         "*Steady State Dynamics, subspace projection=PROPERTY CHANGE, damping change=0.2, stiffness "
         "change=0.3, "
         "real only, frequency scale=LINEAR, interval=RANGE, friction damping=YES\n"},
    });
}

TEST(SteadyStateSubspace, Ranges_AreThoseOfTheModalForm) {
    EXPECT_EQ(Written(oif_SteadyStateSubspace(WithRanges<Subspace, kprC_SteadyStateSubspaceFrequency>())),
              "*Steady State Dynamics, subspace projection, friction damping=NO\n"
              "0.5, 10., 3, \n"
              "10., 1000., 4, 1.5\n");
}
