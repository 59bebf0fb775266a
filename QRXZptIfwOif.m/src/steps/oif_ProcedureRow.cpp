#include "steps/oif_ProcedureRow.h"

#include "base/oif_ClassRows.h"
#include "mesh/oif_SetName.h"
#include "steps/oif_DynamicProcedures.h"
#include "steps/oif_MassScaling.h"
#include "steps/oif_ModalDamping.h"
#include "steps/oif_ModalProcedures.h"
#include "steps/oif_StaticProcedures.h"
#include "steps/oif_StepControls.h"
#include "steps/oif_ThermalProcedures.h"

#include <type_traits>

namespace {

using Extrapolation = kprC_Step::ExtrapolationEnm;
using Amplitude = kprC_Step::AmplitudeEnm;
using Line = oif_StepLine;
using enum oif_Nonlinearity;

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

template <class R>
Line::Fields FieldsOf(const kprC_AnalysisStep& step) {
    [[maybe_unused]] const R& record = static_cast<const R&>(step);
    Line::Fields fields;
    if constexpr (requires { record.extrapolation; }) fields.extrapolation = record.extrapolation;
    if constexpr (requires { record.amplitude; }) fields.amplitude = record.amplitude;
    if constexpr (requires { record.maxNumInc; }) fields.maxNumInc = record.maxNumInc;
    return fields;
}

/// The place where a procedure stands, and its keywords.
struct Place {
    const oif_ModelInfo& modelInfo;
    unsigned previousProcedure;
    qkw_KeywordList keywords{};
};

// The parts of a procedure: each adds keywords of the step.

/// A keyword that the step alone tells.
template <class Keyword>
struct Plain {
    template <class Step>
    static void Add(Place& place, const Step& step) {
        place.keywords.Append(Keyword(step));
    }
};
/// One that is worded by the format of the deck.
template <class Keyword>
struct InFormat {
    static void Add(Place& place, const kprC_AnalysisStep& step) {
        place.keywords.Append(Keyword(step, place.modelInfo.V6Format()));
    }
};
template <class Keyword>
struct WithModelInfo {
    static void Add(Place& place, const kprC_AnalysisStep& step) {
        place.keywords.Append(Keyword(step, place.modelInfo));
    }
};
using Technique = Plain<oif_SolutionTechnique>;

struct Riks {
    static void Add(Place& place, const kprC_StaticRiksStep& step) {
        place.keywords.Append(oif_StaticRiks(step, oif_RegionName(step.region, place.modelInfo)));
    }
};

struct ModalDynamics {
    static void Add(Place& place, const kprC_ModalDynamicsStep& step) {
        place.keywords.Append(oif_ModalDynamics(step, place.previousProcedure));
    }
};

struct SubspaceModes {
    static void Add(Place& place, const kprC_SubspaceDynamicsStep& step) {
        if (step.vectors != 0) place.keywords.Append(oif_SelectEigenmodes(step.vectors));
    }
};

struct MassScaling {
    template <class Step>
    static void Add(Place& place, const Step& step) {
        for (const kprC_MassScaling& scaling : step.massScaling) {
            const cow_String setName = oif_RegionName(scaling.region, place.modelInfo);
            if (scaling.IsVariable()) {
                place.keywords.Append(oif_VariableMassScaling(scaling, setName));
            } else {
                place.keywords.Append(oif_FixedMassScaling(scaling, setName));
            }
        }
    }
};

struct ModalDamping {
    template <class Step>
    static void Add(Place& place, const Step& step) {
        const auto add = [&](const auto& damping) {
            if (!damping.IsNull()) place.keywords.Append(oif_ModalDamping(damping));
        };
        // Transient and spectrum steps have no structural damping.
        constexpr bool hasStructural = requires {
            step.structuralDamping;
        };
        add(step.compositeDamping);
        add(step.directDamping);
        add(step.rayleighDamping);
        if constexpr (hasStructural) add(step.structuralDamping);
        add(step.directDampingByFrequency);
        add(step.rayleighDampingByFrequency);
        if constexpr (hasStructural) add(step.structuralDampingByFrequency);
    }
};

template <class R, class... Parts>
constexpr oif_ProcedureRow RowOf(std::optional<Line> line) {
    return {R::Class.Id(), line, FieldsOf<R>,
            [](const kprC_AnalysisStep& step, const oif_ModelInfo& modelInfo, unsigned previousProcedure) {
                Place place{modelInfo, previousProcedure};
                (Parts::Add(place, static_cast<const R&>(step)), ...);
                return place.keywords;
            },
            (std::is_same_v<Parts, Technique> || ...)};
}

constexpr auto kNo = std::nullopt;
constexpr Line kExplicitLine{CHANGE, kNo, kNo, false, Never};
constexpr Line kPerturbationLine{PERTURBATION, kNo, kNo, false, Never};
constexpr Line kUnsymmetricPerturbationLine{PERTURBATION, kNo, kNo, false, Always};

constexpr oif_ProcedureRow kProcedureRows[] = {
    RowOf<kprC_AnnealStep, Plain<oif_Anneal>>(kExplicitLine),
    RowOf<kprC_BuckleStep, Plain<oif_Buckle>>(kPerturbationLine),
    RowOf<kprC_CoupledTempDisplacementStep, InFormat<oif_CoupledTempDisplacement>, Technique>(
        Line{LATCHED, Extrapolation::LINEAR, Amplitude::STEP, true, WhenSeparated}),
    RowOf<kprC_CoupledThermalElectricStep, Plain<oif_CoupledThermalElectric>, Technique>(
        Line{NONE, Extrapolation::LINEAR, Amplitude::STEP, true, WhenSeparated}),
    RowOf<kprC_ExplicitDynamicsStep, Plain<oif_ExplicitDynamics>, Plain<oif_BulkViscosity>, MassScaling>(
        kExplicitLine),
    RowOf<kprC_FrequencyStep, WithModelInfo<oif_Frequency>>(kPerturbationLine),
    RowOf<kprC_GeostaticStep, Plain<oif_Geostatic>>(Line{LATCHED, kNo, kNo, false, Always}),
    RowOf<kprC_HeatTransferStep, Plain<oif_HeatTransfer>>(
        Line{NONE, Extrapolation::LINEAR, Amplitude::STEP, true, Always}),
    // Its own default makes a linear extrapolation print NO.
    RowOf<kprC_ImplicitDynamicsStep, Plain<oif_ImplicitDynamics>>(
        Line{LATCHED, Extrapolation::PROCEDURE_DEFAULT, Amplitude::STEP, true, Always}),
    RowOf<kprC_MassDiffusionStep, Plain<oif_MassDiffusion>>(
        Line{NONE, Extrapolation::LINEAR, Amplitude::STEP, true, Never}),
    RowOf<kprC_ModalDynamicsStep, ModalDynamics, ModalDamping>(kPerturbationLine),
    RowOf<kprC_RandomResponseStep, Plain<oif_RandomResponse>, ModalDamping>(kPerturbationLine),
    RowOf<kprC_ResponseSpectrumStep, Plain<oif_ResponseSpectrum>, ModalDamping>(kPerturbationLine),
    RowOf<kprC_SoilsStep, Plain<oif_Soils>>(
        Line{LATCHED, Extrapolation::LINEAR, Amplitude::STEP, true, WhenConsolidating}),
    RowOf<kprC_StaticStep, Plain<oif_Static>>(
        Line{LATCHED, Extrapolation::LINEAR, Amplitude::RAMP, true, Always}),
    RowOf<kprC_StaticRiksStep, Riks>(Line{LATCHED, Extrapolation::LINEAR, kNo, true, Always}),
    RowOf<kprC_StaticLinearPerturbationStep, Plain<oif_StaticLinearPerturbation>>(
        kUnsymmetricPerturbationLine),
    RowOf<kprC_SteadyStateDirectStep, Plain<oif_SteadyStateDirect>>(kUnsymmetricPerturbationLine),
    RowOf<kprC_SteadyStateModalStep, Plain<oif_SteadyStateModal>, ModalDamping>(kPerturbationLine),
    RowOf<kprC_SubspaceDynamicsStep, Plain<oif_SubspaceDynamics>, SubspaceModes>(
        Line{LATCHED, kNo, Amplitude::STEP, true, Never}),
    RowOf<kprC_ViscoStep, InFormat<oif_Visco>>(
        Line{LATCHED, Extrapolation::LINEAR, Amplitude::STEP, true, Always}),
    RowOf<kprC_TempDisplacementDynamicsStep, WithModelInfo<oif_DynamicTempDisplacement>,
          Plain<oif_BulkViscosity>, MassScaling>(kExplicitLine),
    // Its line can't be written, on purpose.
    RowOf<kprC_ComplexFrequencyStep, Plain<oif_ComplexFrequency>>(kNo),
    RowOf<kprC_SteadyStateSubspaceStep, Plain<oif_SteadyStateSubspace>>(kUnsymmetricPerturbationLine),
};

} // namespace

std::span<const oif_ProcedureRow> oif_ProcedureRows() {
    return kProcedureRows;
}

const oif_ProcedureRow* oif_FindProcedureRow(unsigned typeId) {
    return oif_FindRow(kProcedureRows, typeId);
}
