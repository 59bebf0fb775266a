#ifndef QRX_STORE_KBCC_SCALARBCS_H
#define QRX_STORE_KBCC_SCALARBCS_H

#include "store_interface/records/conditions/kbcC_BC.h"

class cls_ClassRegistrar;

class kbcC_TemperatureBCState final : public cls_RecordOf<kbcC_TemperatureBCState, kbcC_BCState> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_TemperatureBCState", "temperature in one step"};

    mdl_PropAttr<double> magnitude;
    mdl_PropAttr<cow_List<int>> dofs;

    kbcC_Component Component(int index) const override {
        return index == 0 ? kbcC_Component(magnitude, 0.0) : kbcC_Component();
    }

    static const cls_FieldTable& Fields();
};

/// A condition on one quantity, itself derived from Base.
template <class Base>
class kbcC_ScalarQueries : public Base {
public:
    mdl_PropAttributeStateEnm MagnitudeState(const cow_String& step) const {
        return this->Component(step, 0).state;
    }
    double Magnitude(const cow_String& step) const { return this->Component(step, 0).real; }
};

class kbcC_TemperatureBC final : public kbcC_ScalarQueries<cls_RecordOf<kbcC_TemperatureBC, kbcC_BC>> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_TemperatureBC",
                                         "prescribed temperature of a node set, on degree of freedom 11 or, "
                                         "through the thickness of shells, on those listed",
                                         0x2980010, "Temperature"};

    bool dofsGiven = false;

    cls_Record* NewState(unsigned) const override { return new kbcC_TemperatureBCState(); }
    bool ModifiedNeedsOpNew(const cow_String& stepName) const override;

    static const cls_FieldTable& Fields();
};

class kbcC_DistributedBCState : public cls_RecordOf<kbcC_DistributedBCState, kbcC_BCState> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_DistributedBCState", "a scalar quantity in one step"};

    mdl_PropAttr<double> magnitude;

    kbcC_Component Component(int index) const override {
        return index == 0 ? kbcC_Component(magnitude, Imaginary()) : kbcC_Component();
    }

    static const cls_FieldTable& Fields();

protected:
    virtual double Imaginary() const { return 0.0; }
};

class kbcC_ComplexDistributedBCState final
    : public cls_RecordOf<kbcC_ComplexDistributedBCState, kbcC_DistributedBCState> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_ComplexDistributedBCState",
                                         "a scalar quantity in one step that harmonic steps take as complex"};

    double imaginaryMagnitude = 0.0;

    bool UseComplex(unsigned int procedureId) const override;

    static const cls_FieldTable& Fields();

private:
    double Imaginary() const override { return imaginaryMagnitude; }
};

/// A prescribed scalar quantity of nodes.
class kbcC_DistributedBC : public kbcC_ScalarQueries<cls_AbstractRecordOf<kbcC_DistributedBC, kbcC_BC>> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_DistributedBC", "a prescribed scalar quantity of nodes"};

    bool fixed = false;

    bool ModifiedNeedsOpNew(const cow_String& stepName) const override { return FreesComponent(stepName); }
    /// 0 unless the quantity is one that can be complex.
    double ImaginaryMagnitude(const cow_String& step) const { return Component(step, 0).imag; }

    static const cls_FieldTable& Fields();
};

/// The scalar quantity T, its states of class S.
template <class T, class S>
class kbcC_ScalarOf : public cls_RecordOf<T, kbcC_DistributedBC> {
public:
    cls_Record* NewState(unsigned) const override { return new S(); }
};

class kbcC_PorePressureBC final : public kbcC_ScalarOf<kbcC_PorePressureBC, kbcC_DistributedBCState> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_PorePressureBC",
                                         "prescribed pore fluid pressure, degree of freedom 8; stress",
                                         0x2980014, "PorePressure"};
};

class kbcC_AcousticPressureBC final
    : public kbcC_ScalarOf<kbcC_AcousticPressureBC, kbcC_ComplexDistributedBCState> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_AcousticPressureBC",
                                         "prescribed acoustic pressure, degree of freedom 8; stress",
                                         0x2980016, "AcousticPressure"};
};

class kbcC_FluidPressureBC final : public kbcC_ScalarOf<kbcC_FluidPressureBC, kbcC_DistributedBCState> {
public:
    static constexpr cls_ClassInfo Class{
        "kbcC_FluidPressureBC",
        "prescribed hydrostatic fluid pressure at a reference node, degree of freedom 8; stress", 0x2980018,
        "FluidPressure"};
};

class kbcC_ElectricPotentialBC final
    : public kbcC_ScalarOf<kbcC_ElectricPotentialBC, kbcC_ComplexDistributedBCState> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_ElectricPotentialBC",
                                         "prescribed electric potential, degree of freedom 9; voltage",
                                         0x298001A, "ElectricPotential"};
};

class kbcC_ConcentrationBC final : public kbcC_ScalarOf<kbcC_ConcentrationBC, kbcC_DistributedBCState> {
public:
    static constexpr cls_ClassInfo Class{
        "kbcC_ConcentrationBC",
        "prescribed normalised concentration of a diffusing material, degree of freedom 11", 0x298001C,
        "Concentration"};
};

class kbcC_FluidCavityPressureBC final
    : public kbcC_ScalarOf<kbcC_FluidCavityPressureBC, kbcC_DistributedBCState> {
public:
    static constexpr cls_ClassInfo Class{
        "kbcC_FluidCavityPressureBC",
        "prescribed pressure of a fluid cavity at its reference node, degree of freedom 8; stress", 0x2980031,
        "FluidCavityPressure"};
};

void cls_RegisterScalarConditionRecords(cls_ClassRegistrar& registrar);

#endif
