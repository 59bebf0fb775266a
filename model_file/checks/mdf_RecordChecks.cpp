#include "model_file/checks/mdf_RecordChecks.h"

#include "store_interface/records/cls_ClassRegistrar.h"

#include <algorithm>

void mdf_RecordCheck::Columns(const char* field, const cow_2DArray<double>& table, const char* names,
                              int fieldVariables) {
    const std::string_view list(names);
    const long long expected = 1 + std::count(list.begin(), list.end(), ',') + std::max(fieldVariables, 0);
    if (table.IsEmpty() || table.NumColumns() == expected) return;
    std::string text = "found rows of " + std::to_string(table.NumColumns()) + ", expected rows of " +
                       std::to_string(expected) + ": " + names;
    if (fieldVariables > 0) {
        text += ", " + std::to_string(fieldVariables) +
                (fieldVariables == 1 ? " field variable" : " field variables");
    }
    Error(field, text);
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
        mdf_AddBoundaryChecks(all);
        mdf_AddConnectorChecks(all);
        mdf_AddInteractionChecks(all);
        mdf_AddLoadChecks(all);
        mdf_AddMaterialChecks(all);
        mdf_AddSectionChecks(all);
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

std::string mdf_RecordChecks::TableHint(const cls_Record& record, const char* field) const {
    const cls_ClassRegistrar& classes = cls_Classes();
    for (const cls_ClassEntry* entry = classes.Find(record.DynTypeId()); entry != nullptr;
         entry = classes.Find(entry->baseId)) {
        const auto found = tableHints_.find(entry->info.Id());
        if (found != tableHints_.end()) return found->second(record, field);
    }
    return {};
}
