#include "steps/oif_ModalProcedures.h"

#include "mesh/oif_SetName.h"
#include "store_interface/records/steps/kprC_Predicates.h"

#include <utility>

namespace {

using Eigensolver = kprC_FrequencyStep::EigensolverEnm;
using AcousticCoupling = kprC_FrequencyStep::AcousticCouplingEnm;

constexpr double kComplexMaxEigenDefault = 1e18;
/// From so many points on a range can be biased.
constexpr int kPointsForBias = 4;

/// One line for each frequency range, with `ending` behind it.
template <class Row>
void WriteRanges(utl_Stream& stream, const cow_List<Row>& ranges, const char* ending = "") {
    for (const Row& range : ranges) {
        stream << range.lower << ", " << range.upper << ", " << range.points << ", ";
        if (range.points >= kPointsForBias) stream << range.bias;
        stream << ending << endl;
    }
}

template <class Step>
bool IsLinear(const Step& step) {
    return step.frequencyScale == kprC_Step::FrequencyScaleEnm::LINEAR;
}

/// The ranges of procedures that give their scale in each line.
template <class Step>
void WriteRangesWithScale(utl_Stream& stream, const Step& step) {
    WriteRanges(stream, step.frequencies, IsLinear(step) ? ", 1" : ", ");
}

template <class Step>
void AddScaleAndInterval(oif_KeywordLine& line, const Step& step) {
    line.FixedIf(IsLinear(step), ", frequency scale=LINEAR")
        .FixedIf(!step.subdivideUsingEigenfrequencies, ", interval=RANGE");
}

void AddFrictionDamping(oif_KeywordLine& line, bool frictionDamping) {
    line.Fixed(", friction damping=", oif_YesOrNo(frictionDamping));
}

/// Null for a number outside the enumeration.
const char* CouplingText(AcousticCoupling coupling) {
    switch (coupling) {
    case AcousticCoupling::OFF: return ", acoustic coupling=off";
    case AcousticCoupling::ON: return ", acoustic coupling=on";
    case AcousticCoupling::PROJECTION: return ", acoustic coupling=projection";
    }
    return nullptr;
}

const char* SumText(kprC_ResponseSpectrumStep::SumEnm sum) {
    using Sum = kprC_ResponseSpectrumStep::SumEnm;
    switch (sum) {
    case Sum::ABS: return "ABS";
    case Sum::CQC: return "CQC";
    case Sum::NRL: return "NRL";
    case Sum::SRSS: return "SRSS";
    case Sum::TENP: return "TENP";
    }
    nex_Raise("Unknown response spectrum summation type");
}

const char* ProjectionText(kprC_SteadyStateSubspaceStep::ProjectionEnm projection) {
    using Projection = kprC_SteadyStateSubspaceStep::ProjectionEnm;
    switch (projection) {
    case Projection::NONE: return nullptr;
    case Projection::CONSTANT: return "=CONSTANT";
    case Projection::EIGENFREQUENCY: return "=EIGENFREQUENCY";
    case Projection::PROPERTY_CHANGE: return "=PROPERTY CHANGE";
    case Projection::RANGE: return "=RANGE";
    }
    return nullptr;
}

} // namespace

const char* oif_Frequency::EigensolverText() const {
    switch (step_.eigensolver) {
    case Eigensolver::SUBSPACE: return ", eigensolver=subspace";
    case Eigensolver::LANCZOS: return ", eigensolver=Lanczos";
    case Eigensolver::AMS: return ", eigensolver=AMS";
    }
    return nullptr;
}

void oif_Frequency::Write(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Frequency");
    line.Fixed(EigensolverText());
    if (step_.eigensolver == Eigensolver::LANCZOS) {
        line.Fixed(step_.sim ? ", sim" : ", sim=NO")
            .FixedIf(step_.sim && !step_.dampingProjection, ", damping projection=off")
            .Fixed(CouplingText(step_.acousticCoupling));
    }
    const bool isDisplacement = step_.normalization == kprC_FrequencyStep::NormalizationEnm::DISPLACEMENT;
    line.Fixed(isDisplacement ? ", normalization=displacement" : ", normalization=mass")
        // The blanks around the equals sign are part of the text.
        .FixedUnless(", property evaluation = ", step_.propertyEvaluationFrequency, cls_UnsetDouble)
        .FixedIf(step_.residualModes &&
                     (step_.eigensolver == Eigensolver::LANCZOS || step_.eigensolver == Eigensolver::AMS),
                 ", residual modes");
    if (step_.eigensolver == Eigensolver::AMS) AddAmsParameters(line);
    line.End();
    WriteData(stream);
}

void oif_Frequency::AddAmsParameters(oif_KeywordLine& line) const {
    // Coupling that is on is said for Lanczos only.
    line.FixedIf(step_.acousticCoupling != AcousticCoupling::ON, CouplingText(step_.acousticCoupling))
        .FixedIf(!step_.dampingProjection, ", damping projection=off");
    if (step_.nsetRegion.SetName().IsEmpty()) return;
    line.Fixed(", nset=", oif_RegionName(step_.nsetRegion, *modelInfo_));
}

void oif_Frequency::WriteData(utl_Stream& stream) const {
    switch (step_.eigensolver) {
    case Eigensolver::LANCZOS:
        oif_WriteItems(stream, step_.numEigen, step_.minEigen, step_.maxEigen, step_.shift, step_.blockSize,
                       step_.maxBlocks);
        stream << endl;
        break;
    case Eigensolver::SUBSPACE:
        oif_WriteItems(stream, step_.numEigen, step_.maxEigen, step_.shift);
        stream << ", " << step_.vectors << ", " << step_.maxIterations << endl;
        break;
    case Eigensolver::AMS: WriteAmsData(stream); break;
    }
}

void oif_Frequency::WriteAmsData(utl_Stream& stream) const {
    const std::pair<double, double> factorsAndDefaults[] = {{step_.substructureCutoffMultiplier, 5.0},
                                                            {step_.firstCutoffMultiplier, 1.7},
                                                            {step_.secondCutoffMultiplier, 1.1},
                                                            {step_.acousticRangeFactor, 1.0}};
    oif_WriteItems(stream, step_.numEigen, step_.minEigen, step_.maxEigen);
    for (const auto& [factor, defaultFactor] : factorsAndDefaults) {
        stream << ", ";
        oif_WriteUnless(stream, factor, defaultFactor);
    }
    stream << endl;
    if (!step_.residualModes) return;
    for (int i = 0; i < step_.residualModeValues.Length(); ++i) {
        stream << oif_SetName(step_.residualModeSets[i], true)
                      .UniqueSetName(oif_SetName::regionContext::ASSEMBLY)
               << ", " << step_.residualModeValues[i] << endl;
    }
}

void oif_ComplexFrequency::Write(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Complex Frequency");
    AddFrictionDamping(line, step_.frictionDamping);
    line.End();
    oif_WriteItems(stream, step_.numEigen, step_.minEigen);
    stream << ", ";
    if (step_.maxEigen < kComplexMaxEigenDefault || step_.minEigen != cls_UnsetDouble)
        stream << step_.maxEigen;
    stream << ", ";
    oif_WriteUnless(stream, step_.shift, 0.0);
    stream << endl;
}

void oif_ModalDynamics::Write(utl_Stream& stream) const {
    const bool continues = step_.continueAnalysis && kprC_CanBeContinued(previousProcedure_);
    oif_KeywordLine(stream, "*Modal dynamic").Fixed(", continue=", oif_YesOrNo(continues)).End();
    stream << step_.timeIncrement << ", " << step_.timePeriod << endl;
}

void oif_RandomResponse::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Random Response").End();
    WriteRangesWithScale(stream, step_);
}

void oif_ResponseSpectrum::Write(utl_Stream& stream) const {
    using Comp = kprC_ResponseSpectrumStep::CompEnm;
    oif_KeywordLine(stream, "*Response spectrum")
        .FixedIf(step_.comp == Comp::ALGEBRAIC, ", comp=ALGEBRAIC")
        .FixedIf(step_.comp == Comp::SRSS, ", comp=SRSS")
        .Fixed(", sum=")
        .Text(SumText(step_.sum))
        .End();
    for (const kprC_ResponseSpectrumComponent& component : step_.components) {
        // No blank behind the first comma.
        stream << component.spectrumName << "," << component.x << ", " << component.y << ", " << component.z
               << ", " << component.scale << endl;
    }
}

void oif_SteadyStateDirect::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Steady State Dynamics")
        .Fixed(step_.complex ? ", direct" : ", direct=REAL ONLY")
        .FixedIf(step_.subdivideUsingEigenfrequencies, ", interval=EIGENFREQUENCY")
        .End();
    WriteRangesWithScale(stream, step_);
}

void oif_SteadyStateModal::Write(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Steady State Dynamics");
    AddScaleAndInterval(line, step_);
    line.End();
    WriteRanges(stream, step_.frequencies);
}

void oif_SteadyStateSubspace::Write(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Steady State Dynamics");
    line.Fixed(", subspace projection", ProjectionText(step_.projection));
    if (step_.projection == kprC_SteadyStateSubspaceStep::ProjectionEnm::PROPERTY_CHANGE) {
        line.Fixed(", damping change=", step_.dampingChange)
            .Fixed(", stiffness change=", step_.stiffnessChange);
    }
    line.FixedIf(!step_.complex, ", real only");
    AddScaleAndInterval(line, step_);
    AddFrictionDamping(line, step_.frictionDamping);
    line.End();
    WriteRanges(stream, step_.frequencies);
}
