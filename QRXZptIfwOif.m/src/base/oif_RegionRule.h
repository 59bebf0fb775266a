#ifndef QRX_OIF_REGIONRULE_H
#define QRX_OIF_REGIONRULE_H

#include "store_interface/regions/rgnC_Region.h"

/// What kind of region a record needs, as rgnC_Region::FlagWord() gives it; sums stand for "one of these".
/// Records whose lines name no set, or may go without, take anything.
enum class oif_RegionKind : int { ANY = 0, NODES = 1, ELEMENTS = 2, SURFACE = 8, SURFACE_OR_NODES = 9 };

/// Whether a region with a value is of the kind.
inline bool oif_IsOfKind(const rgnC_Region& region, oif_RegionKind kind) {
    return kind == oif_RegionKind::ANY || (region.FlagWord() & static_cast<int>(kind)) != 0;
}

/// A region of records that derive from Base, and the kind that it may be of.
template <class Base>
struct oif_RegionRule {
    const char* member;
    const rgnC_Region& (*region)(const Base& record);
    oif_RegionKind kind;
    bool isNeeded = true;
};

template <class>
struct oif_ClassOfMember;
template <class C, class M>
struct oif_ClassOfMember<M C::*> {
    using Type = C;
};

/// The rule of a member that its class declares, for example
///     oif_RegionRuleOf<kcoC_Constraint, &kcoC_Tie::master>("master", oif_RegionKind::SURFACE)
template <class Base, auto Member>
constexpr oif_RegionRule<Base> oif_RegionRuleOf(const char* member, oif_RegionKind kind,
                                                bool isNeeded = true) {
    return {member,
            [](const Base& record) -> const rgnC_Region& {
                return static_cast<const typename oif_ClassOfMember<decltype(Member)>::Type&>(record).*Member;
            },
            kind, isNeeded};
}

#endif
