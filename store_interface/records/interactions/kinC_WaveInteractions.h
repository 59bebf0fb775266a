#ifndef QRX_STORE_KINC_WAVEINTERACTIONS_H
#define QRX_STORE_KINC_WAVEINTERACTIONS_H

#include "store_interface/records/interactions/kinC_Interaction.h"

class cls_ClassRegistrar;

class kinC_AcousticImpedanceState final
    : public cls_RecordOf<kinC_AcousticImpedanceState, kinC_InteractionState> {
public:
    static constexpr cls_ClassInfo Class{"kinC_AcousticImpedanceState",
                                         "state of an acoustic impedance in one step", 0x2A0002B};

    mdl_PropAttr<cow_String> property;

    static const cls_FieldTable& Fields();
};

class kinC_AcousticImpedance final
    : public kinC_InteractionOf<kinC_AcousticImpedance, kinC_AcousticImpedanceState> {
public:
    static constexpr cls_ClassInfo Class{"kinC_AcousticImpedance",
                                         "impedance or nonreflecting boundary on an acoustic surface",
                                         0x2A0002A, "Impedance"};

    rgnC_Region surface;
    int nonreflecting = 0;
    int boundaryType = 0;
    double radius = 0.0;
    double semiAxisA = 0.0;
    double semiAxisB = 0.0;
    gsl_Point center;
    gsl_ModelSegment axis;

    static const cls_FieldTable& Fields();
};

class kinC_IncidentWave final : public kinC_InteractionOf<kinC_IncidentWave, kinC_InteractionState> {
public:
    static constexpr cls_ClassInfo Class{"kinC_IncidentWave",
                                         "an acoustic wave from outside that meets a surface", 0x2A0002C};

    rgnC_Region source;
    rgnC_Region standoff;
    rgnC_Region surface;
    int waveType = 0;
    cow_String property;
    cow_String amplitude;
    double magnitude = 1.0;

    static const cls_FieldTable& Fields();
};

class kinC_AcousticImpedanceProp final
    : public cls_RecordOf<kinC_AcousticImpedanceProp, kinC_InteractionProperty> {
public:
    static constexpr cls_ClassInfo Class{"kinC_AcousticImpedanceProp",
                                         "acoustic impedance or admittance as a table", 0x2A00043,
                                         "AcousticImpedanceProperty"};

    bool admittance = false;
    int dependencies = 0;
    cow_2DArray<double> table;

    static const cls_FieldTable& Fields();
};

class kinC_IncidentWaveProperty final
    : public cls_RecordOf<kinC_IncidentWaveProperty, kinC_InteractionProperty> {
public:
    static constexpr cls_ClassInfo Class{
        "kinC_IncidentWaveProperty",
        "how an incident wave travels, with the charge data of an underwater explosion; no deck carries it",
        0x2A00044, "IncidentWaveProp"};

    double speed = 0.0;
    double density = 0.0;
    int shape = 0;
    int bubbleModel = 0;
    double decayA = 0.0;
    double decayB = 0.0;
    double decayC = 0.0;
    double pressureConstant = 0.0;
    double timeConstant = 0.0;
    double pressureExponent = 0.0;
    double timeExponent = 0.0;
    double adiabaticConstant = 0.0;
    double specificHeatRatio = 0.0;
    double chargeDensity = 0.0;
    double chargeMass = 0.0;
    double fluidDensity = 0.0;
    double fluidSoundSpeed = 0.0;
    double gravity = 0.0;
    double atmosphericPressure = 0.0;
    bool waveEffects = true;
    double dragCoefficient = 0.0;
    double dragExponent = 0.0;
    double maximumTime = 0.0;
    int maximumSteps = 0;
    double relativeStepControl = 0.0;
    double absoluteStepControl = 0.0;
    double stepControlExponent = 0.0;
    double initialDepth = 0.0;

    static const cls_FieldTable& Fields();
};

void cls_RegisterWaveInteractionRecords(cls_ClassRegistrar& registrar);

#endif
