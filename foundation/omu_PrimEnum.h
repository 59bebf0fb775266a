#ifndef QRX_FOUNDATION_OMU_PRIMENUM_H
#define QRX_FOUNDATION_OMU_PRIMENUM_H

#include "foundation/cow_List.h"
#include "foundation/cow_String.h"

#include <span>

/// One enumerator: its number, its name in C++ and in model files, and the text that GetString() gives.
/// `deck` is the word that a deck line ends up with where it is not the text; model files take it too.
struct omu_EnumRow {
    int value;
    const char* name;
    const char* text;
    const char* deck = nullptr;
};

/// The one table of an enumeration. It stands beside the enumeration E as
/// `const omu_EnumTable& omu_EnumTableOf(E)`, which argument-dependent lookup finds.
struct omu_EnumTable {
    const char* typeName;
    std::span<const omu_EnumRow> rows;

    /// The row of the number, or null.
    const omu_EnumRow* Row(int value) const;
    /// The row whose name, text or deck word equals `word` in any capitals, or null.
    const omu_EnumRow* RowOfWord(std::string_view word) const;
};

/// A value of an enumeration that knows its texts.
class omu_PrimEnumBase {
public:
    /// Takes the enumerator of the text, name or deck word, in any capitals. False, and no change, if there
    /// is none.
    bool SetValue(const char* text);
    /// The text of the value; empty for a number outside the list.
    cow_String GetString() const { return AsString(value_); }
    cow_String AsString(int value) const;
    /// All texts, in the order of the list.
    cow_List<cow_String> PermissibleValues() const;
    cow_String TypeString() const { return table_->typeName; }

protected:
    omu_PrimEnumBase(const omu_EnumTable& table, int value) : table_(&table), value_(value) {}

    const omu_EnumTable* table_;
    int value_;
};

template <class E, int N>
class omu_PrimEnum : public omu_PrimEnumBase {
public:
    omu_PrimEnum(E value = E()) : omu_PrimEnumBase(omu_EnumTableOf(E()), static_cast<int>(value)) {}
    E Value() const { return static_cast<E>(value_); }
};

/// Whether two texts are equal but for the capitals of ASCII letters.
bool omu_EqualInAnyCapitals(std::string_view a, std::string_view b);

#endif
