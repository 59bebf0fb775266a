#ifndef QRX_MODEL_FILE_MDF_MESHIMPORT_H
#define QRX_MODEL_FILE_MDF_MESHIMPORT_H

#include "mesh_file/msf_Faces.h"
#include "model_file/mdf_MeshFile.h"

/// Makes the mesh of a model of a mesher's mesh. Cells of the asked kinds become element classes; every group
/// becomes the sets that an engineer expects of it:
///
///     cells that are elements            element set NAME; of shells also the surface NAME_SPOS
///     cells on the faces of elements     surface NAME and node set NAME_NODES
///     other cells, points, nodes         node set NAME
///
/// Where the element groups don't split the elements among them, set ALL holds all of them. Classes run from
/// solids to points by kind, sets by dimension and name, members by their place among the elements: so
/// formats that list things in another order give the same deck.
class mdf_MeshImport {
public:
    /// The set of all elements, where one is made.
    static constexpr const char* kAllElements = "ALL";

    mdf_MeshImport(msf_Mesh&& source, const mdf_MeshFileRequest& request, mdf_MeshOrigin& origin,
                   fnd_Sink& problems)
        : source_(std::move(source)), request_(request), origin_(origin), problems_(problems) {}

    /// False when an error hinders it.
    bool Fill(odiK_Mesh& mesh);

private:
    /// A block whose cells become elements.
    struct Elements {
        int block = 0;
        std::string type;
        int width = 0; // nodes of the type, which may leave some of the cell's out
        ddb_ElementShape shape;
    };
    enum class Content { ELEMENTS, SHELL_SIDES, FACES, NODES_OF_FACES, NODES };
    struct SetPlan {
        std::string name;
        Content content = Content::ELEMENTS;
        std::size_t group = 0;
        /// A group of nodes of the same name, whose nodes are added.
        const msf_Group* nodes = nullptr;
    };
    struct Facet {
        int order; // of the block among the elements'
        int cell;
        int side;
    };

    // What becomes of cells and groups.
    bool ChooseTypes();
    bool ChooseType(int block, std::string& type);
    bool CheckType(cel_KindEnm kind, const std::string& type, Elements& elements);
    const char* DefaultType(cel_KindEnm kind) const;
    void RenumberElements();
    bool NameGroups();
    bool NameGroup(std::size_t group, std::string& name);
    void PlanSets(std::size_t group, const std::string& name);
    bool JoinNodes(std::size_t group, const std::string& name);
    bool CheckNames();
    bool MatchFaces();
    bool ReportFaces(std::size_t group, std::size_t first, std::size_t count);

    // Nodes and elements.
    void MarkNodes();
    void MarkNodesOf(const msf_Group& group);
    void AddNodes(odiK_Mesh& mesh);
    void AddElements(odiK_Mesh& mesh);
    std::vector<int> Connectivity(const Elements& elements);

    // Sets.
    void AddSets(odiK_Mesh& mesh);
    void AddSet(odiK_Mesh& mesh, const SetPlan& plan);
    void AddAllElements(odiK_Mesh& mesh);
    std::vector<msf_Run> ElementRuns(const msf_Group& group) const;
    std::vector<Facet> FacetsOf(std::size_t group) const;
    std::vector<int> NodesOf(const SetPlan& plan);
    std::vector<int> NodesOfFaces(std::size_t group) const;
    std::vector<int> NodesOfCells(std::size_t group);
    std::vector<int> NewPlaces(std::vector<int> places) const;
    void Remember(const SetPlan& plan, long long members);
    void Describe();

    bool IsElementBlock(int block) const { return orderOf_[static_cast<std::size_t>(block)] >= 0; }
    const msf_Block& Block(int block) const { return source_.blocks[static_cast<std::size_t>(block)]; }
    int MostDimension() const;
    void Note(std::string text);
    bool Fail(std::string found, std::string expected, std::string hint = {});

    msf_Mesh source_;
    const mdf_MeshFileRequest& request_;
    mdf_MeshOrigin& origin_;
    fnd_Sink& problems_;
    std::vector<Elements> elements_;
    /// Of each block its place in elements_, or -1.
    std::vector<int> orderOf_;
    std::vector<SetPlan> plans_;
    /// By group: the faces behind its cells.
    std::map<std::size_t, std::vector<msf_Face>> faces_;
    /// 1: a node of an element, 2: one that only a group names.
    std::vector<char> isUsed_;
    /// Places of the nodes that the sets of nodes hold.
    std::map<std::string, std::vector<int>> nodesOfPlans_;
    /// Of each node of the file its place in the mesh, or -1; empty: all are there.
    std::vector<int> newPlaces_;
};

#endif
