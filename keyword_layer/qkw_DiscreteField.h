#ifndef QRX_KEYWORD_QKW_DISCRETEFIELD_H
#define QRX_KEYWORD_QKW_DISCRETEFIELD_H

#include "foundation/cow_List.h"
#include "foundation/cow_String.h"

/// A field given label by label.
class qkw_DiscreteField {
public:
    cow_String name;
    cow_String description;
    cow_List<cow_String> instanceNames;
    int location = 0;
    int dataWidth = 0;
    cow_List<int> labels;

    /// Looks at location, name and labels only: these tell fields apart.
    friend bool operator==(const qkw_DiscreteField& a, const qkw_DiscreteField& b) {
        return &a == &b || (a.location == b.location && a.name == b.name && a.labels == b.labels);
    }
};

#endif
