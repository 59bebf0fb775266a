#ifndef QRX_MODEL_FILE_MDF_VALUE_DATA_H
#define QRX_MODEL_FILE_MDF_VALUE_DATA_H

#include "model_file/mdf_Value.h"

#include <cstddef>
#include <cstdint>
#include <functional>
#include <map>
#include <string>
#include <string_view>
#include <vector>

/// What the values of compound kinds hold; for the parser, which fills them.

/// Places that are marked; grows as far as it is.
class mdf_Bits {
public:
    void Mark(std::size_t place) {
        if (place / 64 >= words_.size()) words_.resize(place / 64 + 1);
        words_[place / 64] |= std::uint64_t{1} << place % 64;
    }
    bool IsMarked(std::size_t place) const {
        return place / 64 < words_.size() && (words_[place / 64] >> place % 64 & 1) != 0;
    }
    /// Marks what the other marks, `offset` places further.
    void MarkAll(const mdf_Bits& other, std::size_t offset);
    /// Forgets the marks from `size` on.
    void Truncate(std::size_t size) {
        if (size / 64 >= words_.size()) return;
        words_.resize(size / 64 + 1);
        words_.back() &= (std::uint64_t{1} << size % 64) - 1;
    }

    bool IsEmpty() const { return words_.empty(); }

private:
    std::vector<std::uint64_t> words_;
};

/// Numbers that are held as ints until the first one arrives that isn't.
struct mdf_Numbers {
    /// How numbers beside the first Real were written; bits beyond the end are false.
    struct Marks {
        mdf_Bits isInt;
        mdf_Bits isLarge;
    };

    bool allInts = true;
    std::vector<int> ints;
    std::vector<double> reals;
    std::size_t firstReal = 0;
    std::unique_ptr<Marks> marks;

    mdf_Numbers() = default;
    mdf_Numbers(const mdf_Numbers& other);
    mdf_Numbers(mdf_Numbers&& other) = default;

    std::size_t Size() const { return allInts ? ints.size() : reals.size(); }
    bool HasRoomFor(std::size_t more) const {
        return allInts ? ints.capacity() - ints.size() >= more : reals.capacity() - reals.size() >= more;
    }
    bool Full() const { return !HasRoomFor(1); }
    void Reserve(std::size_t size);
    void AddInt(int value) {
        if (allInts) {
            ints.push_back(value);
        } else {
            AddMarked(value, &Marks::isInt);
        }
    }
    void AddReal(double value, bool isLarge) {
        if (allInts) BecomeReal();
        if (isLarge) {
            AddMarked(value, &Marks::isLarge);
        } else {
            reals.push_back(value);
        }
    }
    mdf_Value At(std::size_t index) const;
    /// An IntArray or RealArray of the numbers from `begin` to before `end`.
    mdf_Value Slice(std::size_t begin, std::size_t end) const;
    /// Marks numbers that are there, those of `more` being the first from `offset` on.
    void AddMarks(const Marks& more, std::size_t offset);
    /// Forgets the numbers from `size` on.
    void Truncate(std::size_t size);

private:
    void BecomeReal();
    void AddMarked(double value, mdf_Bits Marks::*bits) {
        if (!marks) marks = std::make_unique<Marks>();
        ((*marks).*bits).Mark(reals.size());
        reals.push_back(value);
    }
};

struct mdf_Rows {
    mdf_Numbers numbers;
    std::size_t count = 0;
    /// Of all rows, as long as they agree.
    std::size_t length = 0;
    /// Where each row ends, once they differ.
    std::vector<std::size_t> ends;

    std::size_t Begin(std::size_t row) const {
        return ends.empty() ? row * length : (row == 0 ? 0 : ends[row - 1]);
    }
    std::size_t End(std::size_t row) const { return ends.empty() ? (row + 1) * length : ends[row]; }
    /// Makes a row of the numbers that came since the last one.
    void CloseRow() {
        const std::size_t end = numbers.Size();
        if (ends.empty() && end == (count + 1) * length && count > 0) [[likely]] {
            ++count;
        } else {
            CloseOtherRow(end);
        }
    }

private:
    void CloseOtherRow(std::size_t end);
};

struct mdf_Facets {
    /// Label, and id or position in `names`.
    std::vector<int> pairs;
    mdf_Bits isNamed;
    std::vector<std::string> names;
    std::map<std::string, int, std::less<>> indices;

    std::size_t Count() const { return pairs.size() / 2; }
    bool IsNamed(std::size_t row) const { return isNamed.IsMarked(row); }
    /// Makes `name` the second item of the row that has its label only.
    void AddName(std::string_view name);
};

struct mdf_ObjectData {
    std::vector<mdf_Member> members;
    /// Positions in `members` in order of names; empty for few members.
    std::vector<std::uint32_t> order;

    /// To be called when all members are there. Of members with one name the first stays; the names of the
    /// others are returned.
    std::vector<std::string> Index();
    const mdf_Member* Find(std::string_view name) const;
};

template <class T>
mdf_Value mdf_Value::Of(T content) {
    return mdf_Value(Data(std::make_unique<T>(std::move(content))));
}

#endif
