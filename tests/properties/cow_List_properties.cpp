#include "foundation/cow_List.h"

#include "foundation/cow_String.h"
#include "foundation/nex_Exception.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <algorithm>
#include <array>
#include <vector>

namespace {

template <class Item>
Item MakeItem(int number) {
    return Item(number);
}

template <class Item>
bool Same(const cow_List<Item>& list, const std::vector<Item>& model) {
    if (list.Length() != static_cast<int>(model.size())) return false;
    if (list.IsEmpty() != model.empty()) return false;
    for (int i = 0; i < list.Length(); ++i) {
        if (!(list[i] == model[static_cast<std::size_t>(i)])) return false;
    }
    int length = 0;
    for (int i = 0; i < list.Length(); i += length) {
        const Item* run = list.ConstRun(i, length);
        if (length < 1 || !std::equal(run, run + length, model.begin() + i)) return false;
    }
    return true;
}

// Four lists that are copied to, joined with and changed beside each other, beside four vectors.
template <class Item>
void RunRandomOperations() {
    constexpr std::size_t kLists = 4;
    std::array<cow_List<Item>, kLists> lists;
    std::array<std::vector<Item>, kLists> models;
    int number = 0;
    const int steps = *rc::gen::inRange(0, 80);
    for (int step = 0; step < steps; ++step) {
        const auto a = *rc::gen::inRange<std::size_t>(0, kLists);
        const auto b = *rc::gen::inRange<std::size_t>(0, kLists);
        auto& list = lists[a];
        auto& model = models[a];
        const int count = static_cast<int>(model.size());
        const int index = count == 0 ? 0 : *rc::gen::inRange(0, count);
        switch (*rc::gen::inRange(0, 14)) {
        case 0:
        case 1: {
            const int repeat = *rc::gen::inRange(1, 60);
            for (int i = 0; i < repeat; ++i) {
                list.Append(MakeItem<Item>(number));
                model.push_back(MakeItem<Item>(number++));
            }
            break;
        }
        case 2:
        case 3: {
            const int repeat = *rc::gen::inRange(1, 60);
            for (int i = 0; i < repeat; ++i) {
                list.Prepend(MakeItem<Item>(number));
                model.insert(model.begin(), MakeItem<Item>(number++));
            }
            break;
        }
        case 4:
            lists[a] = lists[b];
            models[a] = std::vector<Item>(models[b]);
            break;
        case 5:
            if (count == 0) break;
            list.Put(index, MakeItem<Item>(number));
            model[static_cast<std::size_t>(index)] = MakeItem<Item>(number++);
            break;
        case 6:
            if (count == 0) break;
            list.Get(index) = MakeItem<Item>(number);
            model[static_cast<std::size_t>(index)] = MakeItem<Item>(number++);
            break;
        case 7: {
            const int place = *rc::gen::inRange(0, count + 1);
            list.InsertIndex(place, MakeItem<Item>(number));
            model.insert(model.begin() + place, MakeItem<Item>(number++));
            break;
        }
        case 8:
            if (count == 0) break;
            list.RemoveIndex(index);
            model.erase(model.begin() + index);
            break;
        case 9: {
            if (model.size() + models[b].size() > 3000) break;
            list.Concatenate(lists[b]);
            const std::vector<Item> tail(models[b]);
            model.insert(model.end(), tail.begin(), tail.end());
            break;
        }
        case 10: {
            const int length = *rc::gen::inRange(0, 700);
            list.Fill(length, MakeItem<Item>(number));
            model.assign(static_cast<std::size_t>(length), MakeItem<Item>(number++));
            break;
        }
        case 11: {
            const int length = *rc::gen::inRange(0, count + 40);
            list.Resize(length);
            model.resize(static_cast<std::size_t>(length));
            break;
        }
        case 12: {
            const int size = *rc::gen::inRange(0, 2000);
            list = cow_List<Item>(cow_ListConstruct(size));
            model.clear();
            break;
        }
        default: {
            const int outside = *rc::gen::element(-1, count, count + 100);
            RC_ASSERT_THROWS_AS(list.Get(outside), QRXBasException);
            RC_ASSERT_THROWS_AS(list.RemoveIndex(outside), QRXBasException);
            break;
        }
        }
        for (std::size_t i = 0; i < kLists; ++i) RC_ASSERT(Same(lists[i], models[i]));
        RC_ASSERT((lists[a] == lists[b]) == (models[a] == models[b]));
    }
}

RC_GTEST_PROP(cow_List, RandomOperationsOnStrings_MatchVector, ()) {
    RunRandomOperations<cow_String>();
}

RC_GTEST_PROP(cow_List, RandomOperationsOnInts_MatchVector, ()) {
    RunRandomOperations<int>();
}

RC_GTEST_PROP(cow_List, AnySize_PlansRoomInBlocksOfAnEighthOrLess, ()) {
    const int size = *rc::gen::inRange(1, 1 << 30);
    const cow_List<int> list{cow_ListConstruct(size)};
    const long long block = 1LL << list.Shift();
    const long long planned = (list.TableLength() - 16) * block;
    if (size < 256) {
        RC_ASSERT(list.Shift() == 4);
        RC_ASSERT(list.TableLength() == 16);
    } else {
        // The float nearest to the size stands for it, so the plan may miss it by that rounding.
        const long long rounding = size >> 24;
        RC_ASSERT(planned + rounding >= size);
        RC_ASSERT(planned - block < size + rounding);
        RC_ASSERT(list.TableLength() - 16 >= 8);
        RC_ASSERT(list.TableLength() - 16 <= 16);
    }
}

} // namespace
