#ifndef QRX_STORE_KAMC_AMPLITUDE_H
#define QRX_STORE_KAMC_AMPLITUDE_H

#include "store_interface/records/cls_FieldTable.h"

class cls_ClassRegistrar;

class kamC_Amplitude : public cls_AbstractRecordOf<kamC_Amplitude> {
public:
    static constexpr cls_ClassInfo Class{"kamC_Amplitude",
                                         "how a quantity varies in time or over frequency; held by name"};

    enum class TimeSpanEnm : int { STEP = 0, TOTAL = 1 };

    static constexpr TimeSpanEnm timeSpanDef() { return TimeSpanEnm::STEP; }
    TimeSpanEnm timeSpan = timeSpanDef();
    int stamp = 0;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kamC_Amplitude::TimeSpanEnm);

class kamC_BaselineCorrection final : public cls_RecordOf<kamC_BaselineCorrection> {
public:
    static constexpr cls_ClassInfo Class{"kamC_BaselineCorrection",
                                         "Baseline correction of an acceleration record."};

    cow_List<double> intervals;

    static const cls_FieldTable& Fields();
};

class kamC_Tabular final : public cls_RecordOf<kamC_Tabular, kamC_Amplitude> {
public:
    static constexpr cls_ClassInfo Class{
        "kamC_Tabular", "Amplitude by a table of points; the solver's default definition.", 0, "Table"};

    static constexpr double smoothDef() { return cls_UnsetDouble; }
    double smooth = smoothDef();
    cow_2DArray<double> table;
    mdl_ObjCow<kamC_BaselineCorrection> baselineCorrection;

    static const cls_FieldTable& Fields();
};

class kamC_EquallySpaced final : public cls_RecordOf<kamC_EquallySpaced, kamC_Amplitude> {
public:
    static constexpr cls_ClassInfo Class{"kamC_EquallySpaced", "Amplitude by values at equal intervals."};

    static constexpr double beginDef() { return 0.0; }
    static constexpr double smoothDef() { return cls_UnsetDouble; }
    double fixedInterval = 0.0;
    double begin = beginDef();
    double smooth = smoothDef();
    cow_List<double> values;
    mdl_ObjCow<kamC_BaselineCorrection> baselineCorrection;

    static const cls_FieldTable& Fields();
};

class kamC_Periodic final : public cls_RecordOf<kamC_Periodic, kamC_Amplitude> {
public:
    static constexpr cls_ClassInfo Class{"kamC_Periodic", "Amplitude by a Fourier series."};

    double frequency = 0.0;
    double start = 0.0;
    double a0 = 0.0;
    cow_2DArray<double> table;

    static const cls_FieldTable& Fields();
};

class kamC_Modulated final : public cls_RecordOf<kamC_Modulated, kamC_Amplitude> {
public:
    static constexpr cls_ClassInfo Class{
        "kamC_Modulated", "Amplitude by a modulated sine; data line: the five fields in this order."};

    double initial = 0.0;
    double magnitude = 0.0;
    double start = 0.0;
    double frequency1 = 0.0;
    double frequency2 = 0.0;

    static const cls_FieldTable& Fields();
};

class kamC_Decay final : public cls_RecordOf<kamC_Decay, kamC_Amplitude> {
public:
    static constexpr cls_ClassInfo Class{
        "kamC_Decay", "Amplitude by exponential decay; data line: the four fields in this order."};

    double initial = 0.0;
    double maximum = 0.0;
    double start = 0.0;
    double decayTime = 0.0;

    static const cls_FieldTable& Fields();
};

class kamC_SolutionDependent final : public cls_RecordOf<kamC_SolutionDependent, kamC_Amplitude> {
public:
    static constexpr cls_ClassInfo Class{"kamC_SolutionDependent",
                                         "Amplitude that the solver adjusts to the solution (creep strain "
                                         "rate control); data line: the three fields in this order."};

    double initial = 1.0;
    double minimum = 0.1;
    double maximum = 1000.0;

    static const cls_FieldTable& Fields();
};

class kamC_SmoothStep final : public cls_RecordOf<kamC_SmoothStep, kamC_Amplitude> {
public:
    static constexpr cls_ClassInfo Class{"kamC_SmoothStep", "Amplitude by smooth steps between points.", 0,
                                         "Smooth"};

    cow_2DArray<double> table;

    static const cls_FieldTable& Fields();
};

class kamC_PsdDefinition final : public cls_RecordOf<kamC_PsdDefinition, kamC_Amplitude> {
public:
    static constexpr cls_ClassInfo Class{"kamC_PsdDefinition",
                                         "Power spectral density of a random excitation.", 0, "Psd"};

    enum class PsdTypeEnm : int { BASE = 0, FORCE = 1, DB = 2 };

    static constexpr double gDef() { return 1.0; }
    static constexpr PsdTypeEnm psdTypeDef() { return PsdTypeEnm::FORCE; }
    static constexpr bool userDef() { return false; }
    double dbReference = 0.0;
    double g = gDef();
    PsdTypeEnm psdType = psdTypeDef();
    bool user = userDef();
    cow_2DArray<double> table;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kamC_PsdDefinition::PsdTypeEnm);

class kamC_Spectrum final : public cls_RecordOf<kamC_Spectrum, kamC_Amplitude> {
public:
    static constexpr cls_ClassInfo Class{"kamC_Spectrum", "Response spectrum."};

    enum class TypeEnm : int { DISPLACEMENT = 0, VELOCITY = 1, ACCELERATION = 2, GRAVITY = 3 };

    double g = 0.0;
    TypeEnm type = TypeEnm::ACCELERATION;
    cow_2DArray<double> table;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kamC_Spectrum::TypeEnm);

void cls_RegisterAmplitudeRecords(cls_ClassRegistrar& registrar);

#endif
