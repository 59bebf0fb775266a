#include "sections/oif_PartAttributesBuilder.h"

void oif_PartAttributesBuilder::Build() {}
