#ifndef QRX_OIF_PROCEDUREROW_H
#define QRX_OIF_PROCEDUREROW_H

#include "base/oif_ModelInfo.h"
#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/steps/kprC_Step.h"

#include <optional>
#include <span>

// What is raised for a procedure without a row, and for one whose *Step line can't be written.
inline constexpr char oif_kProcedureError[] = "Unimplemented procedure print method";
inline constexpr char oif_kStepLineError[] = "Unimplemented function to write out *Step card";

/// How a procedure tells of large displacements in its *Step line.
enum class oif_Nonlinearity {
    NONE,
    /// YES or NO where the step differs from what it finds: explicit procedures can turn it off.
    CHANGE,
    /// YES when it is or was on, never NO: what was once on stays on.
    LATCHED,
    PERTURBATION
};

/// Which parameters the *Step line of a procedure takes, and what goes without saying.
struct oif_StepLine {
    /// What the line asks of a step beyond the queries of all steps; absent where the class has no such
    /// field.
    struct Fields {
        std::optional<kprC_Step::ExtrapolationEnm> extrapolation;
        std::optional<kprC_Step::AmplitudeEnm> amplitude;
        std::optional<int> maxNumInc;
    };

    oif_Nonlinearity nonlinearity;
    std::optional<kprC_Step::ExtrapolationEnm> extrapolationDefault; // absent: not written
    std::optional<kprC_Step::AmplitudeEnm> amplitudeDefault;         // absent: not written
    bool writesInc;
    bool (*allowsUnsymm)(const kprC_AnalysisStep& step);
};

/// What the writer knows of a procedure.
struct oif_ProcedureRow {
    unsigned typeId;
    /// Absent: the line can't be written.
    std::optional<oif_StepLine> line;
    oif_StepLine::Fields (*lineFields)(const kprC_AnalysisStep& step);
    /// The keyword of the procedure and those that belong to it. `previousProcedure` is the class number of
    /// the step before, 0 for none.
    qkw_KeywordList (*make)(const kprC_AnalysisStep& step, const oif_ModelInfo& modelInfo,
                            unsigned previousProcedure);
    /// Whether *Solution Technique is among them.
    bool saysTechnique;
};

/// A row for each procedure.
std::span<const oif_ProcedureRow> oif_ProcedureRows();
/// Null for what is none.
const oif_ProcedureRow* oif_FindProcedureRow(unsigned typeId);

#endif
