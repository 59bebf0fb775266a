#include "conditions/oif_PredefinedFields.h"

#include "base/oif_DataLines.h"
#include "foundation/omu_PrimEnum.h"
#include "keyword_layer/qkw_QuorixName.h"

using Distribution = kpfC_Field::DistribTypeEnm;
using Interpolate = kpfC_InterpolateEnm;
using Status = mdl_PropagationStatusEnm;

namespace {

constexpr int kValuesPerLine = 8;

} // namespace

cow_String oif_FieldText::FileStem(const cow_String& fileName) {
    constexpr std::string_view ending = ".fil";
    const std::string_view text = fileName.View();
    if (text.size() <= ending.size()) return fileName;
    const std::size_t stem = text.size() - ending.size();
    return omu_EqualInAnyCapitals(text.substr(stem), ending) ? cow_String(text.substr(0, stem)) : fileName;
}

void oif_FieldText::WriteFile(utl_Stream& stream, const cow_String& fileName) {
    stream << ", file=" << qkw_QuorixName(FileStem(fileName), true);
}

void oif_FieldText::WriteNumber(utl_Stream& stream, const char* parameter, const mdl_PropAttr<int>& number) {
    if (number.IsActive() && number.ConstGet() != 0) stream << parameter << number.ConstGet();
}

void oif_FieldText::WriteFile(utl_Stream& stream, const cow_String& fileName, const kpfC_ResultsFile& file) {
    WriteFile(stream, fileName);
    WriteNumber(stream, ", bstep=", file.beginStep);
    WriteNumber(stream, ", binc=", file.beginIncrement);
    WriteNumber(stream, ", estep=", file.endStep);
    WriteNumber(stream, ", einc=", file.endIncrement);
}

void oif_FieldText::WriteInterpolation(utl_Stream& stream, const kpfC_TemperatureState& state) {
    if (!state.interpolate.IsActive()) return;
    if (state.interpolate == Interpolate::MIDSIDE) stream << ", midside";
    if (!(state.interpolate == Interpolate::INTERPOLATE)) return;
    stream << ", interpolate";
    const auto tolerance = [&](const char* parameter, const mdl_PropAttr<double>& value, double byDefault) {
        if (value.IsActive() && value.ConstGet() != byDefault) stream << parameter << value.ConstGet();
    };
    tolerance(", absolute exterior tolerance=", state.absoluteExteriorTolerance,
              kpfC_TemperatureState::absoluteExteriorToleranceDef());
    tolerance(", exterior tolerance=", state.exteriorTolerance,
              kpfC_TemperatureState::exteriorToleranceDef());
}

void oif_FieldText::PadLines(utl_Stream& stream, int written, int maxSize) {
    for (int lines = GetNumberOfDataLines(maxSize, kValuesPerLine); lines > written; --lines) {
        stream.LineBreak();
    }
}

void oif_FieldText::WriteValues(utl_Stream& stream, const cow_String& setName,
                                const cow_List<mdl_PropAttr<double>>& values, double scale, int maxSize) {
    stream << setName;
    for (int i = 0; i < values.Length(); ++i) stream << ", " << values[i].ConstGet() * scale;
    stream.LineBreak();
    PadLines(stream, 1, maxSize);
}

void oif_FieldText::WriteGeneralFieldBaseData(utl_Stream& stream, const cow_String& setName, int maxSize,
                                              const cow_List<mdl_PropAttr<double>>& values) {
    stream << setName;
    if (values.Length() == 0) {
        stream.LineBreak();
        return PadLines(stream, 1, maxSize);
    }
    stream << ", ";
    // The set does not count as one of the eight.
    oif_DataLines lines(stream, kValuesPerLine);
    for (int i = 0; i < values.Length(); ++i) lines.Add(values[i].ConstGet());
    lines.End();
    PadLines(stream, GetNumberOfDataLines(values.Length(), kValuesPerLine), maxSize);
}

oif_StepField::oif_StepField(const kpfC_Field& field, const cow_String& stepName, bool opMod,
                             const cow_String& setName)
    : distributionType_(field.distributionType), setName_(setName), opMod_(opMod),
      state_(field.ConstGetStateQuad(stepName).state) {
    CheckDeactivate(field.Status(stepName));
}

void oif_StepField::CheckDeactivate(Status status) {
    deactivated_ = status == Status::DEACTIVATED || status == Status::FIELD_RESET;
    if (deactivated_) opMod_ = false;
}

void oif_StepField::WriteOpNew(utl_Stream& stream) const {
    if (!opMod_) stream << ", op=NEW";
}

void oif_StepField::WriteAmplitude(utl_Stream& stream, const cow_String& amplitude) {
    if (!amplitude.IsEmpty()) stream << ", amplitude=" << qkw_QuorixName(amplitude, false);
    stream.LineBreak();
}

void oif_StepField::WriteUserData(utl_Stream& stream) const {
    stream << ", user" << endl << setName_ << endl;
}

void oif_StepField::WriteUserOfFile(utl_Stream& stream) const {
    if (distributionType_ == Distribution::FROM_FILE_AND_USER_DEFINED) stream << ", user";
}

void oif_FieldTemperature::Write(utl_Stream& stream) const {
    const auto& state = StateAs<kpfC_TemperatureState>();
    stream << "*Temperature";
    WriteOpNew(stream);
    if (deactivated_) return stream.LineBreak();
    switch (distributionType_) {
    case Distribution::USER_DEFINED: return WriteUserData(stream);
    case Distribution::FROM_FILE:
    case Distribution::FROM_FILE_AND_USER_DEFINED:
        WriteUserOfFile(stream);
        oif_FieldText::WriteFile(stream, state.magnitude.ConstGet(), state);
        oif_FieldText::WriteInterpolation(stream, state);
        return stream.LineBreak();
    case Distribution::UNIFORM:
        WriteAmplitude(stream, state.amplitude.ConstGet());
        return oif_FieldText::WriteValues(stream, setName_, state.values, scale_, maxSize_);
    default: return stream.LineBreak();
    }
}

void oif_GeneralField::Write(utl_Stream& stream) const {
    const auto& state = StateAs<kpfC_GeneralFieldState>();
    stream << "*Field";
    WriteOpNew(stream);
    // Also where it ends: there are several variables.
    stream << ", variable=" << state.variable << ", number=" << state.NumberOfValues();
    if (deactivated_) return stream.LineBreak();
    switch (distributionType_) {
    case Distribution::USER_DEFINED: return WriteUserData(stream);
    case Distribution::FROM_FILE:
    case Distribution::FROM_FILE_AND_USER_DEFINED:
        WriteUserOfFile(stream);
        oif_FieldText::WriteFile(stream, state.fileName.ConstGet(), state);
        // ", interpolate" is for temperatures and initial conditions only.
        if (state.interpolate.IsActive() && state.interpolate == Interpolate::MIDSIDE) stream << ", midside";
        return stream.LineBreak();
    case Distribution::UNIFORM:
        WriteAmplitude(stream, state.amplitude.ConstGet());
        // Without values there is nothing to fill up either.
        return oif_FieldText::WriteGeneralFieldBaseData(
            stream, setName_, state.values.IsEmpty() ? 0 : state.NumberOfValues(), state.values);
    default: return stream.LineBreak();
    }
}

void oif_PressureStress::Write(utl_Stream& stream) const {
    const auto& state = StateAs<kpfC_PressureStressState>();
    stream << "*Pressure stress";
    WriteOpNew(stream);
    if (deactivated_) return stream.LineBreak();
    switch (distributionType_) {
    case Distribution::USER_DEFINED: return WriteUserData(stream);
    case Distribution::FROM_FILE:
    case Distribution::FROM_FILE_AND_USER_DEFINED:
        WriteUserOfFile(stream);
        oif_FieldText::WriteFile(stream, state.fileName.ConstGet());
        return stream.LineBreak();
    case Distribution::UNIFORM:
        WriteAmplitude(stream, state.amplitude.ConstGet());
        stream << setName_ << ", " << state.magnitude.ConstGet() << endl;
        return;
    default: return stream.LineBreak();
    }
}

void oif_MassFlowRate::Write(utl_Stream& stream) const {
    const auto& state = StateAs<kpfC_MassFlowRateState>();
    stream << "*Mass flow rate";
    WriteOpNew(stream);
    if (deactivated_) return stream.LineBreak();
    switch (distributionType_) {
    case Distribution::USER_DEFINED: return WriteUserData(stream);
    case Distribution::UNIFORM:
        WriteAmplitude(stream, state.amplitude.ConstGet());
        stream << setName_ << ", " << state.component1.ConstGet() << ", " << state.component2.ConstGet()
               << ", " << state.component3.ConstGet() << endl;
        return;
    default: return stream.LineBreak();
    }
}
