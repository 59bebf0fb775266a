#include "ProcedureCases.h"
#include "steps/oif_Step.h"
#include "store_interface/records/steps/kprC_DynamicSteps.h"
#include "store_interface/records/steps/kprC_ModalSteps.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"
#include "store_interface/records/steps/kprC_ThermalSteps.h"

#include <array>
#include <optional>

namespace {

using Matrix = kprC_Step::MatrixStorageEnm;
using Technique = kprC_Step::SolutionTechniqueEnm;

std::string Line(const kprC_AnalysisStep& step, bool nlgeomInherited = false, const char* name = "S") {
    return Written(oif_Step(step, nlgeomInherited, name));
}

/// What stands behind the name.
std::string Parameters(const kprC_AnalysisStep& step, bool nlgeomInherited = false) {
    const std::string line = Line(step, nlgeomInherited);
    const std::string start = "*Step, name=S";
    EXPECT_EQ(line.substr(0, start.size()), start);
    EXPECT_EQ(line.back(), '\n');
    return line.substr(start.size(), line.size() - start.size() - 1);
}

/// Texts of non-linearity: without and with large displacements of the step's own, first where they are not
/// yet in force, then where they are.
using NlgeomTexts = std::array<const char*, 4>;
constexpr NlgeomTexts kI = {"", ", nlgeom=YES", ", nlgeom=NO", ""};
constexpr NlgeomTexts kH = {"", ", nlgeom=YES", ", nlgeom=YES", ", nlgeom=YES"};
constexpr NlgeomTexts kP = {", perturbation", ", perturbation", ", perturbation", ", perturbation"};
constexpr NlgeomTexts kNone = {"", "", "", ""};

/// Texts of the extrapolations 0 to 4.
using ExtrapolationTexts = std::array<const char*, 5>;
constexpr ExtrapolationTexts kDefault0 = {"", ", extrapolation=PARABOLIC", ", extrapolation=NO",
                                          ", extrapolation=NO", ", extrapolation=NO"};
constexpr ExtrapolationTexts kDefault4 = {", extrapolation=NO", ", extrapolation=PARABOLIC",
                                          ", extrapolation=NO", ", extrapolation=NO", ""};

/// Texts of the amplitudes step and ramp.
using AmplitudeTexts = std::array<const char*, 2>;
constexpr AmplitudeTexts kFromStep = {"", ", amplitude=RAMP"};
constexpr AmplitudeTexts kFromRamp = {", amplitude=STEP", ""};
constexpr AmplitudeTexts kNoAmplitude = {"", ""};

enum class Unsymm { NEVER, ALWAYS, SEPARATED, CONSOLIDATION };

struct Expectation {
    NlgeomTexts nlgeom;
    std::optional<ExtrapolationTexts> extrapolation;
    AmplitudeTexts amplitude;
    bool inc;
    Unsymm unsymm;
};

template <class R>
void ExpectNlgeom(const NlgeomTexts& expected) {
    for (const bool inherited : {false, true}) {
        for (const bool own : {false, true}) {
            R record;
            if constexpr (requires { record.nlgeom; })
                record.nlgeom = own ? kprC_Step::NlgeomEnm::ON : kprC_Step::NlgeomEnm::OFF;
            EXPECT_EQ(Parameters(record, inherited), expected[(inherited ? 2U : 0U) + (own ? 1U : 0U)])
                << "own " << own << ", inherited " << inherited;
        }
    }
}

template <class R>
void ExpectValues(const Expectation& expected, const std::string& start) {
    R record;
    if constexpr (requires { record.nlgeom; }) record.nlgeom = kprC_Step::NlgeomEnm::OFF;
    const auto parameters = [&] { return Parameters(record); };
    if constexpr (requires { record.extrapolation; }) {
        ASSERT_TRUE(expected.extrapolation.has_value());
        const auto before = record.extrapolation;
        for (int value = 0; value < 5; ++value) {
            record.extrapolation = kprC_Step::ExtrapolationEnm{value};
            EXPECT_EQ(parameters(), start + (*expected.extrapolation)[static_cast<std::size_t>(value)])
                << "extrapolation " << value;
        }
        record.extrapolation = kprC_Step::ExtrapolationEnm{7};
        EXPECT_EQ(parameters(), start + ", extrapolation=NO");
        record.extrapolation = before;
    } else {
        EXPECT_FALSE(expected.extrapolation.has_value());
    }
    if constexpr (requires { record.amplitude; }) {
        const auto before = record.amplitude;
        for (int value = 0; value < 2; ++value) {
            record.amplitude = kprC_Step::AmplitudeEnm{value};
            EXPECT_EQ(parameters(), start + expected.amplitude[static_cast<std::size_t>(value)])
                << "amplitude " << value;
        }
        record.amplitude = before;
    }
    if constexpr (requires { record.maxNumInc; }) {
        EXPECT_TRUE(expected.inc);
        record.maxNumInc = 101;
        EXPECT_EQ(parameters(), start + ", inc=101");
        record.maxNumInc = 0;
        EXPECT_EQ(parameters(), start + ", inc=0");
        record.maxNumInc = 100;
        EXPECT_EQ(parameters(), start);
    } else {
        EXPECT_FALSE(expected.inc);
    }
}

template <class R>
void ExpectUnsymm(Unsymm rule, const std::string& start) {
    const auto expect = [&](R record, bool allowed, const char* situation) {
        if constexpr (requires { record.nlgeom; }) record.nlgeom = kprC_Step::NlgeomEnm::OFF;
        for (const auto& [storage, text] :
             {std::pair{Matrix::SOLVER_DEFAULT, ""}, std::pair{Matrix::SYMMETRIC, ", unsymm=NO"},
              std::pair{Matrix::UNSYMMETRIC, ", unsymm=YES"}, std::pair{Matrix{3}, ""}}) {
            record.matrixStorage = storage;
            EXPECT_EQ(Parameters(record), start + (allowed ? text : ""))
                << situation << ", storage " << static_cast<int>(storage);
        }
    };
    R record;
    if constexpr (requires { record.solutionTechnique; }) {
        for (const Technique technique :
             {Technique::FULL_NEWTON, Technique::SEPARATED, Technique::QUASI_NEWTON}) {
            record.solutionTechnique = technique;
            const bool allowed =
                rule == Unsymm::SEPARATED ? technique == Technique::SEPARATED : rule != Unsymm::NEVER;
            expect(record, allowed, "technique");
        }
        record.solutionTechnique = Technique::FULL_NEWTON;
    }
    if constexpr (requires {
                      R::ResponseEnm::STEADY_STATE;
                      record.response;
                  }) {
        for (const int response : {0, 1, 2}) {
            record.response = typename R::ResponseEnm{response};
            const bool allowed = rule == Unsymm::CONSOLIDATION ? response == 0 : rule == Unsymm::ALWAYS;
            expect(record, allowed, "response");
        }
    } else {
        expect(record, rule == Unsymm::ALWAYS || rule == Unsymm::CONSOLIDATION, "plain");
    }
}

/// Checks every cell of a procedure's line.
template <class R>
void ExpectLine(const Expectation& expected) {
    SCOPED_TRACE(R::Class.name);
    ExpectNlgeom<R>(expected.nlgeom);
    ExpectValues<R>(expected, expected.nlgeom[0]);
    ExpectUnsymm<R>(expected.unsymm, expected.nlgeom[0]);
}

} // namespace

TEST(StepLine, EveryProcedure_HasItsOwnParametersAndDefaults) {
    ExpectLine<kprC_AnnealStep>({kI, {}, kNoAmplitude, false, Unsymm::NEVER});
    ExpectLine<kprC_BuckleStep>({kP, {}, kNoAmplitude, false, Unsymm::NEVER});
    ExpectLine<kprC_CoupledTempDisplacementStep>({kH, kDefault0, kFromStep, true, Unsymm::SEPARATED});
    ExpectLine<kprC_CoupledThermalElectricStep>({kNone, kDefault0, kFromStep, true, Unsymm::SEPARATED});
    ExpectLine<kprC_ExplicitDynamicsStep>({kI, {}, kNoAmplitude, false, Unsymm::NEVER});
    ExpectLine<kprC_FrequencyStep>({kP, {}, kNoAmplitude, false, Unsymm::NEVER});
    ExpectLine<kprC_GeostaticStep>({kH, {}, kNoAmplitude, false, Unsymm::ALWAYS});
    ExpectLine<kprC_HeatTransferStep>({kNone, kDefault0, kFromStep, true, Unsymm::ALWAYS});
    ExpectLine<kprC_ImplicitDynamicsStep>({kH, kDefault4, kFromStep, true, Unsymm::ALWAYS});
    ExpectLine<kprC_MassDiffusionStep>({kNone, kDefault0, kFromStep, true, Unsymm::NEVER});
    ExpectLine<kprC_ModalDynamicsStep>({kP, {}, kNoAmplitude, false, Unsymm::NEVER});
    ExpectLine<kprC_RandomResponseStep>({kP, {}, kNoAmplitude, false, Unsymm::NEVER});
    ExpectLine<kprC_ResponseSpectrumStep>({kP, {}, kNoAmplitude, false, Unsymm::NEVER});
    ExpectLine<kprC_SoilsStep>({kH, kDefault0, kFromStep, true, Unsymm::CONSOLIDATION});
    ExpectLine<kprC_StaticStep>({kH, kDefault0, kFromRamp, true, Unsymm::ALWAYS});
    ExpectLine<kprC_StaticRiksStep>({kH, kDefault0, kNoAmplitude, true, Unsymm::ALWAYS});
    ExpectLine<kprC_StaticLinearPerturbationStep>({kP, {}, kNoAmplitude, false, Unsymm::ALWAYS});
    ExpectLine<kprC_SteadyStateDirectStep>({kP, {}, kNoAmplitude, false, Unsymm::ALWAYS});
    ExpectLine<kprC_SteadyStateModalStep>({kP, {}, kNoAmplitude, false, Unsymm::NEVER});
    ExpectLine<kprC_SubspaceDynamicsStep>({kH, {}, kFromStep, true, Unsymm::NEVER});
    ExpectLine<kprC_ViscoStep>({kH, kDefault0, kFromStep, true, Unsymm::ALWAYS});
    ExpectLine<kprC_TempDisplacementDynamicsStep>({kI, {}, kNoAmplitude, false, Unsymm::NEVER});
    ExpectLine<kprC_SteadyStateSubspaceStep>({kP, {}, kNoAmplitude, false, Unsymm::ALWAYS});
}

TEST(StepLine, AllParameters_StandInOneOrderOnOneLine) {
    kprC_StaticStep step;
    step.nlgeom = kprC_Step::NlgeomEnm::ON;
    step.extrapolation = kprC_Step::ExtrapolationEnm::PARABOLIC;
    step.amplitude = kprC_Step::AmplitudeEnm::STEP;
    step.maxNumInc = 1000000;
    step.matrixStorage = Matrix::UNSYMMETRIC;
    // Longer than a line of the deck, and not broken.
    const std::string name(80, 'n');
    EXPECT_EQ(Line(step, false, name.c_str()),
              "*Step, name=" + name +
                  ", nlgeom=YES, extrapolation=PARABOLIC, amplitude=STEP, inc=1000000, unsymm=YES\n");
}

TEST(StepLine, StaticStepWithItsFlagOffBehindOneWithItOn_StaysNonlinear) {
    EXPECT_EQ(Parameters(kprC_StaticStep(), true), ", nlgeom=YES");
}

TEST(StepLine, LinearExtrapolationOfImplicitDynamics_PrintsNoOnPurpose) {
    kprC_ImplicitDynamicsStep step;
    EXPECT_EQ(Parameters(step), "");
    step.extrapolation = kprC_Step::ExtrapolationEnm::LINEAR;
    EXPECT_EQ(Parameters(step), ", extrapolation=NO");
}

TEST(StepLine, Name_IsQuotedWhenNeeded) {
    EXPECT_EQ(Line(kprC_BuckleStep(), false, "my step"), "*Step, name=\"my step\", perturbation\n");
    EXPECT_EQ(Line(kprC_HeatTransferStep(), false, "1st"), "*Step, name=\"1st\"\n");
}

TEST(StepLine, Description_StandsBelowAsItIs) {
    kprC_HeatTransferStep step;
    EXPECT_EQ(Line(step), "*Step, name=S\n");
    step.description = "cool, \"slowly\"\nin two lines " + cow_String(std::string(150, 'x'));
    EXPECT_EQ(Line(step), "*Step, name=S\ncool, \"slowly\"\nin two lines " + std::string(150, 'x') + "\n");
    step.description = "ended\n";
    EXPECT_EQ(Line(step), "*Step, name=S\nended\n\n");
}

TEST(StepLine, ComplexFrequency_RaisesOnPurpose) {
    const kprC_ComplexFrequencyStep step;
    const auto [text, raised] = WrittenUntilRaised(oif_Step(step, false, "S"));
    EXPECT_EQ(text, "*Step, name=S");
    EXPECT_EQ(raised, "Unimplemented function to write out *Step card");
}
