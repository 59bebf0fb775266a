#ifndef QRX_TOOLS_VARIABLELIST_H
#define QRX_TOOLS_VARIABLELIST_H

#include <nlohmann/json.hpp>

#include <optional>
#include <string>

/// The number of a procedure by any name of the class of its step, such as "StaticStep" or "Static", in any
/// capitals; none if there is no such procedure.
std::optional<unsigned> FindStepType(const std::string& name);
/// The names of all procedures, as FindStepType takes them.
std::string StepTypeNames();

/// The catalogue of output variables, or of those that one procedure knows.
nlohmann::ordered_json DescribeVariables(std::optional<unsigned> stepType);
/// The same for people to read.
std::string TextOfVariables(const nlohmann::ordered_json& variables, std::optional<unsigned> stepType);

#endif
