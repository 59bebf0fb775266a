#ifndef QRX_STORE_KAMC_AMPLITUDE_H
#define QRX_STORE_KAMC_AMPLITUDE_H

#include "store_interface/records/cls_FieldTable.h"

class cls_ClassRegistrar;

/// How a quantity varies in time or over frequency; held by name.
class kamC_Amplitude : public cls_AbstractRecordOf<kamC_Amplitude> {
public:
    static constexpr cls_ClassInfo Class{"kamC_Amplitude", "how a quantity varies in time or over frequency"};
};

void cls_RegisterAmplitudeRecords(cls_ClassRegistrar& registrar);

#endif
