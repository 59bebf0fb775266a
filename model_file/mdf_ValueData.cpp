#include "model_file/mdf_ValueData.h"

#include <algorithm>
#include <numeric>
#include <utility>

mdf_Numbers::mdf_Numbers(const mdf_Numbers& other)
    : allInts(other.allInts), ints(other.ints), reals(other.reals), firstReal(other.firstReal),
      marks(other.marks ? std::make_unique<Marks>(*other.marks) : nullptr) {}

void mdf_Numbers::Reserve(std::size_t size) {
    if (allInts)
        ints.reserve(size);
    else
        reals.reserve(size);
}

void mdf_Bits::MarkAll(const mdf_Bits& other, std::size_t offset) {
    if (other.words_.empty()) return;
    const std::size_t first = offset / 64;
    const std::size_t shift = offset % 64;
    if (words_.size() < first + other.words_.size() + 1) words_.resize(first + other.words_.size() + 1);
    for (std::size_t i = 0; i < other.words_.size(); ++i) {
        words_[first + i] |= other.words_[i] << shift;
        if (shift > 0) words_[first + i + 1] |= other.words_[i] >> (64 - shift);
    }
}

void mdf_Numbers::AddMarks(const Marks& more, std::size_t offset) {
    if (more.isInt.IsEmpty() && more.isLarge.IsEmpty()) return;
    if (!marks) marks = std::make_unique<Marks>();
    marks->isInt.MarkAll(more.isInt, offset);
    marks->isLarge.MarkAll(more.isLarge, offset);
}

void mdf_Numbers::BecomeReal() {
    allInts = false;
    firstReal = ints.size();
    reals.reserve(std::max(ints.capacity(), firstReal + 1));
    reals.assign(ints.begin(), ints.end());
    ints = {};
}

mdf_Value mdf_Numbers::At(std::size_t index) const {
    if (allInts) return mdf_Value(ints[index]);
    const double value = reals[index];
    if (index < firstReal || (marks && marks->isInt.IsMarked(index)))
        return mdf_Value(static_cast<int>(value));
    if (marks && marks->isLarge.IsMarked(index)) return mdf_Value(mdf_Value::Data(mdf_Value::Large{value}));
    return mdf_Value(value);
}

mdf_Value mdf_Numbers::Slice(std::size_t begin, std::size_t end) const {
    mdf_Numbers numbers;
    if (allInts) {
        numbers.ints.assign(ints.begin() + static_cast<std::ptrdiff_t>(begin),
                            ints.begin() + static_cast<std::ptrdiff_t>(end));
    } else {
        for (std::size_t i = begin; i < end; ++i) {
            const mdf_Value item = At(i);
            if (item.IsInt())
                numbers.AddInt(item.Int());
            else
                numbers.AddReal(item.Real(), item.IsLargeInteger());
        }
    }
    return mdf_Value::Of(std::move(numbers));
}

void mdf_Numbers::Truncate(std::size_t size) {
    if (allInts) {
        ints.resize(size);
        return;
    }
    if (size > firstReal) {
        reals.resize(size);
        if (!marks) return;
        marks->isInt.Truncate(size);
        marks->isLarge.Truncate(size);
        return;
    }
    ints.clear();
    for (std::size_t i = 0; i < size; ++i) ints.push_back(static_cast<int>(reals[i]));
    allInts = true;
    reals = {};
    firstReal = 0;
    marks.reset();
}

void mdf_Rows::CloseOtherRow(std::size_t end) {
    const std::size_t begin = count == 0 ? 0 : End(count - 1);
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
    isNamed.Mark(Count());
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
