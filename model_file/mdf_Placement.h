#ifndef QRX_MODEL_FILE_MDF_PLACEMENT_H
#define QRX_MODEL_FILE_MDF_PLACEMENT_H

#include "model_file/mdf_Value.h"
#include "store_interface/findings/fnd_Finding.h"

/// Gives the first unknown members of a document the hint where a member of just that name may stand: within
/// the object that they were put into, such as sets in its mesh, in an object that this one lies in, or in a
/// neighbour that has a name, as an instance is one of a part. The schema tells.
void mdf_HintPlaces(const mdf_Value& root, std::vector<fnd_Finding>& findings);

#endif
