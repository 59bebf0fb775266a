#ifndef QRX_FOUNDATION_OMI_COMPLEX_H
#define QRX_FOUNDATION_OMI_COMPLEX_H

#include "foundation/omu_PrimEnum.h"

/// A complex number of a harmonic load, by its parts or by magnitude and phase.
struct omi_complex {
    enum class FormEnm : int { RECTANGULAR = 0, POLAR = 1 };

    FormEnm form = FormEnm::RECTANGULAR;
    double real = 0.0; ///< real part, or magnitude
    double imag = 0.0; ///< imaginary part, or phase in degrees

    /// The parts in either form. A phase that is a multiple of 90 degrees gives exact zeros.
    double ConvertedReal() const;
    double ConvertedImag() const;

    friend bool operator==(const omi_complex&, const omi_complex&) = default;
};
const omu_EnumTable& omu_EnumTableOf(omi_complex::FormEnm);

#endif
