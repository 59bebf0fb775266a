#ifndef QRX_STORE_RGNC_SETDATA_H
#define QRX_STORE_RGNC_SETDATA_H

#include "foundation/cow_CountedHld.h"
#include "foundation/cow_List.h"
#include "foundation/cow_String.h"
#include "store_interface/records/cls_Record.h"

#include <unordered_map>
#include <vector>

struct omu_EnumTable;

/// What the entries of a set are.
enum class res_SetTypeEnm : int { NODES = 0, ELEMENTS = 1, FACETS = 2 };
const omu_EnumTable& omu_EnumTableOf(res_SetTypeEnm);

/// The part of a set that lies in one mesh and, for elements and facets, in one element class of it.
struct rgnC_SubsetData {
    int meshIndex = 0;
    /// Negative when it has none.
    int classIndex = -1;
    /// Places of the nodes in the mesh's node list, or of the elements in their class; from 0, in the order
    /// given.
    cow_List<int> subset;
    /// For facets, parallel to the entries: the facet of the element, from 0.
    cow_List<int> facetIds;

    int MeshIndex() const { return meshIndex; }
    int ClassIndex() const { return classIndex; }
    const cow_List<int>& Subset() const { return subset; }
    const cow_List<int>& FacetIds() const { return facetIds; }
};

/// What a set is, but for its members.
struct odiK_SetHead : cls_RecordOf<odiK_SetHead> {
    static constexpr cls_ClassInfo Class{"odiK_SetHead", "a named set"};

    cow_String name;
    res_SetTypeEnm type = res_SetTypeEnm::NODES;
    bool internal = false;

    static const cls_FieldTable& Fields();
};

/// A set as the store holds it. Sets of a mesh that several instances share stand once.
struct odiK_Set : odiK_SetHead {
    std::vector<rgnC_SubsetData> subsets;

    /// What the entries come to for the deck, worked out at the first use: labels, and face names for
    /// facets. Kept only for sets that lie in one mesh.
    struct Resolved {
        cow_List<int> labels;
        cow_List<cow_String> faces;
    };
    thr_Kept<Resolved> resolved;
    /// The places of the subsets by their mesh index; worked out at the first use.
    using PlacesOfMeshes = std::unordered_map<int, std::vector<int>>;
    thr_Kept<PlacesOfMeshes> placesOfMeshes;
};

/// The view on a set's data. A set of a shared mesh is seen from one instance: its subsets then carry that
/// instance's mesh index.
class rgnC_SetData {
public:
    static constexpr int kOwnMeshIndex = -0x7fffffff;

    rgnC_SetData() = default;
    explicit rgnC_SetData(const cow_CountedHld<odiK_Set>& set, int meshIndex = kOwnMeshIndex)
        : set_(set), meshIndex_(meshIndex) {}

    bool IsNull() const { return set_.IsNull(); }
    const cow_String& Name() const { return set_->name; }
    bool Internal() const { return set_->internal; }
    /// 0 nodes, 1 elements, 2 facets.
    int Kind() const { return static_cast<int>(set_->type); }
    int NumSubSets() const { return static_cast<int>(set_->subsets.size()); }
    rgnC_SubsetData SubSet(int index) const;
    /// SubSet(index).MeshIndex() without making the view; unchecked.
    int MeshIndexOfSubSet(int index) const {
        return LiesInOneMesh() ? meshIndex_ : set_->subsets[static_cast<std::size_t>(index)].meshIndex;
    }
    /// The places of the subsets in one mesh, in their order.
    std::vector<int> SubSetsIn(int meshIndex) const;
    /// The store's object, whose caches the readers of large sets share.
    const odiK_Set& Object() const { return *set_; }
    /// Whether all subsets lie in one mesh, seen from one instance.
    bool LiesInOneMesh() const { return meshIndex_ != kOwnMeshIndex; }

private:
    cow_CountedHld<odiK_Set> set_;
    int meshIndex_ = kOwnMeshIndex;
};

#endif
