#ifndef QRX_MODEL_FILE_MDF_INTERACTIONCHECKS_H
#define QRX_MODEL_FILE_MDF_INTERACTIONCHECKS_H

#include "model_file/mdf_Diagnostics.h"
#include "store_interface/model/odiK_Model.h"

/// Reports lists in the states of general contact that are longer than the pairs that they belong to.
void mdf_CheckGeneralContact(const odiK_Model& model, mdf_Diagnostics& diagnostics, const mdf_Path& path);

#endif
