#include "mesh_file/msf_Faces.h"

#include <algorithm>
#include <array>
#include <numeric>

namespace {

/// Corners in ascending order, unused places last.
using Corners = std::array<int, 4>;
constexpr int kNone = 0x7FFFFFFF;

Corners Sorted(const Corners& corners) {
    const int lowA = std::min(corners[0], corners[1]);
    const int highA = std::max(corners[0], corners[1]);
    const int lowB = std::min(corners[2], corners[3]);
    const int highB = std::max(corners[2], corners[3]);
    const int middleA = std::max(lowA, lowB);
    const int middleB = std::min(highA, highB);
    return {std::min(lowA, lowB), std::min(middleA, middleB), std::max(middleA, middleB),
            std::max(highA, highB)};
}

/// The boundary cells by their least corner.
class Boundary {
public:
    Boundary(const msf_Mesh& mesh, std::span<const msf_Run> runs)
        : isBoundaryNode_(static_cast<std::size_t>(mesh.NumNodes())) {
        std::vector<Corners> cells;
        std::size_t count = 0;
        for (const msf_Run& run : runs) count += static_cast<std::size_t>(run.end - run.begin);
        cells.reserve(count);
        for (const msf_Run& run : runs) {
            const msf_Block& block = mesh.blocks[static_cast<std::size_t>(run.block)];
            const int corners = cel_CellOf(block.kind).corners;
            for (int cell = run.begin; cell < run.end; ++cell) {
                Corners key = {kNone, kNone, kNone, kNone};
                std::copy_n(block.Row(cell), std::min(corners, 4), key.begin());
                for (int i = 0; i < std::min(corners, 4); ++i)
                    isBoundaryNode_[static_cast<std::size_t>(block.Row(cell)[i])] = 1;
                cells.push_back(Sorted(key));
            }
        }
        begins_.resize(isBoundaryNode_.size() + 1);
        for (const Corners& cell : cells) ++begins_[static_cast<std::size_t>(cell[0]) + 1];
        std::partial_sum(begins_.begin(), begins_.end(), begins_.begin());
        entries_.resize(cells.size());
        std::vector<int> next(begins_.begin(), begins_.end() - 1);
        for (std::size_t i = 0; i < cells.size(); ++i) {
            entries_[static_cast<std::size_t>(next[static_cast<std::size_t>(cells[i][0])]++)] = {
                cells[i], static_cast<int>(i)};
        }
        for (std::size_t node = 0; node + 1 < begins_.size(); ++node) {
            if (begins_[node + 1] - begins_[node] > 1) std::sort(At(node), At(node + 1), Less);
        }
    }

    bool HasNode(int node) const { return isBoundaryNode_[static_cast<std::size_t>(node)] != 0; }

    /// Calls with the place of each cell of these corners.
    template <class F>
    void ForEach(const Corners& corners, const F& use) {
        auto entry = At(static_cast<std::size_t>(corners[0]));
        const auto end = At(static_cast<std::size_t>(corners[0]) + 1);
        if (end - entry > 16) entry = std::lower_bound(entry, end, Entry{corners, 0}, Less);
        for (; entry != end; ++entry) {
            if (entry->corners == corners) {
                use(static_cast<std::size_t>(entry->place));
            } else if (corners < entry->corners) {
                return;
            }
        }
    }

private:
    struct Entry {
        Corners corners;
        int place;
    };
    static bool Less(const Entry& a, const Entry& b) { return a.corners < b.corners; }
    std::vector<Entry>::iterator At(std::size_t node) { return entries_.begin() + begins_[node]; }

    std::vector<char> isBoundaryNode_;
    std::vector<int> begins_;
    std::vector<Entry> entries_;
};

void MatchBlock(const msf_Mesh& mesh, int blockPlace, Boundary& boundary, std::vector<msf_Face>& faces) {
    const msf_Block& block = mesh.blocks[static_cast<std::size_t>(blockPlace)];
    const std::span<const cel_Side> sides = cel_CellOf(block.kind).sides;
    for (int cell = 0; cell < block.NumCells(); ++cell) {
        const int* row = block.Row(cell);
        for (std::size_t side = 0; side < sides.size(); ++side) {
            const int corners = cel_CellOf(sides[side].kind).corners;
            Corners key = {kNone, kNone, kNone, kNone};
            bool onBoundary = true;
            for (int i = 0; i < corners && onBoundary; ++i) {
                const int node = row[sides[side].nodes[static_cast<std::size_t>(i)]];
                key[static_cast<std::size_t>(i)] = node;
                onBoundary = boundary.HasNode(node);
            }
            if (!onBoundary) continue;
            boundary.ForEach(Sorted(key), [&](std::size_t place) {
                msf_Face& face = faces[place];
                const auto labelOf = [&](int b, int c) {
                    return mesh.blocks[static_cast<std::size_t>(b)].labels[static_cast<std::size_t>(c)];
                };
                const bool isFirst =
                    face.behind == 0 || labelOf(blockPlace, cell) < labelOf(face.block, face.cell);
                const int behind = face.behind + 1;
                if (isFirst) face = {blockPlace, cell, static_cast<int>(side), behind};
                face.behind = behind;
            });
        }
    }
}

} // namespace

std::vector<msf_Face> msf_MatchFaces(const msf_Mesh& mesh, int dimension,
                                     const std::vector<bool>& areElements,
                                     std::span<const msf_Run> boundary) {
    std::size_t count = 0;
    for (const msf_Run& run : boundary) count += static_cast<std::size_t>(run.end - run.begin);
    std::vector<msf_Face> faces(count);
    if (count == 0) return faces;
    Boundary cells(mesh, boundary);
    for (std::size_t block = 0; block < mesh.blocks.size(); ++block) {
        if (areElements[block] && cel_CellOf(mesh.blocks[block].kind).dimension == dimension)
            MatchBlock(mesh, static_cast<int>(block), cells, faces);
    }
    return faces;
}
