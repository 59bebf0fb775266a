#ifndef QRX_MODEL_FILE_MDF_MODELREADER_H
#define QRX_MODEL_FILE_MDF_MODELREADER_H

#include "model_file/mdf_TreeReader.h"
#include "store_interface/model/odiK_Repositories.h"

/// Reads one model of a model file into an empty model of a store.
class mdf_ModelReader {
public:
    /// The given meshes must outlive the reader.
    mdf_ModelReader(odiK_Model& model, mdf_Diagnostics& diagnostics, const mdf_GivenMeshes& given)
        : model_(model), diagnostics_(diagnostics), records_(model, diagnostics),
          tree_(model, records_, diagnostics, given) {}

    void Read(mdf_Value& json, const fnd_Path& path);

private:
    void ReadRepository(const odiK_Repository& info, const mdf_Value& json, const fnd_Path& path);
    void ReadSteps(const mdf_Value& json, const fnd_Path& path);
    void ReadStep(const mdf_Value& json, bool isFirst, const fnd_Path& path, mdf_CapitalsCheck& capitals);
    void Propagate(const fnd_Path& path);

    odiK_Model& model_;
    mdf_Diagnostics& diagnostics_;
    mdf_RecordReader records_;
    mdf_TreeReader tree_;
};

#endif
