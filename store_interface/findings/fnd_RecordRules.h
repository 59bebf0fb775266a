#ifndef QRX_STORE_FND_RECORDRULES_H
#define QRX_STORE_FND_RECORDRULES_H

#include "store_interface/findings/fnd_Finding.h"
#include "store_interface/records/cls_FieldTable.h"

#include <string>
#include <unordered_map>
#include <vector>

/// The record that is looked at: where it stands, and what is to be said of its fields.
class fnd_RecordCheck {
public:
    fnd_RecordCheck(fnd_Sink& sink, const fnd_Path& path) : sink_(sink), path_(path) {}
    /// `field` is "" for the record as such.
    void Add(fnd_CodeName code, std::string_view field, std::string found, std::string expected = {},
             std::string hint = {}) {
        const fnd_Path member(path_, field);
        sink_.Add(code, field.empty() ? path_ : member, std::move(found), std::move(expected),
                  std::move(hint));
    }
    /// An error unless the table has no rows, or as many columns as there are names, such as "time, value",
    /// and field variables behind them.
    void Columns(const char* field, const cow_2DArray<double>& table, const char* names,
                 int fieldVariables = 0);
    /// An error unless the number is 0 or more.
    void NotNegative(const char* field, int value);
    /// A warning unless the number is above 0.
    void Positive(const char* field, double value);

private:
    fnd_Sink& sink_;
    const fnd_Path& path_;
};

/// What records must satisfy beyond the types of their fields, by class. Model files are held against it
/// record by record as they are read, stores by their check; a record with an error in a field isn't looked
/// at.
class fnd_RecordRules {
public:
    /// The rules of all families.
    static const fnd_RecordRules& All();

    /// Adds `void Rule(const T& record, fnd_RecordCheck& check)` for all records of class T and of the
    /// classes derived from it.
    template <auto Rule>
    void Add() {
        AddOf<Rule>(Rule);
    }
    /// Adds `std::string Hint(const T& record, const char* field)`, which tells, when a table of such a
    /// record can't be read, how many columns it needs; empty for nothing.
    template <auto Hint>
    void AddTableHint() {
        AddHintOf<Hint>(Hint);
    }
    void Run(const cls_Record& record, fnd_RecordCheck& check) const;
    std::string TableHint(const cls_Record& record, const char* field) const;

private:
    template <auto Rule, class T>
    void AddOf(void (*)(const T&, fnd_RecordCheck&)) {
        rules_[T::TypeId()].push_back([](const cls_Record& record, fnd_RecordCheck& check) {
            Rule(static_cast<const T&>(record), check);
        });
    }
    template <auto Hint, class T>
    void AddHintOf(std::string (*)(const T&, const char*)) {
        hints_[T::TypeId()] = [](const cls_Record& record, const char* field) {
            return Hint(static_cast<const T&>(record), field);
        };
    }

    std::unordered_map<unsigned, std::vector<void (*)(const cls_Record&, fnd_RecordCheck&)>> rules_;
    std::unordered_map<unsigned, std::string (*)(const cls_Record&, const char*)> hints_;
};

// Each family adds its own.
void fnd_AddAmplitudeRules(fnd_RecordRules& rules);
void fnd_AddBoundaryRules(fnd_RecordRules& rules);
void fnd_AddConnectorRules(fnd_RecordRules& rules);
void fnd_AddInteractionRules(fnd_RecordRules& rules);
void fnd_AddLoadRules(fnd_RecordRules& rules);
void fnd_AddMaterialRules(fnd_RecordRules& rules);
void fnd_AddMaterialValueRules(fnd_RecordRules& rules);
void fnd_AddPartAttributeRules(fnd_RecordRules& rules);
void fnd_AddSectionRules(fnd_RecordRules& rules);
void fnd_AddStepRules(fnd_RecordRules& rules);

#endif
