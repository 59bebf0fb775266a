#ifndef QRX_FOUNDATION_MEM_ALLOCATION_H
#define QRX_FOUNDATION_MEM_ALLOCATION_H

#include <cstddef>

/// The process allocator. Every operation that hands out memory throws std::bad_alloc when there is none;
/// none of them ever returns null.
/// The two "Tiny" paths are for the four-byte counts of copy-on-write handles.
void* mem_OperatorNewThrow(std::size_t bytes);
void* mem_OperatorNewTinyThrow(std::size_t bytes);
void mem_OperatorDelete(void* memory) noexcept;
void mem_OperatorDeleteTiny(void* memory) noexcept;

/// Plain memory for arrays of items. mem_Realloc keeps the first `oldBytes` bytes.
void* mem_Malloc(std::size_t bytes);
void* mem_Realloc(void* memory, std::size_t oldBytes, std::size_t newBytes);
void mem_Free(void* memory) noexcept;

/// Mixin: objects of the class live on the process allocator.
class mem_AllocationOperators {
public:
    static void* operator new(std::size_t bytes) { return mem_OperatorNewThrow(bytes); }
    static void* operator new(std::size_t, void* place) noexcept { return place; }
    static void operator delete(void* memory) noexcept { mem_OperatorDelete(memory); }
    static void operator delete(void*, void*) noexcept {}

protected:
    mem_AllocationOperators() = default;
    mem_AllocationOperators(const mem_AllocationOperators&) = default;
    mem_AllocationOperators(mem_AllocationOperators&&) = default;
    mem_AllocationOperators& operator=(const mem_AllocationOperators&) = default;
    mem_AllocationOperators& operator=(mem_AllocationOperators&&) = default;
    ~mem_AllocationOperators() = default;
};

/// Mixin for very small objects, such as counts.
class mem_AllocationOperatorsTiny {
public:
    static void* operator new(std::size_t bytes) { return mem_OperatorNewTinyThrow(bytes); }
    static void* operator new(std::size_t, void* place) noexcept { return place; }
    static void operator delete(void* memory) noexcept { mem_OperatorDeleteTiny(memory); }
    static void operator delete(void*, void*) noexcept {}
};

/// The same for the counts of copy-on-write storage.
class QRXBasCowAllocator : public mem_AllocationOperatorsTiny {};

#endif
