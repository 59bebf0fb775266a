#include "view_page/vpg_GroupByNodes.h"
#include "view_page/vpg_Mesh.h"

#include <cmath>

namespace {

/// Faces that meet at more than 30 degrees show an edge.
constexpr double kSmooth = 0.8660254037844387;

using Vector = std::array<double, 3>;

struct Edge {
    int ends[2];
    int middle; // -1 for none
    int face;   // among all faces
    bool turned;
};

Vector NormalOf(const vpg_Mesh& mesh, const int* nodes, int corners) {
    Vector normal{};
    for (int i = 0; i < corners; ++i) {
        const auto a = mesh.Place(nodes[i]);
        const auto b = mesh.Place(nodes[(i + 1) % corners]);
        for (std::size_t k = 0; k < 3; ++k) {
            const std::size_t l = (k + 1) % 3;
            const std::size_t m = (k + 2) % 3;
            normal[k] += (static_cast<double>(a[l]) - static_cast<double>(b[l])) *
                         (static_cast<double>(a[m]) + static_cast<double>(b[m]));
        }
    }
    const double length = std::hypot(normal[0], normal[1], normal[2]);
    if (length > 0.0) {
        for (double& component : normal) component /= length;
    }
    return normal;
}

bool IsFeature(const std::vector<Edge>& edges, std::span<const std::uint32_t> same,
               const std::vector<Vector>& normals) {
    if (same.size() != 2) return true;
    const Edge& a = edges[same[0]];
    const Edge& b = edges[same[1]];
    const Vector& first = normals[static_cast<std::size_t>(a.face)];
    const Vector& second = normals[static_cast<std::size_t>(b.face)];
    const double cosine = first[0] * second[0] + first[1] * second[1] + first[2] * second[2];
    // Neighbours that go round alike pass their common edge in opposite directions.
    return (a.turned == b.turned ? -cosine : cosine) < kSmooth;
}

} // namespace

std::vector<int> vpg_FeatureEdges(const vpg_Mesh& mesh) {
    std::vector<Edge> edges;
    std::vector<Vector> normals;
    for (const vpg_Block& block : mesh.Blocks()) {
        const cel_Cell& cell = cel_CellOf(block.kind);
        if (cell.dimension != 2 || block.role == vpg_RoleEnm::FACET) continue;
        const int* row = block.nodes.data();
        for (int i = 0; i < block.NumCells(); ++i, row += cell.nodes) {
            for (std::size_t k = 0; k < cell.edges.size(); ++k) {
                const int a = row[cell.edges[k][0]];
                const int b = row[cell.edges[k][1]];
                const int middle =
                    cel_IsQuadratic(cell) ? row[static_cast<std::size_t>(cell.corners) + k] : -1;
                edges.push_back(
                    {{std::min(a, b), std::max(a, b)}, middle, static_cast<int>(normals.size()), a > b});
            }
            normals.push_back(NormalOf(mesh, row, cell.corners));
        }
    }
    std::vector<int> segments;
    vpg_GroupByNodes(
        edges.size(), static_cast<std::size_t>(mesh.NumNodes()),
        [&](std::size_t item) { return edges[item].ends[0]; },
        [&](std::size_t item) { return edges[item].ends[1]; },
        [&](std::span<const std::uint32_t> same) {
            const Edge& edge = edges[same.front()];
            if (edge.ends[0] == edge.ends[1] || !IsFeature(edges, same, normals)) return;
            if (edge.middle < 0) {
                segments.insert(segments.end(), {edge.ends[0], edge.ends[1]});
            } else {
                segments.insert(segments.end(), {edge.ends[0], edge.middle, edge.middle, edge.ends[1]});
            }
        });
    return segments;
}
