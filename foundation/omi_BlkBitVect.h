#ifndef QRX_FOUNDATION_OMI_BLKBITVECT_H
#define QRX_FOUNDATION_OMI_BLKBITVECT_H

#include <array>
#include <cstdint>
#include <memory>
#include <vector>

/// A set of non-negative integers in blocks of bits, made only where a bit is set: one label of a hundred
/// million costs some kilobytes, not twelve megabytes.
class omi_BlkBitVect {
public:
    /// Raises when `bit` is negative.
    void SetBit(int bit);
    bool IsSet(int bit) const;
    /// Counts the set bits.
    int Recount() const;

private:
    friend class omi_BlkBitVectTrav;
    // bit = 13 bits of page, 9 bits of block in the page, 9 bits in the block
    static constexpr int kWordsPerBlock = 8;
    static constexpr int kBlocksPerPage = 512;
    using Block = std::array<std::uint64_t, kWordsPerBlock>;
    using Page = std::array<std::unique_ptr<Block>, kBlocksPerPage>;

    std::vector<std::unique_ptr<Page>> pages_;
};

/// Walks the set bits in ascending order. The set must not change meanwhile.
class omi_BlkBitVectTrav {
public:
    explicit omi_BlkBitVectTrav(const omi_BlkBitVect& bits) : bits_(bits) {}
    /// The lowest set bit, or -1.
    int First();
    /// The next one, or -1.
    int Next();

private:
    int FindFrom(std::int64_t bit);

    const omi_BlkBitVect& bits_;
    std::int64_t current_ = -1;
};

#endif
