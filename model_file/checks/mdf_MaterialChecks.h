#ifndef QRX_MODEL_FILE_MDF_MATERIALCHECKS_H
#define QRX_MODEL_FILE_MDF_MATERIALCHECKS_H

#include "model_file/checks/mdf_RecordChecks.h"
#include "store_interface/model/odiK_Model.h"

/// An option of a material that its deck can't carry.
struct mdf_IdleOption {
    cow_String material;
    const char* option;
    /// True: an ordinary option of a gasket material; false: a gasket option of an ordinary one.
    bool ofGasket;
};

/// Which options gaskets leave out, by the sections that name the materials.
std::vector<mdf_IdleOption> mdf_IdleGasketOptions(const odiK_Model& model);
/// Warns of them.
void mdf_CheckGasketOptions(const odiK_Model& model, mdf_Diagnostics& diagnostics, const mdf_Path& path);

#endif
