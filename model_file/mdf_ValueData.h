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

/// Numbers that are held as ints until the first one arrives that isn't.
struct mdf_Numbers {
    /// How numbers beside the first Real were written; bits beyond the end are false.
    struct Marks {
        std::vector<bool> isInt;
        std::vector<bool> isLarge;
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
    bool Full() const { return allInts ? ints.size() == ints.capacity() : reals.size() == reals.capacity(); }
    void Reserve(std::size_t size);
    void AddInt(int value);
    void AddReal(double value, bool isLarge);
    mdf_Value At(std::size_t index) const;
    /// An IntArray or RealArray of the numbers from `begin` to before `end`.
    mdf_Value Slice(std::size_t begin, std::size_t end) const;
    /// Forgets the numbers from `size` on.
    void Truncate(std::size_t size);
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
    void CloseRow();
};

struct mdf_Facets {
    /// Label, and id or position in `names`.
    std::vector<int> pairs;
    std::vector<bool> isNamed;
    std::vector<std::string> names;
    std::map<std::string, int, std::less<>> indices;

    std::size_t Count() const { return pairs.size() / 2; }
    bool IsNamed(std::size_t row) const { return row < isNamed.size() && isNamed[row]; }
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
