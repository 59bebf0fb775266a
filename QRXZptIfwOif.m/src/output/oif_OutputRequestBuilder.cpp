#include "output/oif_OutputRequestBuilder.h"

void oif_OutputRequestBuilder::Build() {}
