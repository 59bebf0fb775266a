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
            .Field<&R::timeSpan>("timeSpan",
                                 "what the time values of a curve count from; STEP is not written")
            .Field<&R::stamp>("stamp", "edition of the model in which the amplitude came to be: zero for the "
                                       "base of a restart, more after it; not in the deck");
    return fields;
}

const cls_FieldTable& kamC_BaselineCorrection::Fields() {
    using R = kamC_BaselineCorrection;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::intervals>("intervals", "ends of the correction time intervals, ascending; empty: one "
                                               "correction over the whole record")
            .Unit("time")
            .Example(R"({"intervals": [5]})");
    return fields;
}

const cls_FieldTable& kamC_Tabular::Fields() {
    using R = kamC_Tabular;
    static const cls_FieldTable fields =
        cls_Describe<R>(kamC_Amplitude::Fields())
            .Field<&R::smooth>("smooth",
                               "part of the time interval that is smoothed, 0 to 0.5; unset: no 'smooth='")
            .Unit("no unit")
            .Field<&R::table>("table", "columns: time (time), value (factor); every row has two cells")
            .Field<&R::baselineCorrection>(
                "baselineCorrection",
                "baseline correction of an acceleration record; a keyword of its own behind the amplitude")
            .Example(R"({"table": [[0, 0], [1, 1], [2, 0.5]]})");
    return fields;
}

const cls_FieldTable& kamC_EquallySpaced::Fields() {
    using R = kamC_EquallySpaced;
    static const cls_FieldTable fields =
        cls_Describe<R>(kamC_Amplitude::Fields())
            .Field<&R::fixedInterval>("fixedInterval", "interval between the values; always written")
            .Unit("time")
            .Field<&R::begin>("begin", "time of the first value; written when not 0.0")
            .Unit("time")
            .Field<&R::smooth>("smooth",
                               "part of the time interval that is smoothed, 0 to 0.5; unset: no 'smooth='")
            .Unit("no unit")
            .Field<&R::values>("values", "the values, first to last")
            .Unit("no unit")
            .Field<&R::baselineCorrection>(
                "baselineCorrection",
                "baseline correction of an acceleration record; a keyword of its own behind the amplitude")
            .Example(R"({"fixedInterval": 0.01, "values": [0, 0.4, 1, 0.4, 0]})");
    return fields;
}

const cls_FieldTable& kamC_Periodic::Fields() {
    using R = kamC_Periodic;
    static const cls_FieldTable fields =
        cls_Describe<R>(kamC_Amplitude::Fields())
            .Field<&R::frequency>("frequency", "circular frequency")
            .Unit("radians/time")
            .Field<&R::start>("start", "starting time")
            .Unit("time")
            .Field<&R::a0>("a0", "constant term")
            .Unit("no unit")
            .Field<&R::table>("table",
                              "columns: A (cosine term), B (sine term), one row per term; every row has two "
                              "cells. The number of rows is the first number of the first data line")
            .Example(R"({"frequency": 62.8, "table": [[0, 1]]})");
    return fields;
}

const cls_FieldTable& kamC_Modulated::Fields() {
    using R = kamC_Modulated;
    static const cls_FieldTable fields =
        cls_Describe<R>(kamC_Amplitude::Fields())
            .Field<&R::initial>("initial", "constant term A0")
            .Unit("no unit")
            .Field<&R::magnitude>("magnitude", "magnitude A")
            .Unit("no unit")
            .Field<&R::start>("start", "starting time")
            .Unit("time")
            .Field<&R::frequency1>("frequency1", "circular frequency 1")
            .Unit("radians/time")
            .Field<&R::frequency2>("frequency2", "circular frequency 2")
            .Unit("radians/time")
            .Example(R"({"magnitude": 1, "frequency1": 10, "frequency2": 100})");
    return fields;
}

const cls_FieldTable& kamC_Decay::Fields() {
    using R = kamC_Decay;
    static const cls_FieldTable fields =
        cls_Describe<R>(kamC_Amplitude::Fields())
            .Field<&R::initial>("initial", "constant term A0")
            .Unit("no unit")
            .Field<&R::maximum>("maximum", "coefficient A of the exponential")
            .Unit("no unit")
            .Field<&R::start>("start", "starting time")
            .Unit("time")
            .Field<&R::decayTime>("decayTime", "decay time")
            .Unit("time")
            .Example(R"({"maximum": 1, "decayTime": 0.2})");
    return fields;
}

const cls_FieldTable& kamC_SolutionDependent::Fields() {
    using R = kamC_SolutionDependent;
    static const cls_FieldTable fields = cls_Describe<R>(kamC_Amplitude::Fields())
                                             .Field<&R::initial>("initial", "initial value")
                                             .Unit("no unit")
                                             .Field<&R::minimum>("minimum", "smallest value")
                                             .Unit("no unit")
                                             .Field<&R::maximum>("maximum", "largest value")
                                             .Unit("no unit")
                                             .Example(R"({"initial": 1, "minimum": 0.1, "maximum": 1000})");
    return fields;
}

const cls_FieldTable& kamC_SmoothStep::Fields() {
    using R = kamC_SmoothStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kamC_Amplitude::Fields())
            .Field<&R::table>("table", "columns: time (time), value (factor); every row has two cells")
            .Example(R"({"table": [[0, 0], [1, 1]]})");
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
            .Field<&R::dbReference>(
                "dbReference",
                "reference value of the decibel scale; written as 'db Reference=' when not 0.0")
            .Unit("unit of the excitation")
            .Field<&R::g>("g", "acceleration of gravity; written when not 1.0")
            .Unit("length/time^2")
            .Field<&R::psdType>("psdType", "units of the density; FORCE is not written")
            .Field<&R::user>("user", "true: the function comes from a user subroutine, ', user' is written")
            .Field<&R::table>("table", "columns: real part, imaginary part (units squared/frequency), "
                                       "frequency (cycles/time); every row has three cells")
            .Example(R"({"table": [[1, 0, 10], [1, 0, 1000]]})");
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
            .Field<&R::g>("g",
                          "acceleration of gravity, for spectra in multiples of it; written when not 0.0")
            .Unit("length/time^2")
            .Field<&R::type>("type", "quantity of the spectrum; ACCELERATION is not written")
            .Field<&R::table>("table", "columns: magnitude (units of the quantity), frequency (cycles/time), "
                                       "fraction of critical damping; every row has three cells")
            .Example(R"({"table": [[0.2, 1, 0.05], [0.5, 10, 0.05]]})");
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
