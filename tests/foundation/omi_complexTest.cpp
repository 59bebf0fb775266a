#include "foundation/omi_complex.h"

#include <gtest/gtest.h>

namespace {

omi_complex Polar(double magnitude, double phase) {
    return {omi_complex::FormEnm::POLAR, magnitude, phase};
}

} // namespace

TEST(Complex, PartsInTheirOwnForm_StayAsTheyAre) {
    const omi_complex value{omi_complex::FormEnm::RECTANGULAR, 3.0, 90.0};
    EXPECT_EQ(value.ConvertedReal(), 3.0);
    EXPECT_EQ(value.ConvertedImag(), 90.0);
    EXPECT_EQ(omi_complex(), (omi_complex{omi_complex::FormEnm::RECTANGULAR, 0.0, 0.0}));
}

TEST(Complex, MultiplesOfARightAngle_GiveExactZeros) {
    const struct {
        double phase, real, imag;
    } cases[] = {{0, 2, 0},    {90, 0, 2},    {180, -2, 0}, {270, 0, -2}, {360, 2, 0},   {450, 0, 2},
                 {-90, 0, -2}, {-180, -2, 0}, {-270, 0, 2}, {-360, 2, 0}, {-450, 0, -2}, {3690, 0, 2}};
    for (const auto& c : cases) {
        EXPECT_EQ(Polar(2, c.phase).ConvertedReal(), c.real) << c.phase;
        EXPECT_EQ(Polar(2, c.phase).ConvertedImag(), c.imag) << c.phase;
    }
}

TEST(Complex, OtherPhases_AreTurnedIntoParts) {
    EXPECT_NEAR(Polar(2, 60).ConvertedReal(), 1.0, 1e-15);
    EXPECT_NEAR(Polar(2, 60).ConvertedImag(), 1.7320508075688772, 1e-15);
    EXPECT_NEAR(Polar(2, -30).ConvertedImag(), -1.0, 1e-15);
    EXPECT_NEAR(Polar(2, 390).ConvertedImag(), 1.0, 1e-14);
}
