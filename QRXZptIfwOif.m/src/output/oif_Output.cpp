#include "output/oif_Output.h"

#include "base/oif_DataLines.h"
#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "store_interface/records/steps/kprC_Predicates.h"

#include <algorithm>

using Location = korC_OdbRequestSpec::LocationEnm;

namespace {

constexpr int kNodeNames = 8;
constexpr int kPointsPerKeyword = 16;
constexpr int kModesPerLine = 16;
constexpr int kSurfaceFlag = 8;

/// A parameter with a name, unless it is empty.
void WriteParameter(utl_Stream& stream, const char* parameter, const cow_String& name) {
    if (name.IsEmpty()) return;
    stream << ", ";
    stream.OptionalLineBreak();
    stream << parameter << name;
}

} // namespace

oif_Output::oif_Output(const korC_OdbChannel& channel, TypeEnm type, bool timeMarks, bool pre, bool all,
                       unsigned stepType, const cow_String& filter)
    : timeMarks_(timeMarks), filter_(filter), type_(type), pre_(pre), all_(all), stepType_(stepType),
      channel_(channel) {}

oif_Output::oif_Output(const korC_OdbChannel& channel, TypeEnm type, int frequency, bool pre, bool all,
                       unsigned stepType, const cow_String& filter)
    : oif_Output(channel, type, !kprC_IsExplicit(stepType), pre, all, stepType, filter) {
    frequency_ = frequency;
}

oif_Output::oif_Output(const korC_OdbChannel& channel, TypeEnm type, int numberInterval, bool timeMarks,
                       bool pre, bool all, double stepTime, unsigned stepType, const cow_String& filter)
    : oif_Output(channel, type, timeMarks, pre, all, stepType, filter) {
    numberInterval_ = numberInterval;
    stepTime_ = stepTime;
}

oif_Output::oif_Output(const korC_OdbChannel& channel, TypeEnm type, double timeInterval, bool timeMarks,
                       bool pre, bool all, unsigned stepType, const cow_String& filter)
    : oif_Output(channel, type, timeMarks, pre, all, stepType, filter) {
    timeInterval_ = timeInterval;
}

oif_Output::oif_Output(const korC_OdbChannel& channel, TypeEnm type, const cls_xpListInt& modeList, bool pre,
                       bool all, unsigned stepType, const cow_String& filter)
    : oif_Output(channel, type, !kprC_IsExplicit(stepType), pre, all, stepType, filter) {
    modeList_ = modeList;
}

oif_Output::oif_Output(const korC_OdbChannel& channel, TypeEnm type, const cow_String& timePoints,
                       bool timeMarks, bool pre, bool all, unsigned stepType, const cow_String& filter)
    : oif_Output(channel, type, timeMarks, pre, all, stepType, filter) {
    timePoints_ = timePoints;
}

void oif_Output::Write(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Output");
    line.Fixed(channel_.IsField() ? ", field" : ", history");
    // No output has no variables either.
    if (frequency_ != 0 || type_ != TypeEnm::FREQUENCY) {
        line.FixedIf(pre_, ", variable=PRESELECT")
            .FixedIf(all_ && !pre_, ", variable=ALL")
            .FixedUnless(", filter=", filter_, cow_String());
    }
    switch (type_) {
    case TypeEnm::FREQUENCY: {
        const int usual = kprC_IsImplicitModal(stepType_) ? korC_OdbRequestTable::implicitFrequencyDef() : 1;
        const bool isUsual =
            korC_DefaultOutputType(stepType_, channel_.IsField()) == korC_TypeEnm::FREQUENCY &&
            frequency_ == usual;
        line.FixedIf(!isUsual, ", frequency=", frequency_);
        break;
    }
    case TypeEnm::NUMBER_INTERVAL: AddNumberInterval(line); break;
    case TypeEnm::TIME_INTERVAL: line.Fixed(", time interval=", timeInterval_); break;
    case TypeEnm::MODE_LIST: WriteModes(stream); break;
    case TypeEnm::TIME_POINTS: line.Fixed(", time points=", timePoints_); break;
    }
    const bool hasMarks =
        type_ == TypeEnm::NUMBER_INTERVAL || type_ == TypeEnm::TIME_INTERVAL || type_ == TypeEnm::TIME_POINTS;
    if (hasMarks && timeMarks_ == kprC_IsExplicit(stepType_) &&
        kprC_TimeMarksIsAllowed(stepType_, channel_.IsField())) {
        line.Fixed(timeMarks_ ? ", time marks=YES" : ", time marks=NO");
    }
    line.End();
}

void oif_Output::AddNumberInterval(oif_KeywordLine& line) const {
    const bool isField = channel_.IsField();
    const int usual = isField ? korC_OdbRequestTable::fieldNumberIntervalDef()
                              : korC_OdbRequestTable::historyNumberIntervalDef();
    if (korC_DefaultOutputType(stepType_, isField) == korC_TypeEnm::NUMBER_INTERVAL &&
        numberInterval_ == usual) {
        return;
    }
    if (isField || !kprC_IsExplicit(stepType_)) {
        line.Fixed(", number interval=", numberInterval_);
    } else if (stepTime_ > 0.0 && numberInterval_ >= 1) {
        // Explicit steps know no number of intervals for history.
        line.Fixed(", time interval=", stepTime_ / numberInterval_);
    }
}

void oif_Output::WriteModes(utl_Stream& stream) const {
    if (modeList_.IsEmpty()) return;
    stream << ", mode list";
    stream.LineBreak();
    // A started line ends in a comma; behind a full one stands an empty line.
    for (int i = 0; i < modeList_.Length(); ++i) {
        stream << modeList_[i];
        if ((i + 1) % kModesPerLine == 0) {
            stream.LineBreak();
        } else {
            stream << ", ";
        }
    }
}

void oif_OutputVariables::AppendNew(cls_xpListString& identifiers, const cow_String& identifier) {
    for (int i = 0; i < identifiers.Length(); ++i) {
        if (identifiers[i] == identifier) return;
    }
    identifiers.Append(identifier);
}

void oif_OutputVariables::EndLine(utl_Stream& stream) const {
    if (pre_ || all_) {
        stream.OptionalLineBreak();
        stream << (pre_ ? ", variable=PRESELECT" : ", variable=ALL");
    }
    stream.LineBreak();
}

void oif_OutputVariables::WriteNames(utl_Stream& stream, const cls_xpListString& identifiers,
                                     int perLine) const {
    if (pre_ || all_) return;
    oif_DataLines lines(stream, perLine);
    for (int i = 0; i < identifiers.Length(); ++i) lines.Add(identifiers[i]);
    // Only a name that is the only one has a comma behind it, not one that is alone on a later line.
    if (identifiers.Length() == 1) stream << ", ";
    lines.End();
}

void oif_OutputVariables::WriteKeyword(utl_Stream& stream, const char* keyword, const char* parameter,
                                       const cow_String& setName, const cls_xpListString& identifiers,
                                       int perLine) const {
    if (HasNothing(identifiers)) return;
    stream << keyword;
    WriteParameter(stream, parameter, setName);
    EndLine(stream);
    WriteNames(stream, identifiers, perLine);
}

void oif_NodeOutput::Write(utl_Stream& stream) const {
    const cls_xpListString identifiers = IdentifiersOf(PrintEnm::NODE);
    if (requireVariables_ || !HasNothing(identifiers)) {
        WriteKeyword(stream, "*Node Output", "nset=", setName_, identifiers, kNodeNames);
        return;
    }
    // Eigenvalue steps say so that there is no output.
    stream << "*Node Output";
    WriteParameter(stream, "nset=", setName_);
    EndLine(stream);
}

void oif_ElementOutput::Write(utl_Stream& stream) const {
    cls_xpListString identifiers = Identifiers(
        [this](const korC_OdbRequestSpec& spec, bool isComponent) {
            if (!rebar_ && spec.Location() == Location::REBAR) return false;
            return spec.Print() == PrintEnm::ELEMENT || (spec.Print() == PrintEnm::ELEMENT_OR_CONTACT &&
                                                         !isComponent && request_.interactions.IsEmpty());
        },
        rebar_);
    if (HasNothing(identifiers)) return;
    const auto holds = [&identifiers](const char* name) {
        for (int i = 0; i < identifiers.Length(); ++i) {
            if (identifiers[i] == name) return true;
        }
        return false;
    };
    // Plastic strains bring their equivalent with them.
    if (holds("PE") && !holds("PEEQ")) identifiers.Append("PEEQ");
    const cls_xpListInt& points = request_.sectionPoints;
    int next = 0;
    do {
        stream << "*Element Output";
        WriteParameter(stream, "elset=", setName_);
        if (rebar_) stream << ", rebar";
        if (isField_) stream << (request_.directions ? ", directions=YES" : ", directions=NO");
        EndLine(stream);
        oif_DataLines lines(stream, kPointsPerKeyword);
        const int end = std::min(next + kPointsPerKeyword, points.Length());
        for (; next < end; ++next) lines.Add(points[next]);
        lines.End();
        WriteNames(stream, identifiers);
    } while (next < points.Length());
}

void oif_ContactOutput::Write(utl_Stream& stream) const {
    const cls_xpListString identifiers = Identifiers([](const korC_OdbRequestSpec& spec, bool) {
        return spec.Print() == PrintEnm::CONTACT || spec.Print() == PrintEnm::ELEMENT_OR_CONTACT;
    });
    if (HasNothing(identifiers)) return;
    const bool hasPlace = (isHistory_ || !kprC_IsExplicit(stepType_)) && !setName_.IsEmpty();
    const bool isSurface = (request_.region.FlagWord() & kSurfaceFlag) != 0;
    stream << "*Contact Output";
    if (hasPlace && !isSurface) WriteParameter(stream, "nset=", setName_);
    WriteParameter(stream, "master=", master_);
    WriteParameter(stream, "slave=", slave_);
    WriteParameter(stream, "cpset=", qkw_QuorixName(cpset_, false).Printable());
    // A surface goes by its name in its own instance, without quotes.
    if (hasPlace && isSurface) WriteParameter(stream, "surface=", request_.region.SetName());
    EndLine(stream);
    WriteNames(stream, identifiers);
}

void oif_EnergyOutput::Write(utl_Stream& stream) const {
    WriteKeyword(stream, "*Energy Output", "elset=", setName_, IdentifiersOf(PrintEnm::ENERGY));
}

void oif_IncrementationOutput::Write(utl_Stream& stream) const {
    WriteKeyword(stream, "*Incrementation Output", "", {}, IdentifiersOf(PrintEnm::INCREMENTATION));
}

void oif_IntegratedOutput::Write(utl_Stream& stream) const {
    const cls_xpListString identifiers = IdentifiersOf(PrintEnm::INTEGRATED);
    if (HasNothing(identifiers)) return;
    stream << "*Integrated Output, ";
    stream.OptionalLineBreak();
    stream << "section=" << request_.section;
    EndLine(stream);
    WriteNames(stream, identifiers);
}

void oif_ModalOutput::Write(utl_Stream& stream) const {
    WriteKeyword(stream, "*Modal Output", "", {}, IdentifiersOf(PrintEnm::MODAL));
}

void oif_RadiationOutput::Write(utl_Stream& stream) const {
    WriteKeyword(stream, "*Radiation Output", "elset=", setName_, IdentifiersOf(PrintEnm::RADIATION));
}
