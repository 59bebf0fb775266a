#ifndef QRX_STORE_KINC_CONTACTPROPERTY_H
#define QRX_STORE_KINC_CONTACTPROPERTY_H

#include "store_interface/records/interactions/kinC_Interaction.h"

class cls_ClassRegistrar;

class kinC_TangentialBehavior final : public cls_RecordOf<kinC_TangentialBehavior> {
public:
    static constexpr cls_ClassInfo Class{"kinC_TangentialBehavior",
                                         "friction between two surfaces in contact", 0x2A00048};

    static constexpr double shearStressLimitDef() { return cls_UnsetDouble; }
    static constexpr double elasticSlipStiffnessDef() { return cls_UnsetDouble; }
    int formulation = 0;
    int directionality = 1;
    bool temperatureDependency = false;
    bool pressureDependency = false;
    bool slipRateDependency = false;
    int dependencies = 0;
    int exponentialDecayDefinition = 0;
    cow_2DArray<double> table;
    double shearStressLimit = shearStressLimitDef();
    int maximumElasticSlip = 0;
    double slipTolerance = 0.005;
    double elasticSlip = 0.0;
    double elasticSlipStiffness = elasticSlipStiffnessDef();
    int nStateDependentVars = 0;
    bool useProperties = false;

    static const cls_FieldTable& Fields();
};

class kinC_NormalBehavior final : public cls_RecordOf<kinC_NormalBehavior> {
public:
    static constexpr cls_ClassInfo Class{
        "kinC_NormalBehavior", "pressure against overclosure of two surfaces in contact", 0x2A00049};

    static constexpr double maxStiffnessDef() { return cls_UnsetDouble; }
    static constexpr double contactStiffnessScaleFactorDef() { return 1.0; }
    static constexpr double initialStiffnessScaleFactorDef() { return 1.0; }
    static constexpr double clearanceAtZeroContactPressureDef() { return 0.0; }
    int pressureOverclosure = 0;
    int allowSeparation = 1;
    double maxStiffness = maxStiffnessDef();
    double contactStiffness = 0.0;
    cow_2DArray<double> table;
    int constraintEnforcementMethod = 0;
    double overclosureFactor = 0.0;
    double overclosureMeasure = 0.0;
    double contactStiffnessScaleFactor = contactStiffnessScaleFactorDef();
    double initialStiffnessScaleFactor = initialStiffnessScaleFactorDef();
    double clearanceAtZeroContactPressure = clearanceAtZeroContactPressureDef();

    static const cls_FieldTable& Fields();
};

class kinC_Damping final : public cls_RecordOf<kinC_Damping> {
public:
    static constexpr cls_ClassInfo Class{"kinC_Damping", "damping of two surfaces that approach one another",
                                         0x2A0004A};

    int definition = 0;
    double tangentFraction = 0.0;
    cow_2DArray<double> table;

    static const cls_FieldTable& Fields();
};

class kinC_ThermalConductance final : public cls_RecordOf<kinC_ThermalConductance> {
public:
    static constexpr cls_ClassInfo Class{"kinC_ThermalConductance",
                                         "heat conduction across the gap of two surfaces", 0x2A0004B};

    int definition = 0;
    bool clearanceDependency = false;
    bool pressureDependency = false;
    bool temperatureDependency = false;
    bool massFlowRateDependency = false;
    int dependencies = 0;
    cow_2DArray<double> clearanceTable;
    bool pressureTableTemperatureDependency = false;
    bool pressureTableMassFlowRateDependency = false;
    int pressureTableDependencies = 0;
    cow_2DArray<double> pressureTable;

    static const cls_FieldTable& Fields();
};

class kinC_HeatGeneration final : public cls_RecordOf<kinC_HeatGeneration> {
public:
    static constexpr cls_ClassInfo Class{"kinC_HeatGeneration",
                                         "heat from the work dissipated between two surfaces", 0x2A0004C};

    double heatFraction = 1.0;
    double distributionFraction = 0.5;

    static const cls_FieldTable& Fields();
};

class kinC_Radiation final : public cls_RecordOf<kinC_Radiation> {
public:
    static constexpr cls_ClassInfo Class{"kinC_Radiation", "radiation across the gap of two surfaces",
                                         0x2A0004D};

    double firstEmissivity = 0.0;
    double secondEmissivity = 0.0;
    cow_2DArray<double> table;

    static const cls_FieldTable& Fields();
};

class kinC_GeometricProperties final : public cls_RecordOf<kinC_GeometricProperties> {
public:
    static constexpr cls_ClassInfo Class{
        "kinC_GeometricProperties", "geometry of a contact: area of node contact and padding", 0x2A0004E};

    static constexpr double contactAreaDef() { return 1.0; }
    static constexpr double padThicknessDef() { return cls_UnsetDouble; }
    double contactArea = contactAreaDef();
    double padThickness = padThicknessDef();

    static const cls_FieldTable& Fields();
};

class kinC_ContactProperty final : public cls_RecordOf<kinC_ContactProperty, kinC_InteractionProperty> {
public:
    static constexpr cls_ClassInfo Class{
        "kinC_ContactProperty",
        "how two surfaces in contact behave: up to seven behaviours, each absent or present", 0x2A00041};

    mdl_ObjCow<kinC_TangentialBehavior> tangentialBehavior;
    mdl_ObjCow<kinC_NormalBehavior> normalBehavior;
    mdl_ObjCow<kinC_Damping> damping;
    mdl_ObjCow<kinC_ThermalConductance> thermalConductance;
    mdl_ObjCow<kinC_HeatGeneration> heatGeneration;
    mdl_ObjCow<kinC_Radiation> radiation;
    mdl_ObjCow<kinC_GeometricProperties> geometricProperties;

    static const cls_FieldTable& Fields();
};

void cls_RegisterContactPropertyRecords(cls_ClassRegistrar& registrar);

#endif
