#ifndef QRX_MODEL_FILE_MDF_MODELREADER_H
#define QRX_MODEL_FILE_MDF_MODELREADER_H

#include "model_file/mdf_MeshReader.h"

/// Reads one model of a model file into an empty model of a store.
class mdf_ModelReader {
public:
    mdf_ModelReader(odiK_Model& model, mdf_Diagnostics& diagnostics)
        : model_(model), diagnostics_(diagnostics), records_(model, diagnostics),
          meshes_(model, records_, diagnostics) {}

    void Read(mdf_Value& json, const mdf_Path& path);

private:
    void ReadScalars(const mdf_Value& json, const mdf_Path& path);
    void ReadDatums(const mdf_Value& json, const mdf_Path& path);
    void ReadDatum(const mdf_Value& json, const mdf_Path& path, mdf_CapitalsCheck& capitals);
    bool CheckAxes(const odiK_Datum& datum, bool zGiven, const mdf_Path& path);
    void ReadParts(mdf_Value& json, const mdf_Path& path);
    void ReadAssembly(mdf_Value& json, const mdf_Path& path);
    void ReadInstances(mdf_Value& json, const mdf_Path& path);
    void ReadInstance(const cow_String& name, mdf_Value& json, const mdf_Path& path);
    void ReadAttributeInputs(std::vector<odiK_AttributeInput>& inputs, unsigned type, const mdf_Value& json,
                             const mdf_Path& path);
    void CheckAttributeInputs(const std::vector<odiK_AttributeInput>& inputs, const odiK_Mesh* mesh,
                              const std::string& pointer);
    void CheckPartAttributes();
    void ReadAssemblyAttributes(mdf_Value& json, const mdf_Path& path);
    void ReadRepository(mdl_Repository& repository, const char* kind, const mdf_Value& json,
                        const mdf_Path& path);
    void ReadRepositories(const mdf_Value& json, const mdf_Path& path);
    void ReadSteps(const mdf_Value& json, const mdf_Path& path);
    void Propagate(const mdf_Path& path);

    /// Calls `read` for the member if it is there.
    template <class Reader>
    void WithMember(mdf_Value& json, const mdf_Path& path, const char* member, const Reader& read);
    bool CheckName(const std::string& name, const mdf_Path& path);
    bool ReadFloats(float (&values)[3], const mdf_Value& json, const mdf_Path& path);
    bool ReadDirection(gsl_Vector& vector, const mdf_Value& json, const mdf_Path& path);

    odiK_Model& model_;
    mdf_Diagnostics& diagnostics_;
    mdf_RecordReader records_;
    mdf_MeshReader meshes_;
};

#endif
