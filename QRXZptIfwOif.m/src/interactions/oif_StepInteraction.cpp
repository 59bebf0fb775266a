#include "interactions/oif_StepInteraction.h"

#include "keyword_layer/qkw_QuorixName.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/steps/kprC_Predicates.h"

void oif_StepInteraction::Write(utl_Stream& stream) const {
    const bool ended = interaction_.ConstGet().GetPropStatus(step_) == mdl_PropagationStatusEnm::DEACTIVATED;
    oif_KeywordLine line(stream, Keyword());
    if (!ended) AddParameters(line);
    line.Op(op_).End();
    if (ended) return;
    WriteData(stream);
    stream << endl;
}

void oif_StepInteraction::AddNamed(oif_KeywordLine& line, const char* parameter, const cow_String& name) {
    if (!name.IsEmpty()) line.MayBreak().Fixed(parameter, qkw_QuorixName(name, false));
}

void oif_StepInteraction::AddRegionType(oif_KeywordLine& line, int regionType) const {
    if (!kprC_IsExplicit(interaction_.ConstGet().ConstGetStateQuad(step_).procedureType)) return;
    line.MayBreak()
        .FixedIf(regionType == 1, ", region type=SLIDING")
        .FixedIf(regionType == 2, ", region type=EULERIAN");
}
