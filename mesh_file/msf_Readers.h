#ifndef QRX_MESH_FILE_MSF_READERS_H
#define QRX_MESH_FILE_MSF_READERS_H

#include "mesh_file/msf_Mesh.h"

#include <span>
#include <string_view>

// The readers of the formats, each in a file of its own: one tells by the first bytes whether a file is of
// its format, and fills an empty mesh, or raises msf_Failure.

/// Where a file's bytes are. Without a path the bytes are all there is.
struct msf_Input {
    std::string_view bytes;
    std::string path;
};

/// MSH 4.1 and 2.2, ASCII and binary: nodes in blocks of entities, which have physical groups.
bool msf_IsMsh(std::string_view bytes);
void msf_ReadMsh(const msf_Input& input, const msf_Options& options, msf_Mesh& mesh);
/// Universal files: numbered datasets between lines of "-1".
bool msf_IsUnv(std::string_view bytes);
void msf_ReadUnv(const msf_Input& input, const msf_Options& options, msf_Mesh& mesh);
/// VTK legacy files, ASCII and binary.
bool msf_IsVtk(std::string_view bytes);
void msf_ReadVtk(const msf_Input& input, const msf_Options& options, msf_Mesh& mesh);
/// VTK XML files of unstructured grids.
bool msf_IsVtu(std::string_view bytes);
void msf_ReadVtu(const msf_Input& input, const msf_Options& options, msf_Mesh& mesh);
/// STL, ASCII and binary: triangles without common nodes.
bool msf_IsStl(std::string_view bytes);
void msf_ReadStl(const msf_Input& input, const msf_Options& options, msf_Mesh& mesh);
/// MED 2 to 4, in HDF5.
bool msf_IsMed(std::string_view bytes);
void msf_ReadMed(const msf_Input& input, const msf_Options& options, msf_Mesh& mesh);

/// One format: its name, and its reader.
struct msf_Format {
    const char* name;
    bool (*is)(std::string_view bytes);
    void (*read)(const msf_Input& input, const msf_Options& options, msf_Mesh& mesh);
};
/// All formats, those with the surest marks first.
std::span<const msf_Format> msf_Formats();

#endif
