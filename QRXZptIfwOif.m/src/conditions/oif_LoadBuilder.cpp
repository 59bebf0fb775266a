#include "conditions/oif_LoadBuilder.h"

void oif_LoadBuilder::Build() {}
