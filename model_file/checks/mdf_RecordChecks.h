#ifndef QRX_MODEL_FILE_MDF_RECORDCHECKS_H
#define QRX_MODEL_FILE_MDF_RECORDCHECKS_H

#include "model_file/mdf_Diagnostics.h"
#include "store_interface/records/cls_FieldTable.h"

#include <functional>
#include <unordered_map>
#include <vector>

/// The record that is checked: where it stands in the file, and what is to be said of it.
class mdf_RecordCheck {
public:
    mdf_RecordCheck(mdf_Diagnostics& diagnostics, const mdf_Path& path)
        : diagnostics_(diagnostics), path_(path) {}
    void Error(const char* field, const std::string& text) {
        diagnostics_.Error(mdf_Path(path_, std::string_view(field)), text);
    }
    void Warning(const char* field, const std::string& text) {
        diagnostics_.Warning(mdf_Path(path_, std::string_view(field)), text);
    }
    /// An error unless the table has no rows, or as many columns as there are names, such as "time, value",
    /// and field variables behind them.
    void Columns(const char* field, const cow_2DArray<double>& table, const char* names,
                 int fieldVariables = 0);
    /// An error unless the number is 0 or more.
    void NotNegative(const char* field, int value);
    void NotNegative(const char* field, double value);

private:
    mdf_Diagnostics& diagnostics_;
    const mdf_Path& path_;
};

/// What records of a model file must satisfy beyond the types of their fields. A record that has an error in
/// a field already isn't checked.
class mdf_RecordChecks {
public:
    /// The checks of all families.
    static const mdf_RecordChecks& All();

    /// Adds a check of all records of class T and of the classes derived from it.
    template <class T>
    void Add(void (*check)(const T&, mdf_RecordCheck&)) {
        checks_[T::TypeId()].push_back([check](const cls_Record& record, mdf_RecordCheck& report) {
            check(static_cast<const T&>(record), report);
        });
    }
    /// Adds what is to be said when a table of a record of class T, or of a class derived from it, can't be
    /// read: how many columns it needs; empty for nothing.
    template <class T>
    void AddTableHint(std::string (*hint)(const T&, const char* field)) {
        tableHints_[T::TypeId()] = [hint](const cls_Record& record, const char* field) {
            return hint(static_cast<const T&>(record), field);
        };
    }
    void Run(const cls_Record& record, mdf_RecordCheck& report) const;
    std::string TableHint(const cls_Record& record, const char* field) const;

private:
    std::unordered_map<unsigned, std::vector<std::function<void(const cls_Record&, mdf_RecordCheck&)>>>
        checks_;
    std::unordered_map<unsigned, std::function<std::string(const cls_Record&, const char*)>> tableHints_;
};

void mdf_AddAmplitudeChecks(mdf_RecordChecks& checks);
void mdf_AddBoundaryChecks(mdf_RecordChecks& checks);
void mdf_AddConnectorChecks(mdf_RecordChecks& checks);
void mdf_AddInteractionChecks(mdf_RecordChecks& checks);
void mdf_AddLoadChecks(mdf_RecordChecks& checks);
void mdf_AddMaterialChecks(mdf_RecordChecks& checks);
void mdf_AddSectionChecks(mdf_RecordChecks& checks);
void mdf_AddStepChecks(mdf_RecordChecks& checks);

#endif
