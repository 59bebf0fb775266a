#ifndef QRX_MESH_FILE_MSF_MESHFILE_H
#define QRX_MESH_FILE_MSF_MESHFILE_H

#include "mesh_file/msf_Mesh.h"
#include "mesh_file/msf_Source.h"

#include <string_view>

/// Reads a mesher's file, whose format is told by its content. False, with the reason, when it was refused.
bool msf_ReadMeshFile(const std::string& path, const msf_Options& options, msf_Mesh& mesh,
                      msf_Problem& problem);
/// The same of a file's bytes.
bool msf_ReadMeshBytes(std::string_view bytes, const msf_Options& options, msf_Mesh& mesh,
                       msf_Problem& problem);

#endif
