#ifndef QRX_MESH_FILE_MSF_MESH_H
#define QRX_MESH_FILE_MSF_MESH_H

#include "foundation/cel_Cells.h"

#include <string>
#include <vector>

/// All cells of one kind: N labels, and N rows of `cel_CellOf(kind).nodes` places of nodes, row after row, in
/// the order of the cells' table.
struct msf_Block {
    cel_KindEnm kind = cel_KindEnm::POINT1;
    std::vector<int> labels;
    std::vector<int> nodes;

    int NumCells() const { return static_cast<int>(labels.size()); }
    int Width() const { return cel_CellOf(kind).nodes; }
    const int* Row(int cell) const {
        return nodes.data() + static_cast<std::size_t>(cell) * static_cast<std::size_t>(Width());
    }
};

/// The cells `begin` to `end` - 1 of a block.
struct msf_Run {
    int block = 0;
    int begin = 0;
    int end = 0;
};

/// A named group of cells of one dimension, or of nodes (dimension 0). A group of the file with members of
/// several dimensions comes as several groups of one name.
struct msf_Group {
    std::string name;
    int dimension = 0;
    std::vector<msf_Run> cells;
    /// Places of nodes, for groups of nodes.
    std::vector<int> nodes;

    long long NumCells() const {
        long long count = 0;
        for (const msf_Run& run : cells) count += run.end - run.begin;
        return count;
    }
};

/// A mesher's mesh as flat arrays: N node labels, 3N coordinates, one block for each kind of cell, and groups
/// in the order of the file. Labels are positive and differ; every place of a node is below N. Cells of
/// different kinds may share a label where the format numbers each kind anew.
struct msf_Mesh {
    /// "MSH 4.1, binary".
    std::string format;
    std::vector<int> nodeLabels;
    std::vector<float> coordinates;
    std::vector<msf_Block> blocks;
    /// Whether labels of cells are known to differ from kind to kind too.
    bool oneNumbering = false;
    std::vector<msf_Group> groups;
    /// What was merged, turned, named or left out while reading, as sentences with counts.
    std::vector<std::string> notes;

    int NumNodes() const { return static_cast<int>(nodeLabels.size()); }
    long long NumCells() const {
        long long count = 0;
        for (const msf_Block& block : blocks) count += block.NumCells();
        return count;
    }
};

/// What the user asks of a reader.
struct msf_Options {
    /// Coordinates are multiplied by it before they are rounded to single precision.
    double scale = 1.0;
    /// Integer arrays of cells, of formats without groups, whose values are to become groups "NAME_VALUE".
    std::vector<std::string> groupArrays;
    /// The mesh to take of a file that holds several; empty where there is one.
    std::string part;
};

#endif
