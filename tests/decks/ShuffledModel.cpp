#include "decks/ShuffledModel.h"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <random>
#include <vector>

using Json = nlohmann::ordered_json;

namespace {

Json Shuffled(const Json& json, std::mt19937& random) {
    if (json.is_array()) {
        Json items = Json::array();
        for (const Json& item : json) items.push_back(Shuffled(item, random));
        return items;
    }
    if (!json.is_object()) return json;
    std::vector<std::string> names;
    for (const auto& member : json.items()) names.push_back(member.key());
    std::shuffle(names.begin(), names.end(), random);
    Json members = Json::object();
    for (const std::string& name : names) members[name] = Shuffled(json.at(name), random);
    return members;
}

} // namespace

std::string ShuffledModel(std::string_view modelText, unsigned seed) {
    std::mt19937 random(seed);
    return Shuffled(Json::parse(modelText, nullptr, true, true), random).dump(2);
}
