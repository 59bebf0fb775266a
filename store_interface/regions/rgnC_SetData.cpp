#include "store_interface/regions/rgnC_SetData.h"

#include "store_interface/records/cls_FieldTable.h"

#include <numeric>

const omu_EnumTable& omu_EnumTableOf(res_SetTypeEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "node", "node"}, {1, "element", "element"}, {2, "surface", "surface"}};
    static constexpr omu_EnumTable table{"res_SetTypeEnm", rows};
    return table;
}

const cls_FieldTable& odiK_SetHead::Fields() {
    using R = odiK_SetHead;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::name>("name", "the name of the set")
            .NameOf("set")
            .Required()
            .Field<&R::type>("kind", "what its members are")
            .WordsOnly()
            .Required()
            .Field<&R::internal>("internal", "a set that the deck marks as made by a program")
            .Example(R"({"name": "FIXED", "kind": "node"})");
    return fields;
}

rgnC_SubsetData rgnC_SetData::SubSet(int index) const {
    if (index < 0 || index >= NumSubSets()) cow_RaiseOutOfRange(index, NumSubSets());
    rgnC_SubsetData subset = set_->subsets[static_cast<std::size_t>(index)];
    if (LiesInOneMesh()) subset.meshIndex = meshIndex_;
    return subset;
}

std::vector<int> rgnC_SetData::SubSetsIn(int meshIndex) const {
    if (LiesInOneMesh()) {
        std::vector<int> all(meshIndex == meshIndex_ ? set_->subsets.size() : 0);
        std::iota(all.begin(), all.end(), 0);
        return all;
    }
    const auto& kept = set_->placesOfMeshes;
    const odiK_Set::PlacesOfMeshes* places = kept.Get();
    if (places == nullptr) {
        auto made = std::make_unique<odiK_Set::PlacesOfMeshes>();
        for (int i = 0; i < NumSubSets(); ++i) (*made)[MeshIndexOfSubSet(i)].push_back(i);
        places = kept.Keep(std::move(made));
    }
    const auto found = places->find(meshIndex);
    return found == places->end() ? std::vector<int>() : found->second;
}
