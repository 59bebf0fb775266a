#ifndef QRX_STORE_KPFC_FIELDS_H
#define QRX_STORE_KPFC_FIELDS_H

#include "store_interface/records/conditions/kpfC_Field.h"

class cls_ClassRegistrar;

/// How the values of a results file reach the nodes.
enum class kpfC_InterpolateEnm : int { NONE = 0, INTERPOLATE = 1, MIDSIDE = 2 };
const omu_EnumTable& omu_EnumTableOf(kpfC_InterpolateEnm);

/// Which part of a results file a state reads, and how.
struct kpfC_ResultsFile {
    mdl_PropAttr<int> beginStep;
    mdl_PropAttr<int> beginIncrement;
    mdl_PropAttr<int> endStep;
    mdl_PropAttr<int> endIncrement;
    mdl_PropAttr<kpfC_InterpolateEnm> interpolate;
};

/// Base of the field class T whose states are of class State.
template <class T, class State = kpfC_FieldState>
class kpfC_FieldOf : public cls_RecordOf<T, kpfC_Field> {
public:
    cls_Record* NewState(unsigned) const override { return new State(); }
    const State& StateIn(const cow_String& stepName) const {
        return static_cast<const State&>(this->ConstGetStateQuad(stepName).state.ConstGet());
    }
};

class kpfC_TemperatureState final : public cls_RecordOf<kpfC_TemperatureState, kpfC_FieldState>,
                                    public kpfC_ResultsFile {
public:
    static constexpr cls_ClassInfo Class{"kpfC_TemperatureState", "temperature in one step"};

    static constexpr double absoluteExteriorToleranceDef() { return 0.0; }
    static constexpr double exteriorToleranceDef() { return 0.05; }

    /// The name of the results file.
    mdl_PropAttr<cow_String> magnitude;
    cow_List<mdl_PropAttr<double>> values;
    mdl_PropAttr<double> absoluteExteriorTolerance{absoluteExteriorToleranceDef(),
                                                   mdl_PropAttributeStateEnm::NEVER_SET};
    mdl_PropAttr<double> exteriorTolerance{exteriorToleranceDef(), mdl_PropAttributeStateEnm::NEVER_SET};
    mdl_PropAttr<cow_String> amplitude;

    static const cls_FieldTable& Fields();
};

class kpfC_Temperature final : public kpfC_FieldOf<kpfC_Temperature, kpfC_TemperatureState> {
public:
    static constexpr cls_ClassInfo Class{
        "kpfC_Temperature", "temperature of a node set: constant, by section points, or from a results file",
        0x2EC0008};
};

class kpfC_PressureStressState final : public cls_RecordOf<kpfC_PressureStressState, kpfC_FieldState> {
public:
    static constexpr cls_ClassInfo Class{"kpfC_PressureStressState", "pressure stress in one step"};

    mdl_PropAttr<double> magnitude;
    mdl_PropAttr<cow_String> fileName;
    mdl_PropAttr<cow_String> amplitude;

    static const cls_FieldTable& Fields();
};

class kpfC_PressureStress final : public kpfC_FieldOf<kpfC_PressureStress, kpfC_PressureStressState> {
public:
    static constexpr cls_ClassInfo Class{
        "kpfC_PressureStress",
        "equivalent pressure stress of a node set, which drives the diffusion of a mass: stress", 0x2EC000A};
};

class kpfC_MassFlowRateState final : public cls_RecordOf<kpfC_MassFlowRateState, kpfC_FieldState> {
public:
    static constexpr cls_ClassInfo Class{"kpfC_MassFlowRateState", "mass flow rate in one step"};

    mdl_PropAttr<double> component1;
    mdl_PropAttr<double> component2;
    mdl_PropAttr<double> component3;
    mdl_PropAttr<cow_String> amplitude;

    static const cls_FieldTable& Fields();
};

class kpfC_MassFlowRate final : public kpfC_FieldOf<kpfC_MassFlowRate, kpfC_MassFlowRateState> {
public:
    static constexpr cls_ClassInfo Class{
        "kpfC_MassFlowRate",
        "mass flow rate through forced convection elements at a node set: mass/(area*time)", 0x2EC0013};
};

class kpfC_GeneralFieldState final : public cls_RecordOf<kpfC_GeneralFieldState, kpfC_FieldState>,
                                     public kpfC_ResultsFile {
public:
    static constexpr cls_ClassInfo Class{"kpfC_GeneralFieldState", "field variable in one step"};

    int variable = 1;
    int numberOfValues = 0;
    mdl_PropAttr<cow_String> fileName;
    cow_List<mdl_PropAttr<double>> values;
    mdl_PropAttr<cow_String> amplitude;

    /// The number that was given, else that of the values.
    int NumberOfValues() const { return numberOfValues > 0 ? numberOfValues : values.Length(); }

    static const cls_FieldTable& Fields();
};

class kpfC_GeneralField final : public kpfC_FieldOf<kpfC_GeneralField, kpfC_GeneralFieldState> {
public:
    static constexpr cls_ClassInfo Class{
        "kpfC_GeneralField",
        "a numbered field variable at a node set: constant, by section points, or from a results file",
        0x2EC0015, "FieldVariable"};

protected:
    /// A number of values counts only for the values that it was given with.
    void CompleteState(cls_Record& state, mdl_PropagationStatusEnm status,
                       const mdl_GivenState* given) const override;
};

class kpfC_Velocity final : public kpfC_FieldOf<kpfC_Velocity> {
public:
    static constexpr cls_ClassInfo Class{"kpfC_Velocity",
                                         "initial velocity of a node set, or its rotation about an axis",
                                         0x2EC0016, "InitialVelocity"};

    double velocity1 = 0.0;
    double velocity2 = 0.0;
    double velocity3 = 0.0;
    double omega = 0.0;
    gsl_Point axisBegin;
    gsl_Point axisEnd;

    bool IsRotatingVelocity() const { return omega != 0.0; }

    static const cls_FieldTable& Fields();
};

class kpfC_Stress final : public kpfC_FieldOf<kpfC_Stress> {
public:
    static constexpr cls_ClassInfo Class{
        "kpfC_Stress", "initial stress of an element set: uniform, from a results file, or geostatic",
        0x2EC001A, "InitialStress"};

    static constexpr double sigma11Def() { return cls_UnsetDouble; }
    static constexpr double sigma12Def() { return cls_UnsetDouble; }
    static constexpr double sigma13Def() { return cls_UnsetDouble; }
    static constexpr double sigma22Def() { return cls_UnsetDouble; }
    static constexpr double sigma23Def() { return cls_UnsetDouble; }
    static constexpr double sigma33Def() { return cls_UnsetDouble; }

    double sigma11 = sigma11Def();
    double sigma22 = sigma22Def();
    double sigma33 = sigma33Def();
    double sigma12 = sigma12Def();
    double sigma13 = sigma13Def();
    double sigma23 = sigma23Def();
    double stressMagnitude1 = 0.0;
    double vCoordinate1 = 0.0;
    double stressMagnitude2 = 0.0;
    double vCoordinate2 = 0.0;
    double lateralCoeff1 = 0.0;
    double lateralCoeff2 = cls_UnsetDouble;
    cow_String fileName;
    int step = 0;
    int increment = 0;

    static const cls_FieldTable& Fields();
};

class kpfC_Hardening final : public kpfC_FieldOf<kpfC_Hardening> {
public:
    static constexpr cls_ClassInfo Class{"kpfC_Hardening",
                                         "initial plastic strain and backstress of an element set", 0x2EC001F,
                                         "InitialHardening"};

    double equivPlasticStrain = 0.0;
    cow_List<double> backstress;

    static const cls_FieldTable& Fields();
};

void cls_RegisterFieldRecords(cls_ClassRegistrar& registrar);

#endif
