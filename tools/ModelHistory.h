#ifndef QRX_TOOLS_MODELHISTORY_H
#define QRX_TOOLS_MODELHISTORY_H

#include "store_interface/model/odb_Odb.h"

#include <nlohmann/json.hpp>

#include <string>

/// What every object that lives across steps is in each step, kind by kind: its status and, for boundary
/// conditions, loads and fields, whether the step writes it and whether with op=NEW. A kind whose keywords
/// can't be told apart has the writer's failure in their place.
nlohmann::ordered_json DescribeHistory(const odb_Odb& odb, const cow_String& modelName);
/// The same for people to read, as a table for each kind.
std::string TextOfHistory(const nlohmann::ordered_json& history);

#endif
