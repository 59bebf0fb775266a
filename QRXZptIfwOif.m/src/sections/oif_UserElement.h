#ifndef QRX_OIF_USERELEMENT_H
#define QRX_OIF_USERELEMENT_H

#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/interactions/kinC_ActuatorSensor.h"

/// The user element of an actuator or sensor; nothing for an interaction of another kind. No builder makes
/// it, it is for callers of the library.
///     *User Element, type=U1, nodes=1, coordinates=3, properties=2, i properties=0, unsymm, variables=4
///     SET
class oif_UserElement final : public qkw_KeywordOf<oif_UserElement> {
public:
    /// Without properties.
    explicit oif_UserElement(const mdl_ObjCow<kinC_Interaction>& interaction) : interaction_(interaction) {}
    oif_UserElement(const mdl_ObjCow<kinC_Interaction>& interaction, const kinC_ActuatorSensorProp& property)
        : interaction_(interaction), realProperties_(property.realProperties.Length()),
          intProperties_(property.intProperties.Length()) {}
    void Write(utl_Stream& stream) const override;

private:
    mdl_ObjCow<kinC_Interaction> interaction_;
    int realProperties_ = 0;
    int intProperties_ = 0;
};

/// Properties of an actuator or sensor, the real ones first; nothing for a property of another kind. No
/// builder makes it.
///     *Uel Property, elset=SET
///     0.5, 1., 3
class oif_UelProperty final : public qkw_KeywordOf<oif_UelProperty> {
public:
    /// `parameters`: what stands behind the keyword, with its comma.
    oif_UelProperty(const mdl_ObjCow<kinC_InteractionProperty>& property, const cow_String& parameters)
        : property_(property), parameters_(parameters) {}
    void Write(utl_Stream& stream) const override;

private:
    mdl_ObjCow<kinC_InteractionProperty> property_;
    cow_String parameters_;
};

#endif
