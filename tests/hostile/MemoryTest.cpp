#include "hostile/Findings.h"

#include "model_file/mdf_ModelFile.h"

#include <atomic>
#include <cstdlib>
#include <new>

namespace {

std::atomic<std::size_t> requested{0};
std::atomic<std::size_t> largest{0};

void* Allocate(std::size_t bytes) {
    requested += bytes;
    if (bytes > largest) largest = bytes;
    if (void* memory = std::malloc(bytes == 0 ? 1 : bytes)) return memory;
    throw std::bad_alloc();
}

} // namespace

void* operator new(std::size_t bytes) {
    return Allocate(bytes);
}

// The library's own would be the sanitizer's, whose memory free() mustn't get.
void* operator new(std::size_t bytes, const std::nothrow_t&) noexcept {
    try {
        return Allocate(bytes);
    } catch (const std::bad_alloc&) {
        return nullptr;
    }
}

void operator delete(void* memory) noexcept {
    std::free(memory);
}

void operator delete(void* memory, std::size_t) noexcept {
    std::free(memory);
}

namespace {

class HostileMemory : public testing::TestWithParam<FindingCase> {};

const std::string wildRange = R"({"from": 1, "to": 2147483647})";
const std::string oneNode = R"("nodes": {"labels": [1], "coordinates": [[0, 0, 0]]})";

std::string Rows(std::size_t columns, std::size_t rows) {
    std::string text = "[[0";
    for (std::size_t i = 1; i < columns; ++i) text += ",0";
    text += "]";
    for (std::size_t i = 1; i < rows; ++i) text += ",[]";
    return text + "]";
}

std::string Repeated(const char* piece, int times) {
    std::string text;
    for (int i = 0; i < times; ++i) text += piece;
    return text;
}

const FindingCase memoryCases[] = {
    {"RangeOfNodes", Mesh(R"("nodes": {"labels": )" + wildRange + R"(, "coordinates": []})"), {}},
    {"RangeOfElements",
     Mesh(oneNode + R"(, "elements": [{"type": "MASS", "labels": )" + wildRange +
          R"(, "connectivity": [[1]]}])"),
     {}},
    {"RangeInANodeSet",
     Mesh(oneNode + R"(, "sets": [{"name": "A", "kind": "node", "labels": )" + wildRange + "}]"),
     {}},
    {"RangeInAnElementSet",
     Mesh(R"("sets": [{"name": "A", "kind": "element", "labels": )" + wildRange + "}]"),
     {}},
    {"RangeInAnAssemblySet",
     Whole(R"("sets": [{"name": "A", "kind": "node", "members": [{"instance": "I", "labels": )" + wildRange +
           "}]}]"),
     {}},
    {"RangeInAnAssemblySetOfNoInstance",
     Whole(R"("sets": [{"name": "A", "kind": "node", "members": [{"instance": "X", "labels": )" + wildRange +
           "}]}]"),
     {}},
    {"RangeInTheAssemblysOwnMesh",
     Whole(R"("sets": [{"name": "A", "kind": "node", "members": [{"labels": )" + wildRange + "}]}]"),
     {}},
    {"LabelsFarApart",
     Mesh(R"("nodes": {"labels": [1, 2147483647], "coordinates": [[0, 0, 0], [0, 0, 0]]})"),
     {}},
    {"TableOfOneLongRowAndManyEmptyOnes",
     Model(R"("timePoints": {"T": {"points": )" + Rows(20000, 20000) + "}}"),
     {}},
    {"ConnectivityOfOneLongRowAndManyEmptyOnes",
     Mesh(oneNode + R"(, "elements": [{"type": "X", "labels": {"from": 1, "to": 20000}, "connectivity": )" +
          Rows(20000, 20000) + "}]"),
     {}},
    {"ManySectors",
     Model(R"("cyclicSymmetry": {"symmetryType": "CYCLIC", "numberOfSectors": 2147483647})"),
     {}},
    {"EmptyObjects", Model(R"("datums": [{})" + Repeated(",{}", 20000) + "]"), {}},
    {"RowsThatTurnGeneral", Model(R"("datums": [[1])" + Repeated(",[1]", 20000) + ",null]"), {}},
    {"UnknownMembers", Model(R"("a": 1)" + Repeated(R"(,"a":1)", 20000)), {}},
};

} // namespace

TEST_P(HostileMemory, SmallFile_WithHugeClaims_TakesMemoryByItsSize) {
    const std::string& text = GetParam().text;
    const std::size_t budget = 2'000'000 + 1000 * text.size();
    largest = 0;
    const std::size_t before = requested;
    mdf_Report report;
    mdf_ReadModelText(text, "m.json", report);
    EXPECT_LT(requested - before, budget);
    EXPECT_LT(largest, 1'000'000 + 50 * text.size());
}

INSTANTIATE_TEST_SUITE_P(Cases, HostileMemory, testing::ValuesIn(memoryCases), FindingCaseName);
