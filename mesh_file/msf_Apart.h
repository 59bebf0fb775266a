#ifndef QRX_MESH_FILE_MSF_APART_H
#define QRX_MESH_FILE_MSF_APART_H

#include "mesh_file/msf_Readers.h"

/// Reads in a process of its own, for libraries that a damaged file can bring down: when it dies, the file is
/// refused.
void msf_ReadApart(void (*read)(const msf_Input& input, const msf_Options& options, msf_Mesh& mesh),
                   const msf_Input& input, const msf_Options& options, msf_Mesh& mesh);

#endif
