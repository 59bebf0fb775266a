#include "foundation/omi_BlkBitVect.h"
#include "foundation/omi_IntTable.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <limits>
#include <map>
#include <set>
#include <vector>

namespace {

rc::Gen<int> Label() {
    return rc::gen::oneOf(rc::gen::inRange(0, 2000), rc::gen::inRange(0, 1 << 20),
                          rc::gen::inRange(0, std::numeric_limits<int>::max()));
}

RC_GTEST_PROP(omi_BlkBitVect, RandomLabels_MatchStdSet, ()) {
    omi_BlkBitVect bits;
    std::set<int> model;
    const auto labels = *rc::gen::container<std::vector<int>>(Label());
    for (const int label : labels) {
        bits.SetBit(label);
        model.insert(label);
    }
    RC_ASSERT(bits.Recount() == static_cast<int>(model.size()));
    std::vector<int> walked;
    omi_BlkBitVectTrav trav(bits);
    for (int bit = trav.First(); bit >= 0; bit = trav.Next()) walked.push_back(bit);
    RC_ASSERT(walked == std::vector<int>(model.begin(), model.end()));
    for (const int label : labels) {
        RC_ASSERT(bits.IsSet(label));
        if (label > 0) RC_ASSERT(bits.IsSet(label - 1) == (model.count(label - 1) == 1));
        RC_ASSERT(bits.IsSet(label ^ 1) == (model.count(label ^ 1) == 1));
    }
}

RC_GTEST_PROP(omi_IntTable, RandomEntries_MatchStdMap, ()) {
    omi_IntTable<int> table;
    std::map<int, int> model;
    const auto keys = *rc::gen::container<std::vector<int>>(rc::gen::inRange(-300, 300));
    for (const int key : keys) {
        const int value = *rc::gen::arbitrary<int>();
        table.Insert(key, value);
        model[key] = value;
    }
    for (int key = -310; key <= 310; ++key) {
        RC_ASSERT(table.ConstGet(key) == (model.count(key) == 1 ? model[key] : 0));
    }
}

} // namespace
