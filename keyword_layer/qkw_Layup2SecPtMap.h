#ifndef QRX_KEYWORD_QKW_LAYUP2SECPTMAP_H
#define QRX_KEYWORD_QKW_LAYUP2SECPTMAP_H

#include "foundation/cow_List.h"
#include "foundation/cow_Map.h"
#include "foundation/cow_String.h"

/// Which element sets a composite layup consists of, and which section points of each set lie at chosen
/// places of the plies. Filled while sections are written, asked afterwards; for callers of the library, no
/// keyword uses it. Owners are parts or instances.
class qkw_Layup2SecPtMap {
public:
    /// Places in a ply, to be combined; ALL takes every point.
    enum Places : int { BOTTOM = 1, TOP = 2, MIDDLE = 4, ALL = 8 };

    /// The sets that ElsetsAndSectionPoints looks for, in any form of their names.
    void SetRequestedSets(const cow_List<cow_String>& sets) { requestedSets_ = sets; }

    /// A set of the owner's layup; `plyPoints` has the number of section points in each ply.
    void AddSection(const cow_String& owner, const cow_String& instance, const cow_String& layup,
                    const cow_String& set, const cow_List<int>& plyPoints);
    /// The new instance answers for the owner of `instance`, if that is known.
    void CloneLayupData(const cow_String& newInstance, const cow_String& instance);
    /// From now on the new set stands for the old one; more than one may.
    void RewireSet(const cow_String& owner, const cow_String& oldSet, const cow_String& newSet);

    /// The requested sets of a layup, by full name, with their section points. Empty for an unknown layup.
    cow_Map<cow_String, cow_List<int>> ElsetsAndSectionPoints(const cow_String& name, const cow_String& layup,
                                                              int flags) const;
    /// The numbers of the points at these places, counted through the plies from 1, in ascending order. A
    /// point at several places stands as often.
    static cow_List<int> SectionPoints(int flags, const cow_List<int>& plyPoints);
    /// a + "." + b.
    static cow_String Concat(const cow_String& a, const cow_String& b);

private:
    bool IsRequested(const cow_String& fullName) const;

    cow_List<cow_String> requestedSets_;
    // The keys are "owner.layup" in the first, "owner.set" in the next two.
    cow_Map<cow_String, cow_List<cow_String>> setsOfLayup_;
    cow_Map<cow_String, cow_List<int>> pointsOfSet_;
    cow_Map<cow_String, cow_List<cow_String>> rewiredSets_;
    cow_Map<cow_String, cow_String> ownerOfInstance_;
    cow_Map<cow_String, cow_String> clonedOwners_;
};

#endif
