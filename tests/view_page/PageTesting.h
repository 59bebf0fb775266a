#ifndef QRX_TESTS_VIEW_PAGE_PAGETESTING_H
#define QRX_TESTS_VIEW_PAGE_PAGETESTING_H

#include "model_file/mdf_ModelFile.h"
#include "view_page/vpg_Html.h"

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include <cstring>
#include <memory>

using Ints = std::vector<int>;
using Floats = std::vector<float>;

/// The store of a model with these members.
inline std::unique_ptr<odb_Odb> StoreOf(const std::string& members) {
    mdf_Report report;
    auto odb = mdf_ReadModelText(
        R"({"format": "qrx-model/1", "models": {"Default Model": {)" + members + "}}}", "test", report);
    for (const fnd_Finding& finding : report.findings) {
        EXPECT_FALSE(finding.IsError()) << finding.place << ": " << finding.Text();
    }
    return odb;
}

/// The data of a page, with its arrays by number.
class PageOf {
public:
    explicit PageOf(const odb_Odb& odb)
        : data_(vpg_DataOf(odb, "title")), header(nlohmann::json::parse(data_.header)) {}
    explicit PageOf(const std::string& members) : PageOf(*StoreOf(members)) {}

    Ints IntsOf(const nlohmann::json& index) const {
        const nlohmann::json& entry = header["arrays"][index.get<std::size_t>()];
        const std::string type = entry["type"];
        if (type == "u8") return Read<std::uint8_t, int>(entry);
        if (type == "u16") return Read<std::uint16_t, int>(entry);
        if (type == "i16") return Read<std::int16_t, int>(entry);
        EXPECT_EQ(type, "i32");
        return Read<std::int32_t, int>(entry);
    }
    Floats FloatsOf(const nlohmann::json& index) const {
        return Read<float, float>(header["arrays"][index.get<std::size_t>()]);
    }
    /// The numbers of an array of runs.
    Ints Unrolled(const nlohmann::json& index) const {
        const Ints runs = IntsOf(index);
        Ints all;
        for (std::size_t i = 0; i + 1 < runs.size(); i += 2) {
            for (int k = 0; k < runs[i + 1]; ++k) all.push_back(runs[i] + k);
        }
        return all;
    }
    const nlohmann::json& Object(const std::string& name) const {
        for (const nlohmann::json& object : header["objects"]) {
            if (object["name"] == name) return object;
        }
        ADD_FAILURE() << "there is no object " << name;
        return header;
    }

private:
    template <class Item, class Value>
    std::vector<Value> Read(const nlohmann::json& entry) const {
        std::vector<Value> values;
        for (std::size_t i = 0; i < entry["length"].get<std::size_t>(); ++i) {
            Item item;
            std::memcpy(&item, data_.arrays.data() + entry["offset"].get<std::size_t>() + i * sizeof(Item),
                        sizeof(Item));
            values.push_back(static_cast<Value>(item));
        }
        return values;
    }

    vpg_PageData data_;

public:
    nlohmann::json header;
};

/// Members of a model with one instance I of a part with the mesh; sets are the mesh's.
inline std::string MeshModel(const std::string& coordinates, int nodes, const std::string& elements,
                             const std::string& sets = {}, const std::string& more = {}) {
    return R"("parts": {"P": {"mesh": {"nodes": {"labels": {"from": 1, "to": )" + std::to_string(nodes) +
           R"(}, "coordinates": [)" + coordinates + R"(]}, "elements": [)" + elements + R"(], "sets": [)" +
           sets + R"(]}}}, "assembly": {"instances": {"I": {"part": "P"}}})" +
           (more.empty() ? "" : ", " + more);
}

/// Two cubes, one beside the other along x; nodes are labelled by x first, then y, then z.
inline const std::string kTwoCubes = "[0,0,0],[1,0,0],[2,0,0],[0,1,0],[1,1,0],[2,1,0],"
                                     "[0,0,1],[1,0,1],[2,0,1],[0,1,1],[1,1,1],[2,1,1]";
inline const std::string kTwoHexahedra =
    R"({"type": "C3D8", "labels": [1, 2], "connectivity": [[1,2,5,4,7,8,11,10], [2,3,6,5,8,9,12,11]]})";

#endif
