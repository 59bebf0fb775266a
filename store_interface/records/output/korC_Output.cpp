#include "store_interface/records/output/korC_Output.h"

#include "store_interface/records/cls_ClassRegistrar.h"

bool korC_Output::HasStep(const cow_String& stepName) const {
    const mdl_PropagationStatusEnm status = Status(stepName);
    return IsActive(status) || status == mdl_PropagationStatusEnm::DEACTIVATED ||
           status == mdl_PropagationStatusEnm::DEACTIVATED_FROM_BASE_STATE;
}

const cls_FieldTable& kprC_TimePoint::Fields() {
    static const cls_FieldTable fields =
        cls_Describe<kprC_TimePoint>(cls_Record::Fields())
            .Field<&kprC_TimePoint::generate>("generate", "rows of points are begin, end and increment")
            .Field<&kprC_TimePoint::points>("points",
                                            "rows of one time, or of begin, end and increment (time)");
    return fields;
}

const cls_FieldTable& kadC_AdptMeshCtrl::Fields() {
    static const cls_FieldTable fields =
        cls_Describe<kadC_AdptMeshCtrl>(cls_Record::Fields())
            .Field<&kadC_AdptMeshCtrl::description>("description", "free text");
    return fields;
}

void cls_RegisterOutputRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<korC_OutputState>();
    registrar.Add<korC_Output>();
    registrar.Add<korC_FieldOutput>();
    registrar.Add<korC_HistoryOutput>();
    registrar.Add<korC_IntegratedOutputSection>();
    registrar.Add<kprC_TimePoint>();
    registrar.Add<kadC_AdptMeshCtrl>();
    registrar.Add<kprC_AdptMeshConsState>();
    registrar.Add<kprC_AdptMeshCons>();
}
