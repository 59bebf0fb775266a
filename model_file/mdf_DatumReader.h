#ifndef QRX_MODEL_FILE_MDF_DATUMREADER_H
#define QRX_MODEL_FILE_MDF_DATUMREADER_H

#include "model_file/mdf_RecordReader.h"

/// Reads the datums of a model.
class mdf_DatumReader {
public:
    mdf_DatumReader(odiK_Model& model, mdf_RecordReader& records, mdf_Diagnostics& diagnostics)
        : model_(model), records_(records), diagnostics_(diagnostics) {}

    void ReadDatums(const mdf_Value& json, const fnd_Path& path);

private:
    void ReadDatum(const mdf_Value& json, const fnd_Path& path, mdf_CapitalsCheck& capitals);
    /// `zGiven`: the file gives the third axis.
    bool CheckAxes(const odiK_Datum& datum, bool zGiven, const fnd_Path& path);

    odiK_Model& model_;
    mdf_RecordReader& records_;
    mdf_Diagnostics& diagnostics_;
};

#endif
