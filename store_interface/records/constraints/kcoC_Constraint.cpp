#include "store_interface/records/constraints/kcoC_Constraint.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/constraints/kcoC_Constraints.h"

const omu_EnumTable& omu_EnumTableOf(calC_SymmetryTypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "NONE", "NONE"}, {1, "CYCLIC", "CYCLIC"}};
    static constexpr omu_EnumTable table{"calC_SymmetryTypeEnm", rows};
    return table;
}

const cls_FieldTable& ddb_ModelSectorDefinition::Fields() {
    using R = ddb_ModelSectorDefinition;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::symmetryType>("symmetryType", "CYCLIC makes the model cyclic")
            .Field<&R::numberOfSectors>("numberOfSectors", "number of sectors in the full circle")
            .Field<&R::startPoint>("startPoint", "first point of the axis (length, single precision)")
            .SinglePrecision()
            .Field<&R::endPoint>("endPoint", "second point of the axis (length, single precision)")
            .SinglePrecision()
            .Example(R"({"symmetryType": "CYCLIC", "numberOfSectors": 12, "endPoint": [0, 0, 1]})");
    return fields;
}

void cls_RegisterConstraintRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kcoC_Constraint>();
    registrar.Add<ddb_ModelSectorDefinition>();
    cls_RegisterConstraintKindRecords(registrar);
}
