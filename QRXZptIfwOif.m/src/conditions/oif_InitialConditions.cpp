#include "conditions/oif_InitialConditions.h"

#include "conditions/oif_PredefinedFields.h"
#include "foundation/nex_Exception.h"

#include <initializer_list>

using FieldDistribution = kpfC_Field::DistribTypeEnm;
using Interpolate = kpfC_InterpolateEnm;

namespace {

/// Up to three numbers, each with a separator behind it. A zero leaves its place empty unless it is forced.
void WriteComponentData(utl_Stream& stream, std::initializer_list<double> numbers, bool forced) {
    for (const double number : numbers) {
        if (number != 0.0 || forced) stream << number;
        stream << ", ";
    }
}

/// The same of a function's value and where it has it.
void WriteFunctionData(utl_Stream& stream, double value, double place, bool forced) {
    WriteComponentData(stream, {value, place}, forced);
}

void WriteFileNumbers(oif_KeywordLine& line, const kpfC_ResultsFile& file) {
    oif_FieldText::WriteNumber(line, ", step=", file.beginStep);
    oif_FieldText::WriteNumber(line, ", inc=", file.beginIncrement);
}

} // namespace

oif_InitialConditions::oif_InitialConditions(const kinC_ActuatorSensor& actuator, const cow_String& setName,
                                             int count)
    : record_(actuator), setName_(setName), parameters_([](const Self& self, oif_KeywordLine& line) {
          self.WriteParameters(line, self.record_.ConstGet());
      }),
      form_([](const Self& self, utl_Stream& stream) {
          self.WriteForm(stream, static_cast<const kinC_ActuatorSensor&>(self.record_.ConstGet()));
      }) {
    for (int i = 0; i < count; ++i) {
        values_.Append(i < actuator.initialValues.Length() ? actuator.initialValues[i] : 0.0);
    }
}

bool oif_InitialConditions::IsFromFile() const {
    return distributionType_ == FieldDistribution::FROM_FILE ||
           distributionType_ == FieldDistribution::FROM_FILE_AND_USER_DEFINED;
}

bool oif_InitialConditions::HasDataLines() const {
    return distributionType_ != FieldDistribution::USER_DEFINED && !IsFromFile();
}

void oif_InitialConditions::WriteDistributionType(oif_KeywordLine& line, const cow_String* fileName) const {
    line.FixedIf(distributionType_ == FieldDistribution::USER_DEFINED, ", USER");
    if (IsFromFile() && fileName != nullptr) oif_FieldText::WriteFile(line, *fileName);
}

void oif_InitialConditions::WriteInitialConditionsCard(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Initial Conditions");
    parameters_(*this, line);
    line.End();
}

void oif_InitialConditions::WriteParameters(oif_KeywordLine& line, const kpfC_Temperature&) const {
    const auto& state = StateAs<kpfC_TemperatureState>();
    line.Fixed(", type=TEMPERATURE");
    WriteDistributionType(line, &state.magnitude.ConstGet());
    if (!IsFromFile()) return;
    WriteFileNumbers(line, state);
    oif_FieldText::WriteInterpolation(line, state);
}

void oif_InitialConditions::WriteParameters(oif_KeywordLine& line, const kpfC_GeneralField&) const {
    const auto& state = StateAs<kpfC_GeneralFieldState>();
    // The blanks around this "=" belong there.
    line.Fixed(", type=FIELD").Fixed(", variable = ", state.variable);
    WriteDistributionType(line, &state.fileName.ConstGet());
    if (!IsFromFile()) return;
    WriteFileNumbers(line, state);
    if (!state.interpolate.IsActive()) return;
    line.FixedIf(state.interpolate == Interpolate::MIDSIDE, ", midside")
        .FixedIf(state.interpolate == Interpolate::INTERPOLATE, ", interpolate");
}

void oif_InitialConditions::WriteParameters(oif_KeywordLine& line, const kpfC_Velocity& velocity) const {
    line.Fixed(velocity.IsRotatingVelocity() ? ", type=ROTATING VELOCITY" : ", type=VELOCITY");
}

void oif_InitialConditions::WriteParameters(oif_KeywordLine& line, const kpfC_Stress& stress) const {
    line.Fixed(", type=STRESS");
    WriteDistributionType(line, &stress.fileName);
    line.FixedIf(distributionType_ == FieldDistribution::GEOSTATIC, ", GEOSTATIC")
        .FixedIf(IsFromFile() && stress.step != 0, ", step=", stress.step)
        .FixedIf(IsFromFile() && stress.increment != 0, ", inc=", stress.increment);
}

void oif_InitialConditions::WriteParameters(oif_KeywordLine& line, const kpfC_Hardening&) const {
    line.Fixed(", type=HARDENING");
    // Hardening has no file.
    WriteDistributionType(line, nullptr);
}

void oif_InitialConditions::WriteParameters(oif_KeywordLine&, const cls_Record&) const {
    nex_Raise("Unimplemented initial condition!");
}

void oif_InitialConditions::WriteForm(utl_Stream& stream, const kpfC_Temperature&) const {
    WriteInitialConditionsCard(stream);
    // A load case's scale never comes here.
    if (HasDataLines()) {
        oif_FieldText::WriteValues(stream, setName_, StateAs<kpfC_TemperatureState>().values, 1.0,
                                   setting_.maxTemperatureSize);
    }
}

void oif_InitialConditions::WriteForm(utl_Stream& stream, const kpfC_GeneralField&) const {
    WriteInitialConditionsCard(stream);
    if (HasDataLines()) {
        oif_FieldText::WriteGeneralFieldBaseData(stream, setName_, setting_.maxGeneralFieldSize,
                                                 StateAs<kpfC_GeneralFieldState>().values);
    }
}

void oif_InitialConditions::WriteForm(utl_Stream&, const cls_Record&) const {
    nex_Raise("Unimplemented field for initial condition!");
}

void oif_InitialConditions::WriteSetMagnitudeData(utl_Stream& stream, double magnitude) const {
    stream << setName_ << ", " << magnitude;
}

void oif_InitialConditions::WriteStressTensorData(utl_Stream& stream, const kpfC_Stress& stress) const {
    stream << setName_;
    for (const double component :
         {stress.sigma11, stress.sigma22, stress.sigma33, stress.sigma12, stress.sigma13, stress.sigma23}) {
        stream << ", ";
        if (component != cls_UnsetDouble) stream << component;
    }
    stream.LineBreak();
}

void oif_InitialConditions::WriteForm(utl_Stream& stream, const kpfC_Velocity& velocity) const {
    const double components[] = {velocity.velocity1, velocity.velocity2, velocity.velocity3};
    WriteInitialConditionsCard(stream);
    if (velocity.IsRotatingVelocity()) {
        WriteSetMagnitudeData(stream, velocity.omega);
        stream << ", ";
        WriteComponentData(stream, {components[0], components[1], components[2]}, false);
        stream.LineBreak();
        for (const gsl_Point& point : {velocity.axisBegin, velocity.axisEnd}) {
            WriteComponentData(stream, {point.X(), point.Y(), point.Z()}, true);
        }
        stream.LineBreak();
        return;
    }
    // A velocity of zero must be said in full.
    const bool atRest = components[0] == 0.0 && components[1] == 0.0 && components[2] == 0.0;
    for (int i = 0; i < 3; ++i) {
        if (components[i] != 0.0 || atRest) {
            stream << setName_ << ", " << i + 1 << ", " << components[i] << endl;
        }
    }
}

void oif_InitialConditions::WriteForm(utl_Stream& stream, const kpfC_Stress& stress) const {
    WriteInitialConditionsCard(stream);
    if (distributionType_ == FieldDistribution::GEOSTATIC) {
        stream << setName_ << ", ";
        WriteFunctionData(stream, stress.stressMagnitude1, stress.vCoordinate1, true);
        WriteFunctionData(stream, stress.stressMagnitude2, stress.vCoordinate2, true);
        stream << stress.lateralCoeff1;
        if (stress.lateralCoeff2 != cls_UnsetDouble) stream << ", " << stress.lateralCoeff2;
        stream.LineBreak();
    } else if (HasDataLines()) {
        WriteStressTensorData(stream, stress);
    }
}

void oif_InitialConditions::WriteForm(utl_Stream& stream, const kpfC_Hardening& hardening) const {
    WriteInitialConditionsCard(stream);
    if (distributionType_ == FieldDistribution::USER_DEFINED) return;
    WriteSetMagnitudeData(stream, hardening.equivPlasticStrain);
    const cow_List<double>& backstress = hardening.backstress;
    if (!backstress.IsEmpty()) stream << ", ";
    for (int i = 0; i < backstress.Length() && i < 6; ++i) WriteComponentData(stream, {backstress[i]}, false);
    stream.LineBreak();
}

void oif_InitialConditions::WriteForm(utl_Stream& stream, const kinC_ActuatorSensor&) const {
    oif_KeywordLine(stream, "*Initial Conditions").Fixed(", type=SOLUTION").End();
    stream << setName_;
    for (const double value : values_) stream << ", " << value;
    stream.LineBreak();
}
