#ifndef QRX_MODEL_FILE_MDF_MODELREADER_H
#define QRX_MODEL_FILE_MDF_MODELREADER_H

#include "model_file/mdf_TreeReader.h"
#include "store_interface/model/odiK_Repositories.h"

/// Reads one model of a model file into an empty model of a store.
class mdf_ModelReader {
public:
    /// The given meshes must outlive the reader.
    mdf_ModelReader(odiK_Model& model, mdf_Diagnostics& diagnostics,
                    const mdf_GivenMeshes& given = mdf_NoGivenMeshes)
        : model_(model), diagnostics_(diagnostics), records_(model, diagnostics),
          tree_(model, records_, diagnostics, given) {}

    /// Takes meshes that are there already from the shelf, which must outlive the reader.
    void TakeFrom(mdf_MeshShelf& shelf) { tree_.TakeFrom(shelf); }
    void Read(mdf_Value& json, const fnd_Path& path);
    /// Reads one object of a repository anew into a complete model that has it; an object that lives across
    /// steps is worked out for these. No other object, no step and nothing of the tree may differ from what
    /// the file says.
    void ReadAnew(const odiK_Repository& repository, const std::string& name, const mdf_Value& json,
                  const fnd_Path& place, const kprC_Timeline& timeline);

private:
    void ReadRepository(const odiK_Repository& info, const mdf_Value& json, const fnd_Path& path);
    std::unique_ptr<cls_Record> ReadObject(const odiK_Repository& info, const mdf_Value& json,
                                           const fnd_Path& place);
    void PropagateObject(kprC_PropagatingObject& object, const kprC_Timeline& timeline,
                         const fnd_Path& place);
    void ReadSteps(const mdf_Value& json, const fnd_Path& path);
    void ReadStep(const mdf_Value& json, bool isFirst, const fnd_Path& path, mdf_CapitalsCheck& capitals);
    void Propagate(const fnd_Path& path);

    odiK_Model& model_;
    mdf_Diagnostics& diagnostics_;
    mdf_RecordReader records_;
    mdf_TreeReader tree_;
};

#endif
