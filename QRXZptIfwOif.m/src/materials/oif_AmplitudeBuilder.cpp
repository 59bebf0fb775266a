#include "materials/oif_AmplitudeBuilder.h"

void oif_AmplitudeBuilder::Build() {}
