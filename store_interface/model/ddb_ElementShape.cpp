#include "store_interface/model/ddb_ElementShape.h"

#include <algorithm>
#include <initializer_list>
#include <string>

namespace {

struct Family {
    std::initializer_list<std::string_view> beginnings;
    int dimension;
    int embedding; // 0: by the label
    bool shell;
};

const Family kFamilies[] = {
    {{"SAX",  "DSAX",   "MAX",     "MGAX",  "SFMAX", "SFMGAX", "RAX",  "B2",  "B3",
      "PIPE", "ELBOW",  "FRAME",   "T2D",   "T3D",   "DC1D",   "AC1D", "R2D", "RB",
      "CONN", "SPRING", "DASHPOT", "JOINT", "GAP",   "ITS",    "TUBE"},
     1,
     0,
     false},
    {{"C3D", "CC3D", "DC3D", "DCC3D", "AC3D", "Q3D", "EC3D", "COH3D", "CSS", "SC", "CCL", "DCC", "GK3D"},
     3,
     3,
     false},
    {{"S3", "S4", "S8", "S9", "STRI", "DS"}, 2, 3, true},
    {{"M3D", "SFM3D", "R3D", "CCF", "ASI3D", "F3D"}, 2, 3, false},
    {{"CPE",  "CPS",   "CPEG",  "CAX",  "CGAX", "DC2D", "DCAX", "DCC2D", "DCCAX", "AC2D",
      "ACAX", "COH2D", "COHAX", "GKPS", "GKPE", "GKAX", "GK2D", "CINPE", "CINPS", "CINAX"},
     2,
     2,
     false},
};

bool LineLiesInSpace(std::string_view label) {
    return label.find("3D") != std::string_view::npos || label.starts_with("B3") ||
           label.starts_with("PIPE3") || label.starts_with("ELBOW") || label.starts_with("FRAME3");
}

} // namespace

ddb_ElementShape ddb_ShapeOfLabel(std::string_view typeLabel) {
    std::string label(typeLabel);
    std::transform(label.begin(), label.end(), label.begin(),
                   [](char c) { return c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c; });
    const Family* best = nullptr;
    std::size_t bestLength = 0;
    for (const Family& family : kFamilies) {
        for (const std::string_view beginning : family.beginnings) {
            if (beginning.size() > bestLength && label.starts_with(beginning)) {
                best = &family;
                bestLength = beginning.size();
            }
        }
    }
    ddb_ElementShape shape;
    if (best == nullptr) {
        shape.unknown =
            label != "MASS" && label != "ROTARYI" && label != "HEATCAP" && !label.starts_with("U");
        return shape;
    }
    shape.topologicalDimension = best->dimension;
    shape.embeddingDimension = best->embedding != 0 ? best->embedding : (LineLiesInSpace(label) ? 3 : 2);
    shape.shell = best->shell;
    return shape;
}

ddb_FaceRule ddb_FaceRuleOf(const ddb_ElementShape& shape) {
    const int d = shape.topologicalDimension;
    const int m = shape.embeddingDimension;
    if (d == 1) return {ddb_FaceRuleEnm::NUMBERED, "END"};
    if ((d == 2 && m == 3) || shape.shell) return {ddb_FaceRuleEnm::SHELL, ""};
    if (d == 3 || (d == 2 && m == 2)) return {ddb_FaceRuleEnm::NUMBERED, "S"};
    return {};
}
