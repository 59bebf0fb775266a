#include "store_interface/records/steps/klcC_LoadCase.h"

const cls_FieldTable& klcC_LoadCase::Fields() {
    static const cls_FieldTable fields =
        cls_Describe<klcC_LoadCase>(cls_Record::Fields())
            .Field<&klcC_LoadCase::bcs>("bcs",
                                        "boundary conditions that act in the case, with their scale factors "
                                        "(single precision)")
            .RefersTo("boundaryCondition")
            .Field<&klcC_LoadCase::fields>("fields",
                                           "predefined fields that act in the case, with their scale "
                                           "factors (single precision)")
            .RefersTo("field")
            .Field<&klcC_LoadCase::loads>("loads",
                                          "loads that act in the case, bolt loads too, with their scale "
                                          "factors (single precision)")
            .RefersTo("load")
            .Field<&klcC_LoadCase::baseStateBCs>(
                "baseStateBCs",
                "boundary conditions of the base state that bcs does not name act in the case too, "
                "with the factor 1")
            .Field<&klcC_LoadCase::loadsAreStepLoads>("loadsAreStepLoads",
                                                      "the case takes no loads of its own")
            .Example(R"({"loads": {"Pressure": 1.35}})");
    return fields;
}
