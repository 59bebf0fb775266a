#ifndef QRX_FOUNDATION_COW_LIST_H
#define QRX_FOUNDATION_COW_LIST_H

#include "foundation/cow_CountedHld.h"
#include "foundation/cow_Range.h"

#include <algorithm>
#include <bit>
#include <cstdint>
#include <cstring>
#include <new>
#include <type_traits>
#include <utility>
#include <vector>

/// The 32 bits of the single-precision float nearest to n.
inline int getFloatMask(int n) {
    return std::bit_cast<int>(static_cast<float>(n));
}

/// The binary exponent of the float whose bits are given: the whole part of log2 n for getFloatMask(n),
/// n positive.
inline int getPower(int mask) {
    return static_cast<int>(static_cast<unsigned>(mask) >> 23) - 127;
}

/// Raises the failure of an index that lies outside a container; `what` names the container and the index.
[[noreturn]] void cow_RaiseOutOfRange(int index, int count, const char* what = "cow_List: index");
/// Raises the failure of a number that may not be negative.
[[noreturn]] void cow_RaiseNegative(int number, const char* what);

/// How many items a new list should have room for.
struct cow_ListConstruct {
    explicit cow_ListConstruct(int expectedCount) : size(expectedCount) {}
    int size;
};

/// Raw room for items and the count of the lists that share it. Which items are alive is the lists'
/// business: all lists that share a block have the same live range in it.
template <class T>
class cow_ListBlock : public mem_AllocationOperators {
public:
    explicit cow_ListBlock(int itemCount)
        : items_(static_cast<T*>(mem_Malloc(static_cast<std::size_t>(itemCount) * sizeof(T)))) {
        static_assert(alignof(T) <= alignof(std::max_align_t));
    }
    cow_ListBlock(const cow_ListBlock&) = delete;
    cow_ListBlock& operator=(const cow_ListBlock&) = delete;
    ~cow_ListBlock() { mem_Free(items_); }

    void Increment() { count_.Increment(); }
    bool Decrement() { return count_.Decrement(); }
    bool IsShared() const { return count_.Count() > 1; }
    T* Items() { return items_; }

private:
    thr_Count count_;
    T* items_;
};

/// A sequence in blocks of a power of two of items. Copying a list takes a reference; writing through a
/// copy copies the table of blocks and the one block that is written. Growing at either end never moves an
/// item. Checked access raises "cow_List: index ... is out of range ...".
template <class T>
class cow_List {
public:
    cow_List() noexcept = default;
    explicit cow_List(cow_ListConstruct expected) { Initialize(expected.size); }
    explicit cow_List(const T& a) { AppendAll(a); }
    cow_List(const T& a, const T& b) { AppendAll(a, b); }
    cow_List(const T& a, const T& b, const T& c) { AppendAll(a, b, c); }
    cow_List(const T& a, const T& b, const T& c, const T& d) { AppendAll(a, b, c, d); }
    cow_List(const T& a, const T& b, const T& c, const T& d, const T& e) { AppendAll(a, b, c, d, e); }

    cow_List(const cow_List& other) noexcept
        : count_(other.count_), tableLength_(other.tableLength_), shift_(other.shift_), first_(other.first_),
          tableCount_(other.tableCount_), table_(other.table_) {
        if (tableCount_ != nullptr) tableCount_->Increment();
    }
    cow_List(cow_List&& other) noexcept { Swap(other); }
    cow_List& operator=(const cow_List& other) noexcept {
        cow_List copy(other);
        Swap(copy);
        return *this;
    }
    cow_List& operator=(cow_List&& other) noexcept {
        cow_List moved(std::move(other));
        Swap(moved);
        return *this;
    }
    ~cow_List() { ReleaseTable(); }

    int Length() const { return count_; }
    bool IsEmpty() const { return count_ == 0; }

    void CheckIndex(int index) const {
        if (index < 0 || index >= count_) RaiseOutOfRange(index);
    }
    [[noreturn]] void RaiseOutOfRange(int index) const { cow_RaiseOutOfRange(index, count_); }

    const T& operator[](int index) const { return ConstGet(index); }
    const T& ConstGet(int index) const {
        CheckIndex(index);
        return UncheckedConstGet(index);
    }
    const T& UncheckedConstGet(int index) const {
        const int place = first_ + index;
        return table_[place >> shift_]->Items()[place & Mask()];
    }
    /// The item for writing.
    T& Get(int index) {
        CheckIndex(index);
        return Writable(index);
    }
    const T& Last() const { return ConstGet(count_ - 1); }

    static const T& ItemAt(const cow_List& list, int index) { return list.UncheckedConstGet(index); }
    using ConstIterator = cow_IndexIterator<cow_List, &ItemAt>;
    /// The items in order, for loops that leave the list as it is.
    ConstIterator begin() const { return {*this, 0}; }
    ConstIterator end() const { return {*this, count_}; }

    void Put(int index, T item) { Get(index) = std::move(item); }

    void Append(T item) {
        new (RoomBehind()) T(std::move(item));
        ++count_;
    }

    /// Appends make(0) to make(count - 1), block by block.
    template <class Make>
    void AppendMany(int count, const Make& make) {
        static_assert(std::is_trivially_copyable_v<T>);
        for (int done = 0; done < count;) {
            T* const room = RoomBehind();
            const int end = done + std::min(count - done, BlockSize() - ((first_ + count_) & Mask()));
            const int begin = done;
            for (; done < end; ++done) new (room + (done - begin)) T(make(done));
            count_ += end - begin;
        }
    }

    void Prepend(T item) {
        if (count_ == 0) {
            Append(std::move(item));
            return;
        }
        Prefix();
        const int place = first_ - 1;
        if ((place & Mask()) == Mask()) {
            AddBlockAt(place >> shift_);
        } else {
            OwnBlock(place >> shift_);
        }
        new (table_[place >> shift_]->Items() + (place & Mask())) T(std::move(item));
        first_ = place;
        ++count_;
    }

    /// Puts the item before the one at `index`; `index` may be the length.
    void InsertIndex(int index, T item) {
        if (index < 0 || index > count_) cow_RaiseOutOfRange(index, count_ + 1);
        if (index == 0) {
            Prepend(std::move(item));
            return;
        }
        Append(std::move(item));
        for (int i = count_ - 1; i > index; --i) std::swap(Writable(i), Writable(i - 1));
    }

    void RemoveIndex(int index) {
        CheckIndex(index);
        for (int i = index; i + 1 < count_; ++i) std::swap(Writable(i), Writable(i + 1));
        Shorten(count_ - 1);
    }

    void Concatenate(const cow_List& list) {
        if (count_ == 0) {
            *this = list;
            return;
        }
        const cow_List source(list);
        for (int i = 0; i < source.count_; ++i) Append(source.UncheckedConstGet(i));
    }

    /// Makes the list `count` copies of the item.
    void Fill(int count, const T& item) {
        if (count < 0) cow_RaiseNegative(count, "cow_List: length");
        const T value(item);
        *this = cow_List(cow_ListConstruct(count));
        for (int i = 0; i < count; ++i) Append(value);
    }

    /// Cuts the list off behind `count` items, or fills it up with default items.
    void Resize(int count) {
        if (count < 0) cow_RaiseNegative(count, "cow_List: length");
        while (count_ < count) Append(T());
        if (count < count_) Shorten(count);
    }

    /// Puts the items in ascending order; equal ones keep theirs.
    void Sort() {
        std::vector<T> items;
        items.reserve(static_cast<std::size_t>(count_));
        for (int i = 0; i < count_; ++i) items.push_back(UncheckedConstGet(i));
        std::stable_sort(items.begin(), items.end());
        cow_List sorted{cow_ListConstruct(count_)};
        for (T& item : items) sorted.Append(std::move(item));
        Swap(sorted);
    }

    /// The longest run of items from `index` on that lies in one piece; `length` gets its length.
    const T* ConstRun(int index, int& length) const {
        CheckIndex(index);
        const int place = first_ + index;
        length = std::min(BlockSize() - (place & Mask()), count_ - index);
        return table_[place >> shift_]->Items() + (place & Mask());
    }

    /// The arithmetic of the blocks, for those who plan memory.
    int Shift() const { return shift_; }
    int TableLength() const { return tableLength_; }
    int First() const { return first_; }
    bool HasTable() const { return table_ != nullptr; }
    /// Whether both lists hold the item at `index` in one shared block.
    bool SharesBlock(const cow_List& other, int index) const {
        return table_[(first_ + index) >> shift_] == other.table_[(other.first_ + index) >> other.shift_];
    }

    friend bool operator==(const cow_List& a, const cow_List& b) {
        if (a.count_ != b.count_) return false;
        if (a.table_ == b.table_ && a.first_ == b.first_) return true;
        for (int i = 0; i < a.count_; ++i) {
            if (!(a.UncheckedConstGet(i) == b.UncheckedConstGet(i))) return false;
        }
        return true;
    }

private:
    using Block = cow_ListBlock<T>;
    static constexpr int kFreeSlots = 16;

    int BlockSize() const { return 1 << shift_; }
    int Mask() const { return BlockSize() - 1; }

    template <class... Items>
    void AppendAll(const Items&... items) {
        (Append(items), ...);
    }

    // For a large n the table gets 8 to 16 blocks and sixteen free slots.
    void Initialize(int n) {
        if (n <= 0) return;
        const int bits = getFloatMask(n);
        int length = 0;
        if ((bits >> 23) - 130 > shift_) {
            shift_ = (bits >> 23) - 130;
            length = ((bits & 0x7fffff) + 0x8fffff) >> 20;
        }
        AllocateTable(length + kFreeSlots);
    }

    void AllocateTable(int length) {
        const std::size_t bytes = static_cast<std::size_t>(length) * sizeof(Block*);
        auto* table = static_cast<Block**>(mem_Malloc(bytes));
        std::memset(static_cast<void*>(table), 0, bytes);
        try {
            tableCount_ = new cow_Counter(1);
        } catch (...) {
            mem_Free(table);
            throw;
        }
        table_ = table;
        tableLength_ = length;
    }

    int FirstBlock() const { return first_ >> shift_; }
    int EndBlock() const { return count_ == 0 ? FirstBlock() : ((first_ + count_ - 1) >> shift_) + 1; }

    // A table of this list's own, the blocks still shared.
    void CopyArray() {
        if (table_ == nullptr) {
            AllocateTable(kFreeSlots);
            return;
        }
        if (tableCount_->Count() == 1) return;
        cow_List own;
        own.shift_ = shift_;
        own.AllocateTable(tableLength_);
        own.first_ = first_;
        for (int b = FirstBlock(); b < EndBlock(); ++b) {
            own.table_[b] = table_[b];
            own.table_[b]->Increment();
        }
        own.count_ = count_;
        Swap(own);
    }

    // The items of block `b` that are alive, as a half-open range of places in it.
    std::pair<int, int> LiveRange(int b) const {
        const int start = b << shift_;
        return {std::max(first_ - start, 0), std::min(first_ + count_ - start, BlockSize())};
    }

    void OwnBlock(int b) {
        if (!table_[b]->IsShared()) return;
        const auto [from, to] = LiveRange(b);
        CloneRange(b, from, to);
    }

    void CloneRange(int b, int from, int to) {
        auto* clone = new Block(BlockSize());
        int made = from;
        try {
            for (; made < to; ++made) new (clone->Items() + made) T(table_[b]->Items()[made]);
        } catch (...) {
            while (made > from) clone->Items()[--made].~T();
            delete clone;
            throw;
        }
        table_[b]->Decrement();
        table_[b] = clone;
    }

    T& Writable(int index) {
        CopyArray();
        const int place = first_ + index;
        OwnBlock(place >> shift_);
        return table_[place >> shift_]->Items()[place & Mask()];
    }

    // Where the next item goes, in a block of this list's own.
    T* RoomBehind() {
        CopyArray();
        const int place = first_ + count_;
        if ((place & Mask()) == 0 || count_ == 0) {
            AddBlockAt(place >> shift_);
        } else {
            OwnBlock(place >> shift_);
        }
        return table_[place >> shift_]->Items() + (place & Mask());
    }

    void AddBlockAt(int b) {
        if (b >= tableLength_) GrowTable(std::max(b + 1, 2 * tableLength_));
        // The table keeps a block that a failed Append left without an item.
        if (table_[b] == nullptr) table_[b] = new Block(BlockSize());
    }

    void GrowTable(int length) {
        table_ = static_cast<Block**>(mem_Realloc(static_cast<void*>(table_),
                                                  static_cast<std::size_t>(tableLength_) * sizeof(Block*),
                                                  static_cast<std::size_t>(length) * sizeof(Block*)));
        std::fill(table_ + tableLength_, table_ + length, nullptr);
        tableLength_ = length;
    }

    // Makes room before the first item by moving block pointers, not items.
    void Prefix() {
        CopyArray();
        if (first_ > 0) return;
        const int used = EndBlock();
        if (used == tableLength_) GrowTable(2 * tableLength_);
        // Blocks that a failed Append left behind would be overwritten below.
        for (int b = used; b < tableLength_; ++b) delete std::exchange(table_[b], nullptr);
        std::move_backward(table_, table_ + used, table_ + tableLength_);
        std::fill(table_, table_ + (tableLength_ - used), nullptr);
        first_ = (tableLength_ - used) << shift_;
    }

    void Shorten(int count) {
        if (count == 0) {
            *this = cow_List();
            return;
        }
        CopyArray();
        const int last = (first_ + count - 1) >> shift_;
        const auto [from, to] = LiveRange(last);
        const int end = first_ + count - (last << shift_);
        const bool cloned = table_[last]->IsShared();
        // Before anything is destroyed, since the copies may fail.
        if (cloned) CloneRange(last, from, end);
        for (int b = EndBlock() - 1; b > last; --b) {
            const auto [start, stop] = LiveRange(b);
            ReleaseBlock(b, start, stop);
        }
        for (int i = to; i > end && !cloned; --i) table_[last]->Items()[i - 1].~T();
        count_ = count;
    }

    void ReleaseBlock(int b, int from, int to) {
        if (table_[b]->Decrement()) {
            if constexpr (!std::is_trivially_destructible_v<T>) {
                for (int i = to; i > from; --i) table_[b]->Items()[i - 1].~T();
            }
            delete table_[b];
        }
        table_[b] = nullptr;
    }

    void ReleaseTable() noexcept {
        if (tableCount_ == nullptr || !tableCount_->Decrement()) return;
        for (int b = EndBlock() - 1; b >= FirstBlock(); --b) {
            const auto [from, to] = LiveRange(b);
            ReleaseBlock(b, from, to);
        }
        for (int b = 0; b < tableLength_; ++b) delete table_[b];
        mem_Free(static_cast<void*>(table_));
        delete tableCount_;
    }

    void Swap(cow_List& other) noexcept {
        std::swap(count_, other.count_);
        std::swap(tableLength_, other.tableLength_);
        std::swap(shift_, other.shift_);
        std::swap(first_, other.first_);
        std::swap(tableCount_, other.tableCount_);
        std::swap(table_, other.table_);
    }

    int count_ = 0;
    int tableLength_ = 0;
    int shift_ = 4;
    int first_ = 0;
    cow_Counter* tableCount_ = nullptr;
    Block** table_ = nullptr;
};

/// Walks a list; keeps its own (shared) copy, so that the list may change meanwhile.
template <class T>
class cow_ListIter {
public:
    explicit cow_ListIter(const cow_List<T>& list) : list_(list) {}
    void First() { index_ = 0; }
    void Next() { ++index_; }
    bool IsDone() const { return index_ >= list_.Length(); }
    const T& CurrentItem() const { return list_[index_]; }

private:
    cow_List<T> list_;
    int index_ = 0;
};

#endif
