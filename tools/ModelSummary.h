#ifndef QRX_TOOLS_MODELSUMMARY_H
#define QRX_TOOLS_MODELSUMMARY_H

#include "store_interface/model/odb_Odb.h"

#include <nlohmann/json.hpp>

#include <string>
#include <vector>

/// How many objects of a kind a model has for its deck.
struct KindCount {
    const char* key;  ///< for JSON
    const char* name; ///< for people
    long long count;
};

/// The counts of what goes into the deck, kinds without an object left out. Nodes, elements and sets count
/// once in every instance that shows them; suppressed objects don't count.
std::vector<KindCount> CountsOfDeck(const odiK_Model& model);

/// Objects of one kind that no deck tells.
struct LeftOut {
    const char* what;
    const char* why;
    long long count = 0;
    /// Empty for objects without a name.
    std::vector<std::string> names;
};

/// What the store holds and its deck leaves out.
std::vector<LeftOut> LeftOutOf(const odb_Odb& odb, const odiK_Model& model);

/// What is in a model, member by member.
nlohmann::ordered_json DescribeModel(const odiK_Model& model);
/// The same for people to read.
std::string TextOfDescription(const std::string& modelName, const nlohmann::ordered_json& description);

#endif
