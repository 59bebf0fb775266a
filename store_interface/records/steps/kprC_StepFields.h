#ifndef QRX_STORE_KPRC_STEPFIELDS_H
#define QRX_STORE_KPRC_STEPFIELDS_H

#include "store_interface/records/cls_ClassRegistrar.h"

// Fields that several step classes have, described once: cls_Describe<R>(...).With(kprC_NlgeomField).

inline constexpr auto kprC_NlgeomField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::nlgeom>("nlgeom", "ON: large-displacement effects count");
};
inline constexpr auto kprC_MaxNumIncField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::maxNumInc>("maxNumInc", "largest number of increments; 100 is not written");
};
inline constexpr auto kprC_TimePeriodField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::timePeriod>("timePeriod", "time period of the step").Unit("time");
};
inline constexpr auto kprC_PseudoTimePeriodField = []<class R>(cls_Describe<R>& fields) {
    fields
        .template Field<&R::timePeriod>("timePeriod",
                                        "time period of the step; a pseudo-time in static procedures")
        .Unit("time");
};
inline constexpr auto kprC_StepAmplitudeField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::amplitude>(
        "amplitude", "course of loads without an amplitude: at once or along a ramp; STEP is not written");
};
inline constexpr auto kprC_TimeIncrementationField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::timeIncrementationMethod>("timeIncrementationMethod",
                                                        "AUTOMATIC increments, or DIRECT: all of one size");
};
inline constexpr auto kprC_InitialIncField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::initialInc>("initialInc", "first (or fixed) time increment").Unit("time");
};
inline constexpr auto kprC_MinIncField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::minInc>("minInc", "smallest time increment, automatic method only")
        .Unit("time");
};
inline constexpr auto kprC_MaxIncField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::maxInc>("maxInc", "largest time increment, automatic method only").Unit("time");
};
inline constexpr auto kprC_ExtrapolationField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::extrapolation>("extrapolation",
                                             "how the solution is extrapolated from increment to increment; "
                                             "LINEAR is not written, and any other than PARABOLIC prints NO");
};
inline constexpr auto kprC_UnwrittenTechniqueField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::solutionTechnique>(
        "solutionTechnique", "how the equations are solved; not written for this procedure");
};
inline constexpr auto kprC_StabilizationMethodField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::stabilizationMethod>(
        "stabilizationMethod", "how the step is stabilised, by an energy fraction or by a damping factor");
};
inline constexpr auto kprC_StabilizationMagnitudeField = []<class R>(cls_Describe<R>& fields) {
    fields
        .template Field<&R::stabilizationMagnitude>(
            "stabilizationMagnitude", "dissipated energy fraction or damping factor, by the method")
        .Unit("no unit, or that of the damping factor");
};
inline constexpr auto kprC_AdiabaticField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::adiabatic>("adiabatic", "adiabatic heating by inelastic work");
};
inline constexpr auto kprC_NoStopField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::noStop>(
        "noStop", "direct method only: accept the increment after the last allowed iteration");
};
inline constexpr auto kprC_ResponseField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::response>("response", "STEADY_STATE or TRANSIENT");
};
inline constexpr auto kprC_EndField = []<class R>(cls_Describe<R>& fields) {
    fields
        .template Field<&R::end>("end", "rate of change that ends a transient step when it is reached; "
                                        "without it the step ends with its period")
        .Unit("unit of the solution/time");
};
inline constexpr auto kprC_FrequencyScaleField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::frequencyScale>("frequencyScale",
                                              "how the points lie between the limits of a range");
};
inline constexpr auto kprC_FrequenciesField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::frequencies>("frequencies", "frequency ranges, one data line each");
};
inline constexpr auto kprC_SubdivideField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::subdivideUsingEigenfrequencies>(
        "subdivideUsingEigenfrequencies", "whether the ranges are divided at the natural frequencies");
};
inline constexpr auto kprC_ComplexField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::complex>("complex", "true: complex (damped) response; false: real only");
};
inline constexpr auto kprC_FullyPlasticField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::fullyPlastic>("fullyPlastic",
                                            "element set watched for full plasticity, in the deck's own "
                                            "spelling (written as it stands); empty = none");
};

/// Time increments of procedures that take them automatically or fixed.
inline constexpr auto kprC_TimeIncrementFields = []<class R>(cls_Describe<R>& fields) {
    fields.With(kprC_TimeIncrementationField)
        .With(kprC_MaxNumIncField)
        .With(kprC_InitialIncField)
        .With(kprC_MinIncField)
        .With(kprC_MaxIncField);
};

inline constexpr auto kprC_FrequencyRangeFields = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::upper>("upper", "upper limit, always written")
        .Unit("cycles/time")
        .template Field<&R::lower>("lower", "lower limit or single frequency")
        .Unit("cycles/time")
        .template Field<&R::points>("points", "number of points in the range, ends included")
        .template Field<&R::bias>("bias", "bias of the points towards the ends; written from 4 points on")
        .Unit("no unit");
};

/// Damping of the modes; structural damping where the procedure has it.
inline constexpr auto kprC_ModalDampingFields = []<class R>(cls_Describe<R>& fields) {
    constexpr bool hasStructural = requires {
        &R::structuralDamping;
    };
    fields
        .template Field<&R::compositeDamping>("compositeDamping",
                                              "composite damping by mode; null or absent: none")
        .template Field<&R::directDamping>("directDamping", "direct damping by mode; null or absent: none")
        .template Field<&R::rayleighDamping>("rayleighDamping",
                                             "Rayleigh damping by mode; null or absent: none");
    if constexpr (hasStructural) {
        fields.template Field<&R::structuralDamping>("structuralDamping",
                                                     "structural damping by mode; null or absent: none");
    }
    fields
        .template Field<&R::directDampingByFrequency>("directDampingByFrequency",
                                                      "direct damping by frequency; null or absent: none")
        .template Field<&R::rayleighDampingByFrequency>(
            "rayleighDampingByFrequency", "Rayleigh damping by frequency; null or absent: none");
    if constexpr (hasStructural) {
        fields.template Field<&R::structuralDampingByFrequency>(
            "structuralDampingByFrequency", "structural damping by frequency; null or absent: none");
    }
};

/// Of every procedure that may be stabilized.
inline constexpr omu_EnumRow kprC_StabilizationRows[] = {
    {0, "NONE", "NONE"},
    {1, "DISSIPATED_ENERGY_FRACTION", "DISSIPATED_ENERGY_FRACTION"},
    {2, "DAMPING_FACTOR", "DAMPING_FACTOR"}};

#endif
