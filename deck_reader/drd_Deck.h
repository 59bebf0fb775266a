#ifndef QRX_DECK_READER_DRD_DECK_H
#define QRX_DECK_READER_DRD_DECK_H

#include "deck_reader/drd_Finding.h"
#include "deck_reader/drd_Flat.h"
#include "deck_reader/drd_Keywords.h"
#include "deck_reader/drd_Rows.h"
#include "deck_reader/drd_Texts.h"

#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <vector>

/// A word of keyword lines as it is spelled, once for all lines that have it, with what is known of it: as a
/// keyword and as a parameter.
struct drd_Spelling {
    drd_Word name;                       ///< as it stands
    drd_Word key;                        ///< folded (drd_FoldKey)
    const drd_KeywordRow* row = nullptr; ///< null: no known keyword
    const drd_BlockMark* mark = nullptr; ///< null: begins and ends no block
    drd_DataEnm data = drd_DataEnm::LINES;
    std::span<const drd_DataRef> dataRefs;
    std::span<const drd_ParameterRef> parameterRefs;
};

/// A parameter of a keyword line.
struct drd_Parameter {
    const drd_Spelling* word;
    drd_Word value; ///< as it stands, quotes included, without blanks around it; null when there is none

    drd_Word Name() const { return word->name; }
    drd_Word Key() const { return word->key; }
    bool HasValue() const { return value.data() != nullptr; }
};

/// A line of text that is kept as it stands.
struct drd_Line {
    const char* text;
    std::uint32_t length;
    std::int32_t file;
    std::int64_t line;
};

/// A comment line, `**` included, behind so many data lines of the keyword ahead of it (-1: none).
struct drd_Comment {
    drd_Line text;
    int keyword;
    std::uint32_t linesAhead;
};

/// A keyword line with what belongs to it. Data of nodes, elements and sets are in the arrays of the mesh and
/// of the set, all other lines in drd_Deck::lines.
struct drd_Keyword {
    const drd_Spelling* word = nullptr;
    drd_Line header{}; ///< the keyword line as it stands, continuations included
    const drd_Parameter* firstParameter = nullptr;
    std::uint32_t parameterCount = 0;
    std::uint32_t lines = 0;
    std::uint64_t firstLine = 0;
    int block = 0;   ///< where it stands, index of drd_Deck::blocks
    int parent = -1; ///< the keyword that it is an option of
    int end = 0;     ///< one past the last of its options
    int set = -1;    ///< of a set: index of drd_Deck::setParts

    drd_Word Name() const { return word->name; }
    drd_Word Key() const { return word->key; }
    /// Null: unknown.
    const drd_KeywordRow* Row() const { return word->row; }
    drd_Place Place() const { return {header.file, static_cast<long>(header.line)}; }
    std::span<const drd_Parameter> Parameters() const { return {firstParameter, parameterCount}; }
    /// Whether the data are in the arrays of a mesh or of sets.
    bool IsBulk() const { return word->data > drd_DataEnm::TEXT; }
    /// Whether the data lines are text for people.
    bool HasText() const { return word->data == drd_DataEnm::TEXT; }

    const drd_Parameter* Find(std::string_view parameter) const;
    /// The value of a parameter as it stands; empty when there is none.
    std::string_view Value(std::string_view parameter) const;
};

/// Records from `first` on stand one behind the other, `stride` lines each.
struct drd_PlaceRun {
    std::uint64_t first;
    std::int64_t line;
    std::int32_t file;
    std::int32_t stride;
};

/// Elements of one keyword that have as many nodes each.
struct drd_ElementRun {
    std::uint64_t first; ///< index of drd_Mesh::elements
    std::uint64_t count;
    std::uint64_t firstNode; ///< index of drd_Mesh::connectivity
    int nodes;
    int type; ///< index of drd_Deck::types
    int keyword;
};

/// Nodes of one keyword.
struct drd_NodeRun {
    std::uint64_t first;
    std::uint64_t count;
    int keyword;
};

/// A mesh in flat arrays.
struct drd_Mesh {
    drd_Flat<int> nodes;          ///< labels
    drd_Flat<double> coordinates; ///< three a node
    drd_Flat<int> elements;       ///< labels
    drd_Flat<int> connectivity;   ///< node labels, element by element
    /// Empty, or for each entry of the connectivity the name of the instance that the node belongs to: index
    /// of drd_Deck::owners, -1 for a node of this mesh.
    drd_Flat<int> owners;
    std::vector<drd_ElementRun> elementRuns;
    std::vector<drd_NodeRun> nodeRuns;
    std::vector<drd_PlaceRun> nodePlaces;
    std::vector<drd_PlaceRun> elementPlaces;

    std::size_t Bytes() const {
        return nodes.Bytes() + coordinates.Bytes() + elements.Bytes() + connectivity.Bytes() + owners.Bytes();
    }
};
drd_Place drd_PlaceOf(const std::vector<drd_PlaceRun>& runs, std::uint64_t record);

/// What one keyword says of a set; a set may be said in several. Labels are listed, or in threes (first,
/// last, step) when they are generated.
struct drd_SetPart {
    drd_KindEnm kind = drd_KindEnm::NODE_SET;
    bool isGenerated = false;
    int keyword = -1; ///< -1 for none
    int block = 0;
    drd_Word name;           ///< without quotes
    drd_Word instance;       ///< without quotes; "": none
    std::uint64_t first = 0; ///< index of drd_Deck::labels
    std::uint64_t count = 0;
    std::span<const drd_Word> members; ///< names of sets, and labels of instances, as they stand
};

/// A part, an instance, the assembly, a step, a load case; block 0 is the model itself.
struct drd_Block {
    drd_BlockEnm kind = drd_BlockEnm::MODEL;
    drd_Word name; ///< without quotes
    int parent = -1;
    int begin = -1; ///< its keyword
    int end = -1;   ///< the keyword that ends it, -1 when there is none
    int last = -1;  ///< one past its last keyword
    int mesh = -1;  ///< index of drd_Deck::meshes
};

struct drd_File {
    std::string name;
    drd_Place includedAt{-1, 0};
};

/// A deck as it was read. Keywords stand in the order of the deck, includes in their place. They are plain
/// values: all that they have words and rows of lies in `texts`.
struct drd_Deck {
    std::vector<drd_File> files;
    drd_Rows<drd_Keyword> keywords;
    drd_Rows<drd_Block> blocks;
    std::vector<drd_Mesh> meshes;
    drd_Flat<int> definitions; ///< the keywords that define a name
    drd_Rows<drd_SetPart> setParts;
    std::vector<std::string> types;  ///< element types as they stand
    std::vector<std::string> owners; ///< names of instances, without quotes
    drd_Flat<int> labels;            ///< of sets
    drd_Flat<drd_Line> lines;
    drd_Flat<drd_Comment> comments;
    drd_Texts texts;

    std::string_view Text(const drd_Line& line) const { return {line.text, line.length}; }
    /// A data line of a keyword.
    std::string_view DataLine(const drd_Keyword& keyword, std::uint64_t line) const {
        return Text(lines[keyword.firstLine + line]);
    }
    drd_Place DataPlace(const drd_Keyword& keyword, std::uint64_t line) const {
        const drd_Line& data = lines[keyword.firstLine + line];
        return {data.file, static_cast<long>(data.line)};
    }
    const drd_Mesh* MeshOf(const drd_Block& block) const {
        return block.mesh < 0 ? nullptr : &meshes[static_cast<std::size_t>(block.mesh)];
    }
    const std::string& FileName(drd_Place place) const {
        return files[static_cast<std::size_t>(place.file)].name;
    }
};

/// Where an instance stands: first moved, then turned about the axis through `from` and `to`.
struct drd_Placement {
    double move[3] = {0.0, 0.0, 0.0};
    double from[3] = {0.0, 0.0, 0.0};
    double to[3] = {0.0, 0.0, 0.0};
    double degrees = 0.0;

    bool IsNone() const;
    /// The place of a point, and the direction of a vector.
    void Place(const double (&point)[3], double (&placed)[3]) const;
    void Turn(const double (&vector)[3], double (&turned)[3]) const;
};
/// The placement that the data lines of an instance give; false when they can't be read.
bool drd_PlacementOf(const drd_Deck& deck, const drd_Block& instance, drd_Placement& placement);

#endif
