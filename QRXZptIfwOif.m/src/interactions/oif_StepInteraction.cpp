#include "interactions/oif_StepInteraction.h"

#include "keyword_layer/qkw_QuorixName.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/steps/kprC_Predicates.h"

void oif_StepInteraction::Write(utl_Stream& stream) const {
    const bool ended = interaction_.ConstGet().GetPropStatus(step_) == mdl_PropagationStatusEnm::DEACTIVATED;
    stream << Keyword();
    if (!ended) WriteParameters(stream);
    if (!notNew_) stream << ", op=NEW";
    stream << endl;
    if (ended) return;
    WriteData(stream);
    stream << endl;
}

void oif_StepInteraction::WriteNamed(utl_Stream& stream, const char* parameter, const cow_String& name) {
    if (name.IsEmpty()) return;
    stream.OptionalLineBreak();
    stream << parameter << qkw_QuorixName(name, false);
}

void oif_StepInteraction::WriteRegionType(utl_Stream& stream, int regionType) const {
    if (!kprC_IsExplicit(interaction_.ConstGet().ConstGetStateQuad(step_).procedureType)) return;
    stream.OptionalLineBreak();
    if (regionType == 1) stream << ", region type=SLIDING";
    if (regionType == 2) stream << ", region type=EULERIAN";
}
