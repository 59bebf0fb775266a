#include "materials/oif_SpecialOptions.h"

oif_MaterialTable oif_PlainTable(const kmaC_MaterialTable& values) {
    return oif_MaterialTable(values, 0, false);
}
