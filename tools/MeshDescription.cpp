#include "tools/MeshDescription.h"

#include "foundation/mq_MeshQuality.h"
#include "store_interface/findings/fnd_Text.h"
#include "tools/NumberText.h"
#include "tools/TextTable.h"

#include <algorithm>

using nlohmann::ordered_json;

namespace {

constexpr const char* kDimensionWords[] = {"point", "edge", "surface", "volume"};

ordered_json Box(const msf_Mesh& mesh) {
    double box[2][3] = {};
    for (std::size_t i = 0; i < mesh.coordinates.size(); ++i) {
        const auto value = static_cast<double>(mesh.coordinates[i]);
        double& least = box[0][i % 3];
        double& most = box[1][i % 3];
        least = i < 3 ? value : std::min(least, value);
        most = i < 3 ? value : std::max(most, value);
    }
    return {{"min", {box[0][0], box[0][1], box[0][2]}}, {"max", {box[1][0], box[1][1], box[1][2]}}};
}

double SizeOf(const msf_Mesh& mesh, const msf_Run& run) {
    const msf_Block& block = mesh.blocks[static_cast<std::size_t>(run.block)];
    double size = 0.0;
    for (int cell = run.begin; cell < run.end; ++cell)
        size += mq_SizeOf(block.kind, block.Row(cell), mesh.coordinates);
    return size;
}

ordered_json CountOf(const mq_Count& count) {
    return {{"count", count.count}, {"first", count.first}};
}

} // namespace

ordered_json DescribeMeshFile(const msf_Mesh& mesh, const mq_Quality& quality) {
    ordered_json root = {{"format", mesh.format}, {"nodes", mesh.NumNodes()}, {"box", Box(mesh)}};
    ordered_json& cells = root["cells"] = ordered_json::array();
    for (std::size_t i = 0; i < mesh.blocks.size(); ++i) {
        const msf_Block& block = mesh.blocks[i];
        if (block.NumCells() == 0) continue;
        cells.push_back({{"kind", cel_CellOf(block.kind).name},
                         {"dimension", cel_CellOf(block.kind).dimension},
                         {"count", block.NumCells()},
                         {"size", SizeOf(mesh, {static_cast<int>(i), 0, block.NumCells()})}});
    }
    ordered_json& groups = root["groups"] = ordered_json::array();
    for (const msf_Group& group : mesh.groups) {
        double size = 0.0;
        for (const msf_Run& run : group.cells) size += SizeOf(mesh, run);
        groups.push_back({{"name", group.name},
                          {"dimension", group.dimension},
                          {"cells", group.NumCells()},
                          {"nodes", group.nodes.size()},
                          {"size", size}});
    }
    root["quality"] = {{"inverted", CountOf(quality.inverted)},
                       {"farMidSides", CountOf(quality.farMidSides)},
                       {"repeatedNodes", CountOf(quality.repeatedNodes)},
                       {"repeatedElements", CountOf(quality.repeatedElements)},
                       {"unusedNodes", CountOf(quality.unusedNodes)},
                       {"sharedFaces", CountOf(quality.sharedFaces)}};
    root["notes"] = mesh.notes;
    return root;
}

std::string TextOfMeshFile(const std::string& path, const ordered_json& mesh) {
    std::string text = fnd_Visible(path) + ": " + mesh["format"].get<std::string>() + "\n  " +
                       std::to_string(mesh["nodes"].get<long long>()) + " nodes, from " +
                       PointText(mesh["box"]["min"]) + " to " + PointText(mesh["box"]["max"]) + "\n";
    constexpr const char* kSizeWords[] = {"", "length ", "area ", "volume "};
    const auto sizeText = [&](const ordered_json& object) {
        const auto dimension = object["dimension"].get<std::size_t>();
        return dimension == 0 ? std::string() : kSizeWords[dimension] + NumberText(object["size"]);
    };
    TextTable cells;
    for (const ordered_json& kind : mesh["cells"]) {
        cells.Row({kind["kind"], std::to_string(kind["count"].get<long long>()), sizeText(kind)});
    }
    text += "  cells\n" + cells.Text("    ");
    TextTable groups;
    for (const ordered_json& group : mesh["groups"]) {
        const auto count = group["cells"].get<long long>();
        groups.Row({kDimensionWords[group["dimension"].get<std::size_t>()],
                    fnd_Visible(group["name"].get<std::string>()),
                    count > 0 ? std::to_string(count) + " cells"
                              : std::to_string(group["nodes"].get<long long>()) + " nodes",
                    sizeText(group)});
    }
    text += "  groups (" + std::to_string(mesh["groups"].size()) + ")\n" + groups.Text("    ");
    return text;
}

ordered_json DescribeOrigins(const std::list<mdf_MeshOrigin>& origins) {
    ordered_json list = ordered_json::array();
    for (const mdf_MeshOrigin& origin : origins) {
        ordered_json entry = {{"pointer", origin.place}, {"file", origin.path}, {"format", origin.format}};
        ordered_json& cells = entry["cells"] = ordered_json::object();
        for (const auto& [kind, count] : origin.cells) cells[kind] = count;
        ordered_json& sets = entry["sets"] = ordered_json::array();
        for (const mdf_MeshOrigin::Set& set : origin.sets) {
            sets.push_back({{"name", set.name},
                            {"kind", set.kind},
                            {"members", set.members},
                            {"group", set.group},
                            {"dimension", set.dimension}});
        }
        entry["notes"] = origin.notes;
        list.push_back(std::move(entry));
    }
    return list;
}

std::string TextOfOrigins(const ordered_json& origins) {
    std::string text = "mesh files\n";
    for (const ordered_json& origin : origins) {
        text += "  " + fnd_Visible(origin["file"].get<std::string>()) + " (" +
                origin["format"].get<std::string>() + "), for " + origin["pointer"].get<std::string>() + "\n";
        TextTable sets;
        for (const ordered_json& set : origin["sets"]) {
            const std::string group = set["group"];
            const std::string from = std::string(kDimensionWords[set["dimension"].get<std::size_t>()]) +
                                     " group '" + fnd_Visible(group) + "'";
            sets.Row({set["name"],
                      set["kind"].get<std::string>() == "surface" ? "surface"
                                                                  : set["kind"].get<std::string>() + " set",
                      std::to_string(set["members"].get<long long>()),
                      group.empty() ? "all elements" : from});
        }
        text += sets.Text("    ");
    }
    return text;
}
