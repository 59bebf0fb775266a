// Any text as a model file: it is read or refused with a reason; what was read goes the whole way to a deck
// and back. Texts that are changed as trees get further: see whole_way.cpp.

#include "fuzz/WholeWay.h"

#include <cstdint>
#include <cstdio>
#include <cstdlib>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string problem = WholeWay(std::string_view(reinterpret_cast<const char*>(data), size));
    if (problem.empty()) return 0;
    std::fprintf(stderr, "%s\n", problem.c_str());
    std::abort();
}
