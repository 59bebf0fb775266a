#ifndef QRX_STORE_CLS_LISTS_H
#define QRX_STORE_CLS_LISTS_H

#include "foundation/cow_List.h"
#include "foundation/cow_String.h"

// The lists that records hold.
using cls_xpListInt = cow_List<int>;
using cls_xpListString = cow_List<cow_String>;

#endif
