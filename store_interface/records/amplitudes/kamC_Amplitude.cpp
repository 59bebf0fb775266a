#include "store_interface/records/amplitudes/kamC_Amplitude.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const omu_EnumTable& omu_EnumTableOf(kamC_Amplitude::TimeSpanEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "STEP", "STEP"}, {1, "TOTAL", "TOTAL"}};
    static constexpr omu_EnumTable table{"kamC_Amplitude::TimeSpanEnm", rows};
    return table;
}

const cls_FieldTable& kamC_Amplitude::Fields() {
    using R = kamC_Amplitude;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::timeSpan>("timeSpan", "what the time values of a curve count from; 0 is not written")
            .Field<&R::stamp>("stamp",
                              "edition of the model in which the amplitude came to be: 0 the base of a "
                              "restart, above 0 after it; not in the deck");
    return fields;
}

const cls_FieldTable& kamC_BaselineCorrection::Fields() {
    using R = kamC_BaselineCorrection;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::intervals>("intervals", "ends of the correction time intervals (time), ascending; "
                                               "empty: one correction over the whole record");
    return fields;
}

const cls_FieldTable& kamC_Tabular::Fields() {
    using R = kamC_Tabular;
    static const cls_FieldTable fields =
        cls_Describe<R>(kamC_Amplitude::Fields())
            .Field<&R::smooth>(
                "smooth", "fraction of the time interval that is smoothed, 0 to 0.5; unset: no 'smooth='")
            .Field<&R::table>("table", "columns: time (time), value (factor); every row has two cells")
            .Field<&R::baselineCorrection>(
                "baselineCorrection",
                "baseline correction of an acceleration record; a keyword of its own behind the amplitude");
    return fields;
}

const cls_FieldTable& kamC_EquallySpaced::Fields() {
    using R = kamC_EquallySpaced;
    static const cls_FieldTable fields =
        cls_Describe<R>(kamC_Amplitude::Fields())
            .Field<&R::fixedInterval>("fixedInterval", "interval between the values (time); always written")
            .Field<&R::begin>("begin", "time of the first value; written when not 0.0")
            .Field<&R::smooth>(
                "smooth", "fraction of the time interval that is smoothed, 0 to 0.5; unset: no 'smooth='")
            .Field<&R::values>("values", "the values (factors), first to last")
            .Field<&R::baselineCorrection>(
                "baselineCorrection",
                "baseline correction of an acceleration record; a keyword of its own behind the amplitude");
    return fields;
}

const cls_FieldTable& kamC_Periodic::Fields() {
    using R = kamC_Periodic;
    static const cls_FieldTable fields =
        cls_Describe<R>(kamC_Amplitude::Fields())
            .Field<&R::frequency>("frequency",
                                  "circular frequency (radians/time); second number of the first data line")
            .Field<&R::start>("start", "starting time; third number")
            .Field<&R::a0>("a0", "constant term (factor); fourth number")
            .Field<&R::table>("table",
                              "columns: A (cosine term), B (sine term), one row per term; every row has two "
                              "cells. The number of rows is the first number of the first data line");
    return fields;
}

const cls_FieldTable& kamC_Modulated::Fields() {
    using R = kamC_Modulated;
    static const cls_FieldTable fields =
        cls_Describe<R>(kamC_Amplitude::Fields())
            .Field<&R::initial>("initial", "constant term A0 (factor)")
            .Field<&R::magnitude>("magnitude", "magnitude A (factor)")
            .Field<&R::start>("start", "starting time")
            .Field<&R::frequency1>("frequency1", "circular frequency 1 (radians/time)")
            .Field<&R::frequency2>("frequency2", "circular frequency 2 (radians/time)");
    return fields;
}

const cls_FieldTable& kamC_Decay::Fields() {
    using R = kamC_Decay;
    static const cls_FieldTable fields =
        cls_Describe<R>(kamC_Amplitude::Fields())
            .Field<&R::initial>("initial", "constant term A0 (factor)")
            .Field<&R::maximum>("maximum", "coefficient A of the exponential (factor)")
            .Field<&R::start>("start", "starting time")
            .Field<&R::decayTime>("decayTime", "decay time (time)");
    return fields;
}

const cls_FieldTable& kamC_SolutionDependent::Fields() {
    using R = kamC_SolutionDependent;
    static const cls_FieldTable fields = cls_Describe<R>(kamC_Amplitude::Fields())
                                             .Field<&R::initial>("initial", "initial value (factor)")
                                             .Field<&R::minimum>("minimum", "smallest value (factor)")
                                             .Field<&R::maximum>("maximum", "largest value (factor)");
    return fields;
}

const cls_FieldTable& kamC_SmoothStep::Fields() {
    using R = kamC_SmoothStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kamC_Amplitude::Fields())
            .Field<&R::table>("table", "columns: time (time), value (factor); every row has two cells");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kamC_PsdDefinition::PsdTypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "BASE", "BASE"}, {1, "FORCE", "FORCE"}, {2, "DB", "DB"}};
    static constexpr omu_EnumTable table{"kamC_PsdDefinition::PsdTypeEnm", rows};
    return table;
}

const cls_FieldTable& kamC_PsdDefinition::Fields() {
    using R = kamC_PsdDefinition;
    static const cls_FieldTable fields =
        cls_Describe<R>(kamC_Amplitude::Fields())
            .Field<&R::dbReference>("dbReference", "reference value of the decibel scale (units of the "
                                                   "excitation); written as 'db Reference=' when not 0.0")
            .Field<&R::g>("g", "acceleration of gravity (length/time squared); written when not 1.0")
            .Field<&R::psdType>("psdType", "units of the density; written when not 1")
            .Field<&R::user>("user", "true: the function comes from a user subroutine, ', user' is written")
            .Field<&R::table>("table", "columns: real part, imaginary part (units squared/frequency), "
                                       "frequency (cycles/time); every row has three cells");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kamC_Spectrum::TypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "DISPLACEMENT", "DISPLACEMENT"},
                                           {1, "VELOCITY", "VELOCITY"},
                                           {2, "ACCELERATION", "ACCELERATION"},
                                           {3, "GRAVITY", "G"}};
    static constexpr omu_EnumTable table{"kamC_Spectrum::TypeEnm", rows};
    return table;
}

const cls_FieldTable& kamC_Spectrum::Fields() {
    using R = kamC_Spectrum;
    static const cls_FieldTable fields =
        cls_Describe<R>(kamC_Amplitude::Fields())
            .Field<&R::g>("g", "acceleration of gravity (length/time squared), for spectra in multiples of "
                               "it; written when not 0.0")
            .Field<&R::type>("type", "quantity of the spectrum; written when not 2")
            .Field<&R::table>("table", "columns: magnitude (units of the quantity), frequency (cycles/time), "
                                       "fraction of critical damping; every row has three cells");
    return fields;
}

void cls_RegisterAmplitudeRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kamC_Amplitude>();
    registrar.Add<kamC_BaselineCorrection>();
    registrar.Add<kamC_Tabular>();
    registrar.Add<kamC_EquallySpaced>();
    registrar.Add<kamC_Periodic>();
    registrar.Add<kamC_Modulated>();
    registrar.Add<kamC_Decay>();
    registrar.Add<kamC_SolutionDependent>();
    registrar.Add<kamC_SmoothStep>();
    registrar.Add<kamC_PsdDefinition>();
    registrar.Add<kamC_Spectrum>();
}
