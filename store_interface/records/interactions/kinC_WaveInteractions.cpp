#include "store_interface/records/interactions/kinC_WaveInteractions.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kinC_AcousticImpedanceState::Fields() {
    using R = kinC_AcousticImpedanceState;
    static const cls_FieldTable fields = cls_Describe<R>(kinC_InteractionState::Fields())
                                             .Field<&R::property>("property", "the impedance property")
                                             .RefersTo<kinC_AcousticImpedanceProp>("interactionProperty")
                                             .Example(R"({"property": "Absorber"})");
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
            .Field<&R::boundaryType>("boundaryType", "shape of the nonreflecting boundary")
            .Meanings(boundaryTypeMeanings)
            .Field<&R::radius>("radius", "radius of a circular or spherical boundary")
            .Unit("length")
            .Field<&R::semiAxisA>("semiAxisA", "first figure of an ellipse or spheroid: semimajor axis")
            .Unit("length")
            .Field<&R::semiAxisB>("semiAxisB", "second figure of an ellipse or spheroid, as stored")
            .Unit("length or no unit")
            .Field<&R::center>("center", "centre of an elliptical or spheroidal boundary")
            .Unit("length")
            .Field<&R::axis>("axis",
                             "the major axis of an elliptical or spheroidal boundary; its length counts")
            .Example(R"({"surface": "PART-1.WALL"})");
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
            .Field<&R::property>("property", "the property of the wave")
            .RefersTo<kinC_IncidentWaveProperty>("interactionProperty")
            .Field<&R::amplitude>("amplitude", "amplitude of the wave, of pressure or acceleration")
            .RefersTo("amplitude")
            .Field<&R::magnitude>("magnitude", "reference magnitude")
            .Unit("stress or length/time^2")
            .Example(
                R"({"surface": "PART-1.HULL", "source": "PART-1.SOURCE", "standoff": "PART-1.STANDOFF", "property": "Wave", "amplitude": "Pulse"})");
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
                                       "then field variables; printed as it stands")
            .Example(R"({"table": [[1, 0, 100]]})");
    return fields;
}

const cls_FieldTable& kinC_IncidentWaveProperty::Fields() {
    using R = kinC_IncidentWaveProperty;
    static constexpr cls_IntMeaning shapeMeanings[] = {{0, "planar (any value but 1)"}, {1, "spherical"}};
    static constexpr cls_IntMeaning bubbleModelMeanings[] = {
        {0, "nothing"}, {1, "the charge block"}, {2, "the three decay constants"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_InteractionProperty::Fields())
            .Field<&R::speed>("speed", "speed of sound in the fluid")
            .Unit("length/time")
            .Field<&R::density>("density", "density of the fluid")
            .Unit("mass/volume")
            .Field<&R::shape>("shape", "shape of the wave front")
            .Meanings(shapeMeanings)
            .Field<&R::bubbleModel>("bubbleModel", "what follows the two fluid figures")
            .Meanings(bubbleModelMeanings)
            .Field<&R::decayA>("decayA", "first of the three decay constants")
            .Unit("no unit")
            .Field<&R::decayB>("decayB", "second of the three decay constants")
            .Unit("no unit")
            .Field<&R::decayC>("decayC", "third of the three decay constants")
            .Unit("no unit")
            .Field<&R::pressureConstant>("pressureConstant",
                                         "of the charge: similitude constant of the peak pressure")
            .Unit("stress*(length/mass^(1/3))^(1+A)")
            .Field<&R::timeConstant>("timeConstant", "of the charge: similitude constant of the decay time")
            .Unit("time/mass^(1/3)")
            .Field<&R::pressureExponent>("pressureExponent",
                                         "of the charge: similitude exponent of the peak pressure")
            .Unit("no unit")
            .Field<&R::timeExponent>("timeExponent", "of the charge: similitude exponent of the decay time")
            .Unit("no unit")
            .Field<&R::adiabaticConstant>("adiabaticConstant",
                                          "of the charge: adiabatic constant of the charge")
            .Unit("stress")
            .Field<&R::specificHeatRatio>("specificHeatRatio",
                                          "of the charge: ratio of specific heats of the explosion gas")
            .Unit("no unit")
            .Field<&R::chargeDensity>("chargeDensity", "of the charge: density of the charge")
            .Unit("mass/volume")
            .Field<&R::chargeMass>("chargeMass", "of the charge: mass of the charge")
            .Unit("mass")
            .Field<&R::fluidDensity>("fluidDensity", "of the charge: density of the fluid")
            .Unit("mass/volume")
            .Field<&R::fluidSoundSpeed>("fluidSoundSpeed", "of the charge: speed of sound in the fluid")
            .Unit("length/time")
            .Field<&R::gravity>("gravity", "of the charge: acceleration of gravity")
            .Unit("length/time^2")
            .Field<&R::atmosphericPressure>("atmosphericPressure", "of the charge: atmospheric pressure")
            .Unit("stress")
            .Field<&R::waveEffects>("waveEffects", "of the charge: waves in fluid and gas count")
            .Field<&R::dragCoefficient>("dragCoefficient", "of the charge: flow drag coefficient")
            .Unit("no unit")
            .Field<&R::dragExponent>("dragExponent", "of the charge: flow drag exponent")
            .Unit("no unit")
            .Field<&R::maximumTime>("maximumTime", "of the charge: largest time of the bubble simulation")
            .Unit("time")
            .Field<&R::maximumSteps>("maximumSteps",
                                     "of the charge: largest number of steps of the bubble simulation")
            .Field<&R::relativeStepControl>("relativeStepControl", "of the charge: relative error tolerance")
            .Unit("no unit")
            .Field<&R::absoluteStepControl>("absoluteStepControl", "of the charge: absolute error tolerance")
            .Unit("unit of the solution")
            .Field<&R::stepControlExponent>("stepControlExponent", "of the charge: error control exponent")
            .Unit("no unit")
            .Field<&R::initialDepth>(
                "initialDepth",
                "of the charge: depth of the charge; the keyword's setDepthNormal replaces it")
            .Unit("length")
            .Example(R"({"speed": 1.5e6, "density": 1e-9})");
    return fields;
}

void cls_RegisterWaveInteractionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kinC_AcousticImpedanceState>();
    registrar.Add<kinC_AcousticImpedance>();
    registrar.Add<kinC_IncidentWave>();
    registrar.Add<kinC_AcousticImpedanceProp>();
    registrar.Add<kinC_IncidentWaveProperty>();
}
