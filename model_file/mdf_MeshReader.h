#ifndef QRX_MODEL_FILE_MDF_MESHREADER_H
#define QRX_MODEL_FILE_MDF_MESHREADER_H

#include "model_file/mdf_MeshShelf.h"
#include "model_file/mdf_RecordReader.h"

/// Reads meshes and sets. Bulk arrays are moved out of the document, so that they never stand twice in
/// memory.
class mdf_MeshReader {
public:
    mdf_MeshReader(odiK_Model& model, mdf_RecordReader& records, mdf_Diagnostics& diagnostics,
                   const mdf_GivenMeshes& given)
        : model_(model), records_(records), diagnostics_(diagnostics), given_(given) {}

    /// Takes meshes that are there already from the shelf, which must outlive the reader.
    void TakeFrom(mdf_MeshShelf& shelf) { shelf_ = &shelf; }
    /// The mesh of a part or an instance.
    cow_CountedHld<odiK_Mesh> ReadMesh(mdf_Value& json, const fnd_Path& path);
    /// The assembly's own mesh: no sets, and ends of elements may lie in instances, which must be there.
    void ReadAssemblyMesh(mdf_Value& json, const fnd_Path& path);
    /// The sets of the assembly.
    void ReadAssemblySets(mdf_Value& json, const fnd_Path& path);

    /// A mesher's file gave no mesh.
    bool LacksMesh() const { return lacksMesh_; }

private:
    cow_CountedHld<odiK_Mesh> ReadNewMesh(mdf_Value& json, const fnd_Path& path);

    struct Members {
        std::vector<int> labels;
        std::vector<odiK_FacetInput> facets;
        mdf_Value facetText; // keeps the face names alive
        bool empty = true;
    };

    void ReadNodesAndElements(odiK_Mesh& mesh, mdf_Value& json, const fnd_Path& path, bool inAssembly);
    void ReadNodes(odiK_Mesh& mesh, mdf_Value& json, const fnd_Path& path);
    void ReadElements(odiK_Mesh& mesh, mdf_Value& json, const fnd_Path& path, bool inAssembly);
    void ReadElementClass(odiK_Mesh& mesh, mdf_Value& json, const fnd_Path& path, bool inAssembly);
    bool ReadConnectivity(mdf_Value& json, const fnd_Path& path, std::size_t numElements, int& width,
                          std::vector<int>& nodes);
    bool ReadScopedConnectivity(odiK_Mesh& mesh, const mdf_Value& json, const fnd_Path& path,
                                std::size_t numElements, int& width, std::vector<int>& nodes);
    int ReadScopedNode(odiK_Mesh& mesh, const mdf_Value& json, const fnd_Path& path);
    /// Calls `read(set, path, head)` for each set whose head is good.
    template <class Reader>
    void ForEachSet(mdf_Value& json, const fnd_Path& path, const Reader& read);
    void ReadSets(odiK_Mesh& mesh, mdf_Value& json, const fnd_Path& path);
    bool ReadSetHead(odiK_SetHead& head, const mdf_Value& json, const fnd_Path& path,
                     mdf_CapitalsCheck& capitals);
    bool ReadMembers(Members& members, res_SetTypeEnm type, mdf_Value& json, const fnd_Path& path,
                     std::size_t mostLabels);
    /// One entry of a set of the assembly; the members must outlive the input.
    bool ReadEntry(odiK_MemberInput& input, Members& members, res_SetTypeEnm type, mdf_Value& json,
                   const fnd_Path& path);
    bool ReadFacets(std::vector<odiK_FacetInput>& facets, const mdf_Value& json, const fnd_Path& path);
    /// `most` is the largest number of labels that can be right, so that a wild range costs nothing.
    bool ReadLabels(std::vector<int>& labels, mdf_Value& json, const fnd_Path& path, std::size_t most);

    bool IsIncomplete(const odiK_Mesh* mesh) const { return incomplete_.count(mesh) != 0; }

    odiK_Model& model_;
    mdf_RecordReader& records_;
    mdf_Diagnostics& diagnostics_;
    const mdf_GivenMeshes& given_;
    // Meshes that lack nodes or elements because of errors: what refers to these is not reported too.
    std::set<const odiK_Mesh*> incomplete_;
    bool lacksMesh_ = false;
    mdf_MeshShelf* shelf_ = nullptr;
};

#endif
