#ifndef QRX_DCK_LEFTOUT_H
#define QRX_DCK_LEFTOUT_H

#include "store_interface/model/odb_Odb.h"

#include <string>
#include <vector>

/// Objects of one kind that no deck tells.
struct dck_LeftOut {
    const char* what;
    const char* why;
    long long count = 0;
    /// Empty for objects without a name.
    std::vector<std::string> names;
};

/// What the store holds and its deck leaves out.
std::vector<dck_LeftOut> dck_LeftOutOf(const odb_Odb& odb, const odiK_Model& model);

#endif
