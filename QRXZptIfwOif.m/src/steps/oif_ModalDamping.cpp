#include "steps/oif_ModalDamping.h"

#include "base/oif_KeywordLine.h"

namespace {

const char* OptionsOf(const kprC_CompositeDamping&) {
    return ", modal=COMPOSITE";
}
const char* OptionsOf(const kprC_DirectDamping&) {
    return "";
}
const char* OptionsOf(const kprC_RayleighDamping&) {
    return ", rayleigh";
}
const char* OptionsOf(const kprC_StructuralDamping&) {
    return ", structural";
}
const char* OptionsOf(const kprC_DirectDampingByFrequency&) {
    return ", definition=FREQUENCY RANGE";
}
const char* OptionsOf(const kprC_RayleighDampingByFrequency&) {
    return ", rayleigh, definition=FREQUENCY RANGE";
}
const char* OptionsOf(const kprC_StructuralDampingByFrequency&) {
    return ", structural, definition=FREQUENCY RANGE";
}

void WriteRow(utl_Stream& stream, const kprC_CompositeDampingRow& row) {
    stream << row.firstMode << ", " << row.lastMode << endl;
}
void WriteRow(utl_Stream& stream, const kprC_ModeDampingRow& row) {
    stream << row.firstMode << ", " << row.lastMode << ", " << row.value << endl;
}
void WriteRow(utl_Stream& stream, const kprC_RayleighDampingRow& row) {
    stream << row.firstMode << ", " << row.lastMode << ", " << row.alpha << ", " << row.beta << endl;
}
void WriteRow(utl_Stream& stream, const kprC_FrequencyDampingRow& row) {
    stream << row.low << ", " << row.value << endl;
}
void WriteRow(utl_Stream& stream, const kprC_RayleighFrequencyDampingRow& row) {
    stream << row.low << ", " << row.alpha << ", " << row.beta << endl;
}

} // namespace

void oif_ModalDamping::Write(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Modal Damping");
    std::visit(
        [&](const auto& damping) {
            if (damping.IsNull()) return;
            const auto& record = damping.ConstGet();
            line.Fixed(OptionsOf(record)).End();
            for (const auto& row : record.rows) WriteRow(stream, row);
        },
        damping_);
}

void oif_SelectEigenmodes::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Select Eigenmodes").Fixed(", generate").End();
    stream << "1, " << count_ << ", 1" << endl;
}
