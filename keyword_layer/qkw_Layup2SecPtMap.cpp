#include "keyword_layer/qkw_Layup2SecPtMap.h"

#include "keyword_layer/qkw_QuorixName.h"

#include <algorithm>
#include <string>

void qkw_Layup2SecPtMap::AddSection(const cow_String& owner, const cow_String& instance,
                                    const cow_String& layup, const cow_String& set,
                                    const cow_List<int>& plyPoints) {
    if (!ownerOfInstance_.IsMember(instance)) ownerOfInstance_.Insert(instance, owner);
    setsOfLayup_.GetOrInsert(Concat(owner, layup)).Append(set);
    pointsOfSet_.Insert(Concat(owner, set), plyPoints);
}

void qkw_Layup2SecPtMap::CloneLayupData(const cow_String& newInstance, const cow_String& instance) {
    const cow_String* owner = ownerOfInstance_.Find(instance);
    if (owner != nullptr) clonedOwners_.Insert(newInstance, *owner);
}

void qkw_Layup2SecPtMap::RewireSet(const cow_String& owner, const cow_String& oldSet,
                                   const cow_String& newSet) {
    const cow_String oldName = Concat(owner, oldSet);
    const cow_String newName = Concat(owner, newSet);
    if (const cow_List<int>* found = pointsOfSet_.Find(oldName)) {
        const cow_List<int> points = *found;
        pointsOfSet_.Insert(newName, points);
    }
    rewiredSets_.GetOrInsert(oldName).Append(newName);
}

cow_Map<cow_String, cow_List<int>>
qkw_Layup2SecPtMap::ElsetsAndSectionPoints(const cow_String& name, const cow_String& layup, int flags) const {
    cow_Map<cow_String, cow_List<int>> result;
    const cow_String* cloned = clonedOwners_.Find(name);
    const cow_String& owner = cloned == nullptr ? name : *cloned;
    const cow_List<cow_String>* sets = setsOfLayup_.Find(Concat(owner, layup));
    if (sets == nullptr) return result;
    for (int i = 0; i < sets->Length(); ++i) {
        const cow_String fullName = Concat(owner, (*sets)[i]);
        const cow_List<cow_String>* rewired = rewiredSets_.Find(fullName);
        const cow_List<cow_String> candidates =
            rewired == nullptr ? cow_List<cow_String>(fullName) : *rewired;
        for (int j = 0; j < candidates.Length(); ++j) {
            const cow_List<int>* points = pointsOfSet_.Find(candidates[j]);
            if (points != nullptr && IsRequested(candidates[j])) {
                result.Insert(candidates[j], SectionPoints(flags, *points));
            }
        }
    }
    return result;
}

bool qkw_Layup2SecPtMap::IsRequested(const cow_String& fullName) const {
    cow_String prefix;
    cow_String last;
    qkw_QuorixName::SplitName(fullName, prefix, last);
    std::string underscored(fullName.View());
    std::replace(underscored.begin(), underscored.end(), '.', '_');
    const cow_String forms[] = {fullName, last, qkw_QuorixName(fullName, false).Printable(),
                                qkw_QuorixName(last, false).Printable(), cow_String(underscored)};
    for (int i = 0; i < requestedSets_.Length(); ++i) {
        if (std::find(std::begin(forms), std::end(forms), requestedSets_[i]) != std::end(forms)) return true;
    }
    return false;
}

cow_List<int> qkw_Layup2SecPtMap::SectionPoints(int flags, const cow_List<int>& plyPoints) {
    cow_List<int> points;
    int before = 0;
    for (int i = 0; i < plyPoints.Length(); ++i) {
        const int count = plyPoints[i];
        if ((flags & ALL) != 0) {
            for (int point = 1; point <= count; ++point) points.Append(before + point);
        }
        if ((flags & BOTTOM) != 0) points.Append(before + 1);
        if ((flags & MIDDLE) != 0) points.Append(before + count / 2 + 1);
        if ((flags & TOP) != 0) points.Append(before + count);
        before += count;
    }
    points.Sort();
    return points;
}

cow_String qkw_Layup2SecPtMap::Concat(const cow_String& a, const cow_String& b) {
    return a + "." + b;
}
