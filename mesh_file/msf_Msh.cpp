#include "foundation/thr_InOrder.h"
#include "mesh_file/msf_Builder.h"
#include "mesh_file/msf_Readers.h"

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <exception>
#include <set>
#include <unordered_map>

namespace {

constexpr const char* kEntityWords[] = {"POINT", "CURVE", "SURFACE", "VOLUME"};

/// What both versions of the format have in common: the head, the sections, and the names of groups.
class MshReader {
public:
    MshReader(std::string_view bytes, const msf_Options& options, msf_Mesh& mesh)
        : at_(bytes), builder_(mesh, options) {}

    void Read();

protected:
    using Entity = std::pair<int, int>; // dimension and number

    // Numbers, whichever way they are written.
    int Int(const char* expected) {
        if (binary_) return at_.Raw<std::int32_t>(expected);
        const long long value = at_.Int(expected);
        if (value != static_cast<int>(value)) at_.FailAtWord("found " + std::to_string(value), expected);
        return static_cast<int>(value);
    }
    double Real(const char* expected) { return binary_ ? at_.Raw<double>(expected) : at_.Real(expected); }
    long long Size(const char* expected) {
        return binary_ ? static_cast<long long>(at_.Raw<std::uint64_t>(expected)) : at_.Int(expected);
    }
    std::size_t Count(const char* things, std::size_t bytesEach) {
        const std::string expected = std::string("the number of ") + things;
        return at_.Count(Size(expected.c_str()), things, bytesEach);
    }

    void ReadHead();
    void ReadSection(std::string_view name);
    void SkipSection(const std::string& name);
    void EndSection(const std::string& name);
    void ReadNames();
    std::string NameOfGroup(Entity group);
    const msf_NodeOrder& OrderOf(int code);
    int Dimension(const char* expected);
    void RequireNodes();
    void FinishNames();

    // Version 4.1.
    struct Points { // raw coordinates of a block of nodes
        msf_Cursor at;
        const char* raw;
        std::size_t reals;
        std::size_t count;
    };
    void ReadEntities();
    void ReadNodes4();
    void ReadNodesOfBlock(std::size_t count, std::size_t reals);
    void ReserveCells4(std::size_t blocks);
    void ReadPointsAndCells4();
    void ReadCells4();
    void ReadCellsOfBlock(const msf_NodeOrder& order, std::size_t count);
    // Version 2.2.
    struct Piece { // cells of one block, physical group and entity
        msf_Run run;
        int physical;
        int entity;
    };
    void ReadNodes2();
    void ReadCells2();
    void ReadCell2(const msf_NodeOrder& order, int tags);
    void AddPiece(int block, int place, int physical, int entity);
    void MergeRepeated();
    void MergeRepeatedOf(int block, const std::set<Entity>& inSeveral);

    msf_Cursor at_;
    msf_Builder builder_;
    bool binary_ = false;
    bool isFour_ = true;
    bool hasNodes_ = false;
    bool hasCells_ = false;
    std::map<Entity, std::string> names_;
    std::set<Entity> usedNames_;
    std::set<Entity> nameless_;
    std::map<Entity, std::vector<int>> groupsOfEntity_;
    std::vector<int> row_;
    std::vector<int> tags_;
    std::vector<Points> points_;
    std::vector<Piece> pieces_;
    long long numParametric_ = 0;
};

void MshReader::Read() {
    ReadHead();
    for (std::string_view line = at_.NextLine(); !line.empty(); line = at_.NextLine()) {
        if (line.front() != '$') at_.FailAtWord("found " + msf_Shown(line), "a section such as $Nodes");
        ReadSection(line.substr(1));
    }
    RequireNodes();
    if (!hasCells_) at_.Fail("found no section $Elements", "one");
    if (!isFour_) MergeRepeated();
    builder_.FinishCells(at_);
    FinishNames();
}

void MshReader::ReadHead() {
    if (at_.NextLine() != "$MeshFormat") at_.FailAtWord("found another section", "$MeshFormat");
    const std::string_view version = at_.Word("the version of the format");
    isFour_ = version == "4.1";
    if (!isFour_ && version != "2.2" && version != "2.1" && version != "2") {
        at_.FailAtWord("found version " + msf_Shown(version),
                       "version 4.1 or 2.2: save the mesh as one of them");
    }
    const long long kind = at_.Int("0 for ASCII or 1 for binary");
    const long long size = at_.Int("the size of a number in bytes");
    binary_ = kind == 1;
    if (kind != 0 && kind != 1)
        at_.FailAtWord("found a file of kind " + std::to_string(kind), "0 (ASCII) or 1 (binary)");
    if (size != 8) at_.FailAtWord("found numbers of " + std::to_string(size) + " bytes", "8");
    at_.Line();
    if (binary_) {
        at_.SayOffsets();
        if (at_.Raw<std::int32_t>("the number 1") != 1)
            at_.FailAtWord("found numbers in big-endian order", "little-endian");
    }
    EndSection("MeshFormat");
    builder_.Mesh().format =
        std::string("MSH ") + (isFour_ ? "4.1, " : "2.2, ") + (binary_ ? "binary" : "ASCII");
}

void MshReader::ReadSection(std::string_view section) {
    const std::string name(section);
    if (name == "PhysicalNames") {
        ReadNames();
    } else if (name == "Entities" && isFour_) {
        ReadEntities();
    } else if (name == "Nodes") {
        if (hasNodes_) at_.FailAtWord("found a second section $Nodes", "one");
        hasNodes_ = true;
        isFour_ ? ReadNodes4() : ReadNodes2();
    } else if (name == "Elements") {
        if (hasCells_) at_.FailAtWord("found a second section $Elements", "one");
        RequireNodes();
        hasCells_ = true;
        isFour_ ? ReadPointsAndCells4() : ReadCells2();
    } else if (name == "PartitionedEntities" || name == "GhostElements") {
        at_.FailAtWord("found a section $" + name, "a mesh in one piece, without partitions and ghost cells");
    } else {
        SkipSection(name);
        return;
    }
    EndSection(name);
}

void MshReader::SkipSection(const std::string& name) {
    const std::string end = "$End" + name;
    const std::size_t place = at_.Rest().find(end);
    if (place == std::string_view::npos)
        at_.Fail("found no end of section " + msf_Shown("$" + name), "'" + end + "'");
    at_.MoveTo(at_.At() + place + end.size());
}

void MshReader::EndSection(const std::string& name) {
    const std::string_view line = at_.NextLine();
    if (line == "$End" + name) return;
    at_.FailAtWord("found " + (line.empty() ? "the end of the file" : msf_Shown(line)), "$End" + name);
}

void MshReader::ReadNames() {
    const std::size_t count = at_.Count("names", 4);
    for (std::size_t i = 0; i < count; ++i) {
        const long long dimension = at_.Int("the dimension of a group");
        const long long number = at_.Int("the number of a group");
        if (dimension < 0 || dimension > 3)
            at_.FailAtWord("found dimension " + std::to_string(dimension), "0 to 3");
        const std::string_view line = at_.Line();
        const std::size_t first = line.find('"');
        const std::size_t last = line.rfind('"');
        if (first == last) at_.FailAtWord("found " + msf_Shown(line), "a name in double quotes");
        names_[{static_cast<int>(dimension), static_cast<int>(number)}] =
            msf_Builder::NameOf(line.substr(first + 1, last - first - 1));
    }
}

std::string MshReader::NameOfGroup(Entity group) {
    const auto named = names_.find(group);
    if (named != names_.end() && !named->second.empty()) {
        usedNames_.insert(group);
        return named->second;
    }
    nameless_.insert(group);
    return std::string(kEntityWords[group.first]) + "_" + std::to_string(group.second);
}

void MshReader::FinishNames() {
    const auto count = static_cast<long long>(nameless_.size());
    if (count > 0) {
        const auto& [dimension, number] = *nameless_.begin();
        builder_.Note(msf_Counted(count, "group") + " without a name got one by kind and number, such as " +
                      kEntityWords[dimension] + "_" + std::to_string(number));
    }
    for (const auto& [group, name] : names_) {
        if (!usedNames_.contains(group))
            builder_.Note("group " + msf_Shown(name) + " has no cells and was left out");
    }
    if (numParametric_ > 0)
        builder_.Note("the parametric coordinates of " + msf_Counted(numParametric_, "node") +
                      " were left out");
}

const msf_NodeOrder& MshReader::OrderOf(int code) {
    const msf_NodeOrder* order = msf_FindNodeOrder(msf_FormatEnm::MSH, code);
    if (order == nullptr) {
        at_.FailAtWord(
            "found elements of type " + std::to_string(code),
            "points, lines, triangles, quadrangles, tetrahedra, hexahedra, prisms or pyramids of first or "
            "second order");
    }
    return *order;
}

int MshReader::Dimension(const char* expected) {
    const int dimension = Int(expected);
    if (dimension < 0 || dimension > 3)
        at_.FailAtWord("found dimension " + std::to_string(dimension), "0 to 3");
    return dimension;
}

void MshReader::RequireNodes() {
    if (!hasNodes_) at_.Fail("found no section $Nodes before the elements", "one");
}

void MshReader::ReadEntities() {
    std::size_t counts[4];
    for (std::size_t& count : counts) count = Count("entities", 4);
    for (int dimension = 0; dimension < 4; ++dimension) {
        for (std::size_t i = 0; i < counts[dimension]; ++i) {
            const int number = Int("the number of an entity");
            const int box = dimension == 0 ? 3 : 6;
            for (int j = 0; j < box; ++j) Real("a coordinate of an entity");
            std::vector<int>& groups = groupsOfEntity_[{dimension, number}];
            const std::size_t groupCount = Count("groups of an entity", 2);
            // A group of reversed entities has a negative number.
            for (std::size_t j = 0; j < groupCount; ++j)
                groups.push_back(std::abs(Int("the number of a group")));
            std::sort(groups.begin(), groups.end());
            groups.erase(std::unique(groups.begin(), groups.end()), groups.end());
            if (dimension == 0) continue;
            const std::size_t bounds = Count("bounding entities", 2);
            for (std::size_t j = 0; j < bounds; ++j) Int("the number of a bounding entity");
        }
    }
}

void MshReader::ReadNodes4() {
    const std::size_t blocks = Count("blocks of nodes", 4);
    const std::size_t total = Count("nodes", binary_ ? 32 : 8);
    Size("the least label of a node");
    Size("the largest label of a node");
    builder_.ReserveNodes(total);
    for (std::size_t i = 0; i < blocks; ++i) {
        const int dimension = Dimension("the dimension of an entity");
        Int("the number of an entity");
        const bool parametric = Int("0, or 1 for parametric coordinates") != 0;
        const std::size_t reals = parametric ? 3 + static_cast<std::size_t>(dimension) : 3;
        const std::size_t count = Count("nodes", binary_ ? 8 + 8 * reals : 8);
        if (parametric && dimension > 0) numParametric_ += static_cast<long long>(count);
        ReadNodesOfBlock(count, reals);
    }
    const auto found = static_cast<std::size_t>(builder_.Mesh().NumNodes());
    if (found != total)
        at_.FailAtWord("found " + msf_Counted(static_cast<long long>(found), "node"),
                       std::to_string(total) + ", as the section begins");
    builder_.FinishNodes(at_);
}

void MshReader::ReadNodesOfBlock(std::size_t count, std::size_t reals) {
    if (binary_) {
        const char* const labels = at_.Take(8 * count, "labels of nodes");
        builder_.AddNodeLabels(at_, labels, count);
        const char* const raw = at_.Take(8 * reals * count, "coordinates of nodes");
        points_.push_back({at_, raw, reals, count});
        return;
    }
    std::vector<int> labels(count);
    for (int& label : labels) label = msf_Builder::Label(at_, at_.Int("the label of a node"), "a node");
    for (const int label : labels) {
        double point[3];
        for (double& value : point) value = at_.Real("a coordinate");
        for (std::size_t i = 3; i < reals; ++i) at_.Real("a parametric coordinate");
        builder_.AddNode(at_, label, point[0], point[1], point[2]);
    }
}

/// Looks ahead, so that no array is made twice as large as needed.
void MshReader::ReserveCells4(std::size_t blocks) {
    const std::size_t begin = at_.At();
    std::array<std::size_t, cel_kKinds> counts{};
    for (std::size_t i = 0; i < blocks; ++i) {
        at_.Take(8, "the entity of a block");
        const msf_NodeOrder& order = OrderOf(Int("a type of elements"));
        const std::size_t bytes = 8 * (1 + static_cast<std::size_t>(order.nodes));
        const std::size_t count = Count("elements", bytes);
        counts[static_cast<std::size_t>(order.kind)] += count;
        at_.Take(bytes * count, "elements");
    }
    at_.MoveTo(begin);
    for (std::size_t kind = 0; kind < counts.size(); ++kind) {
        if (counts[kind] == 0) continue;
        const int place = builder_.BlockOf(static_cast<cel_KindEnm>(kind));
        msf_Block& block = builder_.Mesh().blocks[static_cast<std::size_t>(place)];
        block.labels.reserve(counts[kind]);
        block.nodes.reserve(counts[kind] * static_cast<std::size_t>(block.Width()));
    }
}

/// They fill different arrays, which takes most of the time: so two threads do it.
void MshReader::ReadPointsAndCells4() {
    constexpr int kFewNodes = 10000;
    std::exception_ptr ofPoints;
    const auto read = [&](std::size_t task) {
        if (task == 1) {
            ReadCells4();
            return;
        }
        try {
            for (const Points& points : points_)
                builder_.AddCoordinates(points.at, points.raw, points.reals, points.count);
        } catch (...) {
            ofPoints = std::current_exception();
        }
    };
    try {
        thr_ForEach(builder_.Mesh().NumNodes() < kFewNodes ? 1 : thr_NumThreads(0), 2, read);
    } catch (...) {
        // What stands first in the file is told.
        if (!ofPoints) throw;
    }
    if (ofPoints) std::rethrow_exception(ofPoints);
}

void MshReader::ReadCells4() {
    const std::size_t blocks = Count("blocks of elements", 4);
    const std::size_t total = Count("elements", binary_ ? 16 : 4);
    Size("the least label of an element");
    Size("the largest label of an element");
    if (binary_) ReserveCells4(blocks);
    std::size_t found = 0;
    for (std::size_t i = 0; i < blocks; ++i) {
        const int dimension = Dimension("the dimension of an entity");
        const int entity = Int("the number of an entity");
        const msf_NodeOrder& order = OrderOf(Int("a type of elements"));
        const auto width = static_cast<std::size_t>(order.nodes);
        const std::size_t count = Count("elements", binary_ ? 8 * (1 + width) : 2 * (1 + width));
        found += count;
        if (cel_CellOf(order.kind).dimension != dimension) {
            at_.FailAtWord("found elements of another dimension than their entity's",
                           std::to_string(dimension));
        }
        const int block = builder_.BlockOf(order.kind);
        const int begin = builder_.Mesh().blocks[static_cast<std::size_t>(block)].NumCells();
        ReadCellsOfBlock(order, count);
        for (const int group : groupsOfEntity_[{dimension, entity}]) {
            msf_Builder::AddRun(builder_.Group(NameOfGroup({dimension, group}), dimension), block, begin,
                                begin + static_cast<int>(count));
        }
    }
    if (found != total)
        at_.FailAtWord("found " + msf_Counted(static_cast<long long>(found), "element"),
                       std::to_string(total) + ", as the section begins");
}

void MshReader::ReadCellsOfBlock(const msf_NodeOrder& order, std::size_t count) {
    const auto width = static_cast<std::size_t>(order.nodes);
    row_.resize(width);
    if (!binary_) {
        for (std::size_t i = 0; i < count; ++i) {
            const long long label = at_.Int("the label of an element");
            for (int& node : row_) node = builder_.Node(at_, at_.Int("the label of a node"));
            builder_.AddCell(at_, order, label, row_.data());
        }
        return;
    }
    builder_.AddCells(at_, order, at_.Take(8 * (1 + width) * count, "elements"), count);
}

void MshReader::ReadNodes2() {
    const std::size_t count = at_.Count("nodes", binary_ ? 28 : 8);
    if (binary_) at_.Line();
    builder_.ReserveNodes(count);
    for (std::size_t i = 0; i < count; ++i) {
        const int label = Int("the label of a node");
        double point[3];
        for (double& value : point) value = Real("a coordinate");
        builder_.AddNode(at_, label, point[0], point[1], point[2]);
    }
    builder_.FinishNodes(at_);
}

void MshReader::ReadCells2() {
    const std::size_t total = at_.Count("elements", 4);
    if (binary_) at_.Line();
    for (std::size_t found = 0; found < total;) {
        if (!binary_) {
            row_.resize(1);
            const long long label = at_.Int("the label of an element");
            const msf_NodeOrder& order = OrderOf(Int("a type of elements"));
            const int tags = Int("the number of tags");
            tags_.assign(1, msf_Builder::Label(at_, label, "an element"));
            ReadCell2(order, tags);
            ++found;
            continue;
        }
        const msf_NodeOrder& order = OrderOf(Int("a type of elements"));
        const int count = Int("the number of elements");
        const int tags = Int("the number of tags");
        if (count < 1 || static_cast<std::size_t>(count) > total - found) {
            at_.FailAtWord("found a block of " + std::to_string(count) + " elements",
                           "at most " + std::to_string(total - found));
        }
        for (int i = 0; i < count; ++i) {
            tags_.assign(1, msf_Builder::Label(at_, Int("the label of an element"), "an element"));
            ReadCell2(order, tags);
        }
        found += static_cast<std::size_t>(count);
    }
}

/// The rest of a cell whose label is read: tags and nodes.
void MshReader::ReadCell2(const msf_NodeOrder& order, int tags) {
    if (tags < 0 || tags > 1000) at_.FailAtWord("found " + std::to_string(tags) + " tags", "a few");
    int physical = 0;
    int entity = 0;
    for (int i = 0; i < tags; ++i) {
        const int tag = Int("a tag of an element");
        if (i == 0) physical = std::abs(tag);
        if (i == 1) entity = tag;
        if (i == 2 && tag > 0)
            at_.FailAtWord("found an element in a partition",
                           "a mesh in one piece, without partitions and ghost cells");
    }
    row_.resize(static_cast<std::size_t>(order.nodes));
    for (int& node : row_) node = builder_.Node(at_, Int("the label of a node"));
    const int place = builder_.AddCell(at_, order, tags_.front(), row_.data());
    AddPiece(builder_.BlockOf(order.kind), place, physical, entity);
}

void MshReader::AddPiece(int block, int place, int physical, int entity) {
    if (!pieces_.empty()) {
        Piece& last = pieces_.back();
        if (last.run.block == block && last.run.end == place && last.physical == physical &&
            last.entity == entity) {
            last.run.end = place + 1;
            return;
        }
    }
    pieces_.push_back({{block, place, place + 1}, physical, entity});
}

/// An element that is in two groups is stored twice, under two labels: one element in two sets.
void MshReader::MergeRepeated() {
    std::map<Entity, std::set<int>> groups;
    const auto& blocks = builder_.Mesh().blocks;
    const auto dimensionOf = [&](int block) {
        return cel_CellOf(blocks[static_cast<std::size_t>(block)].kind).dimension;
    };
    for (const Piece& piece : pieces_)
        groups[{dimensionOf(piece.run.block), piece.entity}].insert(piece.physical);
    std::set<Entity> inSeveral;
    for (const auto& [entity, physicals] : groups) {
        if (physicals.size() > 1) inSeveral.insert(entity);
    }
    // Groups take the places of the blocks as they will be.
    const auto numBlocks = static_cast<int>(blocks.size());
    for (int block = 0; block < numBlocks; ++block) MergeRepeatedOf(block, inSeveral);
}

void MshReader::MergeRepeatedOf(int blockPlace, const std::set<Entity>& inSeveral) {
    msf_Block& block = builder_.Mesh().blocks[static_cast<std::size_t>(blockPlace)];
    const int dimension = cel_CellOf(block.kind).dimension;
    const auto width = static_cast<std::size_t>(block.Width());
    const auto rowOf = [&](int cell) {
        return std::string_view(reinterpret_cast<const char*>(block.Row(cell)), width * sizeof(int));
    };
    std::unordered_map<std::string_view, int> seen;
    int kept = 0;
    for (const Piece& piece : pieces_) {
        if (piece.run.block != blockPlace) continue;
        const bool mayRepeat = inSeveral.contains({dimension, piece.entity});
        for (int cell = piece.run.begin; cell < piece.run.end; ++cell) {
            int place = kept;
            // Rows move to lower places only, and the views in the map are of rows that were moved already.
            std::copy_n(block.Row(cell), width,
                        block.nodes.begin() +
                            static_cast<std::ptrdiff_t>(static_cast<std::size_t>(kept) * width));
            block.labels[static_cast<std::size_t>(kept)] = block.labels[static_cast<std::size_t>(cell)];
            if (mayRepeat) place = seen.try_emplace(rowOf(kept), kept).first->second;
            if (place == kept) ++kept;
            if (piece.physical != 0)
                builder_.AddRun(builder_.Group(NameOfGroup({dimension, piece.physical}), dimension),
                                blockPlace, place, place + 1);
        }
    }
    const int merged = block.NumCells() - kept;
    block.labels.resize(static_cast<std::size_t>(kept));
    block.nodes.resize(static_cast<std::size_t>(kept) * width);
    if (merged > 0) {
        builder_.Note(msf_Counted(merged, "repeated cell") + " of kind " +
                      std::string(cel_CellOf(block.kind).name) +
                      " were merged, each stored once for every group it is in");
    }
}

} // namespace

bool msf_IsMsh(std::string_view bytes) {
    return bytes.starts_with("$MeshFormat");
}

void msf_ReadMsh(const msf_Input& input, const msf_Options& options, msf_Mesh& mesh) {
    MshReader(input.bytes, options, mesh).Read();
}
