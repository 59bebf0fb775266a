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
void WriteExplicit(utl_Stream& stream, const Step& step, const char* failure) {
    const ExplicitIncrements kind = step.timeIncrementationMethod;
    const bool userControl = kind == ExplicitIncrements::DIRECT_USER_CONTROL;
    stream << IncrementsText(kind, failure);
    if (!userControl && step.scaleFactor != 1.0) stream << ", scale factor=" << step.scaleFactor;
    stream.LineBreak();
    if (userControl) stream << step.initialInc;
    stream << ", " << step.timePeriod;
    const bool bounded =
        kind == ExplicitIncrements::AUTOMATIC || kind == ExplicitIncrements::ELEMENT_BY_ELEMENT;
    if (bounded && step.maxIncrement != cls_UnsetDouble) stream << ",, " << step.maxIncrement;
    stream << endl;
}

/// Whether the step is of class R, whose bulk viscosity is then written.
template <class R>
bool WriteBulkViscosity(utl_Stream& stream, const kprC_AnalysisStep& step) {
    if (step.DynTypeId() != R::TypeId()) return false;
    const R& record = nex_canDynamicCastRef<R>(step, NEX_HERE);
    stream << "*Bulk Viscosity" << endl
           << record.linearBulkViscosity << ", " << record.quadraticBulkViscosity << endl;
    return true;
}

} // namespace

void oif_ImplicitDynamics::Write(utl_Stream& stream) const {
    // No blank behind any comma here.
    stream << "*Dynamic";
    if (step_.alpha != cls_UnsetDouble) stream << ",alpha=" << step_.alpha;
    if (step_.adiabatic) stream << ",adiabatic";
    if (step_.timeIncrementationMethod == kprC_Step::TimeIncrementationEnm::DIRECT) {
        stream << "," << oif_DirectText(step_);
        stream.OptionalLineBreak();
        if (step_.nohaf) stream << ",nohaf";
    } else {
        stream << ",haftol=" << step_.haftol;
    }
    stream.OptionalLineBreak();
    if (step_.initialConditions == kprC_ImplicitDynamicsStep::InitialConditionsEnm::NONE)
        stream << ",initial=NO";
    stream.LineBreak();
    stream << step_.initialInc << "," << step_.timePeriod << ",";
    if (oif_IsAutomatic(step_)) stream << step_.minInc << "," << step_.maxInc;
    stream << endl;
}

void oif_ExplicitDynamics::Write(utl_Stream& stream) const {
    stream << "*Dynamic, Explicit";
    if (step_.adiabatic) stream << ", adiabatic";
    WriteExplicit(stream, step_, "Corrupted Explicit Dynamics procedure");
}

void oif_DynamicTempDisplacement::Write(utl_Stream& stream) const {
    stream << "*Dynamic Temperature-displacement, Explicit";
    WriteExplicit(stream, step_, "Corrupted Dynamic, Temp-displacement procedure");
}

void oif_BulkViscosity::Write(utl_Stream& stream) const {
    if (WriteBulkViscosity<kprC_ExplicitDynamicsStep>(stream, *step_)) return;
    WriteBulkViscosity<kprC_TempDisplacementDynamicsStep>(stream, *step_);
}

void oif_SubspaceDynamics::Write(utl_Stream& stream) const {
    stream << "*Dynamic, subspace";
    if (step_.vectors > 0) stream << ", vectors=" << step_.vectors;
    stream << endl;
    // The line ends in a separator, behind which nothing ever stands.
    stream << step_.initialInc << ", " << step_.timePeriod << ", " << endl;
}
