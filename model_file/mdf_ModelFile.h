#ifndef QRX_MODEL_FILE_MDF_MODELFILE_H
#define QRX_MODEL_FILE_MDF_MODELFILE_H

#include "model_file/mdf_Parameters.h"
#include "store_interface/findings/fnd_Finding.h"
#include "store_interface/model/odb_Odb.h"

#include <iosfwd>
#include <list>
#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <vector>

/// What model files say that they are.
inline constexpr char mdf_kFormat[] = "qrx-model/1";

class mdf_FileText;
struct thr_Progress;
class odiK_Mesh;
using mdf_GivenMeshes = std::vector<cow_CountedHld<odiK_Mesh>>;
inline const mdf_GivenMeshes mdf_NoGivenMeshes;

/// Where a mesh came from that the model file only names: {"file": ...}.
struct mdf_MeshOrigin {
    struct Set {
        std::string name;
        /// "element", "surface" or "node".
        const char* kind = "";
        long long members = 0;
        /// The group that it was made of, and its dimension.
        std::string group;
        int dimension = 0;
    };

    /// JSON pointer of the mesh.
    std::string place;
    std::string path;
    /// "MSH 4.1, binary".
    std::string format;
    /// Cells by kind, and groups, as the file has them.
    std::vector<std::pair<std::string, long long>> cells;
    long long groups = 0;
    std::vector<Set> sets;
    /// What was merged, renamed, numbered anew or left out.
    std::vector<std::string> notes;
    /// The mesh, and the member as the model file has it.
    const odiK_Mesh* mesh = nullptr;
    mdf_Value given;
};

/// Everything that was found in one file, in the order of reading, with lines and columns.
struct mdf_Report {
    std::string fileName;
    std::vector<fnd_Finding> findings;
    /// So many errors are kept, and as many other findings; the rest is counted.
    int most = 50;
    int moreErrors = 0;
    int moreWarnings = 0;
    /// Shows how far reading has come; null: nobody looks.
    thr_Progress* progress = nullptr;
    /// The file, or one that it names, could not be read; a finding says why.
    bool unreadable = false;
    std::list<mdf_MeshOrigin> meshOrigins;
    /// Mesher's files of a variant that are not the template's, or read otherwise, as the variant names them.
    std::vector<std::string> variantMeshFiles;
    /// The file, for Locate().
    std::shared_ptr<const mdf_FileText> text;
    std::vector<mdf_Parameter> parameters;
    /// Where the file says that its schema is; for editors.
    std::string schema;

    /// Gives findings on the file's content, whoever found them, their lines and columns, where they have
    /// none. A file that has changed meanwhile gives none. mdf_Locate does the same for a text.
    void Locate(std::span<fnd_Finding> findings) const;
    bool HasErrors() const;
    /// mdf_LineOf() of the file.
    std::string Line(const fnd_Finding& finding) const;
};

/// What the parts of a line are set off with on a terminal, by escape sequences; none as it is made.
struct mdf_LineStyle {
    const char* place = "";
    const char* error = "";
    const char* warning = "";
    const char* note = "";
    const char* dim = "";
    /// Behind each.
    const char* end = "";
};
/// "model.json:3:14: error: text (/models/A) [code]", as editors read it, or without what isn't known. What
/// runs of the program tell of themselves shows no code.
std::string mdf_LineOf(const std::string& fileName, const fnd_Finding& finding,
                       const mdf_LineStyle& style = {});

/// Which of a file's models decks are written from.
struct mdf_ModelChoice {
    /// Empty: the only one, or of several "Default Model".
    std::string name;
    /// Whether a file is wrong that doesn't tell.
    bool needed = true;
};

/// Reads a model file, or its text, into a store. Null when there are errors; warnings alone don't hinder.
/// The store's models are complete: every name is resolved and every status is known.
std::unique_ptr<odb_Odb> mdf_ReadModelFile(const std::string& path, mdf_Report& report,
                                           const mdf_ModelChoice& choice = {});
/// `given`: meshes that are in memory already, shared, not copied; the member "mesh" of a part or an instance
/// names one by its place.
std::unique_ptr<odb_Odb> mdf_ReadModelText(std::string_view text, const std::string& fileName,
                                           mdf_Report& report, const mdf_GivenMeshes& given = {},
                                           const mdf_ModelChoice& choice = {});

/// Writes all models of a store as a model file; fields that have their default are left out. False when the
/// stream failed.
bool mdf_WriteModelFile(const odb_Odb& odb, std::ostream& out);
/// The same, where meshes that came from mesher's files stay in these; `folder` is the model file's own, from
/// which their paths count. And with the parameters and the schema that the file had.
bool mdf_WriteModelFile(const odb_Odb& odb, std::ostream& out, const std::list<mdf_MeshOrigin>& origins,
                        const std::string& folder, const std::vector<mdf_Parameter>& parameters = {},
                        const std::string& schema = {});

/// Writes the JSON Schema (draft 2020-12) of model files, with the documentation of every field.
bool mdf_WriteSchema(std::ostream& out);

#endif
