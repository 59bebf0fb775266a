#include "steps/oif_Procedure.h"

void oif_WriteStabilization(utl_Stream& stream, int method, double magnitude) {
    if (method != 1 && method != 2) return;
    stream.OptionalLineBreak();
    stream << (method == 1 ? ", stabilize" : ", stabilize, factor") << "=" << magnitude;
}
