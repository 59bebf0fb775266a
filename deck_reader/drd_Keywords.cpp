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

std::span<const drd_ParameterRef> drd_ParameterRefs() {
    return kParameterRefs;
}

std::span<const drd_DataRef> drd_DataRefs(std::string_view folded) {
    static_assert(
        std::is_sorted(std::begin(kDataRefs), std::end(kDataRefs),
                       [](const drd_DataRef& a, const drd_DataRef& b) { return a.keyword < b.keyword; }));
    const auto [first, last] = std::equal_range(
        std::begin(kDataRefs), std::end(kDataRefs), drd_DataRef{folded, 0, 0, 0, NAME, Kind::NONE, ""},
        [](const drd_DataRef& a, const drd_DataRef& b) { return a.keyword < b.keyword; });
    return {first, last};
}
