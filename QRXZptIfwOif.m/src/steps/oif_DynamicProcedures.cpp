#include "steps/oif_DynamicProcedures.h"

namespace {

using ExplicitIncrements = kprC_ExplicitDynamicsStep::TimeIncrementationEnm;

/// The parameter for the kind of increments; raises `failure` for a kind that there isn't.
const char* IncrementsText(ExplicitIncrements kind, const char* failure) {
    switch (kind) {
    case ExplicitIncrements::AUTOMATIC: return "";
    case ExplicitIncrements::DIRECT_USER_CONTROL: return ", direct user control";
    case ExplicitIncrements::ELEMENT_BY_ELEMENT: return ", element by element";
    case ExplicitIncrements::FIXED: return ", fixed time incrementation";
    }
    nex_Raise(failure);
}

/// What follows the name and the own parameters of an explicit procedure.
template <class Step>
void WriteExplicit(utl_Stream& stream, oif_KeywordLine& line, const Step& step, const char* failure) {
    const ExplicitIncrements kind = step.timeIncrementationMethod;
    const bool userControl = kind == ExplicitIncrements::DIRECT_USER_CONTROL;
    line.Fixed(IncrementsText(kind, failure))
        .FixedIf(!userControl && step.scaleFactor != 1.0, ", scale factor=", step.scaleFactor)
        .End();
    if (userControl) stream << step.initialInc;
    stream << ", " << step.timePeriod;
    const bool bounded =
        kind == ExplicitIncrements::AUTOMATIC || kind == ExplicitIncrements::ELEMENT_BY_ELEMENT;
    if (bounded && step.maxIncrement != cls_UnsetDouble) stream << ",, " << step.maxIncrement;
    stream << endl;
}

} // namespace

void oif_ImplicitDynamics::Write(utl_Stream& stream) const {
    // No blank behind any comma here.
    oif_KeywordLine line(stream, "*Dynamic");
    line.FixedUnless(",alpha=", step_.alpha, cls_UnsetDouble).FixedIf(step_.adiabatic, ",adiabatic");
    if (step_.timeIncrementationMethod == kprC_Step::TimeIncrementationEnm::DIRECT) {
        line.Fixed(",", oif_DirectText(step_)).MayBreak().FixedIf(step_.nohaf, ",nohaf");
    } else {
        line.Fixed(",haftol=", step_.haftol);
    }
    line.MayBreak()
        .FixedIf(step_.initialConditions == kprC_ImplicitDynamicsStep::InitialConditionsEnm::NONE,
                 ",initial=NO")
        .End();
    stream << step_.initialInc << "," << step_.timePeriod << ",";
    if (oif_IsAutomatic(step_)) stream << step_.minInc << "," << step_.maxInc;
    stream << endl;
}

void oif_ExplicitDynamics::Write(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Dynamic, Explicit");
    line.FixedIf(step_.adiabatic, ", adiabatic");
    WriteExplicit(stream, line, step_, "Corrupted Explicit Dynamics procedure");
}

void oif_DynamicTempDisplacement::Write(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Dynamic Temperature-displacement, Explicit");
    WriteExplicit(stream, line, step_, "Corrupted Dynamic, Temp-displacement procedure");
}

void oif_BulkViscosity::Write(utl_Stream& stream) const {
    if (!values_) return;
    oif_KeywordLine(stream, "*Bulk Viscosity").End();
    stream << values_->first << ", " << values_->second << endl;
}

void oif_SubspaceDynamics::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Dynamic, subspace")
        .FixedIf(step_.vectors > 0, ", vectors=", step_.vectors)
        .End();
    // The line ends in a separator, behind which nothing ever stands.
    stream << step_.initialInc << ", " << step_.timePeriod << ", " << endl;
}
