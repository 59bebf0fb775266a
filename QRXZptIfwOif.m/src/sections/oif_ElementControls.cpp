#include "sections/oif_ElementControls.h"

#include "base/oif_KeywordLine.h"

#include <cmath>
#include <initializer_list>

namespace {

using Params = bme_ElemCtrlParams;

bool Differ(double a, double b) {
    return std::fabs(a - b) > 1e-6;
}

/// The parameter, if the value is one of those that have one.
template <class E>
void AddWord(oif_KeywordLine& line, const char* name, E value, std::initializer_list<E> written) {
    for (const E one : written) line.FixedIf(one == value, name, value);
}

} // namespace

void oif_HourglassStiffness::Write(utl_Stream& stream) const {
    const double membrane = params_.hourglassStiffness;
    const double bending = params_.bendingHourglassStiffness;
    const double drilling = params_.drillingHourglassScaling;
    if (membrane == 0.0 && bending == 0.0 && drilling == 0.0) return;
    stream << "*Hourglass Stiffness" << endl << membrane << ", , " << bending << ", " << drilling << endl;
}

bool oif_SectionControls::IsEmpty() const {
    return params_.HasDefaultSectionControls(isStandard_ ? bme_ElemLibrary::STANDARD
                                                         : bme_ElemLibrary::EXPLICIT);
}

void oif_SectionControls::Write(utl_Stream& stream) const {
    if (IsEmpty()) return;
    using Distortion = Params::DistortionControlEnm;
    using Split = Params::KinematicSplitEnm;
    using Hourglass = Params::HourglassEnm;
    const Params defaults;
    oif_KeywordLine line(stream, "*Section Controls, name=");
    line.Text(name_);
    AddWord(line, ", DISTORTION CONTROL=", params_.distortionControl, {Distortion::YES, Distortion::NO});
    line.FixedIf(params_.distortionControl == Distortion::YES &&
                     Differ(params_.lengthRatio, defaults.lengthRatio),
                 ", length ratio=", params_.lengthRatio);
    AddWord(line, ", kinematic split=", params_.kinematicSplit, {Split::ORTHOGONAL, Split::CENTROID});
    AddWord(line, ", hourglass=", params_.hourglass,
            {Hourglass::RELAX_STIFFNESS, Hourglass::STIFFNESS, Hourglass::VISCOUS, Hourglass::COMBINED,
             Hourglass::ENHANCED});
    AddWord(line, ", second order accuracy=", params_.secondOrderAccuracy,
            {Params::SecondOrderAccuracyEnm::YES});
    AddWord(line, ", stress rate=", params_.stressRate, {Params::StressRateEnm::SPIN});
    line.FixedIf(params_.hourglass == Hourglass::COMBINED &&
                     Differ(params_.weightFactor, defaults.weightFactor),
                 ", weight factor=", params_.weightFactor);
    stream << endl
           << params_.displacementHourglass << ", " << params_.rotationalHourglass << ", "
           << params_.outOfPlaneHourglass;
    if (Differ(params_.linearBulkViscosity, defaults.linearBulkViscosity) ||
        Differ(params_.quadraticBulkViscosity, defaults.quadraticBulkViscosity)) {
        stream << ", " << params_.linearBulkViscosity << ", " << params_.quadraticBulkViscosity;
    }
    stream << endl;
}
