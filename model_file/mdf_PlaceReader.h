#ifndef QRX_MODEL_FILE_MDF_PLACEREADER_H
#define QRX_MODEL_FILE_MDF_PLACEREADER_H

#include "model_file/mdf_References.h"

/// Reads what records say of the model's tree: regions and datums, which must be there.
class mdf_PlaceReader {
public:
    mdf_PlaceReader(odiK_Model& model, const mdf_References& references, mdf_Diagnostics& diagnostics)
        : model_(model), references_(references), diagnostics_(diagnostics) {}

    /// Reads an array of regions of nodes, which are taken together as an internal set of the assembly.
    rgnC_Region ReadRegions(const mdf_Value& array, const fnd_Path& path);
    rgnC_Region ReadRegion(const mdf_Value& value, const fnd_Path& path);
    bool ReadDatum(dtmC_DatumRef& datum, const mdf_Value& json, const fnd_Path& path);
    /// Reports that there is no instance of the name.
    void ReportNoInstance(const std::string& name, const fnd_Path& path);

private:
    struct Names {
        std::string instance;
        std::string set;
    };

    bool ReadNames(Names& names, const mdf_Value& value, const fnd_Path& path);
    bool ReadDottedNames(Names& names, const mdf_Value& text, const fnd_Path& path);
    /// The hint for a set that stands with another owner; empty where none has it.
    std::string OwnerOf(const Names& names) const;
    void ReportNoSet(const Names& names, const fnd_Path& path);

    odiK_Model& model_;
    const mdf_References& references_;
    mdf_Diagnostics& diagnostics_;
};

#endif
