#include "sections/oif_UserElement.h"

#include "base/oif_DataLines.h"
#include "base/oif_KeywordLine.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <limits>

void oif_UserElement::Write(utl_Stream& stream) const {
    const auto* sensor = nex_canDynamicCastPtr<kinC_ActuatorSensor>(interaction_.Referent());
    if (sensor == nullptr) return;
    oif_KeywordLine(stream, "*User Element")
        .Fixed(", type=", sensor->elementType)
        .Fixed(", nodes=1")
        .FixedUnless(", coordinates=", sensor->coordinates, 0)
        .Fixed(", properties=", realProperties_)
        .MayBreak()
        .Fixed(", i properties=", intProperties_)
        .FixedIf(sensor->unsymm, ", unsymm")
        .Fixed(", variables=", sensor->variables)
        .End();
    stream << sensor->nodeSetText << endl;
}

void oif_UelProperty::Write(utl_Stream& stream) const {
    const auto* property = nex_canDynamicCastPtr<kinC_ActuatorSensorProp>(property_.Referent());
    if (property == nullptr) return;
    stream << "*Uel Property" << parameters_ << endl;
    // All on one line, however many.
    oif_DataLines line(stream, std::numeric_limits<int>::max());
    for (int i = 0; i < property->realProperties.Length(); ++i) line.Add(property->realProperties[i]);
    for (int i = 0; i < property->intProperties.Length(); ++i) line.Add(property->intProperties[i]);
    line.End();
}
