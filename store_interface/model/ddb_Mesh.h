#ifndef QRX_STORE_DDB_MESH_H
#define QRX_STORE_DDB_MESH_H

#include "store_interface/model/ddb_ElementShape.h"
#include "store_interface/regions/rgnC_Region.h"

// What the views look at.
class bme_ElemCtrlParams;
class ddb_PartInstance;
class odiK_Mesh;
class odiK_Model;
struct odiK_ElementClass;

/// Single-precision coordinates of one node.
struct uti_Coord3D {
    float x;
    float y;
    float z;
};

/// The coordinates of a mesh's nodes, as the store holds them: one flat array.
class uti_CoordCont3D {
public:
    explicit uti_CoordCont3D(const std::vector<float>& xyz) : xyz_(&xyz) {}
    int Length() const { return static_cast<int>(xyz_->size() / 3); }
    /// Unchecked.
    uti_Coord3D ConstGet(int index) const {
        const float* place = xyz_->data() + 3 * static_cast<std::size_t>(index);
        return {place[0], place[1], place[2]};
    }

private:
    const std::vector<float>* xyz_;
};

/// View on the nodes of a mesh.
class ddb_NodeData {
public:
    /// `instanceName` is empty for the assembly's mesh.
    ddb_NodeData(const cow_CountedHld<odiK_Mesh>& mesh, const cow_CountedHld<odiK_Model>& model,
                 const cow_String& instanceName)
        : mesh_(mesh), model_(model), instanceName_(instanceName) {}

    /// Number of the mesh's own nodes.
    int NumNodes() const;
    uti_CoordCont3D CoordContainer() const;
    /// The user's label of a node index; an index outside the nodes raises.
    int GetUserNodeLabel(unsigned index) const;
    /// All labels in the order of the nodes; shared, not copied.
    void GetUserNodeLabels(cow_List<int>& labels) const;
    /// The index of a label, or -1.
    int GetMeshNodeIndex(int label) const;

protected:
    cow_CountedHld<odiK_Mesh> mesh_;
    cow_CountedHld<odiK_Model> model_;
    cow_String instanceName_;
};

/// The same, with the answer to whom a node belongs: in an instance's mesh to the instance, in the assembly's
/// to the assembly itself (a native node) or to an instance.
class ddb_ScopedNodeData : public ddb_NodeData {
public:
    explicit ddb_ScopedNodeData(const ddb_NodeData& nodes) : ddb_NodeData(nodes) {}
    bool isNativeNode(int index) const { return instanceName_.IsEmpty() && index < NumNodes(); }
    /// The instance that a node that is not native belongs to; raises when there is none.
    ddb_PartInstance getPartInstance(int index) const;
};

/// View on one element class of a mesh.
class ddb_ElementClass {
public:
    ddb_ElementClass(const cow_CountedHld<odiK_Mesh>& mesh, int index) : mesh_(mesh), index_(index) {}

    int numElements() const;
    int numNodesPerElement() const;
    const cow_String& elementTypeLabel() const;
    /// Node indices, numNodesPerElement() for each element.
    const std::vector<int>& elementConnectivity() const;
    /// The user's labels, one for each element.
    const std::vector<int>& userElementLabelsAsFlatArray() const;
    const ddb_ElementShape& shape() const;

private:
    const odiK_ElementClass& Class() const;

    cow_CountedHld<odiK_Mesh> mesh_;
    int index_;
};

/// View on the elements of a mesh.
class ddb_ElementData {
public:
    explicit ddb_ElementData(const cow_CountedHld<odiK_Mesh>& mesh) : mesh_(mesh) {}
    int numClasses() const;
    int numElements() const;
    /// A class index outside the classes raises.
    ddb_ElementClass elementClass(int index) const;

private:
    cow_CountedHld<odiK_Mesh> mesh_;
};

/// View on a set. `id` is its place among the sets of its owner.
class ddb_Set {
public:
    ddb_Set(int id, const rgnC_Region& region) : id_(id), region_(region) {}
    const cow_String& setLabel() const { return region_.SetName(); }
    res_SetTypeEnm setType() const { return static_cast<res_SetTypeEnm>(set().Kind()); }
    const rgnC_SetData& set() const { return region_.ConstSet().Data(); }
    const ddr_Shortcut& Shortcut() const { return region_.Shortcut(); }
    int Id() const { return id_; }
    /// The region that this set is.
    const rgnC_Region& Region() const { return region_; }

private:
    int id_;
    rgnC_Region region_;
};

class ddb_SetListIT;

/// The sets of a mesh or of the assembly, in the order of the model.
class ddb_SetList {
public:
    /// `instanceName` is empty for the assembly's sets.
    ddb_SetList(const cow_CountedHld<odiK_Model>& model, const cow_String& instanceName)
        : model_(model), instanceName_(instanceName) {}
    int size() const;
    ddb_Set get(int index) const;
    ddb_SetListIT createIterator() const;

    static ddb_Set ItemAt(const ddb_SetList& sets, int index) { return sets.get(index); }
    using ConstIterator = cow_IndexIterator<ddb_SetList, &ItemAt>;
    ConstIterator begin() const { return {*this, 0}; }
    ConstIterator end() const { return {*this, size()}; }

private:
    const std::vector<cow_CountedHld<odiK_Set>>* Sets() const;

    cow_CountedHld<odiK_Model> model_;
    cow_String instanceName_;
};

class ddb_SetListIT {
public:
    explicit ddb_SetListIT(const ddb_SetList& sets) : sets_(sets), size_(sets.size()) {}
    void first() { index_ = 0; }
    void next() { ++index_; }
    bool isDone() const { return index_ >= size_; }
    ddb_Set currentItem() const { return sets_.get(index_); }

private:
    ddb_SetList sets_;
    int size_;
    int index_ = 0;
};

/// View on the mesh of an instance or of the assembly. Instances of one part show one mesh, each under an
/// index of its own.
class ddb_Mesh {
public:
    ddb_Mesh(const cow_CountedHld<odiK_Mesh>& mesh, const cow_CountedHld<odiK_Model>& model,
             const cow_String& instanceName, int meshIndex)
        : mesh_(mesh), model_(model), instanceName_(instanceName), meshIndex_(meshIndex) {}

    ddb_NodeData nodeData() const { return {mesh_, model_, instanceName_}; }
    ddb_ElementData elementData() const { return ddb_ElementData(mesh_); }
    ddb_SetList set() const { return {model_, instanceName_}; }
    int meshIndex() const { return meshIndex_; }
    const odiK_Mesh& mesh() const { return *mesh_; }
    /// A handle that keeps the mesh alive.
    const cow_CountedHld<odiK_Mesh>& Handle() const { return mesh_; }

private:
    cow_CountedHld<odiK_Mesh> mesh_;
    cow_CountedHld<odiK_Model> model_;
    cow_String instanceName_;
    int meshIndex_;
};

/// Element classes as the section code sees them: their controls and where their elements stand.
class bme_ElementClass {
public:
    explicit bme_ElementClass(const odiK_ElementClass& elements) : class_(&elements) {}
    const bme_ElemCtrlParams& GetElemControlParams() const;
    int FirstElementIndex() const;
    int NumElements() const;

private:
    const odiK_ElementClass* class_;
};

class bme_ElementData {
public:
    explicit bme_ElementData(const odiK_Mesh& mesh) : mesh_(&mesh) {}
    unsigned NumClasses() const;
    /// An index outside the classes raises.
    bme_ElementClass GetClass(unsigned index) const;

private:
    const odiK_Mesh* mesh_;
};

#endif
