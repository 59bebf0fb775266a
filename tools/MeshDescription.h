#ifndef QRX_TOOLS_MESHDESCRIPTION_H
#define QRX_TOOLS_MESHDESCRIPTION_H

#include "mesh_file/msf_Mesh.h"
#include "model_file/mdf_ModelFile.h"

#include <nlohmann/json.hpp>

#include <list>

struct mq_Quality;

/// A mesher's mesh for JSON: nodes, cells by kind, box, groups with dimension and size, quality, notes.
nlohmann::ordered_json DescribeMeshFile(const msf_Mesh& mesh, const mq_Quality& quality);
/// The same for people, without quality and notes, which are messages.
std::string TextOfMeshFile(const std::string& path, const nlohmann::ordered_json& mesh);

/// What the meshes of a model got from mesher's files: format, cells, and each set with its group.
nlohmann::ordered_json DescribeOrigins(const std::list<mdf_MeshOrigin>& origins);
std::string TextOfOrigins(const nlohmann::ordered_json& origins);

#endif
