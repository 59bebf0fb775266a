#ifndef QRX_TOOLS_MODELDESCRIPTION_H
#define QRX_TOOLS_MODELDESCRIPTION_H

#include "store_interface/model/odiK_Model.h"

#include <nlohmann/json.hpp>

#include <string>

/// What is in a model, member by member.
nlohmann::ordered_json DescribeModel(const odiK_Model& model);
/// The same for people to read.
std::string TextOfDescription(const std::string& modelName, const nlohmann::ordered_json& description);

#endif
