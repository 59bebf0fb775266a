#ifndef QRX_STORE_DDB_ELEMENTTYPES_H
#define QRX_STORE_DDB_ELEMENTTYPES_H

#include "foundation/cel_Cells.h"

#include <optional>
#include <span>
#include <string>
#include <string_view>

/// What the elements of a family take as their section.
enum class ddb_SectionNeedEnm {
    NOTHING, // rigid elements, springs, connectors (whose section is the assembly's)
    UNKNOWN, // no rule is known
    BEAM,
    TRUSS, // a truss section or a solid one
    SHELL,
    MEMBRANE,
    GASKET,
    POINT, // masses and inertias
    SOLID
};

/// What the nodes of a family's elements carry.
enum class ddb_PhysicsEnm { STRUCTURAL, THERMAL, ACOUSTIC, OTHER };

/// Element types whose labels begin alike.
struct ddb_ElementFamily {
    std::string_view beginning;
    int dimension = 0;
    int embedding = 3; // 0: by the label
    bool shell = false;
    ddb_SectionNeedEnm section = ddb_SectionNeedEnm::UNKNOWN;
    ddb_PhysicsEnm physics = ddb_PhysicsEnm::OTHER;
};

/// The family by the longest known beginning of the label, in any capitals; null where there is none. A point
/// element is known by its whole label.
const ddb_ElementFamily* ddb_FamilyOf(std::string_view typeLabel);

/// One type of element, as far as the table of types tells.
struct ddb_ElementType {
    /// The cell that an element is; none where the table doesn't tell (springs, cylindrical elements).
    std::optional<cel_KindEnm> cell;
    /// What an element may have; 0 where any number is right.
    int minNodes = 0;
    int maxNodes = 0;
    bool displacement = false;
    bool temperature = false;
};

/// The type of a label, in any capitals. None where the label is no type of its family (CPS4Q), or of no
/// family.
std::optional<ddb_ElementType> ddb_FindElementType(std::string_view typeLabel);

/// The types that begin like the label as far as possible, for a hint; at most `count`.
std::string ddb_TypesLike(std::string_view typeLabel, int count = 8);

/// How many faces "S1", "S2", ... elements of the type have; -1 where the table doesn't tell.
int ddb_NumberedFacesOf(std::string_view typeLabel);

#endif
