#ifndef QRX_MODEL_FILE_MDF_CONSTRAINTCHECKS_H
#define QRX_MODEL_FILE_MDF_CONSTRAINTCHECKS_H

#include "model_file/mdf_Diagnostics.h"
#include "store_interface/model/odiK_Model.h"

/// An error for each term of an equation that has a coordinate system and whose set is no node set of the
/// assembly: the system is put on that set.
void mdf_CheckEquationSystems(odiK_Model& model, mdf_Diagnostics& diagnostics, const mdf_Path& path);

#endif
