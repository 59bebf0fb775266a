#ifndef QRX_STORE_MDL_STATUSWORDS_H
#define QRX_STORE_MDL_STATUSWORDS_H

#include <string>
#include <string_view>

/// The name of a propagation status for people to read: "BUILT_INTO_BASE_STATE" as "built into base state".
std::string mdl_StatusWords(std::string_view statusName);

#endif
