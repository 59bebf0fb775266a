#ifndef QRX_TESTS_MESH_FILE_MESHTEXTS_H
#define QRX_TESTS_MESH_FILE_MESHTEXTS_H

#include "mesh_file/msf_MeshFile.h"

#include <gtest/gtest.h>

#include <string>

/// Two tetrahedra on one triangle; the lower face is group "fix holes", both are group "solid".
inline std::string TwoTetrahedra() {
    return "$MeshFormat\n4.1 0 8\n$EndMeshFormat\n"
           "$PhysicalNames\n2\n2 5 \"fix holes\"\n3 1 \"solid\"\n$EndPhysicalNames\n"
           "$Entities\n0 0 1 1\n7 0 0 0 1 1 0 1 5 0\n9 0 0 0 1 1 1 1 1 1 7\n$EndEntities\n"
           "$Nodes\n1 5 1 5\n3 9 0 5\n1\n2\n3\n4\n5\n0 0 0\n1 0 0\n0 1 0\n0 0 1\n0 0 -1\n$EndNodes\n"
           "$Elements\n2 3 1 3\n2 7 2 1\n3 5 1 2\n3 9 4 2\n1 1 2 3 4\n2 1 3 2 5\n$EndElements\n";
}

inline std::string Replaced(std::string text, const std::string& from, const std::string& to) {
    const std::size_t place = text.find(from);
    EXPECT_NE(place, std::string::npos) << from;
    return place == std::string::npos ? text : text.replace(place, from.size(), to);
}

inline msf_Mesh MeshOf(const std::string& bytes, const msf_Options& options = {}) {
    msf_Mesh mesh;
    msf_Problem problem;
    EXPECT_TRUE(msf_ReadMeshBytes(bytes, options, mesh, problem)) << problem.Text();
    return mesh;
}

/// Why the bytes are refused.
inline std::string Refused(const std::string& bytes, const msf_Options& options = {}) {
    msf_Mesh mesh;
    msf_Problem problem;
    return msf_ReadMeshBytes(bytes, options, mesh, problem) ? "nothing" : problem.Text();
}

inline const msf_Group* FindGroup(const msf_Mesh& mesh, const std::string& name, int dimension) {
    for (const msf_Group& group : mesh.groups) {
        if (group.name == name && group.dimension == dimension) return &group;
    }
    return nullptr;
}

#endif
