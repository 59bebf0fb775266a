#ifndef QRX_OIF_PROCEDURE_H
#define QRX_OIF_PROCEDURE_H

#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/steps/kprC_Step.h"

/// Base of the keyword K of a procedure: holds a copy of the step's record R. A step of another class raises.
template <class K, class R>
class oif_ProcedureOf : public qkw_KeywordOf<K> {
public:
    explicit oif_ProcedureOf(const kprC_AnalysisStep& step)
        : step_(nex_canDynamicCastRef<R>(step, NEX_HERE)) {}

protected:
    R step_;
};

inline const char* oif_YesOrNo(bool flag) {
    return flag ? "YES" : "NO";
}

/// The value unless it equals the one that goes without saying.
inline void oif_WriteUnless(utl_Stream& stream, double value, double silent) {
    if (value != silent) stream << value;
}
/// The value unless it is unset.
inline void oif_WriteWhenSet(utl_Stream& stream, double value) {
    oif_WriteUnless(stream, value, cls_UnsetDouble);
}
inline void oif_WriteWhenSet(utl_Stream& stream, int value) {
    if (value != cls_UnsetInt) stream << value;
}

/// The items of a data line with ", " between them; an unset one leaves its place empty.
template <class First, class... Others>
void oif_WriteItems(utl_Stream& stream, First first, Others... others) {
    oif_WriteWhenSet(stream, first);
    ((stream << ", ", oif_WriteWhenSet(stream, others)), ...);
}

/// ", stabilize=M" for method 1, ", stabilize, factor=M" for method 2, nothing for others. All enumerations
/// of stabilization methods share these numbers.
void oif_AddStabilization(oif_KeywordLine& line, int method, double magnitude);

template <class Step>
void oif_AddStabilization(oif_KeywordLine& line, const Step& step) {
    oif_AddStabilization(line, static_cast<int>(step.stabilizationMethod), step.stabilizationMagnitude);
}

/// Whether the increments are chosen by the solver, within bounds.
template <class Step>
bool oif_IsAutomatic(const Step& step) {
    return step.timeIncrementationMethod == Step::TimeIncrementationEnm::AUTOMATIC;
}

/// "initial, period, ", then "min, max" when the increments are automatic.
template <class Step>
void oif_WriteIncrements(utl_Stream& stream, const Step& step) {
    // The separator stays at the end when the increments are fixed.
    stream << step.initialInc << ", " << step.timePeriod << ", ";
    if (oif_IsAutomatic(step)) stream << step.minInc << ", " << step.maxInc;
}

/// "direct" or "direct=NO STOP", for steps whose increments are fixed.
template <class Step>
const char* oif_DirectText(const Step& step) {
    return step.noStop ? "direct=NO STOP" : "direct";
}

#endif
