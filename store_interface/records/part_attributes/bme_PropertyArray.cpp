#include "store_interface/records/part_attributes/bme_PropertyArray.h"

void bme_PropertyArray::Block::Put(int place, std::uint32_t kind) {
    unsigned char* at = bytes.get() + static_cast<std::size_t>(place) * width;
    for (int i = 0; i < width; ++i) at[i] = static_cast<unsigned char>(kind >> (8 * i));
}

void bme_PropertyArray::Set(int first, int count, int bme_Property::*index, int value) {
    if (count <= 0) return;
    if (blocks_.empty()) blocks_.resize(static_cast<std::size_t>((numElements_ - 1) / kBlockSize + 1));
    if (index != index_ || value != value_ || change_ == 0) {
        index_ = index;
        value_ = value;
        ++change_;
    }
    for (int at = first; at < first + count;) {
        const auto b = static_cast<std::size_t>(at / kBlockSize);
        Block& block = blocks_[b];
        const int size = SizeOf(b);
        const int begin = at % kBlockSize;
        const int end = std::min(size, begin + (first + count - at));
        if (block.width == 0 && end - begin == size) {
            block.common = KindAfterChange(block.common);
        } else {
            SetIn(block, begin, end, size);
        }
        at += end - begin;
    }
}

void bme_PropertyArray::SetIn(Block& block, int begin, int end, int size) {
    for (int i = begin; i < end; ++i) {
        const std::uint32_t former = block.At(i);
        const std::uint32_t kind = KindAfterChange(former);
        if (kind == former) continue;
        const std::uint8_t width = kind < 0x100 ? 1 : kind < 0x10000 ? 2 : 4;
        if (width > block.width) Widen(block, size, width);
        block.Put(i, kind);
    }
    if (end - begin < size) return;
    const std::uint32_t common = block.At(0);
    for (int i = 1; i < size; ++i) {
        if (block.At(i) != common) return;
    }
    block.common = common;
    block.width = 0;
    block.bytes.reset();
}

void bme_PropertyArray::Widen(Block& block, int size, std::uint8_t width) {
    Block wide;
    wide.width = width;
    wide.bytes.reset(new unsigned char[static_cast<std::size_t>(size) * width]);
    for (int i = 0; i < size; ++i) wide.Put(i, block.At(i));
    block = std::move(wide);
}

std::uint32_t bme_PropertyArray::KindAfterChange(std::uint32_t kind) {
    if (changed_.size() <= kind) changed_.resize(kinds_.size());
    Changed& changed = changed_[kind];
    if (changed.change != change_) {
        bme_Property property = kinds_[kind];
        property.*index_ = value_;
        const auto [place, isNew] = kindOf_.emplace(property, static_cast<std::uint32_t>(kinds_.size()));
        if (isNew) kinds_.push_back(property);
        changed = {change_, place->second};
    }
    return changed.kind;
}
