#include "steps/oif_Step.h"

#include "base/oif_KeywordLine.h"
#include "steps/oif_ProcedureRow.h"

namespace {

using Extrapolation = kprC_Step::ExtrapolationEnm;
using Amplitude = kprC_Step::AmplitudeEnm;

constexpr int kNumIncDefault = 100;

} // namespace

void oif_Step::Write(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Step");
    line.Fixed(", name=", qkw_QuorixName(name_, false));
    const oif_ProcedureRow* row = oif_FindProcedureRow(step_->DynTypeId());
    if (row == nullptr || !row->line) nex_Raise(oif_kStepLineError);
    const oif_StepLine& parameters = *row->line;
    const oif_StepLine::Fields fields = row->lineFields(*step_);
    const bool nlgeom = step_->Nlgeom() != kprC_Step::NlgeomEnm::OFF;
    switch (parameters.nonlinearity) {
    case oif_Nonlinearity::NONE: break;
    case oif_Nonlinearity::CHANGE: PrintNlgeom(line, nlgeom, nlgeomInherited_); break;
    case oif_Nonlinearity::LATCHED: PrintNlgeom(line, nlgeom || nlgeomInherited_, false); break;
    case oif_Nonlinearity::PERTURBATION: line.Fixed(", perturbation"); break;
    }
    if (parameters.extrapolationDefault) {
        PrintExtrapolate(line, fields.extrapolation.value(), *parameters.extrapolationDefault);
    }
    if (parameters.amplitudeDefault) {
        PrintLoadAmplitude(line, fields.amplitude.value(), *parameters.amplitudeDefault);
    }
    if (parameters.writesInc) line.FixedUnless(", inc=", fields.maxNumInc.value(), kNumIncDefault);
    if (parameters.allowsUnsymm(*step_)) {
        line.FixedIf(step_->matrixStorage == kprC_Step::MatrixStorageEnm::SYMMETRIC, ", unsymm=NO")
            .FixedIf(step_->matrixStorage == kprC_Step::MatrixStorageEnm::UNSYMMETRIC, ", unsymm=YES");
    }
    line.End();
    if (!step_->description.IsEmpty()) stream << step_->description << endl;
}

void oif_Step::PrintExtrapolate(oif_KeywordLine& line, Extrapolation value, Extrapolation defaultValue) {
    if (value == defaultValue) return;
    if (value == Extrapolation::PARABOLIC) {
        line.Fixed(", extrapolation=", value);
    } else {
        line.Fixed(", extrapolation=NO");
    }
}

void oif_Step::PrintLoadAmplitude(oif_KeywordLine& line, Amplitude value, Amplitude defaultValue) {
    line.FixedIf(value != defaultValue, ", amplitude=", value == Amplitude::STEP ? "STEP" : "RAMP");
}

void oif_Step::PrintNlgeom(oif_KeywordLine& line, bool value, bool defaultValue) {
    line.FixedIf(value != defaultValue, ", nlgeom=", value ? "YES" : "NO");
}
