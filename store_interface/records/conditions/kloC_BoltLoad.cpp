#include "store_interface/records/conditions/kloC_BoltLoad.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const omu_EnumTable& omu_EnumTableOf(kloC_BoltLoad::MethodEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "APPLY_FORCE", "APPLY_FORCE"},
                                           {1, "ADJUST_LENGTH", "ADJUST_LENGTH"},
                                           {2, "FIX_LENGTH", "FIX_LENGTH"}};
    static constexpr omu_EnumTable table{"kloC_BoltLoad::MethodEnm", rows};
    return table;
}

cls_Record* kloC_BoltLoad::NewState(unsigned) const {
    return new kloC_BoltLoadState();
}

const kloC_BoltLoadState& kloC_BoltLoad::BoltState(const cow_String& stepName) const {
    return static_cast<const kloC_BoltLoadState&>(ConstGetStateQuad(stepName).state.ConstGet());
}

bool kloC_BoltLoad::IsByForce(const cow_String& stepName) const {
    return BoltState(stepName).boltMethod.ConstGet() == MethodEnm::APPLY_FORCE;
}

bool kloC_BoltLoad::ChangesMethod(const cow_String& stepName) const {
    return BoltState(stepName).boltMethod.IsModified();
}

const cls_FieldTable& kloC_BoltLoadState::Fields() {
    using R = kloC_BoltLoadState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_LoadState::Fields())
            .Field<&R::boltMethod>("boltMethod", "how the bolt is tightened from this step on")
            .Field<&R::magnitude>("magnitude", "bolt force, read by APPLY_FORCE")
            .Unit("force")
            .Field<&R::adjustment>("adjustment", "change of length, read by ADJUST_LENGTH")
            .Unit("length")
            .Example(R"({"boltMethod": "APPLY_FORCE", "magnitude": 20000})");
    return fields;
}

void cls_RegisterBoltLoadRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kloC_BoltLoad>();
    registrar.Add<kloC_BoltLoadState>();
}
