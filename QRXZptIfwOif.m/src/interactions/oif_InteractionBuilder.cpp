#include "interactions/oif_InteractionBuilder.h"

void oif_InteractionBuilder::Build() {}
