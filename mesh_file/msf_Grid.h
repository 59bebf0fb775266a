#ifndef QRX_MESH_FILE_MSF_GRID_H
#define QRX_MESH_FILE_MSF_GRID_H

#include "mesh_file/msf_VtkGrid.h"

#include <span>

/// A group beside a grid in memory: places, from 0, of cells among all of them or of points.
struct msf_GridGroup {
    std::string name;
    bool ofPoints = false;
    std::vector<long long> places;
};

/// Takes an unstructured grid that is in memory, with groups, as the readers take one from a file. False,
/// with the reason, when it was refused.
bool msf_TakeGrid(const msf_VtkGrid& grid, std::span<const msf_GridGroup> groups, const msf_Options& options,
                  msf_Mesh& mesh, msf_Problem& problem);

#endif
