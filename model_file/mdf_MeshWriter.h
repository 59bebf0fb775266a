#ifndef QRX_MODEL_FILE_MDF_MESHWRITER_H
#define QRX_MODEL_FILE_MDF_MESHWRITER_H

#include "model_file/mdf_ModelFile.h"
#include "model_file/mdf_RecordWriter.h"

/// Writes meshes and sets.
class mdf_MeshWriter {
public:
    /// Meshes of mesher's files that `origins` tells of stay there, as a model file in `folder` names them.
    mdf_MeshWriter(mdf_Writer& out, mdf_RecordWriter& records, const odiK_Model& model,
                   const std::list<mdf_MeshOrigin>& origins, const std::string& folder)
        : out_(out), records_(records), model_(model), origins_(origins), folder_(folder) {}

    void WriteMesh(const odiK_Mesh& mesh);
    /// An array.
    void WriteAssemblySets();

private:
    void WriteOrigin(const mdf_MeshOrigin& origin);
    void WriteNodes(const odiK_NodeData& nodes);
    void WriteElements(const odiK_NodeData& nodes, const odiK_ElementClass& elements);
    void WriteEnd(const odiK_NodeData& nodes, int node);
    void WriteHead(const odiK_Set& set);
    void WriteMembers(const odiK_Mesh& mesh, const odiK_Set& set, std::span<const rgnC_SubsetData> subsets);
    void WriteEntry(const odiK_Set& set, const rgnC_SubsetData& subset);

    mdf_Writer& out_;
    mdf_RecordWriter& records_;
    const odiK_Model& model_;
    const std::list<mdf_MeshOrigin>& origins_;
    const std::string& folder_;
};

#endif
