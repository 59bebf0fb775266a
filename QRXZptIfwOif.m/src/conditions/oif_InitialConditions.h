#ifndef QRX_OIF_INITIALCONDITIONS_H
#define QRX_OIF_INITIALCONDITIONS_H

#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/conditions/kpfC_Fields.h"
#include "store_interface/records/interactions/kinC_ActuatorSensor.h"

/// The state that a field begins with, or the first values of a control element:
///     *Initial Conditions, type=TEMPERATURE
///     Set-1, 100.
///     *Initial Conditions, type=STRESS, GEOSTATIC
///     Set-1, -1., 0., -2., -10., 0.5
/// The data of temperatures and of general fields takes as many lines as the model's largest field of the
/// kind. Writing another field raises.
class oif_InitialConditions final : public qkw_KeywordOf<oif_InitialConditions> {
public:
    /// What the state of the field in `stepName` says; velocity, stress and hardening stand in the record.
    oif_InitialConditions(const kpfC_Field& field, const cow_String& initialStepName,
                          const cow_String& stepName, bool opMod, const cow_String& setName,
                          int maxTemperatureSize, int maxGeneralFieldSize);
    /// `count` initial values, those that the record lacks being 0.
    oif_InitialConditions(const kinC_ActuatorSensor& actuator, const cow_String& setName, int count);
    void Write(utl_Stream& stream) const override;

    /// The keyword line of a field; anything else raises.
    void WriteInitialConditionsCard(utl_Stream& stream) const;

private:
    template <class Field>
    const Field& FieldAs() const {
        return static_cast<const Field&>(record_.ConstGet());
    }
    template <class State>
    const State& StateAs() const {
        return static_cast<const State&>(state_.ConstGet());
    }
    bool HasDataLines() const;
    void WriteDistributionType(utl_Stream& stream, const cow_String& fileName) const;
    void WriteSetMagnitudeData(utl_Stream& stream, double magnitude) const;
    void WriteStressTensorData(utl_Stream& stream, const kpfC_Stress& stress) const;
    void WriteVelocity(utl_Stream& stream) const;
    void WriteStress(utl_Stream& stream) const;
    void WriteHardening(utl_Stream& stream) const;
    void WriteActuator(utl_Stream& stream) const;

    mdl_ObjCow<cls_Record> record_;
    mdl_ObjCow<kpfC_FieldState> state_;
    kpfC_Field::DistribTypeEnm distributionType_ = kpfC_Field::DistribTypeEnm::UNIFORM;
    cow_String setName_;
    int maxTemperatureSize_ = 0;
    int maxGeneralFieldSize_ = 0;
    cow_List<double> values_; // of an actuator
};

#endif
