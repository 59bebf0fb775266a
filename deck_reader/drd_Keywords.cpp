#include "deck_reader/drd_Keywords.h"

#include "deck_reader/drd_Text.h"
#include "deck_reader/drd_TextMap.h"

#include <algorithm>
#include <array>
#include <string>

namespace {

constexpr std::uint8_t Bit(drd_BlockEnm block) {
    return static_cast<std::uint8_t>(1U << static_cast<unsigned>(block));
}
constexpr std::uint8_t MODEL = Bit(drd_BlockEnm::MODEL);
constexpr std::uint8_t PART = Bit(drd_BlockEnm::PART);
constexpr std::uint8_t INST = Bit(drd_BlockEnm::INSTANCE);
constexpr std::uint8_t ASSY = Bit(drd_BlockEnm::ASSEMBLY);
constexpr std::uint8_t STEP = Bit(drd_BlockEnm::STEP);
constexpr std::uint8_t CASE = Bit(drd_BlockEnm::LOAD_CASE);
/// Where a mesh may be.
constexpr std::uint8_t MESH = MODEL | PART | INST | ASSY;
constexpr std::uint8_t ANY = MESH | STEP | CASE;

constexpr std::uint8_t Bit(drd_GroupEnm group) {
    return static_cast<std::uint8_t>(1U << static_cast<unsigned>(group));
}
constexpr std::uint8_t MATERIAL = Bit(drd_GroupEnm::MATERIAL);
constexpr std::uint8_t INTERACTION = Bit(drd_GroupEnm::INTERACTION);
constexpr std::uint8_t CONNECTOR = Bit(drd_GroupEnm::CONNECTOR);
constexpr std::uint8_t COUPLING = Bit(drd_GroupEnm::COUPLING);
constexpr std::uint8_t SECTION = Bit(drd_GroupEnm::SECTION);
constexpr std::uint8_t CONTACT = Bit(drd_GroupEnm::CONTACT);
constexpr std::uint8_t OUTPUT = Bit(drd_GroupEnm::OUTPUT);

using Owns = drd_GroupEnm;
using Kind = drd_KindEnm;

constexpr drd_KeywordRow kRows[] = {
#include "deck_reader/drd_Keywords.inl"
};

using enum drd_RefEnm;

constexpr drd_ParameterRef kParameterRefs[] = {
#include "deck_reader/drd_ParameterRefs.inl"
};

constexpr drd_BlockMark kBlockMarks[] = {
    {"part", drd_BlockEnm::PART, false},          {"endpart", drd_BlockEnm::PART, true},
    {"instance", drd_BlockEnm::INSTANCE, false},  {"endinstance", drd_BlockEnm::INSTANCE, true},
    {"assembly", drd_BlockEnm::ASSEMBLY, false},  {"endassembly", drd_BlockEnm::ASSEMBLY, true},
    {"step", drd_BlockEnm::STEP, false},          {"endstep", drd_BlockEnm::STEP, true},
    {"loadcase", drd_BlockEnm::LOAD_CASE, false}, {"endloadcase", drd_BlockEnm::LOAD_CASE, true},
};

constexpr drd_DataRef kDataRefs[] = {
#include "deck_reader/drd_DataRefs.inl"
};

constexpr std::array<std::string_view, 23> kKindWords = {"",
                                                         "part",
                                                         "instance",
                                                         "step",
                                                         "load case",
                                                         "node set",
                                                         "element set",
                                                         "surface",
                                                         "material",
                                                         "amplitude",
                                                         "orientation",
                                                         "surface interaction",
                                                         "connector behavior",
                                                         "section controls",
                                                         "film property",
                                                         "impedance property",
                                                         "spectrum",
                                                         "psd definition",
                                                         "cavity",
                                                         "contact pair",
                                                         "constraint",
                                                         "wave property",
                                                         "derived component"};
static_assert(kKindWords.size() == static_cast<std::size_t>(Kind::DERIVED) + 1);

constexpr std::array<std::string_view, 6> kBlockWords = {"model",    "Part", "Instance",
                                                         "Assembly", "Step", "Load Case"};

/// The rows with the word in the column that a table is ordered by.
template <class Row, std::size_t N>
std::span<const Row> RowsOf(const Row (&rows)[N], std::string_view Row::*column, std::string_view word) {
    const auto first = std::lower_bound(
        rows, rows + N, word, [column](const Row& row, std::string_view w) { return row.*column < w; });
    const auto last = std::upper_bound(
        first, rows + N, word, [column](std::string_view w, const Row& row) { return w < row.*column; });
    return {first, last};
}

template <class Row, std::size_t N>
constexpr bool IsOrdered(const Row (&rows)[N], std::string_view Row::*column) {
    return std::is_sorted(rows, rows + N,
                          [column](const Row& a, const Row& b) { return a.*column < b.*column; });
}
static_assert(IsOrdered(kParameterRefs, &drd_ParameterRef::parameter));
static_assert(IsOrdered(kDataRefs, &drd_DataRef::keyword));

} // namespace

std::string_view drd_WordOf(drd_KindEnm kind) {
    return kKindWords[static_cast<std::size_t>(kind)];
}

std::string_view drd_WordOf(drd_BlockEnm block) {
    return kBlockWords[static_cast<std::size_t>(block)];
}

std::span<const drd_KeywordRow> drd_KeywordRows() {
    return kRows;
}

const drd_KeywordRow* drd_FindKeyword(std::string_view folded) {
    static const auto kIndex = [] {
        drd_TextMap index;
        int place = 0;
        for (const drd_KeywordRow& row : kRows) index.TryEmplace(drd_FoldKey(row.name), place++);
        return index;
    }();
    const int* found = kIndex.Find(folded);
    return found == nullptr ? nullptr : &kRows[*found];
}

std::string_view drd_NameParameter(const drd_KeywordRow& row) {
    return row.defines == Kind::CONTACT_PAIR ? "cpset" : "name";
}

drd_DataEnm drd_DataOf(std::string_view folded) {
    if (folded == "heading" || folded == "step") return drd_DataEnm::TEXT;
    if (folded == "node") return drd_DataEnm::NODES;
    if (folded == "element") return drd_DataEnm::ELEMENTS;
    if (folded == "nset") return drd_DataEnm::NODE_SET;
    return folded == "elset" ? drd_DataEnm::ELEMENT_SET : drd_DataEnm::LINES;
}

const drd_BlockMark* drd_FindBlockMark(std::string_view folded) {
    const auto found = std::find_if(std::begin(kBlockMarks), std::end(kBlockMarks),
                                    [folded](const drd_BlockMark& mark) { return mark.keyword == folded; });
    return found == std::end(kBlockMarks) ? nullptr : &*found;
}

std::span<const drd_ParameterRef> drd_ParameterRefs() {
    return kParameterRefs;
}

std::span<const drd_ParameterRef> drd_ParameterRefs(std::string_view parameter) {
    return RowsOf(kParameterRefs, &drd_ParameterRef::parameter, parameter);
}

std::span<const drd_DataRef> drd_DataRefs(std::string_view folded) {
    return RowsOf(kDataRefs, &drd_DataRef::keyword, folded);
}
