#include "mesh_file/msf_Builder.h"

#include <algorithm>
#include <cstdint>

namespace {

bool IsUtf8(std::string_view text) {
    for (std::size_t i = 0; i < text.size();) {
        const auto lead = static_cast<unsigned char>(text[i++]);
        int more = 0;
        if (lead >= 0x80) more = lead >= 0xF0 && lead < 0xF5 ? 3 : lead >= 0xE0 ? 2 : lead >= 0xC2 ? 1 : -1;
        if (more < 0 || lead >= 0xF5) return false;
        for (; more > 0; --more, ++i) {
            if (i >= text.size() || (static_cast<unsigned char>(text[i]) & 0xC0) != 0x80) return false;
        }
    }
    return true;
}

} // namespace

void msf_Builder::FailLabel(const msf_Cursor& at, long long label, const char* thing) {
    at.FailAtWord("found " + std::to_string(label) + " as the label of " + thing,
                  "a number from 1 to 2147483647");
}

void msf_Builder::FailCoordinate(const msf_Cursor& at, long long label) {
    at.FailAtWord("found a coordinate of node " + std::to_string(label) + " that is no number or too large",
                  "a number of single precision");
}

void msf_Builder::FailIfTwice(const msf_Cursor& at, const char* thing,
                              const cel_LabelIndex::Repetitions& twice, const std::vector<int>& labels) {
    if (twice.empty()) return;
    at.FailAtWord(std::string("found ") + thing + " label " +
                      std::to_string(labels[static_cast<std::size_t>(twice.front())]) + " twice",
                  "labels that differ");
}

void msf_Builder::ReserveNodes(std::size_t count) {
    mesh_.nodeLabels.reserve(count);
    mesh_.coordinates.reserve(3 * count);
}

void msf_Builder::AddNode(const msf_Cursor& at, long long label, double x, double y, double z) {
    mesh_.nodeLabels.push_back(Label(at, label, "a node"));
    for (const double value : {x, y, z}) mesh_.coordinates.push_back(Coordinate(at, label, value));
}

void msf_Builder::AddNodeLabels(const msf_Cursor& at, const char* raw, std::size_t count) {
    for (std::size_t i = 0; i < count; ++i) {
        std::int64_t label;
        std::memcpy(&label, raw + sizeof label * i, sizeof label);
        mesh_.nodeLabels.push_back(Label(at, label, "a node"));
    }
}

void msf_Builder::AddCoordinates(const msf_Cursor& at, const char* raw, std::size_t reals,
                                 std::size_t count) {
    constexpr std::size_t kMost = 512;
    float values[3 * kMost];
    for (std::size_t begin = 0; begin < count; begin += kMost) {
        const std::size_t part = std::min(kMost, count - begin);
        const int* const label = mesh_.nodeLabels.data() + mesh_.coordinates.size() / 3;
        for (std::size_t i = 0; i < part; ++i) {
            double point[3];
            std::memcpy(point, raw + sizeof point[0] * reals * (begin + i), sizeof point);
            for (std::size_t j = 0; j < 3; ++j) values[3 * i + j] = Coordinate(at, label[i], point[j]);
        }
        mesh_.coordinates.insert(mesh_.coordinates.end(), values, values + 3 * part);
    }
}

void msf_Builder::FinishNodes(const msf_Cursor& at) {
    FailIfTwice(at, "node", nodes_.Build(mesh_.nodeLabels), mesh_.nodeLabels);
}

void msf_Builder::FailNoNode(const msf_Cursor& at, long long label) const {
    at.FailAtWord("found node " + std::to_string(label), "the label of a node of the file");
}

int msf_Builder::BlockOf(cel_KindEnm kind) {
    int& block = blockOf_[static_cast<std::size_t>(kind)];
    if (block < 0) {
        block = static_cast<int>(mesh_.blocks.size());
        mesh_.blocks.push_back({kind, {}, {}});
    }
    return block;
}

int msf_Builder::AddCell(const msf_Cursor& at, const msf_NodeOrder& order, long long label,
                         const int* fileRow) {
    msf_Block& block = mesh_.blocks[static_cast<std::size_t>(BlockOf(order.kind))];
    block.labels.push_back(Label(at, label, "an element"));
    for (const std::int8_t place : order.Order()) block.nodes.push_back(fileRow[place]);
    return block.NumCells() - 1;
}

void msf_Builder::AddCells(const msf_Cursor& at, const msf_NodeOrder& order, const char* rows,
                           std::size_t count) {
    constexpr std::size_t kMost = 64;
    std::int64_t raw[kMost * (1 + cel_kMaxNodes)];
    int own[kMost];
    int places[kMost * cel_kMaxNodes];
    const std::size_t width = 1 + static_cast<std::size_t>(order.nodes);
    const std::span<const std::int8_t> nodes = order.Order();
    msf_Block& block = mesh_.blocks[static_cast<std::size_t>(BlockOf(order.kind))];
    for (std::size_t begin = 0; begin < count; begin += kMost) {
        const std::size_t part = std::min(kMost, count - begin);
        std::memcpy(raw, rows + sizeof raw[0] * width * begin, sizeof raw[0] * width * part);
        int* place = places;
        for (std::size_t i = 0; i < part; ++i) {
            const std::int64_t* const row = raw + width * i;
            own[i] = Label(at, row[0], "an element");
            for (const std::int8_t node : nodes) *place++ = Node(at, row[1 + node]);
        }
        block.labels.insert(block.labels.end(), own, own + part);
        block.nodes.insert(block.nodes.end(), places, place);
    }
}

void msf_Builder::FinishCells(const msf_Cursor& at) {
    mesh_.oneNumbering = true;
    firstCell_.clear();
    if (mesh_.blocks.size() == 1) {
        const std::vector<int>& labels = mesh_.blocks.front().labels;
        firstCell_.push_back(0);
        FailIfTwice(at, "element", cells_.Build(labels), labels);
        return;
    }
    std::vector<int> all;
    for (const msf_Block& block : mesh_.blocks) {
        firstCell_.push_back(static_cast<int>(all.size()));
        all.insert(all.end(), block.labels.begin(), block.labels.end());
    }
    FailIfTwice(at, "element", cells_.Build(all), all);
}

bool msf_Builder::FindCell(long long label, int& block, int& place) const {
    const int index = cells_.Find(label);
    if (index < 0) return false;
    const auto next = std::upper_bound(firstCell_.begin(), firstCell_.end(), index);
    block = static_cast<int>(next - firstCell_.begin()) - 1;
    place = index - firstCell_[static_cast<std::size_t>(block)];
    return true;
}

msf_Group& msf_Builder::Group(const std::string& name, int dimension) {
    const auto [entry, isNew] = groupOf_.try_emplace({dimension, name}, mesh_.groups.size());
    if (isNew) mesh_.groups.push_back({name, dimension, {}, {}});
    return mesh_.groups[entry->second];
}

void msf_Builder::AddRun(msf_Group& group, int block, int begin, int end) {
    if (begin == end) return;
    if (!group.cells.empty() && group.cells.back().block == block && group.cells.back().end == begin) {
        group.cells.back().end = end;
    } else {
        group.cells.push_back({block, begin, end});
    }
}

void msf_Builder::AddToGroup(const std::string& name, int block, int place) {
    const cel_KindEnm kind = mesh_.blocks[static_cast<std::size_t>(block)].kind;
    AddRun(Group(name, cel_CellOf(kind).dimension), block, place, place + 1);
}

std::string msf_Builder::NameOf(std::string_view bytes) {
    bytes = bytes.substr(0, bytes.find('\0'));
    while (!bytes.empty() && (bytes.back() == ' ' || bytes.back() == '\r')) bytes.remove_suffix(1);
    while (!bytes.empty() && bytes.front() == ' ') bytes.remove_prefix(1);
    if (IsUtf8(bytes)) return std::string(bytes);
    std::string name;
    for (const char c : bytes) {
        const auto byte = static_cast<unsigned char>(c);
        if (byte < 0x80) {
            name += c;
        } else {
            name += static_cast<char>(0xC0 | byte >> 6);
            name += static_cast<char>(0x80 | (byte & 0x3F));
        }
    }
    return name;
}
