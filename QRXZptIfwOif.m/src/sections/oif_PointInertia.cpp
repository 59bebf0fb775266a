#include "sections/oif_PointInertia.h"

namespace {

void WriteParameter(utl_Stream& stream, const char* name, double value) {
    if (value == 0.0) return;
    stream.OptionalLineBreak();
    stream << name << value;
}

void WriteHead(utl_Stream& stream, const char* keyword, const cow_String& setName, double alpha,
               double composite) {
    stream << keyword << ", elset=" << setName;
    WriteParameter(stream, ", alpha=", alpha);
    WriteParameter(stream, ", composite=", composite);
}

} // namespace

void oif_Mass::Write(utl_Stream& stream) const {
    if (IsEmpty()) return;
    WriteHead(stream, "*Mass", setName_, alpha_, composite_);
    stream.LineBreak();
    stream << mass_ << ", " << endl;
}

bool oif_RotaryI::IsEmpty() const {
    return inertia_.i11 == 0.0 && inertia_.i12 == 0.0 && inertia_.i13 == 0.0 && inertia_.i22 == 0.0 &&
           inertia_.i23 == 0.0 && inertia_.i33 == 0.0;
}

void oif_RotaryI::Write(utl_Stream& stream) const {
    if (IsEmpty()) return;
    WriteHead(stream, "*RotaryI", setName_, inertia_.rotaryAlphaDamping, inertia_.rotaryCompositeDamping);
    if (!orientationName_.IsEmpty()) {
        stream.OptionalLineBreak();
        stream << ", orientation=" << orientationName_;
    }
    stream.LineBreak();
    stream << inertia_.i11 << ", " << inertia_.i22 << ", " << inertia_.i33 << ", " << inertia_.i12 << ", "
           << inertia_.i13 << ", " << inertia_.i23 << endl;
}
