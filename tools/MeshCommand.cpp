#include "deck_checks/dck_Check.h"
#include "foundation/mq_MeshQuality.h"
#include "mesh_file/msf_MeshFile.h"
#include "tools/Commands.h"
#include "tools/MeshDescription.h"

ExitCode RunMesh(const MeshRequest& request, RunReport& report) {
    msf_Options options;
    options.groupArrays = request.groupArrays;
    options.part = request.part;
    msf_Mesh mesh;
    msf_Problem problem;
    if (!msf_ReadMeshFile(request.mesh, options, mesh, problem)) {
        const std::string found = (problem.place.empty() ? "" : problem.place + ": ") + problem.found;
        if (problem.unreadable) {
            report.Add(request.mesh, fnd_Make("unreadable-file", {}, found));
            return ExitCode::FILE_SYSTEM_REFUSED;
        }
        report.Add(request.mesh, fnd_Make("mesh-file", {}, found, problem.expected));
        return ExitCode::MODEL_IS_WRONG;
    }
    mq_Mesh arrays{mesh.nodeLabels, mesh.coordinates, {}};
    for (const msf_Block& block : mesh.blocks)
        arrays.blocks.push_back({block.kind, block.labels, block.nodes, block.Width(), false, true});
    const mq_Quality quality = mq_QualityOf(arrays);
    nlohmann::ordered_json& described = report.Member("mesh") = DescribeMeshFile(mesh, quality);
    report.Print(TextOfMeshFile(request.mesh, described));
    for (const std::string& note : mesh.notes) report.Add(request.mesh, fnd_Make("mesh-file-note", {}, note));
    fnd_List list;
    dck_TellQuality(quality, {}, list);
    for (const fnd_Finding& finding : list.findings) report.Add(request.mesh, finding);
    return ExitCode::DONE;
}
