#ifndef QRX_FOUNDATION_MQ_MESHQUALITY_H
#define QRX_FOUNDATION_MQ_MESHQUALITY_H

#include "foundation/cel_Cells.h"

#include <vector>

/// Cells of one kind over flat arrays: N labels, N rows of `width` places of nodes. A row may be longer than
/// the kind has nodes; places beyond the mesh's nodes are passed over.
struct mq_Block {
    cel_KindEnm kind = cel_KindEnm::POINT1;
    std::span<const int> labels;
    std::span<const int> nodes;
    int width = 1;
    /// Plane cells lie in the plane of x and y and have a right way round.
    bool plane = false;
    /// False: the cells only use nodes; their size, sides and repetitions are their own affair.
    bool hasShape = true;
};

struct mq_Mesh {
    std::span<const int> nodeLabels;
    std::span<const float> coordinates;
    std::vector<mq_Block> blocks;
};

/// How many there are, and the labels of the first ones.
struct mq_Count {
    static constexpr std::size_t kShown = 5;

    long long count = 0;
    std::vector<int> first;

    void Add(int label) {
        if (count++ < static_cast<long long>(kShown)) first.push_back(label);
    }
};

struct mq_Quality {
    /// Elements whose volume (plane ones: area) is negative or zero, and lines and surfaces of no size.
    mq_Count inverted;
    /// Elements with a mid-side node far from the middle of its edge: more than 0.3 of the edge's length from
    /// its middle half.
    mq_Count farMidSides;
    /// Nodes at the place of an earlier one.
    mq_Count repeatedNodes;
    /// Elements with the nodes of an earlier one of their kind.
    mq_Count repeatedElements;
    /// Nodes that no cell has.
    mq_Count unusedNodes;
    /// Solids with a face that three or more share.
    mq_Count sharedFaces;
};

/// Looks at all of it, in time linear in the mesh. Cells share repeated nodes only where they have one place.
mq_Quality mq_QualityOf(const mq_Mesh& mesh);

/// Length, area or volume of a cell with straight edges; of solids negative when they are turned inside out.
double mq_SizeOf(cel_KindEnm kind, const int* row, std::span<const float> coordinates);

#endif
