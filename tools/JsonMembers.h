#ifndef QRX_TOOLS_JSONMEMBERS_H
#define QRX_TOOLS_JSONMEMBERS_H

#include <nlohmann/json.hpp>

#include <string>
#include <utility>

/// Adds a member of a name that the object doesn't have yet. Unlike object[name], it doesn't look through all
/// members for it: an ordered object of many would take a time that grows with their square.
inline void AddMember(nlohmann::ordered_json& object, std::string name, nlohmann::ordered_json value) {
    using OrderedMembers = nlohmann::ordered_json::object_t;
    static_cast<OrderedMembers::Container&>(object.get_ref<OrderedMembers&>())
        .emplace_back(std::move(name), std::move(value));
}

#endif
