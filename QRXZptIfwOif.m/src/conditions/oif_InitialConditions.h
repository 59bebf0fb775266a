#ifndef QRX_OIF_INITIALCONDITIONS_H
#define QRX_OIF_INITIALCONDITIONS_H

#include "base/oif_KeywordLine.h"
#include "conditions/oif_FieldTable.h"
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
    /// What the field's state in the step says; velocity, stress and hardening stand in the record.
    template <class R>
    oif_InitialConditions(const oif_FieldCard& card, const R&, const oif_FieldSetting& setting)
        : record_(card.Object()), state_(card.Quad().state),
          distributionType_(card.Object().distributionType), setName_(card.setName), setting_(setting),
          parameters_([](const Self& self, oif_KeywordLine& line) {
              self.WriteParameters(line, static_cast<const R&>(self.record_.ConstGet()));
          }),
          form_([](const Self& self, utl_Stream& stream) {
              self.WriteForm(stream, static_cast<const R&>(self.record_.ConstGet()));
          }) {}
    /// `count` initial values, those that the record lacks being 0.
    oif_InitialConditions(const kinC_ActuatorSensor& actuator, const cow_String& setName, int count);
    void Write(utl_Stream& stream) const override { form_(*this, stream); }

    /// The keyword line of a field; anything else raises.
    void WriteInitialConditionsCard(utl_Stream& stream) const;

private:
    using Self = oif_InitialConditions;

    template <class State>
    const State& StateAs() const {
        return static_cast<const State&>(state_.ConstGet());
    }
    bool IsFromFile() const;
    bool HasDataLines() const;
    /// What the keyword line says of where the values come from, without a file's parameters.
    void WriteDistributionType(oif_KeywordLine& line, const cow_String* fileName) const;

    // The parameters of each kind of field, and its keyword as a whole.
    void WriteParameters(oif_KeywordLine& line, const kpfC_Temperature& temperature) const;
    void WriteParameters(oif_KeywordLine& line, const kpfC_GeneralField& field) const;
    void WriteParameters(oif_KeywordLine& line, const kpfC_Velocity& velocity) const;
    void WriteParameters(oif_KeywordLine& line, const kpfC_Stress& stress) const;
    void WriteParameters(oif_KeywordLine& line, const kpfC_Hardening& hardening) const;
    void WriteParameters(oif_KeywordLine& line, const cls_Record& other) const;
    void WriteForm(utl_Stream& stream, const kpfC_Temperature& temperature) const;
    void WriteForm(utl_Stream& stream, const kpfC_GeneralField& field) const;
    void WriteForm(utl_Stream& stream, const kpfC_Velocity& velocity) const;
    void WriteForm(utl_Stream& stream, const kpfC_Stress& stress) const;
    void WriteForm(utl_Stream& stream, const kpfC_Hardening& hardening) const;
    void WriteForm(utl_Stream& stream, const kinC_ActuatorSensor& actuator) const;
    void WriteForm(utl_Stream& stream, const cls_Record& other) const;

    void WriteSetMagnitudeData(utl_Stream& stream, double magnitude) const;
    void WriteStressTensorData(utl_Stream& stream, const kpfC_Stress& stress) const;

    mdl_ObjCow<cls_Record> record_;
    mdl_ObjCow<kpfC_FieldState> state_;
    kpfC_Field::DistribTypeEnm distributionType_ = kpfC_Field::DistribTypeEnm::UNIFORM;
    cow_String setName_;
    oif_FieldSetting setting_;
    void (*parameters_)(const Self& self, oif_KeywordLine& line);
    void (*form_)(const Self& self, utl_Stream& stream);
    cow_List<double> values_; // of an actuator
};

#endif
