#include "store_interface/records/interactions/kinC_ActuatorSensor.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kinC_ActuatorSensor::Fields() {
    using R = kinC_ActuatorSensor;
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_Interaction::Fields())
            .Field<&R::coordinates>("coordinates", "number of coordinates; zero writes none")
            .Field<&R::unsymm>("unsymm", "true: ', unsymm'")
            .Field<&R::variables>("variables", "number of solution-dependent variables; always written")
            .Field<&R::elementType>("elementType",
                                    "the element type text, behind 'type='; written as it stands")
            .Field<&R::nodeSetText>(
                "nodeSetText",
                "the node-set text: the whole data line of '*User Element', written as it stands")
            .Field<&R::initialValues>("initialValues",
                                      "values of the actuator form of '*Initial Conditions, type=SOLUTION'")
            .Unit("as the user's code says")
            .Example(R"({"elementType": "U1", "nodeSetText": "1, 2", "variables": 1})");
    return fields;
}

const cls_FieldTable& kinC_ActuatorSensorProp::Fields() {
    using R = kinC_ActuatorSensorProp;
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_InteractionProperty::Fields())
            .Field<&R::realProperties>("realProperties", "real properties, in order")
            .Unit("as the user's code says")
            .Field<&R::intProperties>("intProperties", "integer properties, in order")
            .Example(R"({"realProperties": [1.5]})");
    return fields;
}

void cls_RegisterActuatorSensorRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kinC_ActuatorSensor>();
    registrar.Add<kinC_ActuatorSensorState>();
    registrar.Add<kinC_ActuatorSensorProp>();
}
