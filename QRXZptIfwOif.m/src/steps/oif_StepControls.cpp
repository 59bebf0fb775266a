#include "steps/oif_StepControls.h"

#include "base/oif_KeywordLine.h"
#include "foundation/num_Truncated.h"
#include "steps/oif_ProcedureRow.h"

#include <algorithm>

namespace {

// The entries of the time incrementation before this one are whole numbers.
constexpr int kIntegerEntries = 11;
constexpr int kEntriesOfLine = 8;
// Fewer entries make no field.
constexpr int kLeastFieldEntries = 4;

/// Whether the entry exists and isn't its default. Defaults are compared exactly.
bool IsWritten(const cow_List<double>& values, const cow_List<double>& defaults, int index) {
    return index < values.Length() && (index >= defaults.Length() || values[index] != defaults[index]);
}

/// Whether the lists differ from the entry `first` on, in their lengths or in an entry.
bool DifferFrom(int first, const cow_List<double>& values, const cow_List<double>& defaults) {
    if (values.Length() != defaults.Length()) return std::max(values.Length(), defaults.Length()) > first;
    for (int i = first; i < values.Length(); ++i) {
        if (values[i] != defaults[i]) return true;
    }
    return false;
}

} // namespace

void oif_Controls::Write(utl_Stream& stream) const {
    const kprC_PrimaryControls& controls = Record();
    if (controls.useDefault) return;
    oif_KeywordLine(stream, "*Controls").Fixed(", reset").End();
    if (!controls.resetOnly) WriteBlocks(stream);
}

void oif_Controls::WritePrimaryControls(utl_Stream& stream,
                                        const kprC_PrimaryControls& primaryControls) const {
    if (primaryControls.discontinuous) {
        oif_KeywordLine(stream, "*Controls").Fixed(", analysis=discontinuous").End();
    }

    const cow_List<double>& time = primaryControls.timeIncrementation;
    const cow_List<double> timeDef =
        kprC_PrimaryControls::timeIncrementationDef(primaryControls.discontinuous);
    if (DifferFrom(0, time, timeDef)) {
        oif_KeywordLine(stream, "*Controls").Fixed(", parameters=time incrementation").End();
        for (int i = 0; i < kIntegerEntries; ++i) {
            if (i > 0) stream << ", ";
            if (IsWritten(time, timeDef, i)) stream << num_Truncated(time[i]);
        }
        if (DifferFrom(kIntegerEntries, time, timeDef)) {
            stream.LineBreak();
            PrintControlsData(stream, time, timeDef, kIntegerEntries, time.Length() - 1, -1, false);
        }
        stream << endl;
    }

    const auto block = [&](const char* parameters, const cow_List<double>& values,
                           const cow_List<double>& defaults) {
        if (!DifferFrom(0, values, defaults)) return;
        oif_KeywordLine(stream, "*Controls").Fixed(", parameters=", parameters).End();
        PrintControlsData(stream, values, defaults, 0, values.Length() - 1, -1, false);
        stream << endl;
    };
    block("constraints", primaryControls.constraints, kprC_PrimaryControls::constraintsDef());
    block("line search", primaryControls.lineSearch, kprC_PrimaryControls::lineSearchDef());
}

void oif_Controls::WriteFieldControls(utl_Stream& stream, const char* field, const cow_List<double>& values,
                                      const cow_List<double>& defaults) const {
    if (!DifferFrom(0, values, defaults)) return;
    oif_KeywordLine(stream, "*Controls").Fixed(", parameters=field").Fixed(", field=", field).End();
    PrintFieldData(stream, values, defaults);
}

void oif_Controls::PrintFieldData(utl_Stream& stream, const cow_List<double>& values,
                                  const cow_List<double>& defaults) const {
    if (values.Length() >= kLeastFieldEntries && values.Length() == defaults.Length()) {
        for (int i = 0; i < kEntriesOfLine; ++i) {
            if (i > 0) stream << ", ";
            if (IsWritten(values, defaults, i)) stream << values[i];
        }
        if (DifferFrom(kEntriesOfLine, values, defaults)) {
            stream.LineBreak();
            PrintControlsData(stream, values, defaults, kEntriesOfLine, values.Length() - 1, -1, false);
        }
    }
    stream << endl;
}

void oif_Controls::PrintControlsData(utl_Stream& stream, const cow_List<double>& values,
                                     const cow_List<double>& defaults, int first, int last, int excluded,
                                     bool) const {
    const auto isWritten = [&](int i) { return i != excluded && IsWritten(values, defaults, i); };
    int end = last;
    while (end >= first && !isWritten(end)) --end;
    if (end < first) return;
    // The whole line on which the last written entry stands.
    const int lastLine = first + (end - first) / kEntriesOfLine * kEntriesOfLine;
    end = std::min(last, lastLine + kEntriesOfLine - 1);
    for (int i = first; i <= end; ++i) {
        if (isWritten(i)) stream << values[i];
        if (i == end) break;
        if ((i - first) % kEntriesOfLine == kEntriesOfLine - 1) {
            stream.LineBreak();
        } else {
            stream << ", ";
        }
    }
}

void oif_TypicalControls::WriteTypicalControls(utl_Stream& stream) const {
    const kprC_TypicalControls& controls = Record();
    WritePrimaryControls(stream, controls);
    WriteFieldControls(stream, "displacement", controls.displacement, kprC_PrimaryControls::fieldDef(true));
    const cow_List<double> defaults = kprC_PrimaryControls::fieldDef(false);
    WriteFieldControls(stream, "hydrostatic fluid pressure", controls.hydrostaticFluidPressure, defaults);
    WriteFieldControls(stream, "rotation", controls.rotation, defaults);
}

void oif_HeatTransferControls::WriteHeatTransferControls(utl_Stream& stream) const {
    const kprC_HeatTransferControls& controls = Record();
    WritePrimaryControls(stream, controls);
    WriteFieldControls(stream, "temperature", controls.temperature, kprC_PrimaryControls::fieldDef(false));
}

void oif_MassDiffusionControls::WriteBlocks(utl_Stream& stream) const {
    WriteFieldControls(stream, "concentration", Record().concentration,
                       kprC_PrimaryControls::fieldDef(false));
}

void oif_SolverControls::Write(utl_Stream& stream) const {
    if (controls_.useDefault) return;
    oif_KeywordLine(stream, "*Solver Controls").Fixed(", reset").End();
    if (controls_.resetOnly) return;
    oif_KeywordLine(stream, "*Solver Controls").End();
    if (controls_.relativeTolerance != 0.0) stream << controls_.relativeTolerance;
    stream << ", ";
    if (controls_.maxIterations != 0) stream << controls_.maxIterations;
    stream << endl;
}

void oif_SolutionTechnique::Write(utl_Stream& stream) const {
    const oif_ProcedureRow* row = oif_FindProcedureRow(step_->DynTypeId());
    // The other steps have a technique too, and it is never written.
    if (row == nullptr || !row->saysTechnique) return;
    if (step_->SolutionTechnique() == kprC_Step::SolutionTechniqueEnm::SEPARATED) {
        oif_KeywordLine(stream, "*Solution Technique").Fixed(", type=SEPARATED").End();
    }
}
