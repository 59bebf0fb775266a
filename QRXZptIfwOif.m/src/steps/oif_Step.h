#ifndef QRX_OIF_STEP_H
#define QRX_OIF_STEP_H

#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/steps/kprC_Step.h"

class oif_KeywordLine;

/// The first line of a step, and its description below it:
///     *Step, name=NAME, nlgeom=YES, extrapolation=NO, amplitude=RAMP, inc=N, unsymm=YES
///     description
/// Which of the parameters a procedure takes, and what goes without saying, stands in its row,
/// oif_ProcedureRow.h. Writing a step whose row has no line raises.
class oif_Step final : public qkw_KeywordOf<oif_Step> {
public:
    /// `nlgeomInherited`: large displacements are in force when the step begins. The step must outlive the
    /// keyword.
    oif_Step(const kprC_AnalysisStep& step, bool nlgeomInherited, cow_String name)
        : nlgeomInherited_(nlgeomInherited), step_(&step), name_(std::move(name)) {}
    void Write(utl_Stream& stream) const override;

private:
    // Each writes nothing for a value that equals the default.
    static void PrintExtrapolate(oif_KeywordLine& line, kprC_Step::ExtrapolationEnm value,
                                 kprC_Step::ExtrapolationEnm defaultValue);
    static void PrintLoadAmplitude(oif_KeywordLine& line, kprC_Step::AmplitudeEnm value,
                                   kprC_Step::AmplitudeEnm defaultValue);
    static void PrintNlgeom(oif_KeywordLine& line, bool value, bool defaultValue);

    bool nlgeomInherited_;
    const kprC_AnalysisStep* step_;
    cow_String name_;
};

#endif
