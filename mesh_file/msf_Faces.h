#ifndef QRX_MESH_FILE_MSF_FACES_H
#define QRX_MESH_FILE_MSF_FACES_H

#include "mesh_file/msf_Mesh.h"

#include <span>

/// The side of an element that a boundary cell lies on.
struct msf_Face {
    int block = -1; // -1: there is none
    int cell = -1;
    int side = -1; // from 0
    /// How many elements have the face; of several the first by label counts.
    int behind = 0;
};

/// Finds, through the corner nodes, the face behind each cell of the runs, which are of dimension `dimension`
/// - 1, among the cells of dimension `dimension` of the blocks that are elements (a flag a block). The faces
/// stand run by run. In time linear in the mesh.
std::vector<msf_Face> msf_MatchFaces(const msf_Mesh& mesh, int dimension,
                                     const std::vector<bool>& areElements, std::span<const msf_Run> boundary);

#endif
