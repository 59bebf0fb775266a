#include "conditions/oif_InitialConditions.h"

#include "conditions/oif_PredefinedFields.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <initializer_list>

using Distribution = kpfC_Field::DistribTypeEnm;
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

void WriteFileNumbers(utl_Stream& stream, const kpfC_ResultsFile& file) {
    oif_FieldText::WriteNumber(stream, ", step=", file.beginStep);
    oif_FieldText::WriteNumber(stream, ", inc=", file.beginIncrement);
}

} // namespace

oif_InitialConditions::oif_InitialConditions(const kpfC_Field& field, const cow_String&,
                                             const cow_String& stepName, bool, const cow_String& setName,
                                             int maxTemperatureSize, int maxGeneralFieldSize)
    : record_(field), state_(field.ConstGetStateQuad(stepName).state),
      distributionType_(field.distributionType), setName_(setName), maxTemperatureSize_(maxTemperatureSize),
      maxGeneralFieldSize_(maxGeneralFieldSize) {}

oif_InitialConditions::oif_InitialConditions(const kinC_ActuatorSensor& actuator, const cow_String& setName,
                                             int count)
    : record_(actuator), setName_(setName) {
    for (int i = 0; i < count; ++i) {
        values_.Append(i < actuator.initialValues.Length() ? actuator.initialValues[i] : 0.0);
    }
}

bool oif_InitialConditions::HasDataLines() const {
    return distributionType_ != Distribution::USER_DEFINED && distributionType_ != Distribution::FROM_FILE &&
           distributionType_ != Distribution::FROM_FILE_AND_USER_DEFINED;
}

void oif_InitialConditions::WriteDistributionType(utl_Stream& stream, const cow_String& fileName) const {
    switch (distributionType_) {
    case Distribution::USER_DEFINED: stream << ", USER"; break;
    case Distribution::FROM_FILE:
    case Distribution::FROM_FILE_AND_USER_DEFINED:
        // Hardening has no file.
        if (record_.ConstGet().DynTypeId() != kpfC_Hardening::TypeId())
            oif_FieldText::WriteFile(stream, fileName);
        break;
    case Distribution::GEOSTATIC:
        if (record_.ConstGet().DynTypeId() == kpfC_Stress::TypeId()) stream << ", GEOSTATIC";
        break;
    default: break;
    }
}

void oif_InitialConditions::WriteInitialConditionsCard(utl_Stream& stream) const {
    const bool isFromFile = distributionType_ == Distribution::FROM_FILE ||
                            distributionType_ == Distribution::FROM_FILE_AND_USER_DEFINED;
    stream << "*Initial Conditions, ";
    switch (record_.ConstGet().DynTypeId()) {
    case kpfC_Temperature::Class.Id(): {
        const auto& state = StateAs<kpfC_TemperatureState>();
        stream << "type=TEMPERATURE";
        WriteDistributionType(stream, state.magnitude.ConstGet());
        if (!isFromFile) break;
        WriteFileNumbers(stream, state);
        oif_FieldText::WriteInterpolation(stream, state);
        break;
    }
    case kpfC_GeneralField::Class.Id(): {
        const auto& state = StateAs<kpfC_GeneralFieldState>();
        // The blanks around this "=" belong there.
        stream << "type=FIELD, variable = " << state.variable;
        WriteDistributionType(stream, state.fileName.ConstGet());
        if (!isFromFile) break;
        WriteFileNumbers(stream, state);
        if (!state.interpolate.IsActive()) break;
        if (state.interpolate == Interpolate::MIDSIDE) stream << ", midside";
        if (state.interpolate == Interpolate::INTERPOLATE) stream << ", interpolate";
        break;
    }
    case kpfC_Velocity::Class.Id():
        stream << (FieldAs<kpfC_Velocity>().IsRotatingVelocity() ? "type=ROTATING VELOCITY"
                                                                 : "type=VELOCITY");
        break;
    case kpfC_Stress::Class.Id(): {
        const auto& stress = FieldAs<kpfC_Stress>();
        stream << "type=STRESS";
        WriteDistributionType(stream, stress.fileName);
        if (isFromFile && stress.step != 0) stream << ", step=" << stress.step;
        if (isFromFile && stress.increment != 0) stream << ", inc=" << stress.increment;
        break;
    }
    case kpfC_Hardening::Class.Id():
        stream << "type=HARDENING";
        WriteDistributionType(stream, {});
        break;
    default: nex_Raise("Unimplemented initial condition!");
    }
    stream.LineBreak();
}

void oif_InitialConditions::Write(utl_Stream& stream) const {
    switch (record_.ConstGet().DynTypeId()) {
    case kinC_ActuatorSensor::Class.Id(): return WriteActuator(stream);
    case kpfC_Temperature::Class.Id():
        WriteInitialConditionsCard(stream);
        // A load case's scale never comes here.
        if (HasDataLines()) {
            oif_FieldText::WriteValues(stream, setName_, StateAs<kpfC_TemperatureState>().values, 1.0,
                                       maxTemperatureSize_);
        }
        return;
    case kpfC_GeneralField::Class.Id():
        WriteInitialConditionsCard(stream);
        if (HasDataLines()) {
            oif_FieldText::WriteGeneralFieldBaseData(stream, setName_, maxGeneralFieldSize_,
                                                     StateAs<kpfC_GeneralFieldState>().values);
        }
        return;
    case kpfC_Velocity::Class.Id(): return WriteVelocity(stream);
    case kpfC_Stress::Class.Id(): return WriteStress(stream);
    case kpfC_Hardening::Class.Id(): return WriteHardening(stream);
    default: nex_Raise("Unimplemented field for initial condition!");
    }
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

void oif_InitialConditions::WriteVelocity(utl_Stream& stream) const {
    const auto& velocity = FieldAs<kpfC_Velocity>();
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

void oif_InitialConditions::WriteStress(utl_Stream& stream) const {
    const auto& stress = FieldAs<kpfC_Stress>();
    WriteInitialConditionsCard(stream);
    if (distributionType_ == Distribution::GEOSTATIC) {
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

void oif_InitialConditions::WriteHardening(utl_Stream& stream) const {
    const auto& hardening = FieldAs<kpfC_Hardening>();
    WriteInitialConditionsCard(stream);
    if (distributionType_ == Distribution::USER_DEFINED) return;
    WriteSetMagnitudeData(stream, hardening.equivPlasticStrain);
    const cow_List<double>& backstress = hardening.backstress;
    if (!backstress.IsEmpty()) stream << ", ";
    for (int i = 0; i < backstress.Length() && i < 6; ++i) WriteComponentData(stream, {backstress[i]}, false);
    stream.LineBreak();
}

void oif_InitialConditions::WriteActuator(utl_Stream& stream) const {
    stream << "*Initial Conditions, type=SOLUTION" << endl << setName_;
    for (int i = 0; i < values_.Length(); ++i) stream << ", " << values_[i];
    stream.LineBreak();
}
