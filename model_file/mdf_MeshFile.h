#ifndef QRX_MODEL_FILE_MDF_MESHFILE_H
#define QRX_MODEL_FILE_MDF_MESHFILE_H

#include "mesh_file/msf_Mesh.h"
#include "model_file/mdf_RecordReader.h"

#include <optional>

/// What a model file asks of a mesher's file.
struct mdf_MeshFileRequest {
    /// The path, below the model file's folder.
    std::string path;
    msf_Options options;
    /// By kind of cell; an empty type: such cells make no elements.
    std::map<cel_KindEnm, std::string> elementTypes;
    /// What surfaces become: "shell", ...; empty where nothing is said.
    std::string surfaceElements;
    /// New names by name, or by name, '@' and dimension; empty: the group is left out.
    std::vector<std::pair<std::string, std::string>> groups;
    /// By element type.
    std::map<std::string, bme_ElemCtrlParams> controls;
};

/// The words for families of surface elements.
const std::vector<std::string>& mdf_SurfaceFamilies();

/// Reads the mesh of {"file": ...}: what is asked, the file, and what it becomes.
class mdf_MeshFileReader {
public:
    mdf_MeshFileReader(mdf_RecordReader& records, mdf_Diagnostics& diagnostics)
        : records_(records), diagnostics_(diagnostics) {}

    /// The members that such a mesh may have.
    static const std::vector<std::string>& Members();
    /// False when there is no mesh.
    bool Read(odiK_Mesh& mesh, const mdf_Value& json, const fnd_Path& path);
    /// What is asked alone. False after an error.
    bool ReadRequest(mdf_MeshFileRequest& request, const mdf_Value& json, const fnd_Path& path);

private:
    void ReadFileName(mdf_MeshFileRequest& request, const mdf_Value& json, const fnd_Path& path);
    void ReadElementTypes(mdf_MeshFileRequest& request, const mdf_Value& json, const fnd_Path& path);
    void ReadSurfaceElements(mdf_MeshFileRequest& request, const mdf_Value& json, const fnd_Path& path);
    void ReadGroups(mdf_MeshFileRequest& request, const mdf_Value& json, const fnd_Path& path);
    void ReadControls(mdf_MeshFileRequest& request, const mdf_Value& json, const fnd_Path& path);

    mdf_RecordReader& records_;
    mdf_Diagnostics& diagnostics_;
};

#endif
