// Any bytes as a mesher's file of one format (QRX_FUZZ_FORMAT): they are refused with a reason, or give a
// mesh whose arrays fit each other.

#include "mesh_file/msf_MeshFile.h"
#include "mesh_file/msf_Readers.h"

#include <cstdint>
#include <cstdlib>

namespace {

void Require(bool truth) {
    if (!truth) std::abort();
}

const msf_Format& Format() {
    for (const msf_Format& format : msf_Formats()) {
        if (std::string_view(format.name) == QRX_FUZZ_FORMAT) return format;
    }
    std::abort();
}

void RequireWhole(const msf_Mesh& mesh) {
    const auto nodes = static_cast<std::size_t>(mesh.NumNodes());
    Require(mesh.coordinates.size() == 3 * nodes);
    for (const int label : mesh.nodeLabels) Require(label > 0);
    for (const msf_Block& block : mesh.blocks) {
        Require(block.nodes.size() == block.labels.size() * static_cast<std::size_t>(block.Width()));
        for (const int node : block.nodes) Require(node >= 0 && static_cast<std::size_t>(node) < nodes);
        for (const int label : block.labels) Require(label > 0);
    }
    for (const msf_Group& group : mesh.groups) {
        Require(!group.name.empty());
        for (const int node : group.nodes) Require(node >= 0 && static_cast<std::size_t>(node) < nodes);
        for (const msf_Run& run : group.cells) {
            const msf_Block& block = mesh.blocks.at(static_cast<std::size_t>(run.block));
            Require(run.begin >= 0 && run.begin < run.end && run.end <= block.NumCells());
            Require(cel_CellOf(block.kind).dimension == group.dimension);
        }
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string_view bytes(reinterpret_cast<const char*>(data), size);
    msf_Options options;
    options.groupArrays = {"CellEntityIds"};
    for (int round = 0; round < 2; ++round) {
        msf_Mesh mesh;
        try {
            Format().read({bytes, {}}, options, mesh);
            RequireWhole(mesh);
            break;
        } catch (const msf_Failure& failure) {
            Require(!failure.problem.Text().empty());
            Require(!failure.problem.unreadable);
        }
        options.groupArrays.clear();
    }
    return 0;
}
