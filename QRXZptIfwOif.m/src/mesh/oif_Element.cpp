#include "mesh/oif_Element.h"

#include "base/oif_KeywordLine.h"
#include "base/oif_ModelInfo.h"
#include "foundation/num_Digits.h"
#include "foundation/thr_InOrder.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "store_interface/model/odiK_Mesh.h"

#include <algorithm>
#include <cstring>
#include <type_traits>
#include <vector>

namespace {

constexpr int kPlacesOfLine = 16;
constexpr int kWidestNodeField = 7;

/// What the lines of an element take at most: numbers of eleven characters and their commas, ends of lines,
/// indents, and the room that the last number wants.
std::size_t RoomOfRow(int numNodes) {
    constexpr std::size_t line = 12 * kPlacesOfLine + 14;
    return static_cast<std::size_t>(numNodes / kPlacesOfLine + 1) * line + num_IntRoom(kWidestNodeField);
}

/// Numbers with a comma behind each. `fits`: none of them is negative or has more digits than the field.
template <bool fits, class LabelOf>
char* WriteFields(char* out, const int* nodes, int count, const LabelOf& labelOf, int width) {
    for (int i = 0; i < count; ++i) {
        if constexpr (fits) {
            out = num_WriteField(out, static_cast<std::uint32_t>(labelOf(nodes[i])), width, ',');
        } else {
            out = num_WriteInt(out, labelOf(nodes[i]), width);
            *out++ = ',';
        }
    }
    return out;
}

/// The nodes of an element, to the end of its last line.
template <bool fits, class LabelOf>
char* WriteNodes(char* out, const int* nodes, int numNodes, const LabelOf& labelOf, int width, int indent) {
    if (numNodes == 0) return out;
    // The element's label is the first number of the first line.
    int onLine = std::min(numNodes, kPlacesOfLine - 1);
    for (int j = 0;; onLine = std::min(numNodes - j, kPlacesOfLine)) {
        // The last number of an element is never indented, also where it begins a line.
        if (j > 0 && numNodes - j > 1) {
            std::memset(out, ' ', static_cast<std::size_t>(indent));
            out += indent;
        }
        out = WriteFields<fits>(out, nodes + j, onLine, labelOf, width);
        j += onLine;
        if (j == numNodes) break;
        *out++ = '\n';
    }
    out[-1] = '\n';
    return out;
}

int NumDigits(int value) {
    int digits = value < 0 ? 2 : 1;
    while ((value /= 10) != 0) ++digits;
    return digits;
}

} // namespace

oif_Element::oif_Element(int label, int nodeLabel, const cow_String& type, const cow_String& elset)
    : firstNumber_(label), secondNumber_(nodeLabel), elset_(elset), singleForm_(true), withHeader_(true),
      type_(type) {}

oif_Element::oif_Element(int elementOffset, int nodeOffset, const ddb_ElementClass& elements,
                         const cow_String& elset)
    : firstNumber_(elementOffset), secondNumber_(nodeOffset), elements_(elements), elset_(elset),
      singleForm_(false), withHeader_(true) {}

oif_Element::oif_Element(int elementOffset, int nodeOffset, const ddb_ElementClass& elements,
                         const ddb_Mesh& mesh, bool)
    : firstNumber_(elementOffset), secondNumber_(nodeOffset), elements_(elements), mesh_(mesh),
      singleForm_(false), withHeader_(false) {}

void oif_Element::Write(utl_Stream& stream) const {
    if (withHeader_) {
        oif_KeywordLine(stream, "*Element")
            .Fixed(", type=", singleForm_ ? type_ : elements_->elementTypeLabel())
            .FixedUnless(", elset=", elset_, cow_String())
            .End();
    }
    if (singleForm_) {
        stream << firstNumber_ << ", " << secondNumber_ << endl;
        return;
    }
    WriteConnectivity(stream);
    if (withHeader_) stream.Flush();
}

/// What the labels behind connectivity say of the fields that they need.
struct oif_Element::LabelScan {
    int largest = 0;
    bool areNatural = true;
};

template <class LabelOf>
oif_Element::LabelScan oif_Element::Scan(int threads, const std::vector<int>& connectivity,
                                         const LabelOf& labelOf) {
    constexpr std::size_t pieceLength = std::size_t{1} << 18;
    std::vector<LabelScan> pieces((connectivity.size() + pieceLength - 1) / pieceLength);
    thr_ForEach(threads, pieces.size(), [&](std::size_t piece) {
        const std::size_t begin = piece * pieceLength;
        const std::size_t end = std::min(begin + pieceLength, connectivity.size());
        int largest = 0;
        int least = 0;
        for (std::size_t i = begin; i < end; ++i) {
            const int label = labelOf(connectivity[i]);
            largest = std::max(largest, label);
            least = std::min(least, label);
        }
        pieces[piece] = {largest, least == 0};
    });
    LabelScan whole;
    for (const LabelScan& piece : pieces) {
        whole.largest = std::max(whole.largest, piece.largest);
        whole.areNatural = whole.areNatural && piece.areNatural;
    }
    return whole;
}

void oif_Element::WriteConnectivity(utl_Stream& stream) const {
    const std::vector<int>& connectivity = elements_->elementConnectivity();
    // A walk before the text finds the widest label, and with it any index that has no label.
    const auto itself = [](int index) { return index; };
    LabelScan indices = Scan(stream.Threads(), connectivity, itself);
    if (!mesh_) {
        // Where all are negative, the widest is that nearest to 0.
        if (!connectivity.empty()) indices.largest = *std::ranges::max_element(connectivity);
        WriteRows(stream, itself, indices);
        return;
    }
    const odiK_NodeData& nodes = mesh_->mesh().Nodes();
    if (!indices.areNatural || indices.largest >= nodes.NumNodes()) {
        for (const int index : connectivity) nodes.labels.CheckIndex(index);
    }
    int first = 0;
    if (nodes.index.IsRun(first)) {
        WriteRows(stream, [first](int index) { return first + index; },
                  {connectivity.empty() ? 0 : first + indices.largest, first >= 0});
        return;
    }
    // The blocks of the label list, so that a look-up reads two addresses and no counts.
    const cow_List<int>& labels = nodes.labels;
    const int shift = labels.Shift();
    const int mask = (1 << shift) - 1;
    const int begin = labels.First();
    std::vector<const int*> blocks(static_cast<std::size_t>(begin >> shift), nullptr);
    for (int i = 0; i < labels.Length();) {
        int length = 0;
        const int* run = labels.ConstRun(i, length);
        blocks.push_back(run - ((begin + i) & mask));
        i += length;
    }
    const auto labelOf = [table = blocks.data(), shift, mask, begin](int index) {
        return table[(begin + index) >> shift][(begin + index) & mask];
    };
    WriteRows(stream, labelOf, Scan(stream.Threads(), connectivity, labelOf));
}

template <class LabelOf>
void oif_Element::WriteRows(utl_Stream& stream, const LabelOf& labelOf, const LabelScan& scan) const {
    const std::vector<int>& labels = elements_->userElementLabelsAsFlatArray();
    const int numNodes = elements_->numNodesPerElement();
    const int nodeWidth = std::min(NumDigits(scan.largest) + 1, kWidestNodeField);
    int largestElement = 0;
    for (const int label : labels) largestElement = std::max(largestElement, label);
    const int elementWidth = NumDigits(largestElement);

    const int* const connectivity = elements_->elementConnectivity().data();
    const auto layOut = [&]<bool fits>(std::bool_constant<fits>) {
        return [&, numNodes, nodeWidth, elementWidth](std::size_t begin, std::size_t end, char* out) {
            const int* node = connectivity + begin * static_cast<std::size_t>(numNodes);
            for (std::size_t i = begin; i < end; ++i, node += numNodes) {
                out = num_WriteInt(out, labels[i], elementWidth);
                *out++ = ',';
                out = WriteNodes<fits>(out, node, numNodes, labelOf, nodeWidth, elementWidth + 1);
            }
            return out;
        };
    };
    const std::size_t room = RoomOfRow(numNodes);
    if (scan.areNatural && scan.largest <= static_cast<int>(num_mostInField)) {
        stream.PrintItems(labels.size(), room, layOut(std::true_type()));
    } else {
        stream.PrintItems(labels.size(), room, layOut(std::false_type()));
    }
}

void oif_ElementFromMesh::AddKeyword(Types& types, const cow_String& type, const qkw_Keyword& keyword) {
    types.GetOrInsert(type).Append(keyword);
}

void oif_ElementFromMesh::Write(utl_Stream& stream) const {
    const ddb_Mesh mesh = instance_.mesh();
    const ddb_ElementData elementData = mesh.elementData();
    Types types;
    for (int i = 0; i < elementData.numClasses(); ++i) {
        const ddb_ElementClass elements = elementData.elementClass(i);
        const cow_String& type = elements.elementTypeLabel();
        // Surface elements are not written here.
        if (type.Find("SURF") >= 0) continue;
        AddKeyword(types, type,
                   oif_Element(modelInfo_->AssyElementOffsets(instance_.name()),
                               modelInfo_->AssyNodeOffsets(instance_.name()), elements, mesh, false));
    }
    for (cow_ConstMapIterator<cow_String, qkw_KeywordList> it(types); !it.IsDone(); it.Next()) {
        stream << "*Element, type=" << it.CurrentKey() << endl;
        const qkw_KeywordList& keywords = it.CurrentValue();
        for (int i = 0; i < keywords.Length(); ++i) keywords[i].ConstGet().Write(stream);
    }
    stream.Flush();
}

void oif_AssemblyElement::Write(utl_Stream& stream) const {
    stream << "*Element, type="
           << "CONN3D2";
    stream.LineBreak();
    const rgnC_SetData& set = region_.ConstSet().Data();
    for (int s = 0; s < set.NumSubSets(); ++s) {
        const rgnC_SubsetData subset = set.SubSet(s);
        const ddb_Mesh mesh = modelInfo_->Model().Model().mesh(subset.MeshIndex());
        const ddb_ScopedNodeData nodes(mesh.nodeData());
        const ddb_ElementClass elements = mesh.elementData().elementClass(subset.ClassIndex());
        const int numNodes = elements.numNodesPerElement();
        for (int i = 0; i < subset.Subset().Length(); ++i) {
            const auto element = static_cast<std::size_t>(subset.Subset()[i]);
            stream << elements.userElementLabelsAsFlatArray()[element] << ", ";
            for (int j = 0; j < numNodes; ++j) {
                const int node = elements.elementConnectivity()[element * static_cast<std::size_t>(numNodes) +
                                                                static_cast<std::size_t>(j)];
                if (j > 0) stream << ", ";
                if (!nodes.isNativeNode(node)) {
                    stream << qkw_QuorixName(nodes.getPartInstance(node).Shortcut().Name(), false) << ".";
                }
                stream << nodes.GetUserNodeLabel(static_cast<unsigned>(node));
            }
            stream << endl;
        }
    }
}
