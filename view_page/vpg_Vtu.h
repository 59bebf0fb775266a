#ifndef QRX_VPG_VTU_H
#define QRX_VPG_VTU_H

#include "store_interface/model/odb_Odb.h"

#include <functional>
#include <string_view>

/// Writes the meshes of the model named "Default Model", each instance in its place, as one unstructured grid
/// in VTU form with appended raw data. Cells have the arrays Element (label), Instance, Section and Material
/// (places among the names in the field data, -1 for none), and a flag for each set of elements and each
/// surface; points have Node (label) and a flag for each set of nodes. A set of a part has its own name, a
/// set of the assembly "Assembly." ahead of it. Elements of no known shape are groups of points.
void vpg_WriteVtu(const odb_Odb& odb, const std::function<void(std::string_view)>& out);

#endif
