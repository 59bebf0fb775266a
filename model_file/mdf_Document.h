#ifndef QRX_MODEL_FILE_MDF_DOCUMENT_H
#define QRX_MODEL_FILE_MDF_DOCUMENT_H

#include "model_file/mdf_MeshShelf.h"
#include "model_file/mdf_ModelFile.h"

/// Reads what a model file's text was parsed to; its bulk arrays are moved out. Null when there are errors,
/// those of the parser included.
std::unique_ptr<odb_Odb> mdf_ReadDocument(mdf_Value& root, std::vector<fnd_Finding>& errors,
                                          mdf_Report& report, mdf_MeshShelf* shelf = nullptr,
                                          const mdf_GivenMeshes& given = {},
                                          const mdf_ModelChoice& choice = {});
/// Reads the file that the report is then of. False, with the reason in the report, when it can't be read.
bool mdf_ReadTold(const std::string& path, std::string& text, mdf_Report& report);

#endif
