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
    /// Faces of elements whose type the table of types doesn't know, and nodes that their mesh doesn't know,
    /// are passed over.
    std::vector<Key> Of(const rgnC_Region& region) const;
    /// A number for each node of the model, 0 at first.
    class Numbers {
    public:
        explicit Numbers(const dck_Nodes& nodes);
        int& At(Key node) { return numbers_[PlaceOf(node)]; }
        int At(Key node) const { return numbers_[PlaceOf(node)]; }

    private:
        std::size_t PlaceOf(Key node) const {
            return begins_[static_cast<std::size_t>(node >> 32U)] + static_cast<std::uint32_t>(node);
        }
        std::vector<std::size_t> begins_; // of the meshes
        std::vector<int> numbers_;
    };
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
