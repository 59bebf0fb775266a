#include "store_interface/records/interactions/kinC_WaveInteractions.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kinC_AcousticImpedanceState::Fields() {
    using R = kinC_AcousticImpedanceState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_InteractionState::Fields())
            .Field<&R::property>("property", "name of a kinC_AcousticImpedanceProp")
            .RefersTo<kinC_AcousticImpedanceProp>("interactionProperty");
    return fields;
}

const cls_FieldTable& kinC_AcousticImpedance::Fields() {
    using R = kinC_AcousticImpedance;
    static constexpr cls_IntMeaning nonreflectingMeanings[] = {
        {0, "tabular, by property"}, {1, "nonreflecting boundary, by boundaryType"}};
    static constexpr cls_IntMeaning boundaryTypeMeanings[] = {{0, "PLANAR"},     {1, "IMPROVED"},
                                                              {2, "CIRCULAR"},   {3, "SPHERICAL"},
                                                              {4, "ELLIPTICAL"}, {5, "PROLATE SPHEROIDAL"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_Interaction::Fields())
            .Field<&R::surface>("surface", "the surface")
            .Field<&R::nonreflecting>("nonreflecting", "what the boundary is")
            .Meanings(nonreflectingMeanings)
            .Field<&R::boundaryType>("boundaryType",
                                     "shape of the nonreflecting boundary; from 6 on the name is absent")
            .Meanings(boundaryTypeMeanings)
            .Field<&R::radius>("radius", "radius (length), boundaryType 2 and 3")
            .Field<&R::semiAxisA>(
                "semiAxisA",
                "first figure of the ellipse or spheroid: semimajor axis (length), boundaryType 4 and 5")
            .Field<&R::semiAxisB>("semiAxisB",
                                  "second figure of the ellipse or spheroid, as stored (a length "
                                  "or a ratio), boundaryType 4 and 5")
            .Field<&R::center>("center", "centre (length), boundaryType 4 and 5")
            .Field<&R::axis>("axis", "the major axis, boundaryType 4 and 5; its length counts");
    return fields;
}

const cls_FieldTable& kinC_IncidentWave::Fields() {
    using R = kinC_IncidentWave;
    static constexpr cls_IntMeaning waveTypeMeanings[] = {
        {0, "pressure"}, {1, "acceleration"}, {2, "underwater explosion (any other value)"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_Interaction::Fields())
            .Field<&R::source>("source", "node set of the source point")
            .Field<&R::standoff>("standoff", "node set of the standoff point")
            .Field<&R::surface>("surface", "the surface that the wave meets")
            .Field<&R::waveType>("waveType", "what the amplitude gives")
            .Meanings(waveTypeMeanings)
            .Field<&R::property>("property", "name of a kinC_IncidentWaveProperty")
            .RefersTo<kinC_IncidentWaveProperty>("interactionProperty")
            .Field<&R::amplitude>("amplitude", "amplitude of the wave, for waveType 0 and 1")
            .RefersTo("amplitude")
            .Field<&R::magnitude>("magnitude", "reference magnitude (pressure or acceleration)");
    return fields;
}

const cls_FieldTable& kinC_AcousticImpedanceProp::Fields() {
    using R = kinC_AcousticImpedanceProp;
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_InteractionProperty::Fields())
            .Field<&R::admittance>("admittance",
                                   "true: the table holds admittances; false writes 'data=IMPEDANCE'")
            .Field<&R::dependencies>("dependencies",
                                     "number of field variable columns; the deck doesn't tell it")
            .Field<&R::table>("table", "real part, imaginary part, frequency (cycles per time) if given, "
                                       "then field variables; printed as it stands");
    return fields;
}

const cls_FieldTable& kinC_IncidentWaveProperty::Fields() {
    using R = kinC_IncidentWaveProperty;
    static constexpr cls_IntMeaning shapeMeanings[] = {{0, "planar (any value but 1)"}, {1, "spherical"}};
    static constexpr cls_IntMeaning bubbleModelMeanings[] = {
        {0, "nothing"}, {1, "the charge block"}, {2, "the three decay constants"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_InteractionProperty::Fields())
            .Field<&R::speed>("speed", "speed of sound in the fluid (length per time)")
            .Field<&R::density>("density", "density of the fluid (mass per volume)")
            .Field<&R::shape>("shape", "shape of the wave front")
            .Meanings(shapeMeanings)
            .Field<&R::bubbleModel>("bubbleModel", "what follows the two fluid figures")
            .Meanings(bubbleModelMeanings)
            .Field<&R::decayA>("decayA",
                               "first of the three further numbers (bubbleModel 2): decay constant (no unit)")
            .Field<&R::decayB>("decayB", "second of the three further numbers: decay constant (no unit)")
            .Field<&R::decayC>("decayC", "third of the three further numbers: decay constant (no unit)")
            .Field<&R::pressureConstant>("pressureConstant",
                                         "charge number 1, line 1: similitude constant of the peak pressure")
            .Field<&R::timeConstant>("timeConstant",
                                     "charge number 2, line 1: similitude constant of the decay time")
            .Field<&R::pressureExponent>(
                "pressureExponent",
                "charge number 3, line 1: similitude exponent of the peak pressure (no unit)")
            .Field<&R::timeExponent>(
                "timeExponent", "charge number 4, line 1: similitude exponent of the decay time (no unit)")
            .Field<&R::adiabaticConstant>(
                "adiabaticConstant", "charge number 5, line 1: adiabatic constant of the charge (pressure)")
            .Field<&R::specificHeatRatio>(
                "specificHeatRatio",
                "charge number 6, line 1: ratio of specific heats of the explosion gas (no unit)")
            .Field<&R::chargeDensity>("chargeDensity",
                                      "charge number 7, line 1: density of the charge (mass per volume)")
            .Field<&R::chargeMass>("chargeMass", "charge number 8, line 1: mass of the charge (mass)")
            .Field<&R::fluidDensity>("fluidDensity",
                                     "charge number 9, line 2: density of the fluid (mass per volume)")
            .Field<&R::fluidSoundSpeed>(
                "fluidSoundSpeed", "charge number 10, line 2: speed of sound in the fluid (length per time)")
            .Field<&R::gravity>("gravity",
                                "charge number 11, line 2: acceleration of gravity (length per time squared)")
            .Field<&R::atmosphericPressure>("atmosphericPressure",
                                            "charge number 12, line 2: atmospheric pressure (stress)")
            .Field<&R::waveEffects>("waveEffects", "charge number 13, line 2, fifth field: the flag; waves "
                                                   "in fluid and gas count; '1.0, ' or '0.0, '")
            .Field<&R::dragCoefficient>("dragCoefficient",
                                        "charge number 14, line 2: flow drag coefficient (no unit)")
            .Field<&R::dragExponent>("dragExponent", "charge number 15, line 2: flow drag exponent (no unit)")
            .Field<&R::maximumTime>("maximumTime",
                                    "charge number 16, line 3: largest time of the bubble simulation (time)")
            .Field<&R::maximumSteps>(
                "maximumSteps",
                "charge number 17, line 3, second field: the integer; largest number of its steps")
            .Field<&R::relativeStepControl>("relativeStepControl",
                                            "charge number 18, line 3: relative error tolerance (no unit)")
            .Field<&R::absoluteStepControl>("absoluteStepControl",
                                            "charge number 19, line 3: absolute error tolerance")
            .Field<&R::stepControlExponent>("stepControlExponent",
                                            "charge number 20, line 3: error control exponent (no unit)")
            .Field<&R::initialDepth>("initialDepth",
                                     "charge number 21, line 4: depth of the charge (length); the keyword's "
                                     "setDepthNormal replaces it");
    return fields;
}

void cls_RegisterWaveInteractionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kinC_AcousticImpedanceState>();
    registrar.Add<kinC_AcousticImpedance>();
    registrar.Add<kinC_IncidentWave>();
    registrar.Add<kinC_AcousticImpedanceProp>();
    registrar.Add<kinC_IncidentWaveProperty>();
}
