#include "mesh/oif_Node.h"

#include "foundation/num_Digits.h"

#include <algorithm>
#include <cmath>

namespace {

constexpr int kLabelWidth = 7;
// A label of eleven characters and three coordinates of thirteen, and the room that the last one wants.
constexpr std::size_t kLineRoom = 64 + num_RealRoom(12, 7);

} // namespace

oif_Node::oif_Node(const ddb_PartInstance& instance, const qkw_ModelInfo&)
    : sourceKind_(1), nodeData_(instance.mesh().nodeData()) {}

oif_Node::oif_Node(const ddb_Assembly& assembly, const qkw_ModelInfo&) {
    if (assembly.hasMesh()) nodeData_ = assembly.mesh().nodeData();
}

double oif_Node::FindSmallestReal(double x) {
    return std::pow(10.0, -10.0) * x;
}

void oif_Node::Write(utl_Stream& stream) const {
    if (!nodeData_ || nodeData_->NumNodes() == 0) return;
    stream << "*Node" << endl;
    const uti_CoordCont3D coordinates = nodeData_->CoordContainer();
    cow_List<int> labels;
    nodeData_->GetUserNodeLabels(labels);
    stream.PrintItems(static_cast<std::size_t>(labels.Length()), kLineRoom,
                      [&](std::size_t begin, std::size_t end, char* out) {
                          int i = static_cast<int>(begin);
                          while (i < static_cast<int>(end)) {
                              int length = 0;
                              const int* run = labels.ConstRun(i, length);
                              length = std::min(length, static_cast<int>(end) - i);
                              for (int k = 0; k < length; ++k) {
                                  const uti_Coord3D at = coordinates.ConstGet(i + k);
                                  out = WriteDataLine(out, run[k], at.x, at.y, at.z);
                              }
                              i += length;
                          }
                          return out;
                      });
    stream.Flush();
}

char* oif_Node::WriteDataLine(char* out, int label, float x, float y, float z) const {
    const auto coordinate = [&out, this](float value) {
        *out++ = ',';
        *out++ = ' ';
        out = num_WriteFloat(out, std::fabs(value) < smallReal_ ? 0.0F : value);
    };
    out = static_cast<std::uint32_t>(label) <= num_mostInField
              ? num_WriteField(out, static_cast<std::uint32_t>(label), kLabelWidth, ',') - 1
              : num_WriteInt(out, label, kLabelWidth);
    coordinate(x);
    coordinate(y);
    if (threeDimensional_) coordinate(z);
    *out++ = '\n';
    return out;
}
