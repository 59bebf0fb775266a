#include "mesh_file/msf_MeshFile.h"

#include "mesh_file/msf_Readers.h"

#include <algorithm>

namespace {

constexpr msf_Format kFormats[] = {
    {"MED", msf_IsMed, msf_ReadMed}, {"VTK", msf_IsVtk, msf_ReadVtk}, {"MSH", msf_IsMsh, msf_ReadMsh},
    {"VTU", msf_IsVtu, msf_ReadVtu}, {"STL", msf_IsStl, msf_ReadStl}, {"UNV", msf_IsUnv, msf_ReadUnv},
};

/// Points are nodes to everyone but those who ask for their cells.
void AddNodesOfPoints(msf_Mesh& mesh) {
    for (msf_Group& group : mesh.groups) {
        if (group.dimension != 0) continue;
        for (const msf_Run& run : group.cells) {
            const msf_Block& block = mesh.blocks[static_cast<std::size_t>(run.block)];
            group.nodes.insert(group.nodes.end(), block.nodes.begin() + run.begin,
                               block.nodes.begin() + run.end);
        }
        std::sort(group.nodes.begin(), group.nodes.end());
        group.nodes.erase(std::unique(group.nodes.begin(), group.nodes.end()), group.nodes.end());
    }
}

void Read(const msf_Input& input, const msf_Options& options, msf_Mesh& mesh) {
    if (input.bytes.empty()) msf_Fail("", "the file is empty", "a mesh");
    for (const msf_Format& format : kFormats) {
        if (!format.is(input.bytes)) continue;
        format.read(input, options, mesh);
        if (mesh.nodeLabels.empty()) msf_Fail("", "the file has no nodes", "a mesh");
        AddNodesOfPoints(mesh);
        return;
    }
    msf_Fail("",
             "the file begins with " +
                 msf_Shown(input.bytes.substr(0, std::min<std::size_t>(16, input.bytes.find('\n')))),
             "a mesh as MSH, VTU, VTK, UNV, STL or MED");
}

template <class Action>
bool Guarded(const Action& action, msf_Mesh& mesh, msf_Problem& problem) {
    mesh = msf_Mesh();
    try {
        action();
        return true;
    } catch (const msf_Failure& failure) {
        problem = failure.problem;
        return false;
    }
}

} // namespace

std::span<const msf_Format> msf_Formats() {
    return kFormats;
}

bool msf_ReadMeshFile(const std::string& path, const msf_Options& options, msf_Mesh& mesh,
                      msf_Problem& problem) {
    return Guarded(
        [&] {
            const msf_MappedFile file(path);
            Read({file.Bytes(), path}, options, mesh);
        },
        mesh, problem);
}

bool msf_ReadMeshBytes(std::string_view bytes, const msf_Options& options, msf_Mesh& mesh,
                       msf_Problem& problem) {
    return Guarded([&] { Read({bytes, {}}, options, mesh); }, mesh, problem);
}
