#include "constraints/oif_ConstraintBuilder.h"

void oif_ConstraintBuilder::Build() {}
