#ifndef QRX_OIF_REGIONRULE_H
#define QRX_OIF_REGIONRULE_H

#include "store_interface/regions/rgnC_Region.h"

/// The kinds of regions, as rgnC_Region::FlagWord() gives them; sums stand for "one of these".
struct oif_RegionKind {
    static constexpr int kNodeSet = 1;
    static constexpr int kElementSet = 2;
    static constexpr int kSurface = 8;
};

/// A region of records that derive from Base, and the kinds that it may be of.
template <class Base>
struct oif_RegionRule {
    const char* member;
    const rgnC_Region& (*region)(const Base& record);
    int kinds;
    bool isNeeded = true;
};

template <class>
struct oif_ClassOfMember;
template <class C, class M>
struct oif_ClassOfMember<M C::*> {
    using Type = C;
};

/// The rule of a member that its class declares, for example
///     oif_RegionRuleOf<kcoC_Constraint, &kcoC_Tie::master>("master", oif_RegionKind::kSurface)
template <class Base, auto Member>
constexpr oif_RegionRule<Base> oif_RegionRuleOf(const char* member, int kinds, bool isNeeded = true) {
    return {member,
            [](const Base& record) -> const rgnC_Region& {
                return static_cast<const typename oif_ClassOfMember<decltype(Member)>::Type&>(record).*Member;
            },
            kinds, isNeeded};
}

#endif
