#include "steps/oif_MassScaling.h"

#include "foundation/nex_Exception.h"
#include "foundation/num_Truncated.h"

#include <string>

namespace {

using Scaling = kprC_MassScaling::MassScalingTypeEnm;

constexpr char kFixed[] = "*Fixed Mass Scaling";
constexpr char kVariable[] = "*Variable Mass Scaling";

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

} // namespace

void oif_MassScaling::WriteKind(utl_Stream& stream, const char* kind) const {
    stream << "** Mass Scaling: " << kind << endl;
}

void oif_MassScaling::WriteRegion(utl_Stream& stream) const {
    stream << "**               " << (scaling_.HasRegion() ? setName_ : cow_String("Whole Model")) << endl;
}

void oif_MassScaling::AddRegion(oif_KeywordLine& line) const {
    line.FixedIf(scaling_.HasRegion(), ", elset=", setName_);
}

void oif_MassScaling::AddDt(oif_KeywordLine& line) const {
    if (scaling_.dt != 0.0) line.Fixed(", dt=", scaling_.dt).Fixed(", type=", DtRule(scaling_.dtType));
}

void oif_MassScaling::AddRecurrence(oif_KeywordLine& line) const {
    if (scaling_.frequency != 0) {
        line.Fixed(", frequency=", scaling_.frequency);
    } else {
        line.Fixed(", number interval=", scaling_.numberInterval);
    }
}

void oif_FixedMassScaling::Write(utl_Stream& stream) const {
    if (scaling_.type == Scaling::REINITIALIZE) {
        WriteKind(stream, "Reinitialize Mass");
        WriteRegion(stream);
        oif_KeywordLine line(stream, kFixed);
        AddRegion(line);
        line.End();
    } else if (scaling_.type == Scaling::SEMI_AUTOMATIC) {
        WriteKind(stream, "Semi-Automatic");
        WriteRegion(stream);
        oif_KeywordLine line(stream, kFixed);
        AddRegion(line);
        AddDt(line);
        line.FixedUnless(", factor=", scaling_.factor, 0.0);
        // The kind gates the frequency too, also here where the masses are scaled once only.
        if (scaling_.frequencyKind == kprC_MassScaling::FrequencyKindEnm::NUMBER_INTERVAL) {
            AddRecurrence(line);
        }
        line.End();
    } else {
        // A kind that has no fixed form: an empty line.
        stream.LineBreak();
    }
}

void oif_VariableMassScaling::Write(utl_Stream& stream) const {
    if (scaling_.type == Scaling::DISABLE_THROUGHOUT_STEP) {
        // No region at all, in the comment neither.
        WriteKind(stream, "Disable Throughout Step");
        oif_KeywordLine(stream, kVariable).End();
    } else if (scaling_.type == Scaling::SEMI_AUTOMATIC) {
        WriteKind(stream, "Semi-Automatic");
        WriteRegion(stream);
        oif_KeywordLine line(stream, kVariable);
        AddRegion(line);
        AddDt(line);
        if (scaling_.frequencyKind == kprC_MassScaling::FrequencyKindEnm::NUMBER_INTERVAL) {
            AddRecurrence(line);
        }
        line.End();
    } else if (scaling_.type == Scaling::AUTOMATIC) {
        WriteRolling(stream);
    } else {
        // A kind that has no variable form: an empty line.
        stream.LineBreak();
    }
}

void oif_VariableMassScaling::WriteRolling(utl_Stream& stream) const {
    const int direction = static_cast<int>(scaling_.direction) + 1;
    constexpr int none = static_cast<int>(kprC_MassScaling::RollingDirectionEnm::NONE) + 1;
    if (direction < 1 || direction > none) nex_Raise("Corrupted Explicit Dynamics procedure");
    WriteKind(stream, "Automatic");
    WriteRegion(stream);
    oif_KeywordLine line(stream, kVariable);
    AddRegion(line);
    // The line always ends behind the comma of the feed rate.
    line.Fixed(", type=rolling").Fixed(", feed rate=", scaling_.feedRate).Text(",").End();
    line.Text("extruded length=")
        .Text(scaling_.extrudedLength)
        .Fixed(", cross section=", num_Truncated(scaling_.crossSection))
        .FixedIf(direction < none, ", direction=", direction);
    AddRecurrence(line);
    line.End();
}
