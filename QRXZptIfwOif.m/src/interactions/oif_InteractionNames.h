#ifndef QRX_OIF_INTERACTIONNAMES_H
#define QRX_OIF_INTERACTIONNAMES_H

#include "keyword_layer/qkw_QuorixName.h"
#include "mesh/oif_SetName.h"

// Names as the keywords of interactions write them.

inline cow_String oif_SurfaceName(const rgnC_Region& region, const qkw_ModelInfo& modelInfo) {
    return oif_SetName(region, modelInfo).UniqueSurfaceName(oif_SetName::regionContext::ASSEMBLY);
}
inline cow_String oif_RegionName(const rgnC_Region& region, const qkw_ModelInfo& modelInfo) {
    return oif_SetName(region, modelInfo).UniqueSetName(oif_SetName::regionContext::ASSEMBLY);
}
inline qkw_QuorixName oif_Name(const cow_String& name) {
    return {name, false};
}

#endif
