#ifndef QRX_OIF_REGION_H
#define QRX_OIF_REGION_H

#include "keyword_layer/qkw_ModelInfo.h"

/// The names behind a region; empty for one that is not found.
class oif_Region {
public:
    oif_Region(const qkw_Model& model, const rgnC_Region& region);
    const cow_String& SetName() const { return setName_; }
    const cow_String& InstanceName() const { return instanceName_; }
    /// "INSTANCE.SET", or "SET" without an instance.
    cow_String FullName() const;

private:
    cow_String setName_;
    cow_String instanceName_;
};

#endif
