#include "model_file/checks/mdf_RecordChecks.h"

#include "store_interface/records/steps/kprC_Step.h"

void mdf_AddStepChecks(mdf_RecordChecks&) {}
