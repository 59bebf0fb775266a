#include "model_file/checks/mdf_RecordChecks.h"

#include "store_interface/records/cls_ClassRegistrar.h"

#include <algorithm>

void mdf_RecordCheck::Columns(const char* field, const cow_2DArray<double>& table, const char* names) {
    const std::string_view list(names);
    const auto expected = 1 + static_cast<int>(std::count(list.begin(), list.end(), ','));
    if (table.IsEmpty() || table.NumColumns() == expected) return;
    Error(field, "found rows of " + std::to_string(table.NumColumns()) + ", expected rows of " +
                     std::to_string(expected) + ": " + names);
}

void mdf_RecordCheck::NotNegative(const char* field, int value) {
    if (value < 0) Error(field, "found " + std::to_string(value) + ", expected 0 or more");
}

void mdf_RecordCheck::NotNegative(const char* field, double value) {
    if (value < 0) Error(field, "found " + mdf_Shown(value) + ", expected 0 or more");
}

const mdf_RecordChecks& mdf_RecordChecks::All() {
    static const mdf_RecordChecks checks = [] {
        mdf_RecordChecks all;
        mdf_AddAmplitudeChecks(all);
        mdf_AddConnectorChecks(all);
        mdf_AddStepChecks(all);
        return all;
    }();
    return checks;
}

void mdf_RecordChecks::Run(const cls_Record& record, mdf_RecordCheck& report) const {
    const cls_ClassRegistrar& classes = cls_Classes();
    for (const cls_ClassEntry* entry = classes.Find(record.DynTypeId()); entry != nullptr;
         entry = classes.Find(entry->baseId)) {
        const auto found = checks_.find(entry->info.Id());
        if (found == checks_.end()) continue;
        for (const auto& check : found->second) check(record, report);
    }
}
