#include "materials/oif_MaterialBuilder.h"

void oif_MaterialBuilder::Build() {}
