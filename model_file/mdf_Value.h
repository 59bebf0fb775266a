#ifndef QRX_MODEL_FILE_MDF_VALUE_H
#define QRX_MODEL_FILE_MDF_VALUE_H

#include <cstddef>
#include <cstdint>
#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

struct mdf_Numbers;
struct mdf_Rows;
struct mdf_Facets;
struct mdf_ObjectData;
struct mdf_Member;

/// What a value is. The last four are compact forms of arrays; which form an array has depends on its items
/// alone. An array without items is an IntArray.
enum class mdf_Kind : std::uint8_t {
    Null,
    Bool,
    Int,  ///< fits 32 bits and is written without fraction and exponent
    Real, ///< any other number
    String,
    Array, ///< items of any kind
    Object,
    IntArray,   ///< all items are Int
    RealArray,  ///< all items are numbers, at least one is a Real
    Matrix,     ///< all items are arrays of numbers
    FacetArray, ///< all items are [Int, String or Int], at least one has a String
};

/// "an integer", "an array of numbers", ... for messages.
const char* mdf_KindText(mdf_Kind kind);

/// The bulk data of a Matrix, row after row. One of `ints` and `reals` is empty.
struct mdf_MatrixData {
    std::size_t rows = 0;
    int rowLength = 0;           ///< of every row, or -1 when the rows differ
    std::vector<int> rowLengths; ///< one per row when the rows differ, else empty
    std::vector<int> ints;       ///< all numbers are Int
    std::vector<double> reals;   ///< at least one is not
};

/// A node of a JSON document. It owns what it holds; copying is deep, moving costs nothing.
/// An accessor asked for what the value is not (the string of a number, an item beyond the end) raises
/// std::logic_error: a reader asks for the kind first.
class mdf_Value {
public:
    mdf_Value() noexcept;
    explicit mdf_Value(bool value) noexcept;
    explicit mdf_Value(int value) noexcept;
    explicit mdf_Value(double value) noexcept;
    explicit mdf_Value(std::string_view text);
    explicit mdf_Value(const char* text) : mdf_Value(std::string_view(text)) {}
    explicit mdf_Value(std::string&& text);
    mdf_Value(const mdf_Value& other);
    mdf_Value(mdf_Value&& other) noexcept;
    mdf_Value& operator=(const mdf_Value& other);
    mdf_Value& operator=(mdf_Value&& other) noexcept;
    ~mdf_Value();

    mdf_Kind Kind() const;
    const char* KindText() const { return mdf_KindText(Kind()); }
    bool IsNull() const { return std::holds_alternative<std::monostate>(data_); }
    bool IsBool() const { return std::holds_alternative<bool>(data_); }
    bool IsInt() const { return std::holds_alternative<int>(data_); }
    bool IsNumber() const { return IsInt() || std::holds_alternative<double>(data_) || IsLargeInteger(); }
    bool IsString() const { return As<std::string>() != nullptr; }
    bool IsObject() const { return As<mdf_ObjectData>() != nullptr; }
    /// True for the general and every compact form.
    bool IsArray() const {
        return As<std::vector<mdf_Value>>() != nullptr || As<mdf_Numbers>() != nullptr ||
               As<mdf_Rows>() != nullptr || As<mdf_Facets>() != nullptr;
    }

    bool Bool() const;
    int Int() const;
    /// The number, of an Int too.
    double Real() const;
    /// A Real that was written without fraction and exponent but doesn't fit 32 bits.
    bool IsLargeInteger() const { return std::holds_alternative<Large>(data_); }
    const std::string& String() const;
    std::string TakeString();

    /// Items of an array of any form, members of an object; 0 for everything else.
    std::size_t Size() const;
    bool Empty() const { return Size() == 0; }

    /// The item of an array of any form, by value.
    mdf_Value Item(std::size_t index) const;
    /// The items of a general Array (only of that).
    const std::vector<mdf_Value>& Items() const;
    std::vector<mdf_Value>& Items();

    /// The members of an Object in file order. Values may be changed and moved out, names may not.
    std::span<const mdf_Member> Members() const;
    std::span<mdf_Member> Members();
    /// The value of the member with that name, or null; fast for objects of any size.
    const mdf_Value* Find(std::string_view name) const;
    mdf_Value* Find(std::string_view name);

    /// IntArray, or Matrix without a Real.
    bool AllInts() const;
    /// The numbers of an IntArray, or row after row of a Matrix without a Real.
    std::span<const int> Ints() const;
    /// The numbers of a RealArray, or row after row of a Matrix with a Real.
    std::span<const double> Reals() const;
    /// IntArray, RealArray, Matrix: position, counted row after row, of the first number that is not an Int;
    /// how many numbers there are when all are Int.
    std::size_t FirstReal() const;

    /// Matrix: length of all rows, or -1 when they differ.
    int UniformRowLength() const;
    std::size_t RowLength(std::size_t row) const;
    /// Where the row's numbers begin in Ints() or Reals().
    std::size_t RowBegin(std::size_t row) const;

    /// Moves the numbers out and leaves Null. An IntArray (TakeInts), an array of numbers (TakeReals; Ints
    /// are converted), a Matrix or an array without items (TakeMatrix).
    std::vector<int> TakeInts();
    std::vector<double> TakeReals();
    mdf_MatrixData TakeMatrix();

    /// FacetArray: the first number of a row, and its second item: a text, or a number.
    int FacetLabel(std::size_t row) const;
    bool FacetHasName(std::size_t row) const;
    int FacetId(std::size_t row) const;
    std::string_view FacetName(std::size_t row) const;
    /// FacetArray: the different names, in order of first appearance, and the row's position in them (-1 for
    /// a row with a number), so that a reader works out each name once.
    const std::vector<std::string>& FacetNames() const;
    int FacetNameIndex(std::size_t row) const;

    /// Makes a compact array general; nothing is lost.
    void Generalise();

private:
    friend class mdf_Builder;
    friend struct mdf_Numbers;

    struct Large {
        double value;
    };
    template <class T>
    using Own = std::unique_ptr<T>;
    using Data =
        std::variant<std::monostate, bool, int, double, Large, Own<std::string>, Own<std::vector<mdf_Value>>,
                     Own<mdf_ObjectData>, Own<mdf_Numbers>, Own<mdf_Rows>, Own<mdf_Facets>>;

    explicit mdf_Value(Data&& data) noexcept;
    /// A value of a compound kind.
    template <class T>
    static mdf_Value Of(T content);
    /// What the value holds, or null when that is something else.
    template <class T>
    T* As() const {
        const Own<T>* own = std::get_if<Own<T>>(&data_);
        return own == nullptr ? nullptr : own->get();
    }
    /// The same; raises when it is something else.
    template <class T>
    T& Get(const char* wanted) const {
        T* held = As<T>();
        if (held == nullptr) RaiseMismatch(wanted);
        return *held;
    }

    [[noreturn]] void RaiseMismatch(const char* wanted) const;
    const mdf_Numbers& Numbers() const;
    const mdf_Rows& Rows(std::size_t row) const;
    const mdf_Facets& FacetRow(std::size_t row) const;

    Data data_;
};

struct mdf_Member {
    std::string name;
    mdf_Value value;
};

#endif
