#include "sections/oif_TransformBuilder.h"

void oif_TransformBuilder::Build() {}
