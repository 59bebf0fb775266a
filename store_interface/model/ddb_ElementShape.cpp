#include "store_interface/model/ddb_ElementShape.h"

ddb_FaceRule ddb_FaceRuleOf(const ddb_ElementShape& shape) {
    const int d = shape.topologicalDimension;
    const int m = shape.embeddingDimension;
    if (d == 1) return {ddb_FaceRuleEnm::NUMBERED, "END"};
    if ((d == 2 && m == 3) || shape.shell) return {ddb_FaceRuleEnm::SHELL, ""};
    if (d == 3 || (d == 2 && m == 2)) return {ddb_FaceRuleEnm::NUMBERED, "S"};
    return {};
}
