#include "mesh/oif_Node.h"

#include <cmath>

oif_Node::oif_Node(const ddb_PartInstance& instance, const qkw_ModelInfo&)
    : sourceKind_(1), nodeData_(instance.mesh().nodeData()), mesh_(&instance.mesh().mesh()) {}

oif_Node::oif_Node(const ddb_Assembly& assembly, const qkw_ModelInfo&) {
    if (assembly.hasMesh()) nodeData_ = assembly.mesh().nodeData();
}

double oif_Node::FindSmallestReal(double x) {
    return std::pow(10.0, -10.0) * x;
}

void oif_Node::Write(utl_Stream& stream) const {
    if (!nodeData_ || nodeData_->NumNodes() == 0) return;
    stream << "*Node" << endl;
    const utl_StreamSmallReal guard(stream, smallReal_);
    const uti_CoordCont3D coordinates = nodeData_->CoordContainer();
    cow_List<int> labels;
    nodeData_->GetUserNodeLabels(labels);
    for (int i = 0; i < labels.Length();) {
        int length = 0;
        const int* run = labels.ConstRun(i, length);
        for (int k = 0; k < length; ++k) {
            const uti_Coord3D at = coordinates.ConstGet(i + k);
            WriteDataLine(stream, run[k], at.x, at.y, at.z);
        }
        i += length;
    }
    stream.Flush();
}

void oif_Node::WriteDataLine(utl_Stream& stream, int label, float x, float y, float z) const {
    stream.Print(label, 7);
    stream << ", ";
    stream.Print(x, 12, 7);
    stream << ", ";
    stream.Print(y, 12, 7);
    if (threeDimensional_) {
        stream << ", ";
        stream.Print(z, 12, 7);
    }
    stream << "\n";
}
