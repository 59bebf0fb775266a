#include "steps/oif_StepBuilder.h"

void oif_StepBuilder::Build() {}
