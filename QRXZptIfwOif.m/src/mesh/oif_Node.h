#ifndef QRX_OIF_NODE_H
#define QRX_OIF_NODE_H

#include "keyword_layer/qkw_Keyword.h"
#include "keyword_layer/qkw_ModelInfo.h"

#include <optional>

/// The nodes of an instance, or of the assembly's own mesh:
///     *Node
///           1,           0.,          -1.,          2.5
/// Labels and single-precision coordinates go straight from the store's arrays to the stream. Without nodes
/// nothing is written.
class oif_Node final : public qkw_KeywordOf<oif_Node> {
public:
    oif_Node() = default;
    oif_Node(const ddb_PartInstance& instance, const qkw_ModelInfo& modelInfo);
    oif_Node(const ddb_Assembly& assembly, const qkw_ModelInfo& modelInfo);
    void Write(utl_Stream& stream) const override;

    /// One ten-billionth of a scale of coordinates: below that a coordinate would be as good as zero. No deck
    /// uses it, coordinates go out unfiltered.
    static double FindSmallestReal(double x);

private:
    char* WriteDataLine(char* out, int label, float x, float y, float z) const;

    [[maybe_unused]] int sourceKind_ = 0; // 1: a part instance; nothing reads it
    bool threeDimensional_ = true;
    double smallReal_ = 0.0;
    std::optional<ddb_NodeData> nodeData_;
};

#endif
