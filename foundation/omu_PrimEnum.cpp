#include "foundation/omu_PrimEnum.h"

#include <algorithm>

bool omu_EqualInAnyCapitals(std::string_view a, std::string_view b) {
    const auto lower = [](char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; };
    return std::equal(a.begin(), a.end(), b.begin(), b.end(),
                      [&](char x, char y) { return lower(x) == lower(y); });
}

const omu_EnumRow* omu_EnumTable::Row(int value) const {
    const auto row =
        std::find_if(rows.begin(), rows.end(), [&](const omu_EnumRow& r) { return r.value == value; });
    return row == rows.end() ? nullptr : &*row;
}

const omu_EnumRow* omu_EnumTable::RowOfWord(std::string_view word) const {
    const auto row = std::find_if(rows.begin(), rows.end(), [&](const omu_EnumRow& r) {
        return omu_EqualInAnyCapitals(word, r.name) || omu_EqualInAnyCapitals(word, r.text) ||
               (r.deck != nullptr && omu_EqualInAnyCapitals(word, r.deck));
    });
    return row == rows.end() ? nullptr : &*row;
}

bool omu_PrimEnumBase::SetValue(const char* text) {
    const omu_EnumRow* row = table_->RowOfWord(text);
    if (row == nullptr) return false;
    value_ = row->value;
    return true;
}

cow_String omu_PrimEnumBase::AsString(int value) const {
    const omu_EnumRow* row = table_->Row(value);
    return row == nullptr ? cow_String() : cow_String(row->text);
}

cow_List<cow_String> omu_PrimEnumBase::PermissibleValues() const {
    cow_List<cow_String> texts;
    for (const omu_EnumRow& row : table_->rows) texts.Append(row.text);
    return texts;
}
