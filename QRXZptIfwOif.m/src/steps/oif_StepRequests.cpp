#include "steps/oif_StepRequests.h"

#include "store_interface/records/cls_ClassRegistrar.h"

#include <optional>

namespace {

const char* WriteBool(bool value) {
    return value ? "YES" : "NO";
}

/// One *Print line: the parameters that differ, none when none does.
class PrintLine {
public:
    explicit PrintLine(utl_Stream& stream) : stream_(stream) {}
    PrintLine(const PrintLine&) = delete;
    PrintLine& operator=(const PrintLine&) = delete;

    PrintLine& Parameter(const char* name, int value, int former) {
        if (value != former) Begun().Fixed(name, value);
        return *this;
    }
    PrintLine& Parameter(const char* name, bool value, bool former) {
        if (value != former) Begun().Fixed(name, WriteBool(value));
        return *this;
    }
    void End() {
        if (line_) line_->End();
    }

private:
    oif_KeywordLine& Begun() {
        if (!line_) line_.emplace(stream_, "*Print");
        return *line_;
    }

    utl_Stream& stream_;
    std::optional<oif_KeywordLine> line_;
};

/// The former print if it is a T, else the solver's defaults.
template <class T>
T Reference(const mdl_ObjCow<kprC_DiagnosticPrint>& previous) {
    const T* print = nex_canDynamicCastPtr<T>(static_cast<const kprC_DiagnosticPrint*>(previous.Referent()));
    return print == nullptr ? T() : *print;
}

} // namespace

void oif_Restart::Write(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Restart");
    if (restart_.IsNull()) {
        AddRead(line);
        line.End();
        return;
    }
    const kprC_Restart& restart = restart_.ConstGet();
    const auto addIntervals = [&line](const auto& record) {
        line.Fixed(", number interval=", record.numberInterval)
            .Fixed(", time marks=", WriteBool(record.timeMarks));
    };
    line.Fixed(", write").FixedIf(restart.overlay, ", overlay");
    if (const auto* explicitRestart = nex_canDynamicCastPtr<kprC_ExplicitRestart>(&restart)) {
        addIntervals(*explicitRestart);
    } else {
        const auto& standard = nex_canDynamicCastRef<kprC_StandardRestart>(restart, NEX_HERE);
        if (standard.numberInterval < 1) {
            line.Fixed(", frequency=", standard.frequency);
        } else {
            addIntervals(standard);
        }
    }
    line.End();
}

void oif_Restart::AddRead(oif_KeywordLine& line) const {
    line.Fixed(", read")
        .Fixed(", step=", step_)
        .FixedIf(increment_ != kNoIncrement, useInc_ ? ", inc=" : ", interval=", increment_)
        .FixedIf(endStep_, ", end step");
}

void oif_Monitor::Write(utl_Stream& stream) const {
    if (IsEmpty()) return;
    const kprC_Monitor& monitor = monitor_.ConstGet();
    oif_KeywordLine line(stream, "*Monitor");
    line.Fixed(", dof=", monitor.dof).Fixed(", node=", setName_);
    if (const auto* standard = nex_canDynamicCastPtr<kprC_StandardMonitor>(&monitor)) {
        line.Fixed(", frequency=", standard->frequency);
    }
    line.End();
}

void oif_DiagnosticPrint::Write(utl_Stream& stream) const {
    const kprC_DiagnosticPrint* const print = print_.Referent();
    if (const auto* explicitPrint = nex_canDynamicCastPtr<kprC_ExplicitDiagnosticPrint>(print)) {
        const auto former = Reference<kprC_ExplicitDiagnosticPrint>(previous_);
        PrintLine(stream)
            .Parameter(", allke=", explicitPrint->allke, former.allke)
            .Parameter(", critical element=", explicitPrint->criticalElement, former.criticalElement)
            .Parameter(", etotal=", explicitPrint->etotal, former.etotal)
            .Parameter(", dmass=", explicitPrint->dmass, former.dmass)
            .End();
        return;
    }
    const auto former = Reference<kprC_StandardDiagnosticPrint>(previous_);
    if (const auto* perturbation = nex_canDynamicCastPtr<kprC_PerturbationDiagnosticPrint>(print)) {
        PrintLine(stream)
            .Parameter(", frequency=", perturbation->frequency, former.frequency)
            .Parameter(", solve=", perturbation->solve, former.solve)
            .End();
    } else if (const auto* standard = nex_canDynamicCastPtr<kprC_StandardDiagnosticPrint>(print)) {
        // The standard print has no ", solve=": that of the perturbation prints is only kept in it.
        PrintLine(stream)
            .Parameter(", contact=", standard->contact, former.contact)
            .Parameter(", frequency=", standard->frequency, former.frequency)
            .Parameter(", model change=", standard->modelChange, former.modelChange)
            .End();
    }
}
