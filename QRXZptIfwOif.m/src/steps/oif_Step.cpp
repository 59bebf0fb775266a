#include "steps/oif_Step.h"

#include "keyword_layer/qkw_QuorixName.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/steps/kprC_DynamicSteps.h"
#include "store_interface/records/steps/kprC_ModalSteps.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"
#include "store_interface/records/steps/kprC_ThermalSteps.h"

#include <algorithm>
#include <iterator>
#include <optional>

namespace {

using Extrapolation = kprC_Step::ExtrapolationEnm;
using Amplitude = kprC_Step::AmplitudeEnm;

constexpr int kNumIncDefault = 100;

enum class Nonlinearity {
    NONE,
    /// YES or NO where the step differs from what it finds: explicit procedures can turn it off.
    CHANGE,
    /// YES when it is or was on, never NO: what was once on stays on.
    LATCHED,
    PERTURBATION
};
using enum Nonlinearity;

// When unsymm may be written.
bool Never(const kprC_AnalysisStep&) {
    return false;
}
bool Always(const kprC_AnalysisStep&) {
    return true;
}
bool WhenSeparated(const kprC_AnalysisStep& step) {
    return step.SolutionTechnique() == kprC_Step::SolutionTechniqueEnm::SEPARATED;
}
bool WhenConsolidating(const kprC_AnalysisStep& step) {
    return nex_canDynamicCastRef<kprC_SoilsStep>(step, NEX_HERE).response ==
           kprC_SoilsStep::ResponseEnm::TRANSIENT;
}

/// What the line asks of a step beyond the queries of all steps; absent where the class has no such field.
struct Fields {
    std::optional<Extrapolation> extrapolation;
    std::optional<Amplitude> amplitude;
    std::optional<int> maxNumInc;
};

template <class R>
Fields FieldsOf(const kprC_AnalysisStep& step) {
    [[maybe_unused]] const R& record = nex_canDynamicCastRef<R>(step, NEX_HERE);
    Fields fields;
    if constexpr (requires { record.extrapolation; }) fields.extrapolation = record.extrapolation;
    if constexpr (requires { record.amplitude; }) fields.amplitude = record.amplitude;
    if constexpr (requires { record.maxNumInc; }) fields.maxNumInc = record.maxNumInc;
    return fields;
}

struct Row {
    unsigned typeId;
    Fields (*fieldsOf)(const kprC_AnalysisStep&);
    Nonlinearity nonlinearity;
    std::optional<Extrapolation> extrapolationDefault; // absent: not written
    std::optional<Amplitude> amplitudeDefault;         // absent: not written
    bool writesInc;
    bool (*allowsUnsymm)(const kprC_AnalysisStep&);
};

template <class R>
constexpr Row RowOf(Nonlinearity nonlinearity, std::optional<Extrapolation> extrapolationDefault,
                    std::optional<Amplitude> amplitudeDefault, bool writesInc,
                    bool (*allowsUnsymm)(const kprC_AnalysisStep&)) {
    return {R::Class.Id(),    &FieldsOf<R>, nonlinearity, extrapolationDefault,
            amplitudeDefault, writesInc,    allowsUnsymm};
}

constexpr auto kNo = std::nullopt;

// There is no row for complex frequency steps: their line can't be written, on purpose.
constexpr Row kRows[] = {
    RowOf<kprC_AnnealStep>(CHANGE, kNo, kNo, false, &Never),
    RowOf<kprC_BuckleStep>(PERTURBATION, kNo, kNo, false, &Never),
    RowOf<kprC_CoupledTempDisplacementStep>(LATCHED, Extrapolation::LINEAR, Amplitude::STEP, true,
                                            &WhenSeparated),
    RowOf<kprC_CoupledThermalElectricStep>(NONE, Extrapolation::LINEAR, Amplitude::STEP, true,
                                           &WhenSeparated),
    RowOf<kprC_ExplicitDynamicsStep>(CHANGE, kNo, kNo, false, &Never),
    RowOf<kprC_FrequencyStep>(PERTURBATION, kNo, kNo, false, &Never),
    RowOf<kprC_GeostaticStep>(LATCHED, kNo, kNo, false, &Always),
    RowOf<kprC_HeatTransferStep>(NONE, Extrapolation::LINEAR, Amplitude::STEP, true, &Always),
    // Its own default makes a linear extrapolation print NO.
    RowOf<kprC_ImplicitDynamicsStep>(LATCHED, Extrapolation::PROCEDURE_DEFAULT, Amplitude::STEP, true,
                                     &Always),
    RowOf<kprC_MassDiffusionStep>(NONE, Extrapolation::LINEAR, Amplitude::STEP, true, &Never),
    RowOf<kprC_ModalDynamicsStep>(PERTURBATION, kNo, kNo, false, &Never),
    RowOf<kprC_RandomResponseStep>(PERTURBATION, kNo, kNo, false, &Never),
    RowOf<kprC_ResponseSpectrumStep>(PERTURBATION, kNo, kNo, false, &Never),
    RowOf<kprC_SoilsStep>(LATCHED, Extrapolation::LINEAR, Amplitude::STEP, true, &WhenConsolidating),
    RowOf<kprC_StaticStep>(LATCHED, Extrapolation::LINEAR, Amplitude::RAMP, true, &Always),
    RowOf<kprC_StaticRiksStep>(LATCHED, Extrapolation::LINEAR, kNo, true, &Always),
    RowOf<kprC_StaticLinearPerturbationStep>(PERTURBATION, kNo, kNo, false, &Always),
    RowOf<kprC_SteadyStateDirectStep>(PERTURBATION, kNo, kNo, false, &Always),
    RowOf<kprC_SteadyStateModalStep>(PERTURBATION, kNo, kNo, false, &Never),
    RowOf<kprC_SubspaceDynamicsStep>(LATCHED, kNo, Amplitude::STEP, true, &Never),
    RowOf<kprC_ViscoStep>(LATCHED, Extrapolation::LINEAR, Amplitude::STEP, true, &Always),
    RowOf<kprC_TempDisplacementDynamicsStep>(CHANGE, kNo, kNo, false, &Never),
    RowOf<kprC_SteadyStateSubspaceStep>(PERTURBATION, kNo, kNo, false, &Always),
};

} // namespace

void oif_Step::Write(utl_Stream& stream) const {
    stream << "*Step, name=" << qkw_QuorixName(name_, false);
    const auto* row = std::find_if(std::begin(kRows), std::end(kRows),
                                   [&](const Row& each) { return each.typeId == step_->DynTypeId(); });
    if (row == std::end(kRows)) nex_Raise("Unimplemented function to write out *Step card");
    const Fields fields = row->fieldsOf(*step_);
    const bool nlgeom = step_->Nlgeom() != kprC_Step::NlgeomEnm::OFF;
    switch (row->nonlinearity) {
    case NONE: break;
    case CHANGE: PrintNlgeom(stream, nlgeom, nlgeomInherited_); break;
    case LATCHED: PrintNlgeom(stream, nlgeom || nlgeomInherited_, false); break;
    case PERTURBATION: stream << ", perturbation"; break;
    }
    if (row->extrapolationDefault)
        PrintExtrapolate(stream, fields.extrapolation.value(), *row->extrapolationDefault);
    if (row->amplitudeDefault) PrintLoadAmplitude(stream, fields.amplitude.value(), *row->amplitudeDefault);
    if (row->writesInc) PrintNumInc(stream, fields.maxNumInc.value(), kNumIncDefault);
    if (row->allowsUnsymm(*step_)) {
        if (step_->matrixStorage == kprC_Step::MatrixStorageEnm::SYMMETRIC) stream << ", unsymm=NO";
        if (step_->matrixStorage == kprC_Step::MatrixStorageEnm::UNSYMMETRIC) stream << ", unsymm=YES";
    }
    stream << endl;
    if (!step_->description.IsEmpty()) stream << step_->description << endl;
}

void oif_Step::PrintExtrapolate(utl_Stream& stream, Extrapolation value, Extrapolation defaultValue) {
    if (value == defaultValue) return;
    stream << ", extrapolation=";
    if (value == Extrapolation::PARABOLIC) {
        stream << omu_PrimEnum<Extrapolation, 1>(value).GetString();
    } else {
        stream << "NO";
    }
}

void oif_Step::PrintLoadAmplitude(utl_Stream& stream, Amplitude value, Amplitude defaultValue) {
    if (value != defaultValue) stream << ", amplitude=" << (value == Amplitude::STEP ? "STEP" : "RAMP");
}

void oif_Step::PrintNlgeom(utl_Stream& stream, bool value, bool defaultValue) {
    if (value != defaultValue) stream << ", nlgeom=" << (value ? "YES" : "NO");
}

void oif_Step::PrintNumInc(utl_Stream& stream, int value, int defaultValue) {
    if (value != defaultValue) stream << ", inc=" << value;
}
