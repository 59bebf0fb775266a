#include "model_file/mdf_Value.h"

#include "model_file/mdf_ValueData.h"

#include <stdexcept>
#include <utility>

const char* mdf_KindText(mdf_Kind kind) {
    switch (kind) {
    case mdf_Kind::Null: return "null";
    case mdf_Kind::Bool: return "true or false";
    case mdf_Kind::Int: return "an integer";
    case mdf_Kind::Real: return "a real number";
    case mdf_Kind::String: return "a string";
    case mdf_Kind::Array: return "an array";
    case mdf_Kind::Object: return "an object";
    case mdf_Kind::IntArray: return "an array of integers";
    case mdf_Kind::RealArray: return "an array of numbers";
    case mdf_Kind::Matrix: return "an array of rows of numbers";
    case mdf_Kind::FacetArray: return "an array of facets";
    }
    return "a value";
}

// Documents have as many values as a file has texts and single numbers.
static_assert(sizeof(mdf_Value) == 2 * sizeof(void*));

mdf_Value::mdf_Value() noexcept = default;
mdf_Value::mdf_Value(bool value) noexcept : data_(value) {}
mdf_Value::mdf_Value(int value) noexcept : data_(value) {}
mdf_Value::mdf_Value(double value) noexcept : data_(value) {}
mdf_Value::mdf_Value(std::string_view text) : data_(std::make_unique<std::string>(text)) {}
mdf_Value::mdf_Value(std::string&& text) : data_(std::make_unique<std::string>(std::move(text))) {}
mdf_Value::mdf_Value(Data&& data) noexcept : data_(std::move(data)) {}
mdf_Value::~mdf_Value() = default;

mdf_Value::mdf_Value(const mdf_Value& other) {
    const auto copy = [this]<class T>(const T& held) {
        if constexpr (std::is_copy_constructible_v<T>) {
            data_ = held;
        } else {
            data_ = std::make_unique<typename T::element_type>(*held);
        }
    };
    std::visit(copy, other.data_);
}

mdf_Value::mdf_Value(mdf_Value&& other) noexcept : data_(std::exchange(other.data_, Data())) {}

mdf_Value& mdf_Value::operator=(const mdf_Value& other) {
    if (this != &other) *this = mdf_Value(other);
    return *this;
}

mdf_Value& mdf_Value::operator=(mdf_Value&& other) noexcept {
    // The other may be an item of this one, so it is emptied before this one is released.
    Data taken = std::exchange(other.data_, Data());
    std::swap(data_, taken);
    return *this;
}

mdf_Kind mdf_Value::Kind() const {
    if (const mdf_Numbers* numbers = As<mdf_Numbers>())
        return numbers->allInts ? mdf_Kind::IntArray : mdf_Kind::RealArray;
    static constexpr mdf_Kind kinds[] = {mdf_Kind::Null,   mdf_Kind::Bool,      mdf_Kind::Int,
                                         mdf_Kind::Real,   mdf_Kind::Real,      mdf_Kind::String,
                                         mdf_Kind::Array,  mdf_Kind::Object,    mdf_Kind::IntArray,
                                         mdf_Kind::Matrix, mdf_Kind::FacetArray};
    static_assert(std::size(kinds) == std::variant_size_v<Data>);
    return kinds[data_.index()];
}

void mdf_Value::RaiseMismatch(const char* wanted) const {
    throw std::logic_error(std::string("a value was asked for ") + wanted + " but is " + KindText());
}

const mdf_Numbers& mdf_Value::Numbers() const {
    if (const mdf_Rows* rows = As<mdf_Rows>()) return rows->numbers;
    return Get<mdf_Numbers>("an array of numbers");
}

const mdf_Rows& mdf_Value::Rows(std::size_t row) const {
    const auto& rows = Get<mdf_Rows>(mdf_KindText(mdf_Kind::Matrix));
    if (row >= rows.count) throw std::logic_error("a row beyond the end was asked for");
    return rows;
}

const mdf_Facets& mdf_Value::FacetRow(std::size_t row) const {
    const auto& facets = Get<mdf_Facets>(mdf_KindText(mdf_Kind::FacetArray));
    if (row >= facets.Count()) throw std::logic_error("a facet beyond the end was asked for");
    return facets;
}

bool mdf_Value::Bool() const {
    if (!IsBool()) RaiseMismatch(mdf_KindText(mdf_Kind::Bool));
    return *std::get_if<bool>(&data_);
}

int mdf_Value::Int() const {
    if (!IsInt()) RaiseMismatch(mdf_KindText(mdf_Kind::Int));
    return *std::get_if<int>(&data_);
}

double mdf_Value::Real() const {
    if (const double* real = std::get_if<double>(&data_)) return *real;
    if (const Large* large = std::get_if<Large>(&data_)) return large->value;
    if (!IsInt()) RaiseMismatch(mdf_KindText(mdf_Kind::Real));
    return Int();
}

const std::string& mdf_Value::String() const {
    return Get<std::string>(mdf_KindText(mdf_Kind::String));
}

std::string mdf_Value::TakeString() {
    std::string text = std::move(Get<std::string>(mdf_KindText(mdf_Kind::String)));
    data_ = {};
    return text;
}

std::size_t mdf_Value::Size() const {
    if (const auto* items = As<std::vector<mdf_Value>>()) return items->size();
    if (const mdf_ObjectData* object = As<mdf_ObjectData>()) return object->members.size();
    if (const mdf_Numbers* numbers = As<mdf_Numbers>()) return numbers->Size();
    if (const mdf_Rows* rows = As<mdf_Rows>()) return rows->count;
    const mdf_Facets* facets = As<mdf_Facets>();
    return facets == nullptr ? 0 : facets->Count();
}

mdf_Value mdf_Value::Item(std::size_t index) const {
    if (!IsArray()) RaiseMismatch("an array");
    if (index >= Size()) throw std::logic_error("an item beyond the end was asked for");
    if (const auto* items = As<std::vector<mdf_Value>>()) return (*items)[index];
    if (const mdf_Rows* rows = As<mdf_Rows>())
        return rows->numbers.Slice(rows->Begin(index), rows->End(index));
    if (const mdf_Numbers* numbers = As<mdf_Numbers>()) return numbers->At(index);
    if (FacetHasName(index)) {
        std::vector<mdf_Value> items;
        items.emplace_back(FacetLabel(index));
        items.emplace_back(FacetName(index));
        return Of(std::move(items));
    }
    mdf_Numbers numbers;
    numbers.AddInt(FacetLabel(index));
    numbers.AddInt(FacetId(index));
    return Of(std::move(numbers));
}

const std::vector<mdf_Value>& mdf_Value::Items() const {
    return Get<std::vector<mdf_Value>>(mdf_KindText(mdf_Kind::Array));
}

std::vector<mdf_Value>& mdf_Value::Items() {
    return Get<std::vector<mdf_Value>>(mdf_KindText(mdf_Kind::Array));
}

std::span<const mdf_Member> mdf_Value::Members() const {
    return Get<mdf_ObjectData>(mdf_KindText(mdf_Kind::Object)).members;
}

std::span<mdf_Member> mdf_Value::Members() {
    return Get<mdf_ObjectData>(mdf_KindText(mdf_Kind::Object)).members;
}

const mdf_Value* mdf_Value::Find(std::string_view name) const {
    const mdf_Member* member = Get<mdf_ObjectData>(mdf_KindText(mdf_Kind::Object)).Find(name);
    return member == nullptr ? nullptr : &member->value;
}

mdf_Value* mdf_Value::Find(std::string_view name) {
    return const_cast<mdf_Value*>(std::as_const(*this).Find(name));
}

bool mdf_Value::AllInts() const {
    if (const mdf_Numbers* numbers = As<mdf_Numbers>()) return numbers->allInts;
    const mdf_Rows* rows = As<mdf_Rows>();
    return rows != nullptr && rows->numbers.allInts;
}

std::span<const int> mdf_Value::Ints() const {
    const mdf_Numbers& numbers = Numbers();
    if (!numbers.allInts) RaiseMismatch("integers");
    return numbers.ints;
}

std::span<const double> mdf_Value::Reals() const {
    const mdf_Numbers& numbers = Numbers();
    if (numbers.allInts) RaiseMismatch("real numbers");
    return numbers.reals;
}

std::size_t mdf_Value::FirstReal() const {
    const mdf_Numbers& numbers = Numbers();
    return numbers.allInts ? numbers.ints.size() : numbers.firstReal;
}

int mdf_Value::UniformRowLength() const {
    const auto& rows = Get<mdf_Rows>(mdf_KindText(mdf_Kind::Matrix));
    return rows.ends.empty() ? static_cast<int>(rows.length) : -1;
}

std::size_t mdf_Value::RowLength(std::size_t row) const {
    return Rows(row).End(row) - Rows(row).Begin(row);
}

std::size_t mdf_Value::RowBegin(std::size_t row) const {
    return Rows(row).Begin(row);
}

std::vector<int> mdf_Value::TakeInts() {
    auto& numbers = Get<mdf_Numbers>(mdf_KindText(mdf_Kind::IntArray));
    if (!numbers.allInts) RaiseMismatch(mdf_KindText(mdf_Kind::IntArray));
    std::vector<int> ints = std::move(numbers.ints);
    data_ = {};
    return ints;
}

std::vector<double> mdf_Value::TakeReals() {
    auto& numbers = Get<mdf_Numbers>(mdf_KindText(mdf_Kind::RealArray));
    std::vector<double> reals = std::move(numbers.reals);
    if (numbers.allInts) reals.assign(numbers.ints.begin(), numbers.ints.end());
    data_ = {};
    return reals;
}

mdf_MatrixData mdf_Value::TakeMatrix() {
    mdf_MatrixData data;
    const bool isEmpty = Kind() == mdf_Kind::IntArray && Empty();
    if (!isEmpty) {
        auto& rows = Get<mdf_Rows>(mdf_KindText(mdf_Kind::Matrix));
        data.rows = rows.count;
        data.rowLength = UniformRowLength();
        if (data.rowLength < 0) {
            data.rowLengths.reserve(data.rows);
            for (std::size_t row = 0; row < data.rows; ++row)
                data.rowLengths.push_back(static_cast<int>(RowLength(row)));
        }
        data.ints = std::move(rows.numbers.ints);
        data.reals = std::move(rows.numbers.reals);
    }
    data_ = {};
    return data;
}

int mdf_Value::FacetLabel(std::size_t row) const {
    return FacetRow(row).pairs[2 * row];
}

bool mdf_Value::FacetHasName(std::size_t row) const {
    return FacetRow(row).IsNamed(row);
}

int mdf_Value::FacetId(std::size_t row) const {
    const mdf_Facets& facets = FacetRow(row);
    if (facets.IsNamed(row)) throw std::logic_error("the number of a facet that has a name was asked for");
    return facets.pairs[2 * row + 1];
}

std::string_view mdf_Value::FacetName(std::size_t row) const {
    const int index = FacetNameIndex(row);
    if (index < 0) throw std::logic_error("the name of a facet that has a number was asked for");
    return FacetNames()[static_cast<std::size_t>(index)];
}

const std::vector<std::string>& mdf_Value::FacetNames() const {
    return Get<mdf_Facets>(mdf_KindText(mdf_Kind::FacetArray)).names;
}

int mdf_Value::FacetNameIndex(std::size_t row) const {
    const mdf_Facets& facets = FacetRow(row);
    return facets.IsNamed(row) ? facets.pairs[2 * row + 1] : -1;
}

void mdf_Value::Generalise() {
    if (!IsArray()) RaiseMismatch("an array");
    if (As<std::vector<mdf_Value>>() != nullptr) return;
    std::vector<mdf_Value> items;
    const std::size_t size = Size();
    items.reserve(size + 1);
    for (std::size_t i = 0; i < size; ++i) items.push_back(Item(i));
    *this = Of(std::move(items));
}
