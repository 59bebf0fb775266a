#include "steps/oif_Procedure.h"

void oif_AddStabilization(oif_KeywordLine& line, int method, double magnitude) {
    if (method != 1 && method != 2) return;
    line.MayBreak().Fixed(method == 1 ? ", stabilize=" : ", stabilize, factor=", magnitude);
}
