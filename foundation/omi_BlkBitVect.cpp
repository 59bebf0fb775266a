#include "foundation/omi_BlkBitVect.h"

#include "foundation/cow_List.h"

#include <bit>

void omi_BlkBitVect::SetBit(int bit) {
    if (bit < 0) cow_RaiseNegative(bit, "omi_BlkBitVect: bit");
    const auto page = static_cast<std::size_t>(bit >> 18);
    const auto block = static_cast<std::size_t>((bit >> 9) & 511);
    if (page >= pages_.size()) pages_.resize(page + 1);
    if (!pages_[page]) pages_[page] = std::make_unique<Page>();
    auto& place = (*pages_[page])[block];
    if (!place) place = std::make_unique<Block>(Block{});
    (*place)[static_cast<std::size_t>((bit >> 6) & 7)] |= std::uint64_t{1} << (bit & 63);
}

bool omi_BlkBitVect::IsSet(int bit) const {
    if (bit < 0) return false;
    const auto page = static_cast<std::size_t>(bit >> 18);
    if (page >= pages_.size() || !pages_[page]) return false;
    const auto& block = (*pages_[page])[static_cast<std::size_t>((bit >> 9) & 511)];
    return block && (((*block)[static_cast<std::size_t>((bit >> 6) & 7)] >> (bit & 63)) & 1U) != 0;
}

int omi_BlkBitVect::Recount() const {
    int count = 0;
    for (const auto& page : pages_) {
        if (!page) continue;
        for (const auto& block : *page) {
            if (!block) continue;
            for (const std::uint64_t word : *block) count += std::popcount(word);
        }
    }
    return count;
}

int omi_BlkBitVectTrav::First() {
    return FindFrom(0);
}

int omi_BlkBitVectTrav::Next() {
    return current_ < 0 ? -1 : FindFrom(current_ + 1);
}

int omi_BlkBitVectTrav::FindFrom(std::int64_t bit) {
    const auto& pages = bits_.pages_;
    for (auto page = static_cast<std::size_t>(bit >> 18); page < pages.size(); ++page) {
        const auto pageStart = static_cast<std::int64_t>(page) << 18;
        if (!pages[page]) continue;
        if (bit < pageStart) bit = pageStart;
        while ((bit >> 18) == static_cast<std::int64_t>(page)) {
            const auto& block = (*pages[page])[static_cast<std::size_t>((bit >> 9) & 511)];
            if (!block) {
                bit = ((bit >> 9) + 1) << 9;
                continue;
            }
            const std::uint64_t word = (*block)[static_cast<std::size_t>((bit >> 6) & 7)] >> (bit & 63);
            if (word != 0) {
                current_ = bit + std::countr_zero(word);
                return static_cast<int>(current_);
            }
            bit = ((bit >> 6) + 1) << 6;
        }
    }
    current_ = -1;
    return -1;
}
