#include "view_page/PageTesting.h"

#include "view_page/vpg_Vtu.h"

#include <regex>

namespace {

/// A written file and its arrays by name.
class Vtu {
public:
    explicit Vtu(const std::string& members) {
        vpg_WriteVtu(*StoreOf(members), [this](std::string_view bytes) { text.append(bytes); });
        data_ = text.find("<AppendedData encoding=\"raw\">\n_") + 31;
    }
    template <class T>
    std::vector<T> Array(const std::string& name) const {
        std::smatch found;
        const std::regex entry("Name=\"" + name +
                               "\" NumberOfComponents=\"\\d\" format=\"appended\" offset=\"(\\d+)\"");
        if (!std::regex_search(text, found, entry)) {
            ADD_FAILURE() << "there is no array " << name;
            return {};
        }
        const std::size_t place = data_ + std::stoul(found[1]);
        std::uint64_t bytes = 0;
        std::memcpy(&bytes, text.data() + place, sizeof bytes);
        std::vector<T> values(bytes / sizeof(T));
        std::memcpy(values.data(), text.data() + place + sizeof bytes, bytes);
        return values;
    }

    std::string text;

private:
    std::size_t data_ = 0;
};

using Int32s = std::vector<std::int32_t>;
using Bytes = std::vector<std::uint8_t>;

} // namespace

TEST(Vtu, OfTwoInstances_HasBothInTheirPlaces) {
    const Vtu vtu(
        R"("parts": {"P": {"mesh": {"nodes": {"labels": [5, 6], "coordinates": [[0, 0, 0], [1, 0, 0]]},
            "elements": [{"type": "T3D2", "labels": [9], "connectivity": [[5, 6]]}],
            "sets": [{"name": "END", "kind": "node", "labels": [6]}, {"name": "ALL", "kind": "element", "labels": [9]}]},
            "sectionAssignments": [{"region": "ALL", "sectionName": "S"}]}},
        "materials": {"Steel": {}}, "sections": {"S": {"class": "kseC_TrussSection", "materialName": "Steel"}},
        "assembly": {"instances": {"A": {"part": "P"}, "B": {"part": "P", "translation": [0, 5, 0]}},
                     "sets": [{"name": "ONE", "kind": "element", "members": [{"instance": "B", "labels": [9]}]}]})");
    EXPECT_NE(vtu.text.find("NumberOfPoints=\"4\" NumberOfCells=\"2\""), std::string::npos);
    EXPECT_EQ(vtu.Array<float>("Points"), (Floats{0, 0, 0, 1, 0, 0, 0, 5, 0, 1, 5, 0}));
    EXPECT_EQ(vtu.Array<std::int32_t>("connectivity"), (Int32s{0, 1, 2, 3}));
    EXPECT_EQ(vtu.Array<std::int64_t>("offsets"), (std::vector<std::int64_t>{2, 4}));
    EXPECT_EQ(vtu.Array<std::uint8_t>("types"), (Bytes{3, 3}));
    EXPECT_EQ(vtu.Array<std::int32_t>("Element"), (Int32s{9, 9}));
    EXPECT_EQ(vtu.Array<std::int32_t>("Node"), (Int32s{5, 6, 5, 6}));
    EXPECT_EQ(vtu.Array<std::int32_t>("Instance"), (Int32s{0, 1}));
    EXPECT_EQ(vtu.Array<std::int32_t>("Section"), (Int32s{0, 0}));
    EXPECT_EQ(vtu.Array<std::int32_t>("Material"), (Int32s{0, 0}));
    EXPECT_EQ(vtu.Array<std::uint8_t>("END"), (Bytes{0, 1, 0, 1}));
    EXPECT_EQ(vtu.Array<std::uint8_t>("ALL"), (Bytes{1, 1}));
    EXPECT_EQ(vtu.Array<std::uint8_t>("Assembly.ONE"), (Bytes{0, 1}));
    // "Steel" as bytes.
    EXPECT_NE(vtu.text.find("83 116 101 101 108 0\n"), std::string::npos);
}

TEST(Vtu, OfUnknownElements_HasGroupsOfPoints) {
    const Vtu vtu(MeshModel("[0,0,0],[1,0,0],[2,0,0]", 3,
                            R"({"type": "XYZ3", "labels": [1], "connectivity": [[1,2,3]]})"));
    EXPECT_EQ(vtu.Array<std::uint8_t>("types"), (Bytes{2}));
    EXPECT_EQ(vtu.Array<std::int32_t>("connectivity"), (Int32s{0, 1, 2}));
}

TEST(Vtu, OfQuadraticHexahedra_KeepsTheNodesOrder) {
    std::string places;
    std::string nodes;
    for (int i = 1; i <= 20; ++i) {
        places += (i == 1 ? "[" : ", [") + std::to_string(i) + ", 0, 0]";
        nodes += (i == 1 ? "" : ", ") + std::to_string(i);
    }
    const Vtu vtu(
        MeshModel(places, 20, R"({"type": "C3D20", "labels": [1], "connectivity": [[)" + nodes + "]]}"));
    Int32s expected(20);
    for (int i = 0; i < 20; ++i) expected[static_cast<std::size_t>(i)] = i;
    EXPECT_EQ(vtu.Array<std::int32_t>("connectivity"), expected);
    EXPECT_EQ(vtu.Array<std::uint8_t>("types"), (Bytes{25}));
}
