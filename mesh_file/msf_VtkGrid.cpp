#include "mesh_file/msf_VtkGrid.h"

#include <algorithm>

template <class T, class U>
void msf_NumberArray::Take(std::size_t begin, std::size_t many, U* numbers) const {
    const char* at = data + begin * sizeof(T);
    for (std::size_t i = 0; i < many; ++i, at += sizeof(T)) {
        char bytes[sizeof(T)];
        std::memcpy(bytes, at, sizeof(T));
        if (bigEndian) std::reverse(bytes, bytes + sizeof(T));
        T value;
        std::memcpy(&value, bytes, sizeof(T));
        numbers[i] = static_cast<U>(value);
    }
}

void msf_NumberArray::Ints(std::size_t begin, std::size_t many, long long* numbers) const {
    switch (type) {
    case Type::INT8: return Take<std::int8_t>(begin, many, numbers);
    case Type::UINT8: return Take<std::uint8_t>(begin, many, numbers);
    case Type::INT16: return Take<std::int16_t>(begin, many, numbers);
    case Type::UINT16: return Take<std::uint16_t>(begin, many, numbers);
    case Type::INT32: return Take<std::int32_t>(begin, many, numbers);
    case Type::UINT32: return Take<std::uint32_t>(begin, many, numbers);
    case Type::INT64: return Take<std::int64_t>(begin, many, numbers);
    case Type::UINT64: return Take<std::uint64_t>(begin, many, numbers);
    default: std::fill_n(numbers, many, 0);
    }
}

void msf_NumberArray::Reals(std::size_t begin, std::size_t many, double* numbers) const {
    if (type == Type::FLOAT64) return Take<double>(begin, many, numbers);
    if (type == Type::FLOAT32) return Take<float>(begin, many, numbers);
    for (std::size_t i = 0; i < many; ++i) numbers[i] = static_cast<double>(Int(begin + i));
}

std::size_t msf_NumberArray::SizeOf(Type type) {
    switch (type) {
    case Type::INT8:
    case Type::UINT8: return 1;
    case Type::INT16:
    case Type::UINT16: return 2;
    case Type::INT32:
    case Type::UINT32:
    case Type::FLOAT32: return 4;
    case Type::INT64:
    case Type::UINT64:
    case Type::FLOAT64: return 8;
    default: return 0;
    }
}

namespace {

class GridFiller {
public:
    GridFiller(const msf_VtkGrid& grid, const msf_Options& options, msf_Builder& builder)
        : grid_(grid), options_(options), builder_(builder) {}

    void Fill() {
        at_.SayPlace("the points");
        AddNodes();
        CheckGhosts();
        FindGroupArrays();
        AddCells();
        TurnWedges();
    }

private:
    void AddNodes() {
        const std::size_t count = grid_.points.count / 3;
        if (grid_.points.count % 3 != 0)
            msf_Fail("the points", "found " + std::to_string(grid_.points.count) + " numbers",
                     "three for each point");
        builder_.ReserveNodes(count);
        for (std::size_t i = 0; i < count; ++i) {
            double point[3];
            grid_.points.Reals(3 * i, 3, point);
            builder_.AddNode(at_, static_cast<long long>(i) + 1, point[0], point[1], point[2]);
        }
        builder_.FinishNodes(at_);
    }

    void CheckGhosts() const {
        for (const msf_NumberArray& array : grid_.cellArrays) {
            if (array.name != "vtkGhostType" && array.name != "vtkGhostLevels") continue;
            for (std::size_t i = 0; i < array.count; ++i) {
                if (array.Int(i) != 0)
                    msf_Fail("cell " + std::to_string(i), "found a ghost cell",
                             "a mesh in one piece, without partitions and ghost cells");
            }
        }
    }

    void FindGroupArrays() {
        std::string integers;
        for (const msf_NumberArray& array : grid_.cellArrays) {
            if (!array.IsReal() && array.components == 1 && array.type != msf_NumberArray::Type::NONE)
                integers += (integers.empty() ? "" : ", ") + msf_Shown(array.name);
        }
        for (const std::string& name : options_.groupArrays) {
            const auto array = std::find_if(grid_.cellArrays.begin(), grid_.cellArrays.end(),
                                            [&](const auto& a) { return a.name == name; });
            if (array == grid_.cellArrays.end() || array->IsReal() || array->components != 1 ||
                array->count != grid_.types.count) {
                msf_Fail("", "found no array " + msf_Shown(name) + " with one integer for each cell",
                         integers.empty() ? "no group arrays, since the file has none"
                                          : "one of " + integers);
            }
            groupArrays_.push_back(&*array);
        }
        if (options_.groupArrays.empty() && !integers.empty())
            builder_.Note("the file has arrays of cells that group arrays may name: " + integers);
    }

    [[noreturn]] static void FailAtCell(std::size_t cell, std::string found, std::string expected) {
        msf_Fail("cell " + std::to_string(cell), std::move(found), std::move(expected));
    }

    std::size_t BeginOf(std::size_t cell, std::size_t& next, const msf_NodeOrder& order) const {
        const std::size_t total = grid_.connectivity.count;
        long long begin = static_cast<long long>(next);
        long long end = begin + order.nodes;
        if (grid_.countsAhead) {
            if (next >= total) FailAtCell(cell, "found no nodes", "a row of them");
            const long long count = grid_.connectivity.Int(next);
            begin += 1;
            end = count < 0 || count > static_cast<long long>(total) ? -1 : begin + count;
        } else {
            const std::size_t place = cell + (grid_.offsetsBeginWithZero ? 1 : 0);
            end = grid_.offsets.Int(place);
        }
        if (end - begin != order.nodes || end > static_cast<long long>(total)) {
            FailAtCell(cell,
                       "found " + std::to_string(end - begin) + " nodes of a cell of type " +
                           std::to_string(order.code),
                       std::to_string(order.nodes) + " in the list of nodes");
        }
        next = static_cast<std::size_t>(end);
        return static_cast<std::size_t>(begin);
    }

    void AddCells() {
        const std::size_t count = grid_.types.count;
        const std::size_t offsets = count + (grid_.offsetsBeginWithZero ? 1 : 0);
        if (!grid_.countsAhead && grid_.offsets.count != offsets) {
            msf_Fail("the cells",
                     "found " + std::to_string(grid_.offsets.count) + " offsets for " +
                         std::to_string(count) + " cells",
                     std::to_string(offsets));
        }
        const int nodes = builder_.Mesh().NumNodes();
        std::size_t next = 0;
        const msf_NodeOrder* order = nullptr;
        std::vector<int> row;
        for (std::size_t cell = 0; cell < count; ++cell) {
            const long long type = grid_.types.Int(cell);
            if (order == nullptr || order->code != type) order = msf_FindNodeOrder(msf_FormatEnm::VTK, type);
            if (order == nullptr)
                FailAtCell(cell, "found a cell of type " + std::to_string(type),
                           "a vertex, line, triangle, quadrangle, tetrahedron, hexahedron, wedge or pyramid "
                           "of first or second order");
            const std::size_t begin = BeginOf(cell, next, *order);
            row.resize(static_cast<std::size_t>(order->nodes));
            long long places[cel_kMaxNodes];
            grid_.connectivity.Ints(begin, row.size(), places);
            for (std::size_t i = 0; i < row.size(); ++i) {
                const long long node = places[i];
                if (node < 0 || node >= nodes)
                    FailAtCell(cell, "found point " + std::to_string(node),
                               "one of " + std::to_string(nodes) + ", from 0");
                row[i] = static_cast<int>(node);
            }
            const int place = builder_.AddCell(at_, *order, static_cast<long long>(cell) + 1, row.data());
            for (const msf_NumberArray* array : groupArrays_)
                AddToGroup(*array, array->Int(cell), builder_.BlockOf(order->kind), place);
        }
    }

    void AddToGroup(const msf_NumberArray& array, long long value, int block, int place) {
        const int dimension =
            cel_CellOf(builder_.Mesh().blocks[static_cast<std::size_t>(block)].kind).dimension;
        const auto [entry, isNew] =
            groups_.try_emplace({&array, value, dimension}, builder_.Mesh().groups.size());
        if (isNew) builder_.Group(array.name + "_" + std::to_string(value), dimension);
        msf_Builder::AddRun(builder_.Mesh().groups[entry->second], block, place, place + 1);
    }

    /// The base's normal times the way from base to top: positive when the wedge is the right way round.
    double WedgeSense(const int* row) const {
        const auto point = [&](int i, int axis) {
            return static_cast<double>(builder_.Mesh().coordinates[3 * static_cast<std::size_t>(row[i]) +
                                                                   static_cast<std::size_t>(axis)]);
        };
        double a[3];
        double b[3];
        double up[3];
        for (int k = 0; k < 3; ++k) {
            a[k] = point(1, k) - point(0, k);
            b[k] = point(2, k) - point(0, k);
            up[k] = point(3, k) + point(4, k) + point(5, k) - point(0, k) - point(1, k) - point(2, k);
        }
        return (a[1] * b[2] - a[2] * b[1]) * up[0] + (a[2] * b[0] - a[0] * b[2]) * up[1] +
               (a[0] * b[1] - a[1] * b[0]) * up[2];
    }

    void TurnWedges() {
        constexpr int kTurned[] = {0, 2, 1, 3, 5, 4, 8, 7, 6, 11, 10, 9, 12, 14, 13};
        long long turned = 0;
        for (msf_Block& block : builder_.Mesh().blocks) {
            if (cel_LinearKindOf(block.kind) != cel_KindEnm::WEDGE6) continue;
            const auto width = static_cast<std::size_t>(block.Width());
            for (int cell = 0; cell < block.NumCells(); ++cell) {
                int* row = block.nodes.data() + static_cast<std::size_t>(cell) * width;
                if (WedgeSense(row) >= 0.0) continue;
                int old[15];
                std::copy_n(row, width, old);
                for (std::size_t i = 0; i < width; ++i) row[i] = old[kTurned[i]];
                ++turned;
            }
        }
        if (turned > 0) builder_.Note(msf_Counted(turned, "wedge") + " stood inside out and were turned");
    }

    const msf_VtkGrid& grid_;
    const msf_Options& options_;
    msf_Builder& builder_;
    msf_Cursor at_{std::string_view()};
    std::vector<const msf_NumberArray*> groupArrays_;
    std::map<std::tuple<const msf_NumberArray*, long long, int>, std::size_t> groups_;
};

} // namespace

void msf_FillFromVtk(const msf_VtkGrid& grid, const msf_Options& options, msf_Builder& builder) {
    GridFiller(grid, options, builder).Fill();
}
