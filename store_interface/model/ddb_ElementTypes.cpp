#include "store_interface/model/ddb_ElementTypes.h"

#include "store_interface/model/ddb_ElementShape.h"

#include <algorithm>

namespace {

using Cell = cel_KindEnm;
using Need = ddb_SectionNeedEnm;
using Physics = ddb_PhysicsEnm;

constexpr ddb_ElementFamily kFamilies[] = {
    {"SAX", 1, 0, false, Need::SHELL, Physics::STRUCTURAL},
    {"DSAX", 1, 0, false, Need::SHELL, Physics::THERMAL},
    {"MAX", 1, 0, false, Need::MEMBRANE, Physics::STRUCTURAL},
    {"MGAX", 1, 0, false, Need::MEMBRANE, Physics::STRUCTURAL},
    {"SFMAX", 1, 0, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"SFMGAX", 1, 0, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"RAX", 1, 0, false, Need::NOTHING, Physics::STRUCTURAL},
    {"B2", 1, 0, false, Need::BEAM, Physics::STRUCTURAL},
    {"B3", 1, 0, false, Need::BEAM, Physics::STRUCTURAL},
    {"PIPE", 1, 0, false, Need::BEAM, Physics::STRUCTURAL},
    {"ELBOW", 1, 0, false, Need::BEAM, Physics::STRUCTURAL},
    {"FRAME", 1, 0, false, Need::BEAM, Physics::STRUCTURAL},
    {"T2D", 1, 0, false, Need::TRUSS, Physics::STRUCTURAL},
    {"T3D", 1, 0, false, Need::TRUSS, Physics::STRUCTURAL},
    {"DC1D", 1, 0, false, Need::SOLID, Physics::THERMAL},
    {"AC1D", 1, 0, false, Need::UNKNOWN, Physics::ACOUSTIC},
    {"R2D", 1, 0, false, Need::NOTHING, Physics::STRUCTURAL},
    {"RB", 1, 0, false, Need::NOTHING, Physics::STRUCTURAL},
    {"CONN", 1, 0, false, Need::NOTHING, Physics::STRUCTURAL},
    {"SPRING", 1, 0, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"DASHPOT", 1, 0, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"JOINT", 1, 0, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"GAP", 1, 0, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"ITS", 1, 0, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"TUBE", 1, 0, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"C3D", 3, 3, false, Need::SOLID, Physics::STRUCTURAL},
    {"CC3D", 3, 3, false, Need::UNKNOWN, Physics::OTHER},
    {"DC3D", 3, 3, false, Need::SOLID, Physics::THERMAL},
    {"DCC3D", 3, 3, false, Need::UNKNOWN, Physics::THERMAL},
    {"AC3D", 3, 3, false, Need::SOLID, Physics::ACOUSTIC},
    {"Q3D", 3, 3, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"EC3D", 3, 3, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"COH3D", 3, 3, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"CSS", 3, 3, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"SC", 3, 3, false, Need::SHELL, Physics::STRUCTURAL},
    {"CCL", 3, 3, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"DCC", 3, 3, false, Need::UNKNOWN, Physics::THERMAL},
    {"GK3D", 3, 3, false, Need::GASKET, Physics::STRUCTURAL},
    {"S3", 2, 3, true, Need::SHELL, Physics::STRUCTURAL},
    {"S4", 2, 3, true, Need::SHELL, Physics::STRUCTURAL},
    {"S8", 2, 3, true, Need::SHELL, Physics::STRUCTURAL},
    {"S9", 2, 3, true, Need::SHELL, Physics::STRUCTURAL},
    {"STRI", 2, 3, true, Need::SHELL, Physics::STRUCTURAL},
    {"DS", 2, 3, true, Need::SHELL, Physics::THERMAL},
    {"M3D", 2, 3, false, Need::MEMBRANE, Physics::STRUCTURAL},
    {"SFM3D", 2, 3, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"R3D", 2, 3, false, Need::NOTHING, Physics::STRUCTURAL},
    {"CCF", 2, 3, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"ASI3D", 2, 3, false, Need::UNKNOWN, Physics::ACOUSTIC},
    {"F3D", 2, 3, false, Need::UNKNOWN, Physics::OTHER},
    {"CPE", 2, 2, false, Need::SOLID, Physics::STRUCTURAL},
    {"CPS", 2, 2, false, Need::SOLID, Physics::STRUCTURAL},
    {"CPEG", 2, 2, false, Need::SOLID, Physics::STRUCTURAL},
    {"CAX", 2, 2, false, Need::SOLID, Physics::STRUCTURAL},
    {"CGAX", 2, 2, false, Need::SOLID, Physics::STRUCTURAL},
    {"DC2D", 2, 2, false, Need::SOLID, Physics::THERMAL},
    {"DCAX", 2, 2, false, Need::SOLID, Physics::THERMAL},
    {"DCC2D", 2, 2, false, Need::UNKNOWN, Physics::THERMAL},
    {"DCCAX", 2, 2, false, Need::UNKNOWN, Physics::THERMAL},
    {"AC2D", 2, 2, false, Need::SOLID, Physics::ACOUSTIC},
    {"ACAX", 2, 2, false, Need::SOLID, Physics::ACOUSTIC},
    {"COH2D", 2, 2, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"COHAX", 2, 2, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"GKPS", 2, 2, false, Need::GASKET, Physics::STRUCTURAL},
    {"GKPE", 2, 2, false, Need::GASKET, Physics::STRUCTURAL},
    {"GKAX", 2, 2, false, Need::GASKET, Physics::STRUCTURAL},
    {"GK2D", 2, 2, false, Need::GASKET, Physics::STRUCTURAL},
    {"CINPE", 2, 2, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"CINPS", 2, 2, false, Need::UNKNOWN, Physics::STRUCTURAL},
    {"CINAX", 2, 2, false, Need::UNKNOWN, Physics::STRUCTURAL},
};

constexpr ddb_ElementFamily kPoints[] = {
    {"MASS", 0, 3, false, Need::POINT, Physics::STRUCTURAL},
    {"ROTARYI", 0, 3, false, Need::POINT, Physics::STRUCTURAL},
    {"HEATCAP", 0, 3, false, Need::UNKNOWN, Physics::THERMAL},
};

constexpr ddb_ElementFamily kUser = {"U", 0, 3, false, Need::UNKNOWN, Physics::OTHER};

/// The types of a stem: what may follow it, and what its elements consist of.
struct Stem {
    std::string_view stem;
    std::optional<Cell> cell;
    int minNodes;
    int maxNodes;
    std::string_view endings; // "" is written as "-"
};

constexpr Stem Of(std::string_view stem, Cell cell, int nodes, std::string_view endings) {
    return {stem, cell, nodes, nodes, endings};
}
/// One more node may give the direction of a beam's first axis.
constexpr Stem Beam(std::string_view stem, Cell cell, int nodes, std::string_view endings) {
    return {stem, cell, nodes, nodes + 1, endings};
}
constexpr Stem Counted(std::string_view stem, int nodes, std::string_view endings) {
    return {stem, std::nullopt, nodes, nodes, endings};
}

constexpr std::string_view kLinearSolid = "- H I IH R RH T HT RT RHT P PH RP RPH PT PHT RPT RPHT S HS E";
constexpr std::string_view kQuadraticSolid = "- H R RH T HT RT RHT P PH RP RPH E RE";
constexpr std::string_view kQuadraticTriangle = "- H M MH T HT MT MHT P PH MP MPH E";

constexpr Stem kStems[] = {
    Of("C3D4", Cell::TETRA4, 4, "- H T HT P PH PT PHT E"),
    Of("C3D5", Cell::PYRAMID5, 5, "- H"),
    Of("C3D6", Cell::WEDGE6, 6, "- H T HT P PH PT PHT E"),
    Of("C3D8", Cell::HEXAHEDRON8, 8, kLinearSolid),
    Of("C3D10", Cell::TETRA10, 10, "- H I M MH T HT MT MHT P PH MP MPH PT PHT MPT S HS R E"),
    Of("C3D15", Cell::WEDGE15, 15, "- H E"),
    {"C3D15V", Cell::WEDGE15, 15, 18, "- H"},
    Of("C3D20", Cell::HEXAHEDRON20, 20, kQuadraticSolid),
    {"C3D27", Cell::HEXAHEDRON27, 21, 27, "- H R RH"},
    Counted("CCL9", 9, "- H"),
    Counted("CCL12", 12, "- H"),
    Counted("CCL18", 18, "- H"),
    Counted("CCL24", 24, "- H R RH"),
    Of("CPE3", Cell::TRIANGLE3, 3, "- H T HT P PH E"),
    Of("CPE4", Cell::QUAD4, 4, kLinearSolid),
    Of("CPE6", Cell::TRIANGLE6, 6, kQuadraticTriangle),
    Of("CPE8", Cell::QUAD8, 8, kQuadraticSolid),
    Of("CPS3", Cell::TRIANGLE3, 3, "- T E"),
    Of("CPS4", Cell::QUAD4, 4, "- I R T RT E"),
    Of("CPS6", Cell::TRIANGLE6, 6, "- M T MT E"),
    Of("CPS8", Cell::QUAD8, 8, "- R T RT E RE"),
    Of("CPEG3", Cell::TRIANGLE3, 3, "- H T HT"),
    Of("CPEG4", Cell::QUAD4, 4, "- H I IH R RH T HT RT RHT"),
    Of("CPEG6", Cell::TRIANGLE6, 6, "- H M MH T HT MT MHT"),
    Of("CPEG8", Cell::QUAD8, 8, "- H R RH T HT RT RHT"),
    Of("CAX3", Cell::TRIANGLE3, 3, "- H T HT P PH E"),
    Of("CAX4", Cell::QUAD4, 4, kLinearSolid),
    Of("CAX6", Cell::TRIANGLE6, 6, kQuadraticTriangle),
    Of("CAX8", Cell::QUAD8, 8, kQuadraticSolid),
    {"CAXA4", std::nullopt, 0, 0, "*"},
    {"CAXA8", std::nullopt, 0, 0, "*"},
    Of("CGAX3", Cell::TRIANGLE3, 3, "- H T HT"),
    Of("CGAX4", Cell::QUAD4, 4, "- H R RH T HT RT RHT"),
    Of("CGAX6", Cell::TRIANGLE6, 6, "- H M MH T HT MT MHT"),
    Of("CGAX8", Cell::QUAD8, 8, "- H R RH T HT RT RHT"),
    Of("DC1D2", Cell::LINE2, 2, "- E"),
    Of("DC1D3", Cell::LINE3, 3, "- E"),
    Of("DC2D3", Cell::TRIANGLE3, 3, "- E"),
    Of("DC2D4", Cell::QUAD4, 4, "- E"),
    Of("DC2D6", Cell::TRIANGLE6, 6, "- E"),
    Of("DC2D8", Cell::QUAD8, 8, "- E"),
    Of("DCAX3", Cell::TRIANGLE3, 3, "- E"),
    Of("DCAX4", Cell::QUAD4, 4, "- E"),
    Of("DCAX6", Cell::TRIANGLE6, 6, "- E"),
    Of("DCAX8", Cell::QUAD8, 8, "- E"),
    Of("DC3D4", Cell::TETRA4, 4, "- E"),
    Of("DC3D5", Cell::PYRAMID5, 5, "- E"),
    Of("DC3D6", Cell::WEDGE6, 6, "- E"),
    Of("DC3D8", Cell::HEXAHEDRON8, 8, "- E R"),
    Of("DC3D10", Cell::TETRA10, 10, "- E"),
    Of("DC3D15", Cell::WEDGE15, 15, "- E"),
    Of("DC3D20", Cell::HEXAHEDRON20, 20, "- E"),
    Of("AC1D2", Cell::LINE2, 2, "-"),
    Of("AC1D3", Cell::LINE3, 3, "-"),
    Of("AC2D3", Cell::TRIANGLE3, 3, "-"),
    Of("AC2D4", Cell::QUAD4, 4, "- R"),
    Of("AC2D6", Cell::TRIANGLE6, 6, "-"),
    Of("AC2D8", Cell::QUAD8, 8, "-"),
    Of("ACAX3", Cell::TRIANGLE3, 3, "-"),
    Of("ACAX4", Cell::QUAD4, 4, "- R"),
    Of("ACAX6", Cell::TRIANGLE6, 6, "-"),
    Of("ACAX8", Cell::QUAD8, 8, "-"),
    Of("AC3D4", Cell::TETRA4, 4, "-"),
    Of("AC3D5", Cell::PYRAMID5, 5, "-"),
    Of("AC3D6", Cell::WEDGE6, 6, "-"),
    Of("AC3D8", Cell::HEXAHEDRON8, 8, "- R"),
    Of("AC3D10", Cell::TETRA10, 10, "-"),
    Of("AC3D15", Cell::WEDGE15, 15, "-"),
    Of("AC3D20", Cell::HEXAHEDRON20, 20, "-"),
    Of("S3", Cell::TRIANGLE3, 3, "- R RS T RT"),
    Of("S4", Cell::QUAD4, 4, "- R RS RSW R5 T RT"),
    Of("S8", Cell::QUAD8, 8, "R R5 RT"),
    Of("S9", Cell::QUAD9, 9, "R5"),
    Of("STRI3", Cell::TRIANGLE3, 3, "-"),
    Of("STRI65", Cell::TRIANGLE6, 6, "-"),
    Of("DS3", Cell::TRIANGLE3, 3, "-"),
    Of("DS4", Cell::QUAD4, 4, "-"),
    Of("DS6", Cell::TRIANGLE6, 6, "-"),
    Of("DS8", Cell::QUAD8, 8, "-"),
    Of("SAX1", Cell::LINE2, 2, "-"),
    Of("SAX2", Cell::LINE3, 3, "- T"),
    {"SAXA", std::nullopt, 0, 0, "*"},
    Of("DSAX1", Cell::LINE2, 2, "-"),
    Of("DSAX2", Cell::LINE3, 3, "-"),
    Of("SC6", Cell::WEDGE6, 6, "R RT"),
    Of("SC8", Cell::HEXAHEDRON8, 8, "R RT"),
    Of("CSS8", Cell::HEXAHEDRON8, 8, "-"),
    Of("M3D3", Cell::TRIANGLE3, 3, "-"),
    Of("M3D4", Cell::QUAD4, 4, "- R"),
    Of("M3D6", Cell::TRIANGLE6, 6, "-"),
    Of("M3D8", Cell::QUAD8, 8, "- R"),
    Of("M3D9", Cell::QUAD9, 9, "- R"),
    Of("MAX1", Cell::LINE2, 2, "-"),
    Of("MAX2", Cell::LINE3, 3, "-"),
    Of("MGAX1", Cell::LINE2, 2, "-"),
    Of("MGAX2", Cell::LINE3, 3, "-"),
    Of("SFM3D3", Cell::TRIANGLE3, 3, "-"),
    Of("SFM3D4", Cell::QUAD4, 4, "- R"),
    Of("SFM3D6", Cell::TRIANGLE6, 6, "-"),
    Of("SFM3D8", Cell::QUAD8, 8, "- R"),
    Of("SFMAX1", Cell::LINE2, 2, "-"),
    Of("SFMAX2", Cell::LINE3, 3, "-"),
    Of("SFMGAX1", Cell::LINE2, 2, "-"),
    Of("SFMGAX2", Cell::LINE3, 3, "-"),
    Of("R2D2", Cell::LINE2, 2, "-"),
    Of("RAX2", Cell::LINE2, 2, "-"),
    Of("R3D3", Cell::TRIANGLE3, 3, "-"),
    Of("R3D4", Cell::QUAD4, 4, "-"),
    Of("RB2D2", Cell::LINE2, 2, "-"),
    Of("RB3D2", Cell::LINE2, 2, "-"),
    Of("B21", Cell::LINE2, 2, "- H"),
    Of("B22", Cell::LINE3, 3, "- H"),
    Of("B23", Cell::LINE2, 2, "- H"),
    Beam("B31", Cell::LINE2, 2, "- H OS OSH"),
    Beam("B32", Cell::LINE3, 3, "- H OS OSH"),
    Beam("B33", Cell::LINE2, 2, "- H"),
    Of("PIPE21", Cell::LINE2, 2, "- H"),
    Of("PIPE22", Cell::LINE3, 3, "- H"),
    Beam("PIPE31", Cell::LINE2, 2, "- H"),
    Beam("PIPE32", Cell::LINE3, 3, "- H"),
    Beam("ELBOW31", Cell::LINE2, 2, "- B C"),
    Beam("ELBOW32", Cell::LINE3, 3, "-"),
    Of("FRAME2D", Cell::LINE2, 2, "-"),
    Beam("FRAME3D", Cell::LINE2, 2, "-"),
    Of("T2D2", Cell::LINE2, 2, "- H T HT E"),
    Of("T2D3", Cell::LINE3, 3, "- H T HT E"),
    Of("T3D2", Cell::LINE2, 2, "- H T HT E"),
    Of("T3D3", Cell::LINE3, 3, "- H T HT E"),
    // An end may be the ground.
    {"CONN2D2", Cell::LINE2, 1, 2, "-"},
    {"CONN3D2", Cell::LINE2, 1, 2, "-"},
    Of("COH2D4", Cell::QUAD4, 4, "-"),
    Counted("COH2D4P", 6, "-"),
    Of("COHAX4", Cell::QUAD4, 4, "-"),
    Counted("COHAX4P", 6, "-"),
    Of("COH3D6", Cell::WEDGE6, 6, "-"),
    Counted("COH3D6P", 9, "-"),
    Of("COH3D8", Cell::HEXAHEDRON8, 8, "-"),
    Counted("COH3D8P", 12, "-"),
    Of("GK2D2", Cell::LINE2, 2, "- N"),
    Of("GKPS4", Cell::QUAD4, 4, "- N"),
    Counted("GKPS6", 6, "- N"),
    Of("GKPE4", Cell::QUAD4, 4, "-"),
    Counted("GKPE6", 6, "-"),
    Of("GKAX2", Cell::LINE2, 2, "- N"),
    Of("GKAX4", Cell::QUAD4, 4, "- N"),
    Counted("GKAX6", 6, "- N"),
    Of("GK3D2", Cell::LINE2, 2, "- N"),
    Counted("GK3D4L", 4, "- N"),
    Of("GK3D6", Cell::WEDGE6, 6, "- N"),
    Counted("GK3D6L", 6, "- N"),
    Of("GK3D8", Cell::HEXAHEDRON8, 8, "- N"),
    Counted("GK3D12M", 12, "- N"),
    Counted("GK3D18", 18, "- N"),
    Of("F3D3", Cell::TRIANGLE3, 3, "-"),
    Of("F3D4", Cell::QUAD4, 4, "-"),
    Of("CINPE4", Cell::QUAD4, 4, "-"),
    Counted("CINPE5", 5, "R"),
    Of("CINPS4", Cell::QUAD4, 4, "-"),
    Counted("CINPS5", 5, "R"),
    Of("CINAX4", Cell::QUAD4, 4, "-"),
    Counted("CINAX5", 5, "R"),
    Of("EC3D8", Cell::HEXAHEDRON8, 8, "R RT"),
    Of("DCC2D4", Cell::QUAD4, 4, "- D"),
    Of("DCCAX4", Cell::QUAD4, 4, "- D"),
    Of("DCC3D8", Cell::HEXAHEDRON8, 8, "- D"),
    Of("MASS", Cell::POINT1, 1, "-"),
    Of("ROTARYI", Cell::POINT1, 1, "-"),
    Of("HEATCAP", Cell::POINT1, 1, "-"),
};

std::string Capitals(std::string_view label) {
    std::string capitals(label);
    std::transform(capitals.begin(), capitals.end(), capitals.begin(),
                   [](char c) { return c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c; });
    return capitals;
}

/// Calls with each ending of a stem's list.
template <class F>
void ForEachEnding(std::string_view endings, F&& use) {
    while (!endings.empty()) {
        const std::size_t end = std::min(endings.find(' '), endings.size());
        const std::string_view ending = endings.substr(0, end);
        use(ending == "-" ? std::string_view() : ending);
        endings.remove_prefix(std::min(end + 1, endings.size()));
    }
}

bool MayEnd(const Stem& stem, std::string_view ending) {
    if (stem.endings == "*") return true;
    bool found = false;
    ForEachEnding(stem.endings, [&](std::string_view each) { found = found || each == ending; });
    return found;
}

const Stem* StemOf(std::string_view label) {
    for (const Stem& stem : kStems) {
        if (label.starts_with(stem.stem) && MayEnd(stem, label.substr(stem.stem.size()))) return &stem;
    }
    return nullptr;
}

/// Families such as springs have no list of types: any label is right.
bool HasTypes(const ddb_ElementFamily& family) {
    return std::any_of(std::begin(kStems), std::end(kStems),
                       [&](const Stem& stem) { return ddb_FamilyOf(stem.stem) == &family; });
}

bool LineLiesInSpace(std::string_view label) {
    return label.find("3D") != std::string_view::npos || label.starts_with("B3") ||
           label.starts_with("PIPE3") || label.starts_with("ELBOW") || label.starts_with("FRAME3");
}

} // namespace

const ddb_ElementFamily* ddb_FamilyOf(std::string_view typeLabel) {
    const std::string label = Capitals(typeLabel);
    const ddb_ElementFamily* best = nullptr;
    for (const ddb_ElementFamily& family : kFamilies) {
        if (label.starts_with(family.beginning) &&
            (best == nullptr || family.beginning.size() > best->beginning.size())) {
            best = &family;
        }
    }
    if (best != nullptr) return best;
    for (const ddb_ElementFamily& point : kPoints) {
        if (label == point.beginning) return &point;
    }
    return label.starts_with(kUser.beginning) ? &kUser : nullptr;
}

ddb_ElementShape ddb_ShapeOfLabel(std::string_view typeLabel) {
    const ddb_ElementFamily* family = ddb_FamilyOf(typeLabel);
    ddb_ElementShape shape;
    shape.unknown = family == nullptr;
    if (family == nullptr) return shape;
    shape.topologicalDimension = family->dimension;
    shape.embeddingDimension =
        family->embedding != 0 ? family->embedding : (LineLiesInSpace(Capitals(typeLabel)) ? 3 : 2);
    shape.shell = family->shell;
    return shape;
}

std::optional<ddb_ElementType> ddb_FindElementType(std::string_view typeLabel) {
    const std::string label = Capitals(typeLabel);
    const ddb_ElementFamily* family = ddb_FamilyOf(label);
    if (family == nullptr) return std::nullopt;
    ddb_ElementType type;
    type.displacement = family->physics == Physics::STRUCTURAL;
    type.temperature = family->physics == Physics::THERMAL;
    const Stem* stem = StemOf(label);
    if (stem == nullptr) return HasTypes(*family) ? std::nullopt : std::optional(type);
    type.cell = stem->cell;
    type.minNodes = stem->minNodes;
    type.maxNodes = stem->maxNodes;
    if (label.substr(stem->stem.size()).find('T') != std::string::npos) type.temperature = true;
    return type;
}

std::string ddb_TypesLike(std::string_view typeLabel, int count) {
    const std::string label = Capitals(typeLabel);
    std::string types;
    int left = count;
    const auto add = [&](const Stem& stem) {
        ForEachEnding(stem.endings, [&](std::string_view ending) {
            if (ending == "*" || left == 0) return;
            if (!types.empty()) types += ", ";
            types.append(stem.stem).append(ending);
            --left;
        });
    };
    for (std::size_t length = label.size(); length > 1 && types.empty(); --length) {
        for (const Stem& stem : kStems) {
            if (stem.stem.starts_with(std::string_view(label).substr(0, length))) add(stem);
        }
    }
    return types;
}

int ddb_NumberedFacesOf(std::string_view typeLabel) {
    const std::optional<ddb_ElementType> type = ddb_FindElementType(typeLabel);
    if (!type.has_value() || !type->cell.has_value()) return -1;
    const ddb_FaceRule rule = ddb_FaceRuleOf(ddb_ShapeOfLabel(typeLabel));
    if (rule.rule != ddb_FaceRuleEnm::NUMBERED || *rule.prefix == '\0') return -1;
    return static_cast<int>(cel_CellOf(*type->cell).sides.size());
}
