#include "foundation/mem_Allocation.h"

#include <cstring>
#include <new>

// Everything ends in the global operator new, so that a host program that replaces it sees every request.
void* mem_OperatorNewThrow(std::size_t bytes) {
    return ::operator new(bytes);
}

void* mem_OperatorNewTinyThrow(std::size_t bytes) {
    return ::operator new(bytes);
}

void mem_OperatorDelete(void* memory) noexcept {
    ::operator delete(memory);
}

void mem_OperatorDeleteTiny(void* memory) noexcept {
    ::operator delete(memory);
}

void* mem_Malloc(std::size_t bytes) {
    return ::operator new(bytes);
}

void* mem_Realloc(void* memory, std::size_t oldBytes, std::size_t newBytes) {
    void* grown = ::operator new(newBytes);
    if (memory != nullptr) {
        std::memcpy(grown, memory, oldBytes < newBytes ? oldBytes : newBytes);
        ::operator delete(memory);
    }
    return grown;
}

void mem_Free(void* memory) noexcept {
    ::operator delete(memory);
}
