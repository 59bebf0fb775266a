#include "foundation/cow_Map.h"

#include "foundation/nex_Exception.h"
#include "tests/properties/Bytes.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <array>
#include <map>
#include <string>
#include <vector>

namespace {

/// A naive model of the tree: each key stands under the letters of its path from the root, "L" and "R". The
/// order of these texts is the pre-order: a node before what lies below it, and left before right.
class PathModel {
public:
    void Insert(const std::string& key) {
        std::string path;
        while (keys_.count(path) != 0 && keys_[path] != key) path += Turn(key, path.size());
        keys_[path] = key;
    }
    std::vector<std::string> Walk() const {
        std::vector<std::string> walk;
        for (const auto& [path, key] : keys_) walk.push_back(key);
        return walk;
    }

private:
    static char Turn(const std::string& key, std::size_t depth) {
        // Even depths read the key (with its final zero) from the head, odd ones from the tail.
        if (depth > key.size()) return 'L';
        const std::string withZero = key + '\0';
        const char byte =
            depth % 2 == 0 ? withZero[depth / 2] : *(key.rbegin() + static_cast<long>(depth / 2));
        return byte % 2 == 0 ? 'L' : 'R';
    }

    std::map<std::string, std::string> keys_;
};

using Map = cow_Map<cow_String, int>;

std::vector<std::string> Walk(const Map& map) {
    std::vector<std::string> walk;
    for (cow_ConstMapIterator<cow_String, int> iter(map); !iter.IsDone(); iter.Next()) {
        walk.emplace_back(iter.CurrentKey().View());
    }
    return walk;
}

void CheckSame(const Map& map, const std::map<std::string, int>& model) {
    RC_ASSERT(map.Count() == static_cast<int>(model.size()));
    std::map<std::string, int> walked;
    for (cow_ConstMapIterator<cow_String, int> iter(map); !iter.IsDone(); iter.Next()) {
        RC_ASSERT(walked.emplace(iter.CurrentKey().View(), iter.CurrentValue()).second);
    }
    RC_ASSERT(walked == model);
    for (const auto& [key, value] : model) {
        const int* found = map.Find(cow_String(key));
        RC_ASSERT(found != nullptr);
        RC_ASSERT(*found == value);
        RC_ASSERT(map.ConstGet(cow_String(key)) == value);
    }
}

// Three maps that are copied and changed beside each other, beside three std::maps.
RC_GTEST_PROP(cow_Map, RandomOperations_MatchStdMap, ()) {
    constexpr std::size_t kMaps = 3;
    std::array<Map, kMaps> maps;
    std::array<std::map<std::string, int>, kMaps> models;
    const int steps = *rc::gen::inRange(0, 100);
    for (int step = 0; step < steps; ++step) {
        const auto a = *rc::gen::inRange<std::size_t>(0, kMaps);
        const auto b = *rc::gen::inRange<std::size_t>(0, kMaps);
        const std::string key = *ShortText();
        const cow_String mapKey(key);
        switch (*rc::gen::inRange(0, 8)) {
        case 0:
        case 1:
        case 2:
            RC_ASSERT(maps[a].Insert(mapKey, step));
            models[a][key] = step;
            break;
        case 3:
            maps[a] = maps[b];
            models[a] = std::map<std::string, int>(models[b]);
            break;
        case 4: RC_ASSERT(maps[a].Remove(mapKey) == (models[a].erase(key) == 1)); break;
        case 5: {
            if (models[a].empty()) break;
            const auto& present = *rc::gen::elementOf(models[a]);
            const std::string gone = present.first;
            RC_ASSERT(maps[a].Remove(cow_String(gone)));
            models[a].erase(gone);
            break;
        }
        case 6:
            if (models[a].count(key) == 0) {
                RC_ASSERT_THROWS_AS(maps[a].Get(mapKey), QRXBasException);
                RC_ASSERT_THROWS_AS(maps[a].ConstGet(mapKey), QRXBasException);
            } else {
                maps[a].Get(mapKey) += 1000;
                models[a][key] += 1000;
            }
            break;
        default:
            maps[a].GetOrInsert(mapKey) += 1;
            models[a][key] += 1;
            break;
        }
        RC_ASSERT(maps[a].IsMember(mapKey) == (models[a].count(key) == 1));
        for (std::size_t i = 0; i < kMaps; ++i) CheckSame(maps[i], models[i]);
    }
}

RC_GTEST_PROP(cow_Map, AnyInsertions_AreWalkedInPreOrderOfTheirPaths, ()) {
    Map map;
    PathModel model;
    const auto keys = *rc::gen::container<std::vector<std::string>>(ShortText());
    for (const std::string& key : keys) {
        map.Insert(cow_String(key), 0);
        model.Insert(key);
    }
    RC_ASSERT(Walk(map) == model.Walk());
    if (!keys.empty()) RC_ASSERT(Walk(map).front() == keys.front());
}

RC_GTEST_PROP(cow_Map, NumberedNames_AreWalkedInPreOrderOfTheirPaths, ()) {
    Map map;
    PathModel model;
    const auto numbers = *rc::gen::container<std::vector<int>>(rc::gen::inRange(0, 2000));
    for (const int number : numbers) {
        const std::string key = "Set-" + std::to_string(number);
        map.Insert(cow_String(key), number);
        model.Insert(key);
    }
    RC_ASSERT(Walk(map) == model.Walk());
}

RC_GTEST_PROP(cow_Map, RandomOperationsWithIntegerKeys_MatchStdMap, ()) {
    cow_Map<int, int> map;
    std::map<int, int> model;
    const auto keys = *rc::gen::container<std::vector<int>>(
        rc::gen::oneOf(rc::gen::inRange(-50, 50), rc::gen::arbitrary<int>()));
    for (const int key : keys) {
        if (*rc::gen::inRange(0, 4) == 0) {
            RC_ASSERT(map.Remove(key) == (model.erase(key) == 1));
        } else {
            map.Insert(key, key / 2);
            model[key] = key / 2;
        }
        RC_ASSERT(map.Count() == static_cast<int>(model.size()));
    }
    for (const auto& [key, value] : model) RC_ASSERT(map.ConstGet(key) == value);
    std::map<int, int> walked;
    for (cow_ConstMapIterator<int, int> iter(map); !iter.IsDone(); iter.Next()) {
        walked.emplace(iter.CurrentKey(), iter.CurrentValue());
    }
    RC_ASSERT(walked == model);
}

} // namespace
