#ifndef QRX_STORE_KLOC_BOLTLOAD_H
#define QRX_STORE_KLOC_BOLTLOAD_H

#include "store_interface/records/conditions/kloC_Load.h"

class cls_ClassRegistrar;

class kloC_BoltLoadState;

class kloC_BoltLoad final : public cls_RecordOf<kloC_BoltLoad, kloC_Load> {
public:
    static constexpr cls_ClassInfo Class{"kloC_BoltLoad",
                                         "tightening of a bolt across its pre-tension section, by a force or "
                                         "by a length change, or locking of the bolt at its current length",
                                         0x2880024, "BoltPretension"};

    enum class MethodEnm : int { APPLY_FORCE = 0, ADJUST_LENGTH = 1, FIX_LENGTH = 2 };

    cls_Record* NewState(unsigned procedureType) const override;
    /// The state in the step, a default one where the load has none.
    const kloC_BoltLoadState& BoltState(const cow_String& stepName) const;
    /// Whether a force tightens the bolt in the step, and not its length.
    bool IsByForce(const cow_String& stepName) const;
    /// Whether the step says another method.
    bool ChangesMethod(const cow_String& stepName) const;
};
const omu_EnumTable& omu_EnumTableOf(kloC_BoltLoad::MethodEnm);

class kloC_BoltLoadState final : public cls_RecordOf<kloC_BoltLoadState, kloC_LoadState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_BoltLoadState", "how a bolt is tightened in one step"};

    mdl_PropAttr<kloC_BoltLoad::MethodEnm> boltMethod;
    mdl_PropAttr<double> magnitude;
    mdl_PropAttr<double> adjustment;

    static const cls_FieldTable& Fields();
};

void cls_RegisterBoltLoadRecords(cls_ClassRegistrar& registrar);

#endif
