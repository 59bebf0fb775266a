#ifndef QRX_STORE_KINC_ACTUATORSENSOR_H
#define QRX_STORE_KINC_ACTUATORSENSOR_H

#include "store_interface/records/interactions/kinC_Interaction.h"

class cls_ClassRegistrar;

class kinC_ActuatorSensorState final : public cls_RecordOf<kinC_ActuatorSensorState, kinC_InteractionState> {
public:
    static constexpr cls_ClassInfo Class{"kinC_ActuatorSensorState",
                                         "state of a control element in one step"};
};

class kinC_ActuatorSensor final : public kinC_InteractionOf<kinC_ActuatorSensor, kinC_ActuatorSensorState> {
public:
    static constexpr cls_ClassInfo Class{
        "kinC_ActuatorSensor", "a control element at a node: a user element; no deck writes it by itself"};

    int coordinates = 0;
    bool unsymm = false;
    int variables = 0;
    cow_String elementType;
    cow_String nodeSetText;
    cow_List<double> initialValues;

    static const cls_FieldTable& Fields();
};

class kinC_ActuatorSensorProp final : public cls_RecordOf<kinC_ActuatorSensorProp, kinC_InteractionProperty> {
public:
    static constexpr cls_ClassInfo Class{"kinC_ActuatorSensorProp",
                                         "properties of the control element's user code", 0,
                                         "ActuatorSensorProperty"};

    cow_List<double> realProperties;
    cow_List<int> intProperties;

    static const cls_FieldTable& Fields();
};

void cls_RegisterActuatorSensorRecords(cls_ClassRegistrar& registrar);

#endif
