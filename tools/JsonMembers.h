#ifndef QRX_TOOLS_JSONMEMBERS_H
#define QRX_TOOLS_JSONMEMBERS_H

#include <nlohmann/json.hpp>

#include <algorithm>
#include <cstddef>
#include <string>
#include <utility>

/// Adds a member of a name that the object doesn't have yet. Unlike object[name], it doesn't look through all
/// members for it: an ordered object of many would take a time that grows with their square.
inline void AddMember(nlohmann::ordered_json& object, std::string name, nlohmann::ordered_json value) {
    using Object = nlohmann::ordered_json::object_t;
    auto& members = static_cast<Object::Container&>(object.get_ref<Object&>());
    if (members.size() == members.capacity()) {
        // Left to itself it would copy the values, since the names beside them are constant.
        Object::Container more;
        more.reserve(std::max<std::size_t>(4, 2 * members.size()));
        for (auto& [known, kept] : members) more.emplace_back(known, std::move(kept));
        members.swap(more);
    }
    members.emplace_back(std::move(name), std::move(value));
}

#endif
