#include "store_interface/records/steps/kprC_StepTimes.h"

namespace {

kprC_TimeField FieldOf(const kprC_Step& step, std::initializer_list<const char*> names) {
    for (const char* name : names) {
        const cls_Field* field = step.DynFields().Find(name);
        if (field == nullptr || field->type->Kind() != cls_FieldKind::Double) continue;
        return {field->name, *static_cast<const double*>(field->In(step))};
    }
    return {};
}

} // namespace

kprC_StepTimes::kprC_StepTimes(const kprC_Step& step)
    : period(FieldOf(step, {"timePeriod", "totalArc"})),
      initial(FieldOf(step, {"initialInc", "initialArcInc", "timeIncrement"})),
      least(FieldOf(step, {"minInc", "minArcInc"})),
      most(FieldOf(step, {"maxInc", "maxArcInc", "maxIncrement"})) {
    const cls_Field* method = step.DynFields().Find("timeIncrementationMethod");
    if (method == nullptr || method->type->Kind() != cls_FieldKind::Enum) return;
    // Every enumeration of the methods begins with the automatic one.
    automatic = static_cast<const cls_EnumType&>(*method->type).Get(method->In(step)) == 0;
}
