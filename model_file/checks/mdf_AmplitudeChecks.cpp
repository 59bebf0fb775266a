#include "model_file/checks/mdf_RecordChecks.h"

#include "store_interface/records/amplitudes/kamC_Amplitude.h"

void mdf_AddAmplitudeChecks(mdf_RecordChecks& checks) {
    checks.Add<kamC_Tabular>([](const kamC_Tabular& record, mdf_RecordCheck& check) {
        check.Columns("table", record.table, "time, value");
    });
    checks.Add<kamC_SmoothStep>([](const kamC_SmoothStep& record, mdf_RecordCheck& check) {
        check.Columns("table", record.table, "time, value");
    });
    checks.Add<kamC_Periodic>([](const kamC_Periodic& record, mdf_RecordCheck& check) {
        check.Columns("table", record.table, "cosine term, sine term");
    });
    checks.Add<kamC_PsdDefinition>([](const kamC_PsdDefinition& record, mdf_RecordCheck& check) {
        check.Columns("table", record.table, "real part, imaginary part, frequency");
    });
    checks.Add<kamC_Spectrum>([](const kamC_Spectrum& record, mdf_RecordCheck& check) {
        check.Columns("table", record.table, "magnitude, frequency, fraction of critical damping");
    });
}
