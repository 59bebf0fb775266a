#ifndef QRX_STORE_ODIK_MESH_H
#define QRX_STORE_ODIK_MESH_H

#include "foundation/cel_LabelIndex.h"
#include "store_interface/findings/fnd_Finding.h"
#include "store_interface/model/ddb_ElementShape.h"
#include "store_interface/records/part_attributes/bme_ElemCtrlParams.h"
#include "store_interface/regions/rgnC_SetData.h"

#include <span>
#include <unordered_map>

/// A node of an instance that an element of the assembly's mesh ends at.
struct odiK_ForeignNode {
    cow_String instanceName;
    int label = 0;
};

/// The nodes of a mesh: user labels, and coordinates in single precision, three a node.
struct odiK_NodeData {
    cow_List<int> labels;
    std::vector<float> coordinates;
    /// Only in the assembly's mesh; such a node's index is the number of own nodes plus its place here.
    std::vector<odiK_ForeignNode> foreign;
    cel_LabelIndex index;

    int NumNodes() const { return labels.Length(); }
    std::size_t NumWithForeign() const { return static_cast<std::size_t>(NumNodes()) + foreign.size(); }
    /// The label of an own or a foreign node. An index beyond them raises.
    int Label(int index) const;
};

/// Elements of one type: labels, and for each element the indices of its nodes, in one flat row after
/// another.
struct odiK_ElementClass {
    cow_String type;
    int nodesPerElement = 0;
    std::vector<int> labels;
    std::vector<int> connectivity;
    bme_ElemCtrlParams controls;
    ddb_ElementShape shape;
    /// Place of the first element among all elements of the mesh.
    int firstElementIndex = 0;

    int NumElements() const { return static_cast<int>(labels.size()); }
};

/// A facet as the user states it: a face name such as "S1", "SPOS" or "END2", or the facet's id from 0.
struct odiK_FacetInput {
    int elementLabel = 0;
    int id = -1;
    std::string_view face; // empty: the id counts
};

/// The elements `begin` to `end` - 1 of a class.
struct odiK_ElementRun {
    int classIndex = 0;
    int begin = 0;
    int end = 0;
};

/// A set on its way into a mesh.
struct odiK_SetInput {
    cow_String name;
    res_SetTypeEnm type = res_SetTypeEnm::NODES;
    bool internal = false;
    std::span<const int> labels;
    std::span<const odiK_FacetInput> facets;
    /// Elements of the mesh by place, before those of `labels`.
    std::span<const odiK_ElementRun> runs = {};
};

/// A mesh: nodes, elements in classes of one type, and named sets. Elements find their nodes and sets their
/// members by user label when they are added, so nodes come first and sets last.
class odiK_Mesh {
public:
    const odiK_NodeData& Nodes() const { return nodes_; }
    const std::vector<odiK_ElementClass>& Classes() const { return classes_; }
    const std::vector<cow_CountedHld<odiK_Set>>& Sets() const { return sets_; }
    int NumElements() const { return numElements_; }

    /// Sets the nodes: positive labels that do not repeat, three coordinates a label.
    void SetNodes(std::vector<int> labels, std::vector<float> coordinates, fnd_Sink& problems);
    void SetNodes(std::vector<int> labels, std::vector<float> coordinates);
    /// Adds a class: positive labels, and for each element a row of `nodesPerElement` node labels.
    void AddElements(const cow_String& type, std::vector<int> labels, int nodesPerElement,
                     std::vector<int> nodeLabels, const bme_ElemCtrlParams& controls, fnd_Sink& problems);
    void AddElements(const cow_String& type, std::vector<int> labels, int nodesPerElement,
                     std::vector<int> nodeLabels, const bme_ElemCtrlParams& controls = {});
    /// The same where the nodes are given by index, foreign ones included; for the assembly's mesh.
    void AddElementsByIndex(const cow_String& type, std::vector<int> labels, int nodesPerElement,
                            std::vector<int> nodeIndices, const bme_ElemCtrlParams& controls,
                            fnd_Sink& problems);
    /// The index of a node in an instance, for AddElementsByIndex.
    int AddForeignNode(const cow_String& instanceName, int label);
    /// Looks for element labels that stand twice in the mesh; to be called when all classes are there. The
    /// places begin with "/elements/<class>".
    void FinishElements(fnd_Sink& problems);
    /// Adds a set whose name is new in the mesh and whose members are there.
    void AddSet(const odiK_SetInput& input, fnd_Sink& problems);
    void AddNodeSet(const cow_String& name, const std::vector<int>& labels, bool internal = false);
    void AddElementSet(const cow_String& name, const std::vector<int>& labels, bool internal = false);
    void AddSurface(const cow_String& name, const std::vector<odiK_FacetInput>& facets,
                    bool internal = false);

    /// The place of a set, or -1.
    int FindSet(const cow_String& name) const;
    /// The class and the place in it of an element; false when there is none.
    bool FindElement(int label, int& classIndex, int& place) const;
    /// The place of an element among all elements of the mesh, or -1.
    int FindElementIndex(int label) const {
        if (indexedClasses_ != classes_.size()) IndexElements();
        return elementIndex_.Find(label);
    }
    int FindNode(int label) const { return nodes_.index.Find(label); }

    /// Appends the subsets that the members of the input give: one for nodes, for elements and facets one for
    /// each run of members of one class, in the order given. `place` is prefixed to the problems' places.
    void AppendSubsets(const odiK_SetInput& input, int meshIndex, std::vector<rgnC_SubsetData>& subsets,
                       const std::string& place, fnd_Sink& problems) const;

private:
    cel_LabelIndex::Repetitions IndexElements() const;

    odiK_NodeData nodes_;
    std::vector<odiK_ElementClass> classes_;
    std::vector<cow_CountedHld<odiK_Set>> sets_;
    std::unordered_map<std::string_view, int> setIndex_;
    int numElements_ = 0;
    // Over the labels of all classes, one class behind the other.
    mutable cel_LabelIndex elementIndex_;
    mutable std::size_t indexedClasses_ = 0;
};

/// The facet id of a face name on an element of the shape, or -1.
int odiK_FacetOfFace(const ddb_ElementShape& shape, std::string_view face);
/// Whether the facet id can be on an element of the shape: 0, 1 and 6 by the rule of shells, 0 and 1 for the
/// ends of lines, else 0 to 5.
bool odiK_FacetFits(const ddb_ElementShape& shape, int facet);

#endif
