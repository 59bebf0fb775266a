#include "store_interface/findings/fnd_RecordRules.h"

#include "store_interface/findings/fnd_Text.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <algorithm>

void fnd_RecordCheck::Columns(const char* field, const cow_2DArray<double>& table, const char* names,
                              int fieldVariables) {
    const std::string_view list(names);
    const long long expected = 1 + std::count(list.begin(), list.end(), ',') + std::max(fieldVariables, 0);
    if (table.IsEmpty() || table.NumColumns() == expected) return;
    std::string rows = "rows of " + std::to_string(expected) + ": " + names;
    if (fieldVariables > 0) rows += ", " + fnd_Counted(fieldVariables, "field variable");
    Add("table-columns", field, "found rows of " + std::to_string(table.NumColumns()), rows);
}

void fnd_RecordCheck::NotNegative(const char* field, int value) {
    if (value < 0) Add("negative-number", field, "found " + std::to_string(value), "0 or more");
}

void fnd_RecordCheck::Positive(const char* field, double value) {
    if (!(value > 0)) Add("not-positive", field, "found " + fnd_Shown(value), "more than 0");
}

void fnd_RecordRules::Run(const cls_Record& record, fnd_RecordCheck& check) const {
    const cls_ClassRegistrar& classes = cls_Classes();
    for (const cls_ClassEntry* entry = classes.Find(record.DynTypeId()); entry != nullptr;
         entry = classes.Find(entry->baseId)) {
        const auto found = rules_.find(entry->info.Id());
        if (found == rules_.end()) continue;
        for (const auto rule : found->second) rule(record, check);
    }
}

std::string fnd_RecordRules::TableHint(const cls_Record& record, const char* field) const {
    const cls_ClassRegistrar& classes = cls_Classes();
    for (const cls_ClassEntry* entry = classes.Find(record.DynTypeId()); entry != nullptr;
         entry = classes.Find(entry->baseId)) {
        const auto found = hints_.find(entry->info.Id());
        if (found != hints_.end()) return found->second(record, field);
    }
    return {};
}
