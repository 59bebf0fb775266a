#include "steps/oif_StepExtras.h"

#include "foundation/num_Truncated.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <string>

namespace {

using Scaling = kprC_MassScaling::MassScalingTypeEnm;

constexpr char kFixed[] = "*Fixed Mass Scaling";
constexpr char kVariable[] = "*Variable Mass Scaling";

const char* WriteBool(bool value) {
    return value ? "YES" : "NO";
}

cow_String DtRule(kprC_MassScaling::DtTypeEnm rule) {
    switch (rule) {
    case kprC_MassScaling::DtTypeEnm::BELOW_MIN: return "below min";
    case kprC_MassScaling::DtTypeEnm::SET_EQUAL_DT: return "set equal dt";
    default: break;
    }
    std::string word(omu_PrimEnum<kprC_MassScaling::DtTypeEnm, 4>(rule).GetString().View());
    for (char& c : word) {
        if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
    }
    return cow_String(word);
}

const char* OptionsOf(const kprC_CompositeDamping&) {
    return ", modal=COMPOSITE";
}
const char* OptionsOf(const kprC_DirectDamping&) {
    return "";
}
const char* OptionsOf(const kprC_RayleighDamping&) {
    return ", rayleigh";
}
const char* OptionsOf(const kprC_StructuralDamping&) {
    return ", structural";
}
const char* OptionsOf(const kprC_DirectDampingByFrequency&) {
    return ", definition=FREQUENCY RANGE";
}
const char* OptionsOf(const kprC_RayleighDampingByFrequency&) {
    return ", rayleigh, definition=FREQUENCY RANGE";
}
const char* OptionsOf(const kprC_StructuralDampingByFrequency&) {
    return ", structural, definition=FREQUENCY RANGE";
}

void WriteRow(utl_Stream& stream, const kprC_CompositeDampingRow& row) {
    stream << row.firstMode << ", " << row.lastMode << endl;
}
void WriteRow(utl_Stream& stream, const kprC_ModeDampingRow& row) {
    stream << row.firstMode << ", " << row.lastMode << ", " << row.value << endl;
}
void WriteRow(utl_Stream& stream, const kprC_RayleighDampingRow& row) {
    stream << row.firstMode << ", " << row.lastMode << ", " << row.alpha << ", " << row.beta << endl;
}
void WriteRow(utl_Stream& stream, const kprC_FrequencyDampingRow& row) {
    stream << row.low << ", " << row.value << endl;
}
void WriteRow(utl_Stream& stream, const kprC_RayleighFrequencyDampingRow& row) {
    stream << row.low << ", " << row.alpha << ", " << row.beta << endl;
}

/// One *Print line: the parameters that differ, none when none does.
class PrintLine {
public:
    explicit PrintLine(utl_Stream& stream) : stream_(stream) {}
    PrintLine(const PrintLine&) = delete;
    PrintLine& operator=(const PrintLine&) = delete;

    PrintLine& Parameter(const char* name, int value, int former) {
        if (value != former) Begin() << name << value;
        return *this;
    }
    PrintLine& Parameter(const char* name, bool value, bool former) {
        if (value != former) Begin() << name << WriteBool(value);
        return *this;
    }
    void End() {
        if (begun_) stream_ << endl;
    }

private:
    utl_Stream& Begin() {
        if (!begun_) stream_ << "*Print";
        begun_ = true;
        return stream_;
    }

    utl_Stream& stream_;
    bool begun_ = false;
};

/// The former print if it is a T, else the solver's defaults.
template <class T>
T Reference(const mdl_ObjCow<kprC_DiagnosticPrint>& previous) {
    const T* print = nex_canDynamicCastPtr<T>(static_cast<const kprC_DiagnosticPrint*>(previous.Referent()));
    return print == nullptr ? T() : *print;
}

} // namespace

void oif_MassScaling::WriteKind(utl_Stream& stream, const char* kind) const {
    stream << "** Mass Scaling: " << kind << endl;
}

void oif_MassScaling::WriteRegion(utl_Stream& stream) const {
    stream << "**               " << (scaling_.HasRegion() ? setName_ : cow_String("Whole Model")) << endl;
}

void oif_MassScaling::WriteKeyword(utl_Stream& stream, const char* keyword) const {
    stream << keyword;
    if (scaling_.HasRegion()) stream << ", elset=" << setName_;
}

void oif_MassScaling::WriteDt(utl_Stream& stream) const {
    if (scaling_.dt != 0.0) stream << ", dt=" << scaling_.dt << ", type=" << DtRule(scaling_.dtType);
}

void oif_MassScaling::WriteRecurrence(utl_Stream& stream) const {
    if (scaling_.frequency != 0) {
        stream << ", frequency=" << scaling_.frequency;
    } else {
        stream << ", number interval=" << scaling_.numberInterval;
    }
}

void oif_FixedMassScaling::Write(utl_Stream& stream) const {
    if (scaling_.type == Scaling::REINITIALIZE) {
        WriteKind(stream, "Reinitialize Mass");
        WriteRegion(stream);
        WriteKeyword(stream, kFixed);
    } else if (scaling_.type == Scaling::SEMI_AUTOMATIC) {
        WriteKind(stream, "Semi-Automatic");
        WriteRegion(stream);
        WriteKeyword(stream, kFixed);
        WriteDt(stream);
        if (scaling_.factor != 0.0) stream << ", factor=" << scaling_.factor;
        // The kind gates the frequency too, also here where the masses are scaled once only.
        if (scaling_.frequencyKind == kprC_MassScaling::FrequencyKindEnm::NUMBER_INTERVAL)
            WriteRecurrence(stream);
    }
    // Also after a kind that has no fixed form: an empty line.
    stream << endl;
}

void oif_VariableMassScaling::Write(utl_Stream& stream) const {
    if (scaling_.type == Scaling::DISABLE_THROUGHOUT_STEP) {
        // No region at all, in the comment neither.
        WriteKind(stream, "Disable Throughout Step");
        stream << kVariable;
    } else if (scaling_.type == Scaling::SEMI_AUTOMATIC) {
        WriteKind(stream, "Semi-Automatic");
        WriteRegion(stream);
        WriteKeyword(stream, kVariable);
        WriteDt(stream);
        if (scaling_.frequencyKind == kprC_MassScaling::FrequencyKindEnm::NUMBER_INTERVAL)
            WriteRecurrence(stream);
    } else if (scaling_.type == Scaling::AUTOMATIC) {
        WriteRolling(stream);
    }
    // Also after a kind that has no variable form: an empty line.
    stream << endl;
}

void oif_VariableMassScaling::WriteRolling(utl_Stream& stream) const {
    const int direction = static_cast<int>(scaling_.direction) + 1;
    constexpr int none = static_cast<int>(kprC_MassScaling::RollingDirectionEnm::NONE) + 1;
    if (direction < 1 || direction > none) nex_Raise("Corrupted Explicit Dynamics procedure");
    WriteKind(stream, "Automatic");
    WriteRegion(stream);
    WriteKeyword(stream, kVariable);
    stream << ", type=rolling, feed rate=" << scaling_.feedRate << "," << endl;
    stream << "extruded length=" << scaling_.extrudedLength
           << ", cross section=" << num_Truncated(scaling_.crossSection);
    if (direction < none) stream << ", direction=" << direction;
    WriteRecurrence(stream);
}

void oif_ModalDamping::Write(utl_Stream& stream) const {
    stream << "*Modal Damping";
    std::visit(
        [&stream](const auto& damping) {
            if (damping.IsNull()) return;
            const auto& record = damping.ConstGet();
            stream << OptionsOf(record) << endl;
            for (int i = 0; i < record.rows.Length(); ++i) WriteRow(stream, record.rows[i]);
        },
        damping_);
}

void oif_SelectEigenmodes::Write(utl_Stream& stream) const {
    stream << "*Select Eigenmodes, generate" << endl;
    stream << "1, " << count_ << ", 1" << endl;
}

void oif_LoadCase::Write(utl_Stream& stream) const {
    stream << "*Load Case, name=" << qkw_QuorixName(name_, false) << endl;
}

void oif_Restart::Write(utl_Stream& stream) const {
    if (restart_.IsNull()) {
        WriteRead(stream);
        return;
    }
    const kprC_Restart& restart = restart_.ConstGet();
    const auto intervals = [&stream](const auto& record) {
        stream << "number interval=" << record.numberInterval
               << ", time marks=" << WriteBool(record.timeMarks);
    };
    stream << "*Restart, write, ";
    if (restart.overlay) stream << "overlay, ";
    if (restart.DynTypeId() == kprC_ExplicitRestart::TypeId()) {
        intervals(static_cast<const kprC_ExplicitRestart&>(restart));
    } else {
        const auto& standard = nex_canDynamicCastRef<kprC_StandardRestart>(restart, NEX_HERE);
        if (standard.numberInterval < 1) {
            stream << "frequency=" << standard.frequency;
        } else {
            intervals(standard);
        }
    }
    stream << endl;
}

void oif_Restart::WriteRead(utl_Stream& stream) const {
    stream << "*Restart, read, step=" << step_;
    if (increment_ != kNoIncrement) stream << ", " << (useInc_ ? "inc=" : "interval=") << increment_;
    if (endStep_) stream << ", end step";
    stream << endl;
}

void oif_Monitor::Write(utl_Stream& stream) const {
    if (IsEmpty()) return;
    const kprC_Monitor& monitor = monitor_.ConstGet();
    stream << "*Monitor, dof=" << monitor.dof << ", node=" << setName_;
    if (const auto* standard = nex_canDynamicCastPtr<kprC_StandardMonitor>(&monitor)) {
        stream << ", frequency=" << standard->frequency;
    }
    stream << endl;
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
