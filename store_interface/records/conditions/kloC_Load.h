#ifndef QRX_STORE_KLOC_LOAD_H
#define QRX_STORE_KLOC_LOAD_H

#include "store_interface/propagation/kprC_PropagatingObject.h"
#include "store_interface/regions/rgnC_Region.h"

/// State of a load in one step.
class kloC_LoadState : public cls_RecordOf<kloC_LoadState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_LoadState", "state of a load in one step"};

    mdl_PropAttr<cow_String> amplitude;

    static const cls_FieldTable& Fields();
};

/// A number of a load in one step. A real load has it in its state; a complex one has both parts in the
/// record, and nothing of the state counts.
struct kloC_LoadValue {
    double real = 0.0;
    double imag = 0.0;
    mdl_PropAttributeStateEnm state = mdl_PropAttributeStateEnm::NEVER_SET;
};

/// A force-like quantity on a region, held by name.
class kloC_Load : public kprC_PropagatingOf<kloC_Load, kloC_LoadState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_Load", "a load"};

    enum class DistribTypeEnm : int {
        UNIFORM = 0,
        USER_DEFINED = 1,
        FIELD = 2,
        TOTAL_FORCE = 3,
        HYDROSTATIC = 4
    };

    rgnC_Region region;

    mdl_PropagationFamilyEnm Family() const override { return mdl_PropagationFamilyEnm::LOAD; }
    /// Whether the load refers to a named field; if so, its name.
    virtual bool UsesField(cow_String& fieldName) const;
    /// Whether it has real and imaginary parts.
    virtual bool IsComplex() const { return false; }
    /// What the load amounts to in the step: three components, or one magnitude; none for a class without.
    virtual std::vector<kloC_LoadValue> Values(const cow_String&) const { return {}; }
    /// The number that chooses the label of the load's lines: a degree of freedom or a distribution.
    virtual int Selector() const { return 0; }

    static const cls_FieldTable& Fields();
};

const omu_EnumTable& omu_EnumTableOf(kloC_Load::DistribTypeEnm);

/// Base of the load class T whose states are of class State: answers the queries from the fields that the
/// two have.
template <class T, class State, class Base = kloC_Load>
class kloC_LoadOf : public cls_RecordOf<T, Base> {
public:
    cls_Record* NewState(unsigned) const override { return new State(); }
    const State& StateIn(const cow_String& stepName) const {
        return static_cast<const State&>(this->ConstGetStateQuad(stepName).state.ConstGet());
    }
    bool IsComplex() const override {
        if constexpr (requires { Self().complex; }) return Self().complex;
        return false;
    }
    std::vector<kloC_LoadValue> Values(const cow_String& stepName) const override {
        if constexpr (requires { Self().complexComponent1; }) {
            if (Self().complex) {
                return {Parts(Self().complexComponent1), Parts(Self().complexComponent2),
                        Parts(Self().complexComponent3)};
            }
        }
        if constexpr (requires { Self().complexMagnitude; }) {
            if (Self().complex) return {Parts(Self().complexMagnitude)};
        }
        [[maybe_unused]] const State& state = StateIn(stepName);
        if constexpr (requires { state.component1; }) {
            return {Real(state.component1), Real(state.component2), Real(state.component3)};
        } else if constexpr (requires { state.magnitude; }) {
            return {Real(state.magnitude)};
        } else {
            return {};
        }
    }
    int Selector() const override {
        if constexpr (requires { Self().dof; }) {
            return Self().dof;
        } else if constexpr (requires { Self().distributionType; }) {
            return static_cast<int>(Self().distributionType);
        } else {
            return 0;
        }
    }

private:
    const T& Self() const { return static_cast<const T&>(*this); }
    static kloC_LoadValue Parts(const omi_complex& value) {
        return {value.ConvertedReal(), value.ConvertedImag()};
    }
    static kloC_LoadValue Real(const mdl_PropAttr<double>& value) {
        return {value.ConstGet(), 0.0, value.State()};
    }
};

#endif
