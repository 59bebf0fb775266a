#include "foundation/omi_complex.h"

#include <cmath>

namespace {

constexpr double kPi = 3.14159265358979323846;

} // namespace

const omu_EnumTable& omu_EnumTableOf(omi_complex::FormEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "RECTANGULAR", "RECTANGULAR"}, {1, "POLAR", "POLAR"}};
    static constexpr omu_EnumTable table{"omi_complex::FormEnm", rows};
    return table;
}

double omi_complex::ConvertedReal() const {
    if (form == FormEnm::RECTANGULAR) return real;
    const double phase = std::fmod(imag, 360.0);
    // Keywords compare the parts with exactly 0, which a cosine seldom is.
    if (phase == 0.0) return real;
    if (std::fabs(phase) == 90.0 || std::fabs(phase) == 270.0) return 0.0;
    if (std::fabs(phase) == 180.0) return -real;
    return real * std::cos(phase * kPi / 180.0);
}

double omi_complex::ConvertedImag() const {
    if (form == FormEnm::RECTANGULAR) return imag;
    const double phase = std::fmod(imag, 360.0);
    if (phase == 0.0 || std::fabs(phase) == 180.0) return 0.0;
    if (phase == 90.0 || phase == -270.0) return real;
    if (phase == 270.0 || phase == -90.0) return -real;
    return real * std::sin(phase * kPi / 180.0);
}
