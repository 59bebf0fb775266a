#include "store_interface/findings/fnd_RecordRules.h"

#include "store_interface/records/amplitudes/kamC_Amplitude.h"

namespace {

void CheckTabular(const kamC_Tabular& record, fnd_RecordCheck& check) {
    check.Columns("table", record.table, "time, value");
}

void CheckSmoothStep(const kamC_SmoothStep& record, fnd_RecordCheck& check) {
    check.Columns("table", record.table, "time, value");
}

void CheckPeriodic(const kamC_Periodic& record, fnd_RecordCheck& check) {
    check.Columns("table", record.table, "cosine term, sine term");
}

void CheckPsdDefinition(const kamC_PsdDefinition& record, fnd_RecordCheck& check) {
    check.Columns("table", record.table, "real part, imaginary part, frequency");
}

void CheckSpectrum(const kamC_Spectrum& record, fnd_RecordCheck& check) {
    check.Columns("table", record.table, "magnitude, frequency, fraction of critical damping");
}

} // namespace

void fnd_AddAmplitudeRules(fnd_RecordRules& rules) {
    rules.Add<CheckTabular>();
    rules.Add<CheckSmoothStep>();
    rules.Add<CheckPeriodic>();
    rules.Add<CheckPsdDefinition>();
    rules.Add<CheckSpectrum>();
}
