#ifndef QRX_KEYWORD_QKW_BYNAME_H
#define QRX_KEYWORD_QKW_BYNAME_H

#include "foundation/cow_COW.h"
#include "foundation/cow_String.h"

#include <functional>
#include <string_view>
#include <unordered_map>

/// Values under names that have no order: what is filed for each of many steps or instances. Copies share
/// all of them until one is written to.
template <class V>
class qkw_ByName {
public:
    /// The value for writing, a default one at the name's first use.
    V& GetOrInsert(const cow_String& name) {
        if (table_.IsNull()) table_.Reset(new Table());
        return table_.Get()[name];
    }
    /// Null for an absent name.
    const V* Find(const cow_String& name) const {
        if (table_.IsNull()) return nullptr;
        const auto place = table_.ConstGet().find(name);
        return place == table_.ConstGet().end() ? nullptr : &place->second;
    }

private:
    struct Hash {
        std::size_t operator()(const cow_String& name) const {
            return std::hash<std::string_view>()(name.View());
        }
    };
    using Table = std::unordered_map<cow_String, V, Hash>;

    cow_COW<Table, cow_Direct<Table>> table_;
};

#endif
