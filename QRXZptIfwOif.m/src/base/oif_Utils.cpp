#include "base/oif_Utils.h"

#include "keyword_layer/qkw_QuorixName.h"

bool oif_Utils::CheckDataState(const mdl_PropAttributeStateEnm& state, const bool& flag) {
    return state == mdl_PropAttributeStateEnm::SET || (state == mdl_PropAttributeStateEnm::CARRIED && !flag);
}

void oif_Utils::SetDeactivateOpFlags(const mdl_PropagationStatusEnm& status, bool& first, bool& second) {
    first = status == mdl_PropagationStatusEnm::DEACTIVATED ||
            status == mdl_PropagationStatusEnm::DEACTIVATED_FROM_BASE_STATE;
    if (first) second = false;
}

cow_String oif_Utils::GetConnectorSetName(cow_String name) {
    return qkw_QuorixName(name, false).Printable();
}
