#ifndef QRX_STORE_KPRC_STEPTIMES_H
#define QRX_STORE_KPRC_STEPTIMES_H

#include "store_interface/records/steps/kprC_Step.h"

/// A real field of a step; its name is null where the step's class has no such field.
struct kprC_TimeField {
    const char* name = nullptr;
    double value = 0.0;

    /// The field is there and has a value.
    bool IsSet() const { return name != nullptr && value != cls_UnsetDouble; }
};

/// How long a step lasts and in which increments, under the names that its class has for these. A step with
/// arc length control has arc lengths in their place.
struct kprC_StepTimes {
    explicit kprC_StepTimes(const kprC_Step& step);

    kprC_TimeField period;
    kprC_TimeField initial;
    kprC_TimeField least;
    kprC_TimeField most;
    /// The increments are chosen by the solver. True for classes that leave no choice.
    bool automatic = true;
};

#endif
