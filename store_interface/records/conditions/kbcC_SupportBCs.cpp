#include "store_interface/records/conditions/kbcC_SupportBCs.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/conditions/kbcC_MotionBCs.h"

const omu_EnumTable& omu_EnumTableOf(kbcC_TypeBC::TypeNameEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "XSYMM", "XSYMM"},   {1, "YSYMM", "YSYMM"},       {2, "ZSYMM", "ZSYMM"},
        {3, "XASYMM", "XASYMM"}, {4, "YASYMM", "YASYMM"},     {5, "ZASYMM", "ZASYMM"},
        {6, "PINNED", "PINNED"}, {7, "ENCASTRE", "ENCASTRE"}, {8, "NOWARP", "NOWARP"},
        {9, "NOOVAL", "NOOVAL"}, {10, "NODEFORM", "NODEFORM"}};
    static constexpr omu_EnumTable table{"kbcC_TypeBC::TypeNameEnm", rows};
    return table;
}

cls_Record* kbcC_TypeBC::NewState(unsigned) const {
    return new kbcC_TypeBCState();
}

bool kbcC_TypeBC::ModifiedNeedsOpNew(const cow_String& stepName) const {
    return static_cast<const kbcC_TypeBCState&>(ConstGetStateQuad(stepName).state.ConstGet())
        .typeName.IsModified();
}

bool kbcC_SubmodelBC::IsSubmodelActive(mdl_PropagationStatusEnm status) {
    return IsActive(status) && !IsBuiltIn(status) && status != mdl_PropagationStatusEnm::FIELD_PROPAGATED;
}

const cls_FieldTable& kbcC_TypeBCState::Fields() {
    using R = kbcC_TypeBCState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbcC_BCState::Fields())
            .Field<&R::typeName>("typeName", "the kind of support")
            .Field<&R::buckleCase>("buckleCase", "load cases of a buckling step that the condition enters")
            .Meanings(kbcC_BuckleCaseMeanings())
            .Example(R"({"typeName": "ENCASTRE"})");
    return fields;
}

const cls_FieldTable& kbcC_SubmodelBCState::Fields() {
    using R = kbcC_SubmodelBCState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbcC_BCState::Fields())
            .Field<&R::centerZone>("centerZone", "the boundary is held at its current values, not driven")
            .Field<&R::dofs>("dofs", "degrees of freedom that are driven, in the order of the data lines")
            .Field<&R::shellThicknessValue>("shellThicknessValue",
                                            "size of the centre zone of a boundary between shell and solid; "
                                            "zero or less: a tenth of shellThickness")
            .Unit("length")
            .Field<&R::stepName>("stepName", "the step of the global analysis, as the deck shall hold it (a "
                                             "number); not a step of this model")
            .Field<&R::increment>("increment", "increment of that step; zero for none")
            .Field<&R::timeScale>("timeScale", "the time of the global step is scaled to that of this step")
            .Example(R"({"dofs": [1, 2, 3], "stepName": "1"})");
    return fields;
}

const cls_FieldTable& kbcC_SubmodelBC::Fields() {
    using R = kbcC_SubmodelBC;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbcC_BC::Fields())
            .Field<&R::globalElset>("globalElset", "the element set of the global model that drives the "
                                                   "boundary, empty for all of it; not a set of this model")
            .Field<&R::shellThickness>(
                "shellThickness",
                "shell thickness of the global model, for boundaries between shell and solid")
            .Unit("length")
            .Field<&R::absoluteExteriorTolerance>(
                "absoluteExteriorTolerance",
                "how far a driven node may lie outside the elements of the global model")
            .Unit("length")
            .Field<&R::exteriorTolerance>(
                "exteriorTolerance",
                "how far a driven node may lie outside, as a fraction of the elements' average size")
            .Unit("no unit")
            .Example(R"({"region": "PART-1.SET"})");
    return fields;
}

void cls_RegisterSupportConditionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kbcC_TypeBC>();
    registrar.Add<kbcC_TypeBCState>();
    registrar.Add<kbcC_SymmetryBC>();
    registrar.Add<kbcC_SubmodelBC>();
    registrar.Add<kbcC_SubmodelBCState>();
}
