#ifndef QRX_MODEL_FILE_MDF_TREEREADER_H
#define QRX_MODEL_FILE_MDF_TREEREADER_H

#include "model_file/mdf_DatumReader.h"
#include "model_file/mdf_MeshReader.h"

/// Reads the frame of a model: its data, datums, parts and assembly, field by field of their tables.
class mdf_TreeReader {
public:
    mdf_TreeReader(odiK_Model& model, mdf_RecordReader& records, mdf_Diagnostics& diagnostics,
                   const mdf_GivenMeshes& given)
        : model_(model), records_(records), diagnostics_(diagnostics), datums_(model, records, diagnostics),
          meshes_(model, records, diagnostics, given) {}

    /// Reads the fields of an object of the frame, in the order of its table.
    void ReadFields(cls_Record& frame, mdf_Value& json, const fnd_Path& path);
    /// Takes meshes that are there already from the shelf, which must outlive the reader.
    void TakeFrom(mdf_MeshShelf& shelf) { meshes_.TakeFrom(shelf); }
    /// A mesher's file gave no mesh.
    bool LacksMesh() const { return meshes_.LacksMesh(); }
    /// Looks up the sets that the attributes of parts and instances lie on.
    void CheckAttributes();

private:
    void ReadFrame(cls_Record& frame, mdf_Value& json, const fnd_Path& path);
    void ReadTree(const cls_Field& field, void* place, mdf_Value& json, const fnd_Path& path);
    /// Calls `read(name, object, path)` for the members of an object, each of which is a named `thing`.
    template <class Reader>
    void ForEachNamed(mdf_Value& json, const fnd_Path& path, const char* thing, const Reader& read);
    void ReadPart(const cow_String& name, mdf_Value& json, const fnd_Path& path);
    void ReadInstance(const cow_String& name, mdf_Value& json, const fnd_Path& path);
    void CheckPart(odiK_Instance& instance, const mdf_Value& json, const fnd_Path& path);
    void ReadAttributeInputs(std::vector<odiK_AttributeInput>& inputs, unsigned type, const mdf_Value& json,
                             const fnd_Path& path);
    void ReadAttributes(ptoC_PartAttributeList& list, unsigned type, const mdf_Value& json,
                        const fnd_Path& path);
    void CheckAttributeInputs(const std::vector<odiK_AttributeInput>& inputs, const odiK_Mesh* mesh,
                              const std::string& pointer);
    void CheckInstanceAttributes(odiK_Instance& instance, const std::string& pointer);

    odiK_Model& model_;
    mdf_RecordReader& records_;
    mdf_Diagnostics& diagnostics_;
    mdf_DatumReader datums_;
    mdf_MeshReader meshes_;
};

#endif
