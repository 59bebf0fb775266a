#include "conditions/oif_BoundaryConditionBuilder.h"

void oif_BoundaryConditionBuilder::Build() {}
