#ifndef QRX_MESH_FILE_MSF_BUILDER_H
#define QRX_MESH_FILE_MSF_BUILDER_H

#include "foundation/cel_LabelIndex.h"
#include "mesh_file/msf_Cursor.h"
#include "mesh_file/msf_Mesh.h"
#include "mesh_file/msf_NodeOrder.h"

#include <array>
#include <cmath>
#include <limits>
#include <map>

/// What readers fill a mesh with: nodes first, then cells, whose nodes are found by label, then groups.
class msf_Builder {
public:
    msf_Builder(msf_Mesh& mesh, const msf_Options& options) : mesh_(mesh), scale_(options.scale) {
        blockOf_.fill(-1);
    }

    msf_Mesh& Mesh() { return mesh_; }

    void ReserveNodes(std::size_t count);
    /// Fails at the cursor's place for labels beyond 1 ... 2^31 - 1 and coordinates beyond single precision.
    void AddNode(const msf_Cursor& at, long long label, double x, double y, double z);
    /// The same in two goes: raw labels (64 bits) first, then as many rows of `reals` doubles, of which the
    /// first three are coordinates. These may be added while another thread adds cells.
    void AddNodeLabels(const msf_Cursor& at, const char* raw, std::size_t count);
    void AddCoordinates(const msf_Cursor& at, const char* raw, std::size_t reals, std::size_t count);
    /// To be called when all nodes are there.
    void FinishNodes(const msf_Cursor& at);
    int FindNode(long long label) const { return nodes_.Find(label); }
    /// The place of a node, or a failure at the cursor's place.
    int Node(const msf_Cursor& at, long long label) const {
        const int place = nodes_.Find(label);
        if (place < 0) FailNoNode(at, label);
        return place;
    }

    /// The place of the block of a kind, made when it is first asked for.
    int BlockOf(cel_KindEnm kind);
    /// Adds a cell whose row of places stands in the file's order; gives its place in the block.
    int AddCell(const msf_Cursor& at, const msf_NodeOrder& order, long long label, const int* fileRow);
    /// Adds the cells of a kind whose rows of raw numbers (64 bits) follow each other: a label, and the
    /// labels of the nodes in the file's order.
    void AddCells(const msf_Cursor& at, const msf_NodeOrder& order, const char* rows, std::size_t count);
    /// Fails when a label of a cell stands twice; for formats with one numbering of all cells.
    void FinishCells(const msf_Cursor& at);
    /// The cell of a label, after FinishCells; false when there is none.
    bool FindCell(long long label, int& block, int& place) const;

    /// The group of that name and dimension, made when it is first asked for.
    msf_Group& Group(const std::string& name, int dimension);
    /// Appends cells; those that follow the last ones lengthen their run.
    static void AddRun(msf_Group& group, int block, int begin, int end);
    /// Puts a cell into the group of that name and of the cell's dimension.
    void AddToGroup(const std::string& name, int block, int place);

    /// The label, or a failure at the cursor's place.
    static int Label(const msf_Cursor& at, long long label, const char* thing) {
        if (label < 1 || label > std::numeric_limits<int>::max()) FailLabel(at, label, thing);
        return static_cast<int>(label);
    }
    void Note(std::string text) { mesh_.notes.push_back(std::move(text)); }
    /// "Gruppe" in Latin-1 as UTF-8; other bytes come as they are.
    static std::string NameOf(std::string_view bytes);

private:
    float Coordinate(const msf_Cursor& at, long long label, double value) const {
        const auto coordinate = static_cast<float>(value * scale_);
        if (!std::isfinite(coordinate)) FailCoordinate(at, label);
        return coordinate;
    }
    [[noreturn]] static void FailLabel(const msf_Cursor& at, long long label, const char* thing);
    [[noreturn]] static void FailCoordinate(const msf_Cursor& at, long long label);
    static void FailIfTwice(const msf_Cursor& at, const char* thing, const cel_LabelIndex::Repetitions& twice,
                            const std::vector<int>& labels);
    [[noreturn]] void FailNoNode(const msf_Cursor& at, long long label) const;

    msf_Mesh& mesh_;
    double scale_;
    cel_LabelIndex nodes_;
    cel_LabelIndex cells_;
    std::array<int, cel_kKinds> blockOf_{};
    /// Of the cells, one block behind the other, the place of each block's first.
    std::vector<int> firstCell_;
    std::map<std::pair<int, std::string>, std::size_t> groupOf_;
};

#endif
