#include "sections/oif_Orientation.h"

#include "keyword_layer/qkw_QuorixName.h"

void oif_Transform::Write(utl_Stream& stream) const {
    csys_.Write(stream, cow_String("*Transform, nset=") + qkw_QuorixName(nset_, false).Printable(), true);
}

void oif_Orientation::Write(utl_Stream& stream) const {
    const cow_String head = cow_String("*Orientation, name=") + name_;
    if (csys_.IsNull()) {
        stream << head << ", system=user" << endl;
        return;
    }
    if (!csys_.ConstGet().Write(stream, head, false) || !withRotation_) return;
    // An angle of 0 has its line too.
    switch (axis_) {
    case ptoC_MaterialOrientation::axisEnm::AXIS_1: stream << "1, "; break;
    case ptoC_MaterialOrientation::axisEnm::AXIS_2: stream << "2, "; break;
    case ptoC_MaterialOrientation::axisEnm::AXIS_3: stream << "3, "; break;
    }
    stream << angle_ << endl;
}
