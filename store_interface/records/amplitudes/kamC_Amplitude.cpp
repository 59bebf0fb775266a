#include "store_interface/records/amplitudes/kamC_Amplitude.h"

#include "store_interface/records/cls_ClassRegistrar.h"

void cls_RegisterAmplitudeRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kamC_Amplitude>();
}
