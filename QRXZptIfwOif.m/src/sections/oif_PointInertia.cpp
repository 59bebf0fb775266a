#include "sections/oif_PointInertia.h"

#include "base/oif_KeywordLine.h"

namespace {

oif_KeywordLine Head(utl_Stream& stream, const char* keyword, const cow_String& setName, double alpha,
                     double composite) {
    oif_KeywordLine line(stream, keyword);
    line.Fixed(", elset=", setName);
    if (alpha != 0.0) line.MayBreak().Fixed(", alpha=", alpha);
    if (composite != 0.0) line.MayBreak().Fixed(", composite=", composite);
    return line;
}

} // namespace

void oif_Mass::Write(utl_Stream& stream) const {
    if (IsEmpty()) return;
    Head(stream, "*Mass", setName_, alpha_, composite_).End();
    stream << mass_ << ", " << endl;
}

bool oif_RotaryI::IsEmpty() const {
    return inertia_.i11 == 0.0 && inertia_.i12 == 0.0 && inertia_.i13 == 0.0 && inertia_.i22 == 0.0 &&
           inertia_.i23 == 0.0 && inertia_.i33 == 0.0;
}

void oif_RotaryI::Write(utl_Stream& stream) const {
    if (IsEmpty()) return;
    oif_KeywordLine line =
        Head(stream, "*RotaryI", setName_, inertia_.rotaryAlphaDamping, inertia_.rotaryCompositeDamping);
    if (!orientationName_.IsEmpty()) line.MayBreak().Fixed(", orientation=", orientationName_);
    line.End();
    stream << inertia_.i11 << ", " << inertia_.i22 << ", " << inertia_.i33 << ", " << inertia_.i12 << ", "
           << inertia_.i13 << ", " << inertia_.i23 << endl;
}
