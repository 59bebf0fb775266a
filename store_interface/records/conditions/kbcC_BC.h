#ifndef QRX_STORE_KBCC_BC_H
#define QRX_STORE_KBCC_BC_H

#include "store_interface/propagation/kprC_PropagatingObject.h"
#include "store_interface/regions/rgnC_Region.h"

/// One prescribed value in one step, such as a displacement along an axis.
struct kbcC_Component {
    kbcC_Component() = default;
    kbcC_Component(const mdl_PropAttr<double>& value, double imaginary)
        : state(value.State()), real(value.IsActive() ? value.ConstGet() : 0.0),
          imag(value.IsActive() ? imaginary : 0.0) {}

    mdl_PropAttributeStateEnm state = mdl_PropAttributeStateEnm::NEVER_SET;
    /// Both are 0 unless the value was set or carried over.
    double real = 0.0;
    double imag = 0.0;
};

/// State of a boundary condition in one step.
class kbcC_BCState : public cls_RecordOf<kbcC_BCState> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_BCState", "state of a boundary condition in one step"};

    mdl_PropAttr<cow_String> amplitude;

    /// Whether a step of the procedure takes the values as complex ones.
    virtual bool UseComplex(unsigned int procedureId) const;
    /// The prescribed values: six of a motion in the order of the degrees of freedom, one of a scalar
    /// quantity. All others were never set.
    virtual kbcC_Component Component(int index) const;
    /// Which load cases of a buckling step the condition enters: 0 or 3 both, 1 the pre-stress, 2 the
    /// buckling mode; any other number none.
    virtual int BuckleCase() const { return 0; }

    static const cls_FieldTable& Fields();
};

/// A prescribed value on the degrees of freedom of a region, held by name.
class kbcC_BC : public kprC_PropagatingOf<kbcC_BC, kbcC_BCState> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_BC", "a boundary condition"};

    enum class DistribTypeEnum : int { UNIFORM = 0, USER_DEFINED = 1, FIELD = 2 };

    rgnC_Region region;
    dtmC_DatumRef datum;
    DistribTypeEnum distributionType = DistribTypeEnum::UNIFORM;

    mdl_PropagationFamilyEnm Family() const override { return mdl_PropagationFamilyEnm::BOUNDARY_CONDITION; }
    /// Whether the change made in the step can't be told by adding to what is there. Asked for statuses 3
    /// and 10.
    virtual bool ModifiedNeedsOpNew(const cow_String& stepName) const;
    kbcC_Component Component(const cow_String& stepName, int index) const {
        return ConstGetStateQuad(stepName).state.ConstGet().Component(index);
    }

    static const cls_FieldTable& Fields();

protected:
    /// Whether a component was cleared in the step: keywords that add and change can't free it again.
    bool FreesComponent(const cow_String& stepName) const;
};
const omu_EnumTable& omu_EnumTableOf(kbcC_BC::DistribTypeEnum);

void cls_RegisterConditionRecords(cls_ClassRegistrar& registrar);

#endif
