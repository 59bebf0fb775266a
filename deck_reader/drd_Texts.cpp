#include "deck_reader/drd_Texts.h"

#include <algorithm>

char* drd_Texts::NewBlock(std::size_t bytes) {
    constexpr std::size_t kSmallest = std::size_t{1} << 10;
    constexpr std::size_t kLargest = std::size_t{1} << 20;
    const std::size_t size = std::max(std::clamp(2 * size_, kSmallest, kLargest), bytes);
    blocks_.push_back(std::make_unique_for_overwrite<char[]>(size));
    size_ = size;
    used_ = bytes;
    return blocks_.back().get();
}
