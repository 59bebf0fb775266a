#ifndef QRX_DECK_READER_DRD_KEYWORDS_H
#define QRX_DECK_READER_DRD_KEYWORDS_H

#include <cstdint>
#include <span>
#include <string_view>

/// What a block of a deck is. Keywords outside all blocks stand in the model.
enum class drd_BlockEnm : std::uint8_t { MODEL, PART, INSTANCE, ASSEMBLY, STEP, LOAD_CASE };

/// Keywords that stand together below one that owns them.
enum class drd_GroupEnm : std::uint8_t {
    NONE,
    MATERIAL,
    INTERACTION,
    CONNECTOR,
    COUPLING,
    SECTION,
    CONTACT,
    OUTPUT
};

/// What names stand for.
enum class drd_KindEnm : std::uint8_t {
    NONE,
    PART,
    INSTANCE,
    STEP,
    LOAD_CASE,
    NODE_SET,
    ELEMENT_SET,
    SURFACE,
    MATERIAL,
    AMPLITUDE,
    ORIENTATION,
    INTERACTION,
    BEHAVIOR,
    CONTROLS,
    FILM_PROPERTY,
    IMPEDANCE,
    SPECTRUM,
    PSD,
    CAVITY,
    CONTACT_PAIR,
    CONSTRAINT,
    WAVE_PROPERTY,
    DERIVED
};
/// "node set", "material", ...
std::string_view drd_WordOf(drd_KindEnm kind);
/// "part", "load case", ...
std::string_view drd_WordOf(drd_BlockEnm block);

/// What is known of a keyword.
struct drd_KeywordRow {
    std::string_view name;
    std::uint8_t places; ///< one bit for each drd_BlockEnm
    std::uint8_t groups; ///< that it is an option of, one bit for each drd_GroupEnm
    drd_GroupEnm owns;
    drd_KindEnm defines;

    bool IsOptionOf(drd_GroupEnm group) const { return (groups >> static_cast<unsigned>(group) & 1U) != 0; }
    bool MayStandIn(drd_BlockEnm block) const { return (places >> static_cast<unsigned>(block) & 1U) != 0; }
};

/// All known keywords.
std::span<const drd_KeywordRow> drd_KeywordRows();
/// The row of a keyword in folded form (drd_FoldKey), or null.
const drd_KeywordRow* drd_FindKeyword(std::string_view folded);
/// The parameter that holds the name of what the keyword defines.
std::string_view drd_NameParameter(const drd_KeywordRow& row);

/// What the data lines of a keyword are: kept as they stand, as what they are or as text for people, or read
/// into arrays.
enum class drd_DataEnm : std::uint8_t { LINES, TEXT, NODES, ELEMENTS, NODE_SET, ELEMENT_SET };
drd_DataEnm drd_DataOf(std::string_view folded);

/// A keyword that begins or ends a block.
struct drd_BlockMark {
    std::string_view keyword; ///< folded
    drd_BlockEnm kind;
    bool ends;
};
/// Null for all other keywords.
const drd_BlockMark* drd_FindBlockMark(std::string_view folded);

/// A kind of thing that a field or a parameter may name. Both kinds of a set or a label are looked for where
/// a place takes either.
enum class drd_RefEnm : std::uint8_t {
    NAME,                ///< of `kind`
    NODES,               ///< a node set, or the label of a node
    ELEMENTS,            ///< an element set, or the label of an element
    SURFACE_OR_NODES,    ///< a surface, or a node set in its place
    ELEMENTS_OR_NODES,   ///< an element set or a node set, or a label
    NAME_UNLESS_NUMBER,  ///< of `kind`; a number is a number
    NODES_UNLESS_NUMBER, ///< a node set; a number is a number
};

/// A parameter that refers to something by name.
struct drd_ParameterRef {
    std::string_view keyword; ///< folded; "" for all
    std::string_view parameter;
    drd_RefEnm ref;
    drd_KindEnm kind;
};
/// The rows of a parameter, folded.
std::span<const drd_ParameterRef> drd_ParameterRefs(std::string_view parameter);
/// All of them.
std::span<const drd_ParameterRef> drd_ParameterRefs();

/// A column of data lines that refers to something by name.
struct drd_DataRef {
    std::string_view keyword; ///< folded
    int firstLine;            ///< from 0
    int lineStep;             ///< 0: that line alone; 1: it and all behind
    int column;               ///< from 0; -1: all
    drd_RefEnm ref;
    drd_KindEnm kind;
    std::string_view onlyWith; ///< a parameter that the keyword must have, or "name=value"; "" for none
};
/// The columns of a keyword.
std::span<const drd_DataRef> drd_DataRefs(std::string_view folded);

#endif
