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

/// A face of four corners is a fan of triangles around its middle, whose volumes add up to one product.
double VolumeOf(const cel_Cell& cell, const Vector* p) {
    if (cell.corners == 4) return Dot(Cross(p[1] - p[0], p[2] - p[0]), p[3] - p[0]) / 6.0;
    double volume = 0.0;
    for (const cel_Side& side : cell.sides) {
        // From the first corner, so that a cell far from the origin loses no digits.
        const auto corner = [&](std::size_t i) { return p[side.nodes[i]] - p[0]; };
        const Vector a = corner(0);
        const Vector b = corner(1);
        const Vector c = corner(2);
        if (cel_CellOf(side.kind).corners == 3) {
            volume += Dot(Cross(a, b), c);
        } else {
            const Vector d = corner(3);
            volume += 0.25 * Dot(Cross(c - a, d - b), a + b + c + d);
        }
    }
    return volume / 6.0;
}

std::uint64_t Mixed(std::uint64_t value) {
    value = (value ^ value >> 30) * 0xBF58476D1CE4E5B9ULL;
    value = (value ^ value >> 27) * 0x94D049BB133111EBULL;
    return value ^ value >> 31;
}

/// Nodes in whatever order they stand.
struct NodeSet {
    int least = 0;
    /// Sets of one sum may differ.
    std::uint64_t sum = 0;

    explicit NodeSet(std::span<const int> nodes) : least(nodes.front()) {
        for (const int node : nodes) {
            least = std::min(least, node);
            sum += static_cast<std::uint64_t>(node);
        }
    }
};
std::uint64_t HashOf(std::span<const int> nodes) {
    std::uint64_t sum = 0;
    for (const int node : nodes) sum += Mixed(static_cast<std::uint64_t>(node) + 0x9E3779B97F4A7C15ULL);
    return Mixed(sum);
}

/// Counts things to three by the word and the hash that they are given, and so tells most of those that have
/// no equals. What lies near each other should have words that do.
class Tally {
public:
    explicit Tally(std::size_t words) : words_(words) {}

    void Add(std::size_t word, std::uint64_t hash) {
        const int shift = ShiftOf(hash);
        if (CountAt(word, shift) < 3) words_[word] += std::uint64_t{1} << shift;
    }
    int CountOf(std::size_t word, std::uint64_t hash) const { return CountAt(word, ShiftOf(hash)); }

private:
    static int ShiftOf(std::uint64_t hash) {
        return static_cast<int>(Mixed(hash) >> 59) * 2;
    }
    int CountAt(std::size_t word, int shift) const { return static_cast<int>(words_[word] >> shift & 3); }

    std::vector<std::uint64_t> words_;
};

/// A thing, told by its place or label, that may have equals: they have its hash.
struct Candidate {
    std::uint64_t hash;
    int number;
};

/// Calls `use` for each run of candidates with one hash, in the order of their numbers.
template <class F>
void ForEachRun(std::vector<Candidate>& candidates, const F& use) {
    std::sort(candidates.begin(), candidates.end(), [](const Candidate& a, const Candidate& b) {
        return a.hash != b.hash ? a.hash < b.hash : a.number < b.number;
    });
    for (auto run = candidates.begin(); run != candidates.end();) {
        const auto end = std::find_if(run, candidates.end(),
                                      [run](const Candidate& other) { return other.hash != run->hash; });
        use(std::span(run, end));
        run = end;
    }
}

/// The numbers of those that equal an earlier one, in order.
template <class Equal>
std::vector<int> RepeatedOf(std::vector<Candidate>& candidates, const Equal& equal) {
    std::vector<int> repeated;
    std::vector<int> different;
    ForEachRun(candidates, [&](std::span<const Candidate> run) {
        different.clear();
        for (const Candidate& candidate : run) {
            const int number = candidate.number;
            if (std::any_of(different.begin(), different.end(),
                            [&](int known) { return equal(known, number); }))
                repeated.push_back(number);
            else
                different.push_back(number);
        }
    });
    std::sort(repeated.begin(), repeated.end());
    return repeated;
}

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
        double square = 0.0;
        for (int i = 1; i < cell.corners; ++i) {
            const Vector away = points[i] - points[0];
            square = std::max(square, Dot(away, away));
        }
        const double extent = std::sqrt(square);
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
        const auto row = [&](int place) {
            return block.nodes.subspan(static_cast<std::size_t>(place) * width, width);
        };
        const int count = static_cast<int>(block.labels.size());
        // Nodes that aren't there share a word.
        Tally tally(static_cast<std::size_t>(numNodes_) + 1);
        const auto wordOf = [this](const NodeSet& nodes) {
            return static_cast<std::size_t>(IsNode(nodes.least) ? nodes.least : numNodes_);
        };
        for (int place = 0; place < count; ++place) {
            const NodeSet nodes(row(place));
            tally.Add(wordOf(nodes), nodes.sum);
        }
        std::vector<Candidate> candidates;
        for (int place = 0; place < count; ++place) {
            const NodeSet nodes(row(place));
            if (tally.CountOf(wordOf(nodes), nodes.sum) > 1)
                candidates.push_back({HashOf(row(place)), place});
        }
        std::vector<int> mine;
        std::vector<int> other;
        const auto equal = [&](int a, int b) {
            mine.assign(row(a).begin(), row(a).end());
            other.assign(row(b).begin(), row(b).end());
            std::sort(mine.begin(), mine.end());
            std::sort(other.begin(), other.end());
            return mine == other;
        };
        for (const int place : RepeatedOf(candidates, equal))
            quality_.repeatedElements.Add(block.labels[static_cast<std::size_t>(place)]);
    }

    void ExamineNodes() {
        const auto bits = [this](int node) {
            const float* at = mesh_.coordinates.data() + 3 * static_cast<std::size_t>(node);
            // Adding zero makes one of the two zeros.
            return std::array{std::bit_cast<std::uint32_t>(at[0] + 0.0F),
                              std::bit_cast<std::uint32_t>(at[1] + 0.0F),
                              std::bit_cast<std::uint32_t>(at[2] + 0.0F)};
        };
        const auto hashOf = [&bits](int node) {
            std::uint64_t hash = 0;
            for (const std::uint32_t value : bits(node)) hash = Mixed(hash + value);
            return hash;
        };
        const std::size_t words = std::bit_ceil(static_cast<std::size_t>(numNodes_) / 2 + 1);
        Tally tally(words);
        const auto wordOf = [words](std::uint64_t hash) {
            return static_cast<std::size_t>(hash) & (words - 1);
        };
        for (int node = 0; node < numNodes_; ++node) {
            const std::uint64_t hash = hashOf(node);
            tally.Add(wordOf(hash), hash >> 32);
        }
        std::vector<Candidate> candidates;
        for (int node = 0; node < numNodes_; ++node) {
            const std::uint64_t hash = hashOf(node);
            if (tally.CountOf(wordOf(hash), hash >> 32) > 1) candidates.push_back({hash, node});
        }
        for (const int node : RepeatedOf(candidates, [&](int a, int b) { return bits(a) == bits(b); }))
            quality_.repeatedNodes.Add(mesh_.nodeLabels[static_cast<std::size_t>(node)]);
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

    void ExamineFaces() {
        Tally tally(static_cast<std::size_t>(numNodes_));
        const auto word = [](const NodeSet& face) { return static_cast<std::size_t>(face.least); };
        ForEachFace([&](std::span<const int> nodes, int) {
            const NodeSet face(nodes);
            tally.Add(word(face), face.sum);
        });
        std::vector<Candidate> candidates;
        ForEachFace([&](std::span<const int> nodes, int label) {
            const NodeSet face(nodes);
            if (tally.CountOf(word(face), face.sum) > 2) candidates.push_back({HashOf(nodes), label});
        });
        std::vector<int> labels;
        ForEachRun(candidates, [&](std::span<const Candidate> run) {
            if (run.size() < 3) return;
            for (const Candidate& face : run) labels.push_back(face.number);
        });
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
