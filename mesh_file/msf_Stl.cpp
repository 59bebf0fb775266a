#include "mesh_file/msf_Builder.h"
#include "mesh_file/msf_Readers.h"

#include <algorithm>
#include <bit>
#include <cstdint>

namespace {

constexpr std::size_t kStlHead = 84;
constexpr std::size_t kFacet = 50;

bool IsBinary(std::string_view bytes) {
    if (bytes.size() < kStlHead) return false;
    std::uint32_t count = 0;
    std::memcpy(&count, bytes.data() + 80, sizeof count);
    return bytes.size() == kStlHead + kFacet * static_cast<std::size_t>(count);
}

bool StartsWithWord(std::string_view text, std::string_view word) {
    return text.starts_with(word) &&
           (text.size() == word.size() || text[word.size()] == ' ' || text[word.size()] == '\n' ||
            text[word.size()] == '\r' || text[word.size()] == '\t');
}

/// Points by their three numbers, each kept once.
class Points {
public:
    Points() : table_(1024, -1) {}

    int Place(const float (&point)[3]) {
        if (2 * (places_ + 1) > table_.size()) Grow();
        const int place = Slot(point);
        if (place >= 0) return place;
        table_[slot_] = static_cast<int>(places_++);
        xyz.insert(xyz.end(), point, point + 3);
        return static_cast<int>(places_) - 1;
    }

    std::vector<float> xyz;

private:
    static std::uint64_t Hash(const float* point) {
        std::uint64_t hash = 0;
        for (int i = 0; i < 3; ++i) {
            hash = (hash ^ std::bit_cast<std::uint32_t>(point[i])) * 0x9E3779B97F4A7C15ULL;
            hash ^= hash >> 29;
        }
        return hash;
    }
    int Slot(const float* point) {
        slot_ = Hash(point) & (table_.size() - 1);
        for (; table_[slot_] >= 0; slot_ = (slot_ + 1) & (table_.size() - 1)) {
            const float* known = xyz.data() + 3 * static_cast<std::size_t>(table_[slot_]);
            if (std::equal(known, known + 3, point)) return table_[slot_];
        }
        return -1;
    }
    void Grow() {
        table_.assign(2 * table_.size(), -1);
        for (std::size_t i = 0; i < places_; ++i) {
            Slot(xyz.data() + 3 * i);
            table_[slot_] = static_cast<int>(i);
        }
    }

    std::vector<int> table_;
    std::size_t slot_ = 0;
    std::size_t places_ = 0;
};

class StlReader {
public:
    StlReader(std::string_view bytes, const msf_Options& options, msf_Mesh& mesh)
        : bytes_(bytes), at_(bytes), builder_(mesh, options) {}

    void Read() {
        const bool binary = IsBinary(bytes_);
        builder_.Mesh().format = binary ? "STL, binary" : "STL, ASCII";
        binary ? ReadBinary() : ReadText();
        AddAll();
    }

private:
    struct Solid {
        std::string name;
        std::size_t firstTriangle;
    };

    void ReadBinary() {
        at_.SayOffsets();
        at_.Take(80, "a head of 80 bytes");
        const auto count = at_.Raw<std::uint32_t>("the number of triangles");
        for (std::uint32_t i = 0; i < count; ++i) {
            at_.Take(12, "a normal");
            for (int corner = 0; corner < 3; ++corner) {
                float point[3];
                for (float& value : point) value = at_.Raw<float>("a coordinate");
                AddCorner(point[0], point[1], point[2]);
            }
            at_.Take(2, "the attribute of a triangle");
        }
    }

    void Expect(std::string_view word) {
        const std::string expected = "'" + std::string(word) + "'";
        const std::string_view found = at_.Word(expected.c_str());
        if (found != word) at_.FailAtWord("found " + msf_Shown(found), expected);
    }

    void ReadText() {
        while (!at_.PeekWord().empty()) {
            Expect("solid");
            const std::string name = msf_Builder::NameOf(at_.Line());
            solids_.push_back({name, corners_.size() / 3});
            while (at_.PeekWord() == "facet") ReadFacet();
            Expect("endsolid");
            at_.Line();
        }
    }

    void ReadFacet() {
        for (const char* word : {"facet", "normal"}) Expect(word);
        for (int i = 0; i < 3; ++i) at_.Real("a number of the normal");
        for (const char* word : {"outer", "loop"}) Expect(word);
        for (int corner = 0; corner < 3; ++corner) {
            Expect("vertex");
            double point[3];
            for (double& value : point) value = at_.Real("a coordinate");
            AddCorner(point[0], point[1], point[2]);
        }
        for (const char* word : {"endloop", "endfacet"}) Expect(word);
    }

    void AddCorner(double x, double y, double z) {
        // Adding zero makes one of the two zeros.
        const float point[3] = {static_cast<float>(x) + 0.0F, static_cast<float>(y) + 0.0F,
                                static_cast<float>(z) + 0.0F};
        corners_.push_back(points_.Place(point));
    }

    void AddAll() {
        const std::size_t nodes = points_.xyz.size() / 3;
        builder_.ReserveNodes(nodes);
        for (std::size_t i = 0; i < nodes; ++i) {
            const float* p = points_.xyz.data() + 3 * i;
            builder_.AddNode(at_, static_cast<long long>(i) + 1, static_cast<double>(p[0]),
                             static_cast<double>(p[1]), static_cast<double>(p[2]));
        }
        builder_.FinishNodes(at_);
        static const msf_NodeOrder order = {msf_FormatEnm::VTK, cel_KindEnm::TRIANGLE3, 0, 3, {0, 1, 2}};
        std::size_t solid = 0;
        long long flat = 0;
        for (std::size_t i = 0; i < corners_.size(); i += 3) {
            while (solid + 1 < solids_.size() && solids_[solid + 1].firstTriangle <= i / 3) ++solid;
            const int* row = corners_.data() + i;
            if (row[0] == row[1] || row[1] == row[2] || row[2] == row[0]) {
                ++flat;
                continue;
            }
            const int place = builder_.AddCell(at_, order, static_cast<long long>(i / 3) + 1, row);
            if (!solids_.empty() && !solids_[solid].name.empty())
                builder_.AddToGroup(solids_[solid].name, 0, place);
        }
        builder_.Note(msf_Counted(static_cast<long long>(corners_.size()), "corner") +
                      " of triangles were merged into " + msf_Counted(static_cast<long long>(nodes), "node"));
        if (flat > 0) builder_.Note(msf_Counted(flat, "triangle") + " with two equal corners were left out");
    }

    std::string_view bytes_;
    msf_Cursor at_;
    msf_Builder builder_;
    Points points_;
    std::vector<int> corners_;
    std::vector<Solid> solids_;
};

} // namespace

bool msf_IsStl(std::string_view bytes) {
    return StartsWithWord(bytes, "solid") || IsBinary(bytes);
}

void msf_ReadStl(const msf_Input& input, const msf_Options& options, msf_Mesh& mesh) {
    StlReader(input.bytes, options, mesh).Read();
}
