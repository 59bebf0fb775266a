#include "store_interface/findings/fnd_Nearest.h"

#include "store_interface/findings/fnd_Text.h"

#include <algorithm>
#include <bit>
#include <cstdlib>
#include <cstring>
#include <numeric>

namespace {

/// The characters that occur, as bits; some characters share one.
unsigned long long LettersOf(const char* text, std::size_t length) {
    unsigned long long letters = 0;
    for (std::size_t i = 0; i < length; ++i) letters |= 1ULL << (static_cast<unsigned char>(text[i]) & 63U);
    return letters;
}

/// Characters that one has and the other has not, less for a common beginning.
int Unlikeness(std::string_view name, std::string_view word) {
    int counts[256] = {};
    for (const char c : name) ++counts[static_cast<unsigned char>(c)];
    for (const char c : word) --counts[static_cast<unsigned char>(c)];
    int unlike = 0;
    for (const int count : counts) unlike += std::abs(count);
    const auto [end, other] = std::mismatch(name.begin(), name.end(), word.begin(), word.end());
    return unlike - static_cast<int>(end - name.begin());
}

} // namespace

fnd_Nearest::fnd_Nearest(std::string_view name) {
    if (name.size() > kLongest) return;
    length_ = name.size();
    std::transform(name.begin(), name.end(), name_, [](char c) { return fnd_LowerCase(c); });
    letters_ = LettersOf(name_, length_);
    // Something of the name must be left.
    least_ = std::min(std::max<std::size_t>(1, length_ / 3) + 1, length_);
}

void fnd_Nearest::Try(std::string_view candidate) {
    const std::size_t gap = std::max(candidate.size(), length_) - std::min(candidate.size(), length_);
    if (candidate.size() > kLongest) return;
    const std::size_t common = std::min(candidate.size(), length_);
    const bool mayBegin = gap < leastRest_ && common >= kBeginning;
    if (gap >= least_ && !mayBegin) return;
    char lower[kLongest];
    std::transform(candidate.begin(), candidate.end(), lower, [](char c) { return fnd_LowerCase(c); });
    if (mayBegin && std::memcmp(lower, name_, common) == 0) {
        leastRest_ = gap;
        sameBeginning_ = candidate;
    }
    if (gap >= least_) return;
    // Each change takes away or brings at most one character.
    const unsigned long long letters = LettersOf(lower, candidate.size());
    const int lost = std::max(std::popcount(letters_ & ~letters), std::popcount(letters & ~letters_));
    if (static_cast<std::size_t>(lost) >= least_) return;
    const std::size_t distance = DistanceTo(lower, candidate.size());
    if (distance >= least_) return;
    least_ = distance;
    nearest_ = candidate;
}

std::size_t fnd_Nearest::DistanceTo(const char* candidate, std::size_t length) const {
    // Rows of the table of distances between beginnings. Cells as far as `least_` off the diagonal can't be
    // on the way to a distance below it.
    using Cell = unsigned char;
    const auto most = static_cast<Cell>(least_);
    Cell rows[3][kLongest + 2];
    std::memset(rows, most, sizeof rows);
    Cell* row = rows[0];
    Cell* above = rows[1];
    Cell* twoAbove = rows[2];
    for (std::size_t j = 0; j < std::min(least_, length + 1); ++j) row[j] = static_cast<Cell>(j);
    Cell bestAbove = 0;
    for (std::size_t i = 0; i < length_; ++i) {
        std::swap(twoAbove, above);
        std::swap(above, row);
        const std::size_t from = i + 1 >= least_ ? i + 1 - least_ : 0;
        const std::size_t to = std::min(length, i + least_);
        row[from] = from == 0 ? static_cast<Cell>(std::min(i + 1, least_)) : most;
        Cell best = row[from];
        for (std::size_t j = from; j < to; ++j) {
            int cell = std::min(row[j], above[j + 1]) + 1;
            cell = std::min(cell, above[j] + (name_[i] == candidate[j] ? 0 : 1));
            if (i > 0 && j > 0 && name_[i] == candidate[j - 1] && name_[i - 1] == candidate[j]) {
                cell = std::min(cell, twoAbove[j - 1] + 1);
            }
            row[j + 1] = static_cast<Cell>(std::min<int>(cell, most));
            best = std::min(best, row[j + 1]);
        }
        row[to + 1] = most;
        // Two rows, since swapped characters reach over one.
        if (best >= most && bestAbove >= most) return least_;
        bestAbove = best;
    }
    return row[length];
}

std::string fnd_Nearest::Hint() const {
    const std::string& meant = nearest_.empty() ? sameBeginning_ : nearest_;
    return meant.empty() ? std::string() : "did you mean " + fnd_Quoted(meant) + "?";
}

std::string fnd_DidYouMean(std::string_view name, const std::vector<std::string>& known) {
    fnd_Nearest nearest(name);
    for (const std::string& candidate : known) nearest.Try(candidate);
    return nearest.Hint();
}

std::vector<std::size_t> fnd_PlacesOfNearest(const std::vector<std::string>& words, std::string_view name) {
    std::vector<std::size_t> places(words.size());
    std::iota(places.begin(), places.end(), std::size_t{0});
    if (words.size() > fnd_kListed && name.empty()) places.resize(fnd_kListed);
    if (places.size() <= fnd_kListed) return places;
    // Fast, since a model may have a great many names.
    const std::string lower = fnd_LowerCase(name);
    std::vector<int> unlike;
    unlike.reserve(words.size());
    for (const std::string& word : words) unlike.push_back(Unlikeness(lower, fnd_LowerCase(word)));
    std::ranges::stable_sort(places, {}, [&unlike](std::size_t i) { return unlike[i]; });
    places.resize(fnd_kListed);
    std::ranges::sort(places);
    return places;
}

std::string fnd_ThereAre(const std::vector<std::string>& known, std::string_view name) {
    if (known.empty()) return "there is none";
    std::string list = known.size() == 1 ? "there is " : "there are ";
    const char* separator = "";
    for (const std::size_t i : fnd_PlacesOfNearest(known, name)) {
        list.append(separator).append(fnd_Quoted(known[i]));
        separator = ", ";
    }
    if (known.size() > fnd_kListed) list += ", ... (" + std::to_string(known.size() - fnd_kListed) + " more)";
    return list;
}
