#include "conditions/oif_PredefinedFields.h"

#include "base/oif_DataLines.h"
#include "foundation/omu_PrimEnum.h"

using FieldDistribution = kpfC_Field::DistribTypeEnm;
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

void oif_FieldText::WriteFile(oif_KeywordLine& line, const cow_String& fileName) {
    line.Fixed(", file=", qkw_QuorixName(FileStem(fileName), true));
}

void oif_FieldText::WriteNumber(oif_KeywordLine& line, const char* parameter,
                                const mdl_PropAttr<int>& number) {
    line.FixedIf(number.IsActive() && number.ConstGet() != 0, parameter, number.ConstGet());
}

void oif_FieldText::WriteFileRange(oif_KeywordLine& line, const kpfC_ResultsFile& file) {
    WriteNumber(line, ", bstep=", file.beginStep);
    WriteNumber(line, ", binc=", file.beginIncrement);
    WriteNumber(line, ", estep=", file.endStep);
    WriteNumber(line, ", einc=", file.endIncrement);
}

void oif_FieldText::WriteInterpolation(oif_KeywordLine& line, const kpfC_TemperatureState& state) {
    if (!state.interpolate.IsActive()) return;
    line.FixedIf(state.interpolate == Interpolate::MIDSIDE, ", midside");
    if (!(state.interpolate == Interpolate::INTERPOLATE)) return;
    line.Fixed(", interpolate");
    const auto tolerance = [&](const char* parameter, const mdl_PropAttr<double>& value, double byDefault) {
        line.FixedIf(value.IsActive() && value.ConstGet() != byDefault, parameter, value.ConstGet());
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
    for (const auto& value : values) stream << ", " << value.ConstGet() * scale;
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
    for (const auto& value : values) lines.Add(value.ConstGet());
    lines.End();
    PadLines(stream, GetNumberOfDataLines(values.Length(), kValuesPerLine), maxSize);
}

oif_StepField::oif_StepField(const oif_FieldCard& card)
    : setName_(card.setName), state_(card.Quad().state), distributionType_(card.Object().distributionType),
      op_(card.op),
      deactivated_(card.Quad().status == Status::DEACTIVATED || card.Quad().status == Status::FIELD_RESET) {
    if (deactivated_) op_ = oif_Op::NEW;
}

void oif_StepField::Write(utl_Stream& stream) const {
    oif_KeywordLine line(stream, Keyword());
    line.Op(op_);
    WriteVariable(line);
    if (deactivated_) return line.End();
    switch (distributionType_) {
    case FieldDistribution::USER_DEFINED:
        line.Fixed(", user").End();
        stream << setName_ << endl;
        return;
    case FieldDistribution::FROM_FILE:
    case FieldDistribution::FROM_FILE_AND_USER_DEFINED:
        if (const cow_String* fileName = FileName()) {
            line.FixedIf(distributionType_ == FieldDistribution::FROM_FILE_AND_USER_DEFINED, ", user");
            oif_FieldText::WriteFile(line, *fileName);
            WriteFileParameters(line);
        }
        return line.End();
    case FieldDistribution::UNIFORM: line.Amplitude(Amplitude()).End(); return WriteData(stream);
    default: return line.End();
    }
}

void oif_FieldTemperature::WriteFileParameters(oif_KeywordLine& line) const {
    oif_FieldText::WriteFileRange(line, State());
    oif_FieldText::WriteInterpolation(line, State());
}

void oif_FieldTemperature::WriteData(utl_Stream& stream) const {
    oif_FieldText::WriteValues(stream, setName_, State().values, scale_, maxSize_);
}

// Also where it ends: there are several variables.
void oif_GeneralField::WriteVariable(oif_KeywordLine& line) const {
    line.Fixed(", variable=", State().variable).Fixed(", number=", State().NumberOfValues());
}

void oif_GeneralField::WriteFileParameters(oif_KeywordLine& line) const {
    const auto& interpolate = State().interpolate;
    oif_FieldText::WriteFileRange(line, State());
    // ", interpolate" is for temperatures and initial conditions only.
    line.FixedIf(interpolate.IsActive() && interpolate == Interpolate::MIDSIDE, ", midside");
}

void oif_GeneralField::WriteData(utl_Stream& stream) const {
    // Without values there is nothing to fill up either.
    const int size = State().values.IsEmpty() ? 0 : State().NumberOfValues();
    oif_FieldText::WriteGeneralFieldBaseData(stream, setName_, size, State().values);
}

void oif_PressureStress::WriteData(utl_Stream& stream) const {
    stream << setName_ << ", " << State().magnitude.ConstGet() << endl;
}

void oif_MassFlowRate::WriteData(utl_Stream& stream) const {
    stream << setName_ << ", " << State().component1.ConstGet() << ", " << State().component2.ConstGet()
           << ", " << State().component3.ConstGet() << endl;
}
