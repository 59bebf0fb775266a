#include "model_file/mdf_Value.h"

#include "model_file/mdf_ValueData.h"

#include <algorithm>
#include <numeric>
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

mdf_Numbers::mdf_Numbers(const mdf_Numbers& other)
    : allInts(other.allInts), ints(other.ints), reals(other.reals), firstReal(other.firstReal),
      marks(other.marks ? std::make_unique<Marks>(*other.marks) : nullptr) {}

void mdf_Numbers::Reserve(std::size_t size) {
    if (allInts)
        ints.reserve(size);
    else
        reals.reserve(size);
}

namespace {

void Mark(std::vector<bool>& bits, std::size_t index) {
    if (bits.size() <= index) bits.resize(index + 1);
    bits[index] = true;
}

bool IsMarked(const std::vector<bool>& bits, std::size_t index) {
    return index < bits.size() && bits[index];
}

} // namespace

void mdf_Numbers::AddInt(int value) {
    if (allInts) {
        ints.push_back(value);
        return;
    }
    if (!marks) marks = std::make_unique<Marks>();
    Mark(marks->isInt, reals.size());
    reals.push_back(value);
}

void mdf_Numbers::AddReal(double value, bool isLarge) {
    if (allInts) {
        allInts = false;
        firstReal = ints.size();
        reals.reserve(std::max(ints.capacity(), firstReal + 1));
        reals.assign(ints.begin(), ints.end());
        ints = {};
    }
    if (isLarge) {
        if (!marks) marks = std::make_unique<Marks>();
        Mark(marks->isLarge, reals.size());
    }
    reals.push_back(value);
}

mdf_Value mdf_Numbers::At(std::size_t index) const {
    if (allInts) return mdf_Value(ints[index]);
    const double value = reals[index];
    if (index < firstReal || (marks && IsMarked(marks->isInt, index)))
        return mdf_Value(static_cast<int>(value));
    mdf_Value item(value);
    item.largeInteger_ = marks && IsMarked(marks->isLarge, index);
    return item;
}

mdf_Value mdf_Numbers::Slice(std::size_t begin, std::size_t end) const {
    auto numbers = std::make_unique<mdf_Numbers>();
    if (allInts) {
        numbers->ints.assign(ints.begin() + static_cast<std::ptrdiff_t>(begin),
                             ints.begin() + static_cast<std::ptrdiff_t>(end));
    } else {
        for (std::size_t i = begin; i < end; ++i) {
            const mdf_Value item = At(i);
            if (item.IsInt())
                numbers->AddInt(item.Int());
            else
                numbers->AddReal(item.Real(), item.IsLargeInteger());
        }
    }
    mdf_Value slice;
    slice.kind_ = numbers->allInts ? mdf_Kind::IntArray : mdf_Kind::RealArray;
    slice.numbers_ = numbers.release();
    return slice;
}

void mdf_Numbers::Truncate(std::size_t size) {
    if (allInts) {
        ints.resize(size);
        return;
    }
    if (size > firstReal) {
        reals.resize(size);
        if (!marks) return;
        marks->isInt.resize(std::min(size, marks->isInt.size()));
        marks->isLarge.resize(std::min(size, marks->isLarge.size()));
        return;
    }
    ints.clear();
    for (std::size_t i = 0; i < size; ++i) ints.push_back(static_cast<int>(reals[i]));
    allInts = true;
    reals = {};
    firstReal = 0;
    marks.reset();
}

void mdf_Rows::CloseRow() {
    const std::size_t begin = count == 0 ? 0 : End(count - 1);
    const std::size_t end = numbers.Size();
    if (count == 0) {
        length = end;
    } else if (!ends.empty()) {
        ends.push_back(end);
    } else if (end - begin != length) {
        ends.reserve(count + 1);
        for (std::size_t row = 0; row < count; ++row) ends.push_back((row + 1) * length);
        ends.push_back(end);
    }
    ++count;
}

void mdf_Facets::AddName(std::string_view name) {
    Mark(isNamed, Count());
    auto found = indices.find(name);
    if (found == indices.end()) {
        found = indices.emplace(name, static_cast<int>(names.size())).first;
        names.emplace_back(name);
    }
    pairs.push_back(found->second);
}

namespace {
constexpr std::size_t fewMembers = 8;
}

std::vector<std::string> mdf_ObjectData::Index() {
    const auto before = [this](std::uint32_t a, std::uint32_t b) {
        const int sign = members[a].name.compare(members[b].name);
        return sign != 0 ? sign < 0 : a < b;
    };
    const auto sort = [&] {
        order.resize(members.size());
        std::iota(order.begin(), order.end(), 0u);
        std::sort(order.begin(), order.end(), before);
    };
    sort();
    std::vector<std::uint32_t> repeated;
    for (std::size_t i = 1; i < order.size(); ++i) {
        if (members[order[i]].name == members[order[i - 1]].name) repeated.push_back(order[i]);
    }
    std::vector<std::string> names;
    if (!repeated.empty()) {
        std::sort(repeated.begin(), repeated.end());
        std::vector<mdf_Member> kept;
        auto next = repeated.begin();
        for (std::uint32_t i = 0; i < members.size(); ++i) {
            if (next != repeated.end() && *next == i) {
                names.push_back(std::move(members[i].name));
                ++next;
            } else {
                kept.push_back(std::move(members[i]));
            }
        }
        members = std::move(kept);
        sort();
    }
    if (members.size() <= fewMembers) order = {};
    return names;
}

const mdf_Member* mdf_ObjectData::Find(std::string_view name) const {
    if (order.empty()) {
        const auto found = std::find_if(members.begin(), members.end(),
                                        [&](const mdf_Member& member) { return member.name == name; });
        return found == members.end() ? nullptr : &*found;
    }
    const auto found =
        std::lower_bound(order.begin(), order.end(), name,
                         [this](std::uint32_t i, std::string_view n) { return members[i].name < n; });
    return found != order.end() && members[*found].name == name ? &members[*found] : nullptr;
}

mdf_Value::mdf_Value(std::string_view text) : kind_(mdf_Kind::String), string_(new std::string(text)) {}

mdf_Value::mdf_Value(std::string&& text)
    : kind_(mdf_Kind::String), string_(new std::string(std::move(text))) {}

mdf_Value::mdf_Value(const mdf_Value& other) : mdf_Value() {
    switch (other.kind_) {
    case mdf_Kind::Null: break;
    case mdf_Kind::Bool: bool_ = other.bool_; break;
    case mdf_Kind::Int: int_ = other.int_; break;
    case mdf_Kind::Real: real_ = other.real_; break;
    case mdf_Kind::String: string_ = new std::string(*other.string_); break;
    case mdf_Kind::Array: array_ = new std::vector<mdf_Value>(*other.array_); break;
    case mdf_Kind::Object: object_ = new mdf_ObjectData(*other.object_); break;
    case mdf_Kind::IntArray:
    case mdf_Kind::RealArray: numbers_ = new mdf_Numbers(*other.numbers_); break;
    case mdf_Kind::Matrix: rows_ = new mdf_Rows(*other.rows_); break;
    case mdf_Kind::FacetArray: facets_ = new mdf_Facets(*other.facets_); break;
    }
    kind_ = other.kind_;
    largeInteger_ = other.largeInteger_;
}

mdf_Value::mdf_Value(mdf_Value&& other) noexcept : mdf_Value() {
    *this = std::move(other);
}

mdf_Value& mdf_Value::operator=(const mdf_Value& other) {
    if (this != &other) *this = mdf_Value(other);
    return *this;
}

mdf_Value& mdf_Value::operator=(mdf_Value&& other) noexcept {
    if (this == &other) return *this;
    // The other may be an item of this one, so it is emptied before this one is released.
    mdf_Value old;
    const auto carry = [](mdf_Value& to, mdf_Value& from) {
        to.kind_ = std::exchange(from.kind_, mdf_Kind::Null);
        to.largeInteger_ = std::exchange(from.largeInteger_, false);
        switch (to.kind_) {
        case mdf_Kind::Null: break;
        case mdf_Kind::Bool: to.bool_ = from.bool_; break;
        case mdf_Kind::Int: to.int_ = from.int_; break;
        case mdf_Kind::Real: to.real_ = from.real_; break;
        case mdf_Kind::String: to.string_ = from.string_; break;
        case mdf_Kind::Array: to.array_ = from.array_; break;
        case mdf_Kind::Object: to.object_ = from.object_; break;
        case mdf_Kind::IntArray:
        case mdf_Kind::RealArray: to.numbers_ = from.numbers_; break;
        case mdf_Kind::Matrix: to.rows_ = from.rows_; break;
        case mdf_Kind::FacetArray: to.facets_ = from.facets_; break;
        }
    };
    carry(old, *this);
    carry(*this, other);
    return *this;
}

mdf_Value::~mdf_Value() {
    Release();
}

void mdf_Value::Release() noexcept {
    switch (std::exchange(kind_, mdf_Kind::Null)) {
    case mdf_Kind::Null:
    case mdf_Kind::Bool:
    case mdf_Kind::Int:
    case mdf_Kind::Real: break;
    case mdf_Kind::String: delete string_; break;
    case mdf_Kind::Array: delete array_; break;
    case mdf_Kind::Object: delete object_; break;
    case mdf_Kind::IntArray:
    case mdf_Kind::RealArray: delete numbers_; break;
    case mdf_Kind::Matrix: delete rows_; break;
    case mdf_Kind::FacetArray: delete facets_; break;
    }
    largeInteger_ = false;
}

void mdf_Value::RaiseMismatch(const char* wanted) const {
    throw std::logic_error(std::string("a value was asked for ") + wanted + " but is " + KindText());
}

void mdf_Value::Expect(mdf_Kind kind) const {
    if (kind_ != kind) RaiseMismatch(mdf_KindText(kind));
}

const mdf_Numbers& mdf_Value::Numbers() const {
    if (kind_ == mdf_Kind::Matrix) return rows_->numbers;
    if (kind_ != mdf_Kind::IntArray && kind_ != mdf_Kind::RealArray) RaiseMismatch("an array of numbers");
    return *numbers_;
}

const mdf_Rows& mdf_Value::Rows() const {
    Expect(mdf_Kind::Matrix);
    return *rows_;
}

const mdf_Rows& mdf_Value::Rows(std::size_t row) const {
    if (row >= Rows().count) throw std::logic_error("a row beyond the end was asked for");
    return *rows_;
}

const mdf_Facets& mdf_Value::FacetRow(std::size_t row) const {
    Expect(mdf_Kind::FacetArray);
    if (row >= facets_->Count()) throw std::logic_error("a facet beyond the end was asked for");
    return *facets_;
}

bool mdf_Value::Bool() const {
    Expect(mdf_Kind::Bool);
    return bool_;
}

int mdf_Value::Int() const {
    Expect(mdf_Kind::Int);
    return int_;
}

double mdf_Value::Real() const {
    if (kind_ == mdf_Kind::Int) return int_;
    Expect(mdf_Kind::Real);
    return real_;
}

const std::string& mdf_Value::String() const {
    Expect(mdf_Kind::String);
    return *string_;
}

std::string mdf_Value::TakeString() {
    Expect(mdf_Kind::String);
    std::string text = std::move(*string_);
    Release();
    return text;
}

std::size_t mdf_Value::Size() const {
    switch (kind_) {
    case mdf_Kind::Null:
    case mdf_Kind::Bool:
    case mdf_Kind::Int:
    case mdf_Kind::Real:
    case mdf_Kind::String: return 0;
    case mdf_Kind::Array: return array_->size();
    case mdf_Kind::Object: return object_->members.size();
    case mdf_Kind::IntArray:
    case mdf_Kind::RealArray: return numbers_->Size();
    case mdf_Kind::Matrix: return rows_->count;
    case mdf_Kind::FacetArray: return facets_->Count();
    }
    return 0;
}

mdf_Value mdf_Value::Item(std::size_t index) const {
    if (!IsArray()) RaiseMismatch("an array");
    if (index >= Size()) throw std::logic_error("an item beyond the end was asked for");
    if (kind_ == mdf_Kind::Array) return (*array_)[index];
    if (kind_ == mdf_Kind::Matrix) return rows_->numbers.Slice(rows_->Begin(index), rows_->End(index));
    if (kind_ != mdf_Kind::FacetArray) return numbers_->At(index);
    mdf_Value row;
    if (facets_->IsNamed(index)) {
        auto items = std::make_unique<std::vector<mdf_Value>>();
        items->emplace_back(FacetLabel(index));
        items->emplace_back(FacetName(index));
        row.array_ = items.release();
        row.kind_ = mdf_Kind::Array;
    } else {
        auto numbers = std::make_unique<mdf_Numbers>();
        numbers->AddInt(FacetLabel(index));
        numbers->AddInt(FacetId(index));
        row.numbers_ = numbers.release();
        row.kind_ = mdf_Kind::IntArray;
    }
    return row;
}

const std::vector<mdf_Value>& mdf_Value::Items() const {
    Expect(mdf_Kind::Array);
    return *array_;
}

std::vector<mdf_Value>& mdf_Value::Items() {
    Expect(mdf_Kind::Array);
    return *array_;
}

std::span<const mdf_Member> mdf_Value::Members() const {
    Expect(mdf_Kind::Object);
    return object_->members;
}

std::span<mdf_Member> mdf_Value::Members() {
    Expect(mdf_Kind::Object);
    return object_->members;
}

const mdf_Value* mdf_Value::Find(std::string_view name) const {
    Expect(mdf_Kind::Object);
    const mdf_Member* member = object_->Find(name);
    return member == nullptr ? nullptr : &member->value;
}

mdf_Value* mdf_Value::Find(std::string_view name) {
    return const_cast<mdf_Value*>(std::as_const(*this).Find(name));
}

bool mdf_Value::AllInts() const {
    return (kind_ == mdf_Kind::IntArray || kind_ == mdf_Kind::Matrix) && Numbers().allInts;
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
    const mdf_Rows& rows = Rows();
    return rows.ends.empty() ? static_cast<int>(rows.length) : -1;
}

std::size_t mdf_Value::RowLength(std::size_t row) const {
    return Rows(row).End(row) - Rows(row).Begin(row);
}

std::size_t mdf_Value::RowBegin(std::size_t row) const {
    return Rows(row).Begin(row);
}

std::vector<int> mdf_Value::TakeInts() {
    Expect(mdf_Kind::IntArray);
    std::vector<int> ints = std::move(numbers_->ints);
    Release();
    return ints;
}

std::vector<double> mdf_Value::TakeReals() {
    if (kind_ != mdf_Kind::IntArray) Expect(mdf_Kind::RealArray);
    std::vector<double> reals = std::move(numbers_->reals);
    if (numbers_->allInts) reals.assign(numbers_->ints.begin(), numbers_->ints.end());
    Release();
    return reals;
}

mdf_MatrixData mdf_Value::TakeMatrix() {
    mdf_MatrixData data;
    if (kind_ != mdf_Kind::IntArray || !Empty()) {
        Expect(mdf_Kind::Matrix);
        data.rows = rows_->count;
        data.rowLength = UniformRowLength();
        if (data.rowLength < 0) {
            data.rowLengths.reserve(data.rows);
            for (std::size_t row = 0; row < data.rows; ++row)
                data.rowLengths.push_back(static_cast<int>(RowLength(row)));
        }
        data.ints = std::move(rows_->numbers.ints);
        data.reals = std::move(rows_->numbers.reals);
    }
    Release();
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
    return facets_->names[static_cast<std::size_t>(index)];
}

const std::vector<std::string>& mdf_Value::FacetNames() const {
    Expect(mdf_Kind::FacetArray);
    return facets_->names;
}

int mdf_Value::FacetNameIndex(std::size_t row) const {
    const mdf_Facets& facets = FacetRow(row);
    return facets.IsNamed(row) ? facets.pairs[2 * row + 1] : -1;
}

void mdf_Value::Generalise() {
    if (!IsArray()) RaiseMismatch("an array");
    if (kind_ == mdf_Kind::Array) return;
    auto items = std::make_unique<std::vector<mdf_Value>>();
    const std::size_t size = Size();
    items->reserve(size + 1);
    for (std::size_t i = 0; i < size; ++i) items->push_back(Item(i));
    Release();
    array_ = items.release();
    kind_ = mdf_Kind::Array;
}
