#ifndef QRX_VPG_MESH_H
#define QRX_VPG_MESH_H

#include "foundation/cel_Cells.h"
#include "store_interface/model/odiK_Mesh.h"

#include <array>
#include <cstdint>
#include <string>
#include <unordered_map>
#include <utility>
#include <vector>

/// What a cell of the page is of the model.
enum class vpg_RoleEnm {
    SOLID,     ///< a face of a solid, on the skin
    SHELL,     ///< a shell, whose two sides differ
    SHEET,     ///< another plane or surface element
    LINE,      ///< a beam, a truss or another line
    CONNECTOR, ///< an element between two places of the assembly
    POINT,     ///< a point element
    UNKNOWN,   ///< an element that the page doesn't know the shape of: its first node
    FACET,     ///< a facet of a surface that is on no skin; shown with its surface alone
};
const char* vpg_WordOf(vpg_RoleEnm role);

constexpr std::size_t vpg_Index(int index) {
    return static_cast<std::size_t>(index);
}

/// Cells of the page that are alike: of one element class, role and kind.
struct vpg_Block {
    vpg_RoleEnm role = vpg_RoleEnm::SOLID;
    cel_KindEnm kind = cel_KindEnm::POINT1;
    int classIndex = 0;
    int firstCell = 0;
    /// For each cell: its nodes, as the mesh counts them; the element's place in its class; of facets and
    /// faces the side's number from 0.
    std::vector<int> nodes;
    std::vector<int> elements;
    std::vector<int> sides;

    int NumCells() const { return static_cast<int>(elements.size()); }
};

/// The cells that a page draws of a mesh: the skin of solids, which is the faces that occur once, all other
/// elements, and facets of surfaces that are on no skin. Cells are counted through all blocks.
class vpg_Mesh {
public:
    /// `foreign` are the coordinates of the mesh's foreign nodes, behind one another.
    explicit vpg_Mesh(const odiK_Mesh& mesh, std::vector<float> foreign = {});

    const odiK_Mesh& Mesh() const { return mesh_; }
    const std::vector<vpg_Block>& Blocks() const { return blocks_; }
    int NumCells() const { return numCells_; }
    int NumNodes() const { return numNodes_; }
    std::array<float, 3> Place(int node) const;
    int FirstElement(int classIndex) const {
        return mesh_.Classes()[vpg_Index(classIndex)].firstElementIndex;
    }

    /// The cell of an element's side (0, 1, ...), made when there is none yet; of an element that is drawn
    /// itself, its own cell where the side is one of a shell's. -1 when the element has no such side.
    int CellOfFacet(int classIndex, int element, int side);
    /// Appends the cells of an element but for mere facets. `element` counts through all classes.
    void AppendCellsOf(int element, std::vector<int>& cells) const;
    /// Places of the elements, through all classes, that the cells are of; in the order of the cells.
    std::vector<int> ElementsOfCells() const;
    /// Element types of no known shape, and how many elements each has.
    std::vector<std::pair<std::string, int>> UnknownTypes() const;

private:
    /// An element and 0, or its side from 1; and the cell.
    using Entry = std::pair<std::uint64_t, int>;

    static std::uint64_t KeyOf(int element, int side) {
        return static_cast<std::uint64_t>(element) << 4 | static_cast<unsigned>(side + 1);
    }
    void AddSkin();
    void AddElements(int classIndex);
    vpg_Block& BlockFor(vpg_RoleEnm role, cel_KindEnm kind, int classIndex);
    int AddCell(vpg_Block& block, int element, int side, const int* row, const std::int8_t* places);
    void Number();
    int FindCell(std::uint64_t key) const;
    int AddFacet(int classIndex, int element, int side);

    const odiK_Mesh& mesh_;
    std::vector<float> foreign_;
    int numNodes_;
    std::vector<vpg_Block> blocks_;
    int numCells_ = 0;
    std::vector<Entry> cellOf_;
    // Facets on no skin come one by one when the others are numbered.
    std::unordered_map<std::uint64_t, int> facets_;
};

/// The cell that elements of a class are, if their shape is known.
const cel_Cell* vpg_CellOf(const odiK_ElementClass& elements);

/// The edges of a mesh's cells where its shape has an edge: where a face ends, where more than two meet, and
/// where two meet at an angle. Pairs of nodes, mid-side nodes between two of them.
std::vector<int> vpg_FeatureEdges(const vpg_Mesh& mesh);

#endif
