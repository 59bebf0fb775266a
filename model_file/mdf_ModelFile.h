#ifndef QRX_MODEL_FILE_MDF_MODELFILE_H
#define QRX_MODEL_FILE_MDF_MODELFILE_H

#include "store_interface/findings/fnd_Finding.h"
#include "store_interface/model/odb_Odb.h"

#include <iosfwd>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

/// What model files say that they are.
inline constexpr char mdf_kFormat[] = "qrx-model/1";

/// Everything that was found in one file, in the order of reading. Errors of syntax have a line and a column.
/// Errors beyond the fiftieth are not kept.
struct mdf_Report {
    std::string fileName;
    std::vector<fnd_Finding> findings;
    /// The file itself could not be read; the one finding says why.
    bool unreadable = false;

    bool HasErrors() const;
    /// "model.json:3:14: error: text", or "model.json: error: /models/A: text".
    std::string Line(const fnd_Finding& finding) const;
};
/// The same of any file.
std::string mdf_LineOf(const std::string& fileName, const fnd_Finding& finding);

/// Reads a model file, or its text, into a store. Null when there are errors; warnings alone don't hinder.
/// The store's models are complete: every name is resolved and every status is known.
std::unique_ptr<odb_Odb> mdf_ReadModelFile(const std::string& path, mdf_Report& report);
std::unique_ptr<odb_Odb> mdf_ReadModelText(std::string_view text, const std::string& fileName,
                                           mdf_Report& report);

/// Writes all models of a store as a model file; fields that have their default are left out. False when the
/// stream failed.
bool mdf_WriteModelFile(const odb_Odb& odb, std::ostream& out);

/// Writes the JSON Schema (draft 2020-12) of model files, with the documentation of every field.
bool mdf_WriteSchema(std::ostream& out);

#endif
