#include "store_interface/records/conditions/kbcC_BC.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/conditions/kbcC_MotionBCs.h"
#include "store_interface/records/conditions/kbcC_ScalarBCs.h"
#include "store_interface/records/conditions/kbcC_SupportBCs.h"
#include "store_interface/records/conditions/kloC_BoltLoad.h"
#include "store_interface/records/conditions/kloC_Loads.h"
#include "store_interface/records/conditions/kpfC_Fields.h"

const omu_EnumTable& omu_EnumTableOf(kbcC_BC::DistribTypeEnum) {
    static constexpr omu_EnumRow rows[] = {
        {0, "UNIFORM", "UNIFORM"}, {1, "USER_DEFINED", "USER_DEFINED"}, {2, "FIELD", "FIELD"}};
    static constexpr omu_EnumTable table{"kbcC_BC::DistribTypeEnum", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kpfC_Field::DistribTypeEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "UNIFORM", "UNIFORM"},
        {1, "USER_DEFINED", "USER_DEFINED"},
        {2, "FIELD", "FIELD"},
        {3, "FROM_FILE", "FROM_FILE"},
        {4, "FROM_FILE_AND_USER_DEFINED", "FROM_FILE_AND_USER_DEFINED"},
        {5, "GEOSTATIC", "GEOSTATIC"},
    };
    static constexpr omu_EnumTable table{"kpfC_Field::DistribTypeEnm", rows};
    return table;
}

bool kbcC_BC::ModifiedNeedsOpNew(const cow_String&) const {
    return false;
}

bool kbcC_BC::FreesComponent(const cow_String& stepName) const {
    for (int i = 0; i < 6; ++i) {
        if (Component(stepName, i).state == mdl_PropAttributeStateEnm::CLEARED) return true;
    }
    return false;
}

bool kbcC_BCState::UseComplex(unsigned int) const {
    return false;
}

kbcC_Component kbcC_BCState::Component(int) const {
    return {};
}

bool kloC_Load::UsesField(cow_String&) const {
    return false;
}

const cls_FieldTable& kbcC_BCState::Fields() {
    static const cls_FieldTable fields =
        cls_Describe<kbcC_BCState>(cls_Record::Fields())
            .Field<&kbcC_BCState::amplitude>("amplitude", "amplitude in this step")
            .RefersTo("amplitude")
            .InBaseState(cls_BaseStateRule::Dropped)
            .Example(R"({"amplitude": "Ramp"})");
    return fields;
}

const cls_FieldTable& kbcC_BC::Fields() {
    static const cls_FieldTable fields =
        cls_Describe<kbcC_BC>(kprC_PropagatingObject::Fields())
            .Field<&kbcC_BC::region>("region", "the node set (or other set) that it acts on")
            .Field<&kbcC_BC::datum>("datum", "coordinate system of the components; none for the global one")
            .Field<&kbcC_BC::distributionType>("distributionType",
                                               "uniform, by a user subroutine, or from a field")
            .Example(R"({"region": "PART-1.SET"})");
    return fields;
}

const cls_FieldTable& kloC_LoadState::Fields() {
    static const cls_FieldTable fields =
        cls_Describe<kloC_LoadState>(cls_Record::Fields())
            .Field<&kloC_LoadState::amplitude>("amplitude", "amplitude in this step")
            .RefersTo("amplitude");
    return fields;
}

const cls_FieldTable& kloC_Load::Fields() {
    static const cls_FieldTable fields =
        cls_Describe<kloC_Load>(kprC_PropagatingObject::Fields())
            .Field<&kloC_Load::region>("region", "the set or surface that it acts on")
            .Example(R"({"region": "PART-1.TOP"})");
    return fields;
}

const cls_FieldTable& kpfC_Field::Fields() {
    static const cls_FieldTable fields =
        cls_Describe<kpfC_Field>(kprC_PropagatingObject::Fields())
            .Field<&kpfC_Field::region>("region", "the node or element set that it acts on")
            .Field<&kpfC_Field::distributionType>("distributionType", "where the values come from")
            .Example(R"({"region": "PART-1.SET"})");
    return fields;
}

void cls_RegisterConditionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kbcC_BCState>();
    registrar.Add<kbcC_BC>();
    cls_RegisterMotionConditionRecords(registrar);
    cls_RegisterScalarConditionRecords(registrar);
    cls_RegisterSupportConditionRecords(registrar);
    registrar.Add<kloC_LoadState>();
    registrar.Add<kloC_Load>();
    cls_RegisterBoltLoadRecords(registrar);
    cls_RegisterLoadRecords(registrar);
    registrar.Add<kpfC_FieldState>();
    registrar.Add<kpfC_Field>();
    cls_RegisterFieldRecords(registrar);
}
