#ifndef QRX_STORE_DDB_ELEMENTSHAPE_H
#define QRX_STORE_DDB_ELEMENTSHAPE_H

#include <string_view>

/// What an element type's faces are named by.
struct ddb_ElementShape {
    int topologicalDimension = 0;
    int embeddingDimension = 3;
    bool shell = false;
    /// The type is none of the known families and none of the point elements (MASS, ROTARYI, HEATCAP and user
    /// elements U...).
    bool unknown = false;
};

/// The shape by the longest known beginning of the label, in any capitals.
ddb_ElementShape ddb_ShapeOfLabel(std::string_view typeLabel);

/// How the facets of a shape are named: "S" or "END" and the facet's number, or by the two sides of a shell.
enum class ddb_FaceRuleEnm { NUMBERED, SHELL };
struct ddb_FaceRule {
    ddb_FaceRuleEnm rule = ddb_FaceRuleEnm::NUMBERED;
    const char* prefix = "";
};
ddb_FaceRule ddb_FaceRuleOf(const ddb_ElementShape& shape);

#endif
