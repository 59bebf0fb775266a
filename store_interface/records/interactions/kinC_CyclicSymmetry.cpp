#include "store_interface/records/interactions/kinC_CyclicSymmetry.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kinC_CyclicSymmetryState::Fields() {
    using R = kinC_CyclicSymmetryState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_InteractionState::Fields())
            .Field<&R::cyclicMode>("cyclicMode", "cyclic mode (nodal diameter) that the loads of the step "
                                                 "excite")
            .Example(R"({"cyclicMode": 2})");
    return fields;
}

void cls_RegisterCyclicSymmetryRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kinC_CyclicSymmetryState>();
    registrar.Add<kinC_CyclicSymmetry>();
    registrar.Add<kinC_ElasticFoundation>();
}
