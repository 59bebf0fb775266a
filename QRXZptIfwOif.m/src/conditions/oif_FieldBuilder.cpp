#include "conditions/oif_FieldBuilder.h"

void oif_FieldBuilder::Build() {}
