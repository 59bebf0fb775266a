#include "sections/oif_ElementControls.h"

#include <cmath>
#include <initializer_list>

namespace {

using Params = bme_ElemCtrlParams;

bool Differ(double a, double b) {
    return std::fabs(a - b) > 1e-6;
}

/// The parameter, if the value is one of those that have one.
template <class E>
void WriteWord(utl_Stream& stream, const char* name, E value, std::initializer_list<E> written) {
    for (const E one : written) {
        if (one == value) stream << name << omu_PrimEnum<E, 1>(value).GetString();
    }
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
    stream << "*Section Controls, name=" << name_;
    WriteWord(stream, ", DISTORTION CONTROL=", params_.distortionControl, {Distortion::YES, Distortion::NO});
    if (params_.distortionControl == Distortion::YES && Differ(params_.lengthRatio, defaults.lengthRatio)) {
        stream << ", length ratio=" << params_.lengthRatio;
    }
    WriteWord(stream, ", kinematic split=", params_.kinematicSplit, {Split::ORTHOGONAL, Split::CENTROID});
    WriteWord(stream, ", hourglass=", params_.hourglass,
              {Hourglass::RELAX_STIFFNESS, Hourglass::STIFFNESS, Hourglass::VISCOUS, Hourglass::COMBINED,
               Hourglass::ENHANCED});
    WriteWord(stream, ", second order accuracy=", params_.secondOrderAccuracy,
              {Params::SecondOrderAccuracyEnm::YES});
    WriteWord(stream, ", stress rate=", params_.stressRate, {Params::StressRateEnm::SPIN});
    if (params_.hourglass == Hourglass::COMBINED && Differ(params_.weightFactor, defaults.weightFactor)) {
        stream << ", weight factor=" << params_.weightFactor;
    }
    stream << endl
           << params_.displacementHourglass << ", " << params_.rotationalHourglass << ", "
           << params_.outOfPlaneHourglass;
    if (Differ(params_.linearBulkViscosity, defaults.linearBulkViscosity) ||
        Differ(params_.quadraticBulkViscosity, defaults.quadraticBulkViscosity)) {
        stream << ", " << params_.linearBulkViscosity << ", " << params_.quadraticBulkViscosity;
    }
    stream << endl;
}
