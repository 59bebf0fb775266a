#include "mesh_file/msf_Grid.h"

#include <algorithm>

namespace {

/// Adds the groups to a mesh whose cells stand kind by kind in the grid's order.
class GridGroups {
public:
    GridGroups(const msf_VtkGrid& grid, msf_Builder& builder) : builder_(builder) {
        std::array<int, cel_kKinds> next{};
        for (std::size_t cell = 0; cell < grid.types.count; ++cell) {
            const cel_KindEnm kind = msf_FindNodeOrder(msf_FormatEnm::VTK, grid.types.Int(cell))->kind;
            cells_.push_back({builder.BlockOf(kind), next[static_cast<std::size_t>(kind)]++});
        }
    }

    void Add(const msf_GridGroup& group) {
        std::vector<int> nodes;
        for (const long long place : group.places) {
            const long long count =
                group.ofPoints ? builder_.Mesh().NumNodes() : static_cast<long long>(cells_.size());
            if (place < 0 || place >= count) {
                msf_Fail("set " + msf_Shown(group.name),
                         std::string("found ") + (group.ofPoints ? "point " : "cell ") +
                             std::to_string(place),
                         "one of " + std::to_string(count) + ", from 0");
            }
            if (group.ofPoints) {
                nodes.push_back(static_cast<int>(place));
            } else {
                AddCell(group.name, cells_[static_cast<std::size_t>(place)], nodes);
            }
        }
        if (nodes.empty()) return;
        std::sort(nodes.begin(), nodes.end());
        nodes.erase(std::unique(nodes.begin(), nodes.end()), nodes.end());
        builder_.Group(group.name, 0).nodes = std::move(nodes);
    }

private:
    struct Cell {
        int block;
        int place;
    };

    /// Points are nodes too.
    void AddCell(const std::string& name, const Cell& cell, std::vector<int>& nodes) {
        const msf_Block& block = builder_.Mesh().blocks[static_cast<std::size_t>(cell.block)];
        if (block.kind == cel_KindEnm::POINT1) nodes.push_back(*block.Row(cell.place));
        builder_.AddToGroup(name, cell.block, cell.place);
    }

    msf_Builder& builder_;
    std::vector<Cell> cells_;
};

} // namespace

bool msf_TakeGrid(const msf_VtkGrid& grid, std::span<const msf_GridGroup> groups, const msf_Options& options,
                  msf_Mesh& mesh, msf_Problem& problem) {
    mesh = msf_Mesh();
    mesh.format = "arrays";
    try {
        msf_Builder builder(mesh, options);
        msf_FillFromVtk(grid, options, builder);
        GridGroups all(grid, builder);
        for (const msf_GridGroup& group : groups) all.Add(group);
        return true;
    } catch (const msf_Failure& failure) {
        problem = failure.problem;
        return false;
    }
}
