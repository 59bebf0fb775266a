#include "steps/oif_ThermalProcedures.h"

namespace {

constexpr double kMxdemDefault = 0.1;

template <class Step>
bool IsSteady(const Step& step) {
    return step.response == Step::ResponseEnm::STEADY_STATE;
}

/// What ends a transient step: its period, or a rate of change, which is absent at the value `none`.
void AddEnd(oif_KeywordLine& line, double rate, double none) {
    line.Fixed(rate == none ? ", end=PERIOD" : ", end=SS");
}

template <class Step>
void AddResponse(oif_KeywordLine& line, const Step& step) {
    if (IsSteady(step)) {
        line.MayBreak().Fixed(", steady state");
    } else {
        AddEnd(line, step.end, cls_UnsetDouble);
    }
}

template <class Step>
void AddMxdem(oif_KeywordLine& line, const Step& step) {
    if (step.mxdem != kMxdemDefault) line.MayBreak().Fixed(", mxdem=", step.mxdem);
}

/// The data line; the rate of change that ends the step is absent at the value `none`.
template <class Step>
void WriteData(utl_Stream& stream, const Step& step, double none) {
    oif_WriteIncrements(stream, step);
    stream << (oif_IsAutomatic(step) ? ", " : ", ,");
    oif_WriteUnless(stream, step.end, none);
    stream << endl;
}

} // namespace

void oif_HeatTransfer::Write(utl_Stream& stream) const {
    const bool automatic = oif_IsAutomatic(step_);
    oif_KeywordLine line(stream, "*Heat Transfer");
    AddResponse(line, step_);
    if (automatic) line.MayBreak().Fixed(", deltmx=", step_.deltmx);
    AddMxdem(line, step_);
    line.End();
    if (automatic || !IsSteady(step_)) {
        WriteData(stream, step_, cls_UnsetDouble);
        return;
    }
    // Fixed increments in a steady state: the bounds are given too, and equal the increment.
    stream << step_.initialInc << ", " << step_.timePeriod << ", " << step_.initialInc << ", "
           << step_.initialInc << ", ";
    oif_WriteWhenSet(stream, step_.end);
    stream << endl;
}

void oif_CoupledThermalElectric::Write(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Coupled Thermal-Electrical");
    AddResponse(line, step_);
    if (oif_IsAutomatic(step_)) {
        line.MayBreak().Fixed(", deltmx=", step_.deltmx);
        // For automatic increments only, unlike *Heat Transfer.
        AddMxdem(line, step_);
    }
    line.End();
    WriteData(stream, step_, cls_UnsetDouble);
}

void oif_MassDiffusion::Write(utl_Stream& stream) const {
    // Here a rate of 0 is none, not the unset one.
    constexpr double none = 0.0;
    oif_KeywordLine line(stream, "*Mass Diffusion");
    if (IsSteady(step_)) {
        line.Fixed(", steady state");
    } else {
        AddEnd(line, step_.end, none);
        if (oif_IsAutomatic(step_)) line.MayBreak().Fixed(", dcmax=", step_.dcmax);
    }
    line.End();
    WriteData(stream, step_, none);
}

void oif_CoupledTempDisplacement::Write(utl_Stream& stream) const {
    using Creep = kprC_CoupledTempDisplacementStep::CreepEnm;
    oif_KeywordLine line(stream, "*Coupled Temperature-Displacement");
    line.FixedIf(step_.creep == Creep::NONE, v6Format_ ? ", creep=none" : ", no creep")
        .FixedIf(step_.creep == Creep::EXPLICIT, v6Format_ ? ", creep=explicit" : ", explicit");
    if (IsSteady(step_)) {
        line.MayBreak().Fixed(", steady state");
    } else if (oif_IsAutomatic(step_)) {
        if (step_.deltmx > 0.0) line.MayBreak().Fixed(", deltmx=", step_.deltmx);
        if (step_.creep != Creep::NONE && step_.cetol > 0.0) line.MayBreak().Fixed(", cetol=", step_.cetol);
    }
    oif_AddStabilization(line, step_);
    line.End();
    oif_WriteIncrements(stream, step_);
    stream << endl;
}
