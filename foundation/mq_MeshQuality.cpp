#include "foundation/mq_MeshQuality.h"

#include "foundation/thr_InOrder.h"

#include <algorithm>
#include <bit>
#include <cmath>
#include <functional>
#include <iterator>
#include <numeric>

namespace {

struct Vector {
    double x = 0.0;
    double y = 0.0;
    double z = 0.0;
};
Vector operator-(const Vector& a, const Vector& b) {
    return {a.x - b.x, a.y - b.y, a.z - b.z};
}
Vector operator+(const Vector& a, const Vector& b) {
    return {a.x + b.x, a.y + b.y, a.z + b.z};
}
Vector operator*(double s, const Vector& a) {
    return {s * a.x, s * a.y, s * a.z};
}
double Dot(const Vector& a, const Vector& b) {
    return a.x * b.x + a.y * b.y + a.z * b.z;
}
Vector Cross(const Vector& a, const Vector& b) {
    return {a.y * b.z - a.z * b.y, a.z * b.x - a.x * b.z, a.x * b.y - a.y * b.x};
}
double Length(const Vector& a) {
    return std::sqrt(Dot(a, a));
}

Vector Point(std::span<const float> coordinates, int node) {
    const float* p = coordinates.data() + 3 * static_cast<std::size_t>(node);
    return {static_cast<double>(p[0]), static_cast<double>(p[1]), static_cast<double>(p[2])};
}

/// Smaller than this part of a cell's extent is nothing; rounding gives flat cells a volume of either sign.
constexpr double kNothing = 1e-10;

/// Twice the area times the normal of a triangle or quadrangle.
Vector AreaOf(const Vector* p, int corners) {
    return corners == 3 ? Cross(p[1] - p[0], p[2] - p[0]) : Cross(p[2] - p[0], p[3] - p[1]);
}

double VolumeOf(const cel_Cell& cell, const Vector* p) {
    if (cell.corners == 4) return Dot(Cross(p[1] - p[0], p[2] - p[0]), p[3] - p[0]) / 6.0;
    double volume = 0.0;
    for (const cel_Side& side : cell.sides) {
        const int corners = cel_CellOf(side.kind).corners;
        Vector face[4];
        Vector middle;
        for (int i = 0; i < corners; ++i) {
            // From the first corner, so that a cell far from the origin loses no digits.
            face[i] = p[side.nodes[static_cast<std::size_t>(i)]] - p[0];
            middle = middle + (1.0 / corners) * face[i];
        }
        for (int i = 0; i < corners; ++i)
            volume += Dot(Cross(face[i], face[(i + 1) % corners]), middle) / 6.0;
    }
    return volume;
}

std::uint64_t Mixed(std::uint64_t value) {
    value = (value ^ value >> 30) * 0xBF58476D1CE4E5B9ULL;
    value = (value ^ value >> 27) * 0x94D049BB133111EBULL;
    return value ^ value >> 31;
}

/// One number for a set of nodes, in whatever order they stand.
template <class Nodes>
std::uint64_t HashOf(const Nodes& nodes) {
    std::uint64_t sum = 0;
    for (const int node : nodes) sum += Mixed(static_cast<std::uint64_t>(node) + 0x9E3779B97F4A7C15ULL);
    return Mixed(sum);
}

/// Finds things that equal an earlier one by their hash, in a table of places.
class EarlierOnes {
public:
    explicit EarlierOnes(std::size_t count) : table_(std::bit_ceil(2 * count + 2), -1) {}

    template <class Equal>
    bool HasEqual(std::uint64_t hash, int place, const Equal& equal) {
        std::size_t slot = hash & (table_.size() - 1);
        for (; table_[slot] >= 0; slot = (slot + 1) & (table_.size() - 1)) {
            if (equal(table_[slot])) return true;
        }
        table_[slot] = place;
        return false;
    }

private:
    std::vector<int> table_;
};

class Examiner {
public:
    explicit Examiner(const mq_Mesh& mesh)
        : mesh_(mesh), numNodes_(static_cast<int>(mesh.nodeLabels.size())) {}

    mq_Quality Examine() {
        // Each finds something of its own, the longest first.
        const std::function<void()> tasks[] = {
            [this] { ExamineFaces(); },
            [this] { ForEachShape([this](const mq_Block& block) { ExamineShapes(block); }); },
            [this] { ForEachShape([this](const mq_Block& block) { ExamineRepetitions(block); }); },
            [this] { ExamineNodes(); },
            [this] { ExamineUse(); },
        };
        const int threads = numNodes_ < kFewNodes ? 1 : 0;
        thr_ForEach(threads, std::size(tasks), [&](std::size_t i) { tasks[i](); });
        return std::move(quality_);
    }

private:
    static constexpr int kFewNodes = 20000;

    template <class Look>
    void ForEachShape(const Look& look) const {
        for (const mq_Block& block : mesh_.blocks) {
            if (block.hasShape) look(block);
        }
    }

    void ExamineUse() {
        std::vector<char> used(static_cast<std::size_t>(numNodes_));
        for (const mq_Block& block : mesh_.blocks) {
            for (const int node : block.nodes) {
                if (IsNode(node)) used[static_cast<std::size_t>(node)] = 1;
            }
        }
        for (std::size_t i = 0; i < used.size(); ++i) {
            if (used[i] == 0) quality_.unusedNodes.Add(mesh_.nodeLabels[i]);
        }
    }

    bool IsNode(int node) const { return node >= 0 && node < numNodes_; }
    bool HasAllNodes(const int* row, int count) const {
        return std::all_of(row, row + count, [this](int node) { return IsNode(node); });
    }
    static bool Fits(const mq_Block& block) { return block.width >= cel_CellOf(block.kind).nodes; }

    void ExamineShapes(const mq_Block& block) {
        const cel_Cell& cell = cel_CellOf(block.kind);
        if (!Fits(block) || cell.dimension == 0) return;
        const int* row = block.nodes.data();
        Vector points[cel_kMaxNodes];
        for (const int label : block.labels) {
            if (HasAllNodes(row, cell.nodes)) {
                for (int i = 0; i < cell.nodes; ++i) points[i] = Point(mesh_.coordinates, row[i]);
                if (!HasSize(cell, points, block.plane)) quality_.inverted.Add(label);
                if (HasFarMidSide(cell, points)) quality_.farMidSides.Add(label);
            }
            row += block.width;
        }
    }

    static bool HasSize(const cel_Cell& cell, const Vector* points, bool plane) {
        double extent = 0.0;
        for (int i = 1; i < cell.corners; ++i) extent = std::max(extent, Length(points[i] - points[0]));
        if (cell.dimension == 1) return extent > 0.0;
        if (cell.dimension == 3) return VolumeOf(cell, points) > kNothing * extent * extent * extent;
        const Vector area = AreaOf(points, cell.corners);
        return (plane ? area.z : Length(area)) > kNothing * extent * extent;
    }

    /// Lines are passed over: decks have their middle node in the middle, other formats last.
    static bool HasFarMidSide(const cel_Cell& cell, const Vector* points) {
        if (!cel_IsQuadratic(cell) || cell.dimension == 1) return false;
        for (std::size_t i = 0; i < cell.edges.size(); ++i) {
            const Vector& begin = points[cell.edges[i][0]];
            const Vector along = points[cell.edges[i][1]] - begin;
            const Vector to = points[static_cast<std::size_t>(cell.corners) + i] - begin;
            const double square = Dot(along, along);
            const double part = square > 0.0 ? std::clamp(Dot(to, along) / square, 0.25, 0.75) : 0.5;
            const Vector away = to - part * along;
            if (Dot(away, away) > 0.09 * square) return true;
        }
        return false;
    }

    void ExamineRepetitions(const mq_Block& block) {
        const auto width = static_cast<std::size_t>(block.width);
        EarlierOnes earlier(block.labels.size());
        const auto row = [&](int place) {
            return block.nodes.subspan(static_cast<std::size_t>(place) * width, width);
        };
        std::vector<int> mine;
        std::vector<int> other;
        for (std::size_t i = 0; i < block.labels.size(); ++i) {
            const auto place = static_cast<int>(i);
            const bool repeated = earlier.HasEqual(HashOf(row(place)), place, [&](int known) {
                mine.assign(row(place).begin(), row(place).end());
                other.assign(row(known).begin(), row(known).end());
                std::sort(mine.begin(), mine.end());
                std::sort(other.begin(), other.end());
                return mine == other;
            });
            if (repeated) quality_.repeatedElements.Add(block.labels[i]);
        }
    }

    void ExamineNodes() {
        EarlierOnes earlier(static_cast<std::size_t>(numNodes_));
        const auto at = [&](int node) {
            return mesh_.coordinates.data() + 3 * static_cast<std::size_t>(node);
        };
        for (int node = 0; node < numNodes_; ++node) {
            std::uint64_t hash = 0;
            // Adding zero makes one of the two zeros.
            for (int i = 0; i < 3; ++i) hash = Mixed(hash + std::bit_cast<std::uint32_t>(at(node)[i] + 0.0F));
            const bool repeated = earlier.HasEqual(
                hash, node, [&](int known) { return std::equal(at(node), at(node) + 3, at(known)); });
            if (repeated) quality_.repeatedNodes.Add(mesh_.nodeLabels[static_cast<std::size_t>(node)]);
        }
    }

    template <class F>
    void ForEachFace(const F& use) const {
        for (const mq_Block& block : mesh_.blocks) {
            const cel_Cell& cell = cel_CellOf(block.kind);
            if (cell.dimension != 3 || !block.hasShape || !Fits(block)) continue;
            const int* row = block.nodes.data();
            for (const int label : block.labels) {
                for (const cel_Side& side : cell.sides) {
                    std::array<int, 4> corners{};
                    const int count = cel_CellOf(side.kind).corners;
                    for (int i = 0; i < count; ++i)
                        corners[static_cast<std::size_t>(i)] = row[side.nodes[static_cast<std::size_t>(i)]];
                    const std::span<const int> nodes(corners.data(), static_cast<std::size_t>(count));
                    if (HasAllNodes(nodes.data(), count)) use(nodes, label);
                }
                row += block.width;
            }
        }
    }

    /// Faces lie in bins by their least corner; in a bin equal ones come side by side.
    void ExamineFaces() {
        std::vector<std::size_t> bins(static_cast<std::size_t>(numNodes_) + 1);
        const auto binOf = [](std::span<const int> nodes) {
            return static_cast<std::size_t>(*std::min_element(nodes.begin(), nodes.end()));
        };
        ForEachFace([&](std::span<const int> nodes, int) { ++bins[binOf(nodes) + 1]; });
        std::partial_sum(bins.begin(), bins.end(), bins.begin());
        struct Face {
            std::uint64_t hash;
            int label;
        };
        std::vector<Face> faces(bins.back());
        std::vector<std::size_t> next(bins.begin(), bins.end() - 1);
        ForEachFace([&](std::span<const int> nodes, int label) {
            faces[next[binOf(nodes)]++] = {HashOf(nodes), label};
        });
        std::vector<int> labels;
        for (std::size_t bin = 0; bin + 1 < bins.size(); ++bin) {
            const auto begin = faces.begin() + static_cast<std::ptrdiff_t>(bins[bin]);
            const auto end = faces.begin() + static_cast<std::ptrdiff_t>(bins[bin + 1]);
            std::sort(begin, end, [](const Face& a, const Face& b) {
                return a.hash != b.hash ? a.hash < b.hash : a.label < b.label;
            });
            for (auto run = begin; run != end;) {
                const auto stop =
                    std::find_if(run, end, [run](const Face& face) { return face.hash != run->hash; });
                for (auto face = run; stop - run > 2 && face != stop; ++face) labels.push_back(face->label);
                run = stop;
            }
        }
        std::sort(labels.begin(), labels.end());
        labels.erase(std::unique(labels.begin(), labels.end()), labels.end());
        for (const int label : labels) quality_.sharedFaces.Add(label);
    }

    const mq_Mesh& mesh_;
    int numNodes_;
    mq_Quality quality_;
};

} // namespace

mq_Quality mq_QualityOf(const mq_Mesh& mesh) {
    return Examiner(mesh).Examine();
}

double mq_SizeOf(cel_KindEnm kind, const int* row, std::span<const float> coordinates) {
    const cel_Cell& cell = cel_CellOf(kind);
    Vector points[8];
    for (int i = 0; i < cell.corners; ++i) points[i] = Point(coordinates, row[i]);
    switch (cell.dimension) {
    case 1: return Length(points[1] - points[0]);
    case 2: return 0.5 * Length(AreaOf(points, cell.corners));
    case 3: return VolumeOf(cell, points);
    default: return 0.0;
    }
}
