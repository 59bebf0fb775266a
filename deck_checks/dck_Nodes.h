#ifndef QRX_DCK_NODES_H
#define QRX_DCK_NODES_H

#include "store_interface/model/odiK_Model.h"

#include <cstdint>
#include <vector>

/// Which nodes regions consist of, through all meshes of a model. The model must not change meanwhile.
class dck_Nodes {
public:
    /// A node: its mesh's index above, its place in the mesh below.
    using Key = std::uint64_t;

    explicit dck_Nodes(const odiK_Model& model);

    /// The nodes of a node set, or of the elements or faces of another region, in ascending order, each once.
    /// Faces of elements whose type the table of types doesn't know are passed over.
    std::vector<Key> Of(const rgnC_Region& region) const;
    /// The label of a node and, in front of it, the instance: "BEAM-1.12".
    std::string NameOf(Key node) const;

private:
    const odiK_Mesh* MeshOf(int meshIndex) const;
    void Append(const rgnC_SubsetData& subset, int kind, std::vector<Key>& nodes) const;

    struct Entry {
        cow_String name;
        cow_CountedHld<odiK_Mesh> mesh;
    };
    std::vector<Entry> meshes_; // by mesh index
};

#endif
