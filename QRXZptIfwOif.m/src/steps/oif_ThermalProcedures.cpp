#include "steps/oif_ThermalProcedures.h"

namespace {

constexpr double kMxdemDefault = 0.1;
template <class Step>
bool IsSteady(const Step& step) {
    return step.response == Step::ResponseEnm::STEADY_STATE;
}

/// What ends a transient step: its period, or a rate of change, which is absent at the value `none`.
void WriteEnd(utl_Stream& stream, double rate, double none) {
    stream << (rate == none ? ", end=PERIOD" : ", end=SS");
}

template <class Step>
void WriteResponse(utl_Stream& stream, const Step& step) {
    if (IsSteady(step)) {
        stream.OptionalLineBreak();
        stream << ", steady state";
    } else {
        WriteEnd(stream, step.end, cls_UnsetDouble);
    }
}

void WriteReal(utl_Stream& stream, const char* parameter, double value) {
    stream.OptionalLineBreak();
    stream << parameter << value;
}

template <class Step>
void WriteMxdem(utl_Stream& stream, const Step& step) {
    if (step.mxdem != kMxdemDefault) WriteReal(stream, ", mxdem=", step.mxdem);
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
    stream << "*Heat Transfer";
    WriteResponse(stream, step_);
    if (automatic) WriteReal(stream, ", deltmx=", step_.deltmx);
    WriteMxdem(stream, step_);
    stream.LineBreak();
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
    stream << "*Coupled Thermal-Electrical";
    WriteResponse(stream, step_);
    if (oif_IsAutomatic(step_)) {
        WriteReal(stream, ", deltmx=", step_.deltmx);
        // For automatic increments only, unlike *Heat Transfer.
        WriteMxdem(stream, step_);
    }
    stream.LineBreak();
    WriteData(stream, step_, cls_UnsetDouble);
}

void oif_MassDiffusion::Write(utl_Stream& stream) const {
    // Here a rate of 0 is none, not the unset one.
    constexpr double none = 0.0;
    stream << "*Mass Diffusion";
    if (IsSteady(step_)) {
        stream << ", steady state";
    } else {
        WriteEnd(stream, step_.end, none);
        if (oif_IsAutomatic(step_)) WriteReal(stream, ", dcmax=", step_.dcmax);
    }
    stream.LineBreak();
    WriteData(stream, step_, none);
}

void oif_CoupledTempDisplacement::Write(utl_Stream& stream) const {
    using Creep = kprC_CoupledTempDisplacementStep::CreepEnm;
    stream << "*Coupled Temperature-Displacement";
    if (step_.creep == Creep::NONE) stream << (v6Format_ ? ", creep=none" : ", no creep");
    if (step_.creep == Creep::EXPLICIT) stream << (v6Format_ ? ", creep=explicit" : ", explicit");
    if (IsSteady(step_)) {
        stream.OptionalLineBreak();
        stream << ", steady state";
    } else if (oif_IsAutomatic(step_)) {
        if (step_.deltmx > 0.0) WriteReal(stream, ", deltmx=", step_.deltmx);
        if (step_.creep != Creep::NONE && step_.cetol > 0.0) WriteReal(stream, ", cetol=", step_.cetol);
    }
    oif_WriteStabilization(stream, step_);
    stream.LineBreak();
    oif_WriteIncrements(stream, step_);
    stream << endl;
}
