#include "keyword_layer/qkw_Model.h"

const omu_EnumTable& omu_EnumTableOf(mdl_Model::FormulationEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "NOT_SET", "NOT_SET"}, {1, "SCATTERED", "SCATTERED"}, {2, "TOTAL", "TOTAL"}};
    static constexpr omu_EnumTable table{"mdl_Model::FormulationEnm", rows};
    return table;
}
