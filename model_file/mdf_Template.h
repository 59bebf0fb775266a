#ifndef QRX_MODEL_FILE_MDF_TEMPLATE_H
#define QRX_MODEL_FILE_MDF_TEMPLATE_H

#include "model_file/mdf_MeshShelf.h"
#include "model_file/mdf_ModelFile.h"

#include <functional>

/// A value of a variant.
struct mdf_Change {
    /// JSON pointer to a place of the template.
    std::string pointer;
    mdf_Value value;
};

/// A model file that is read once, and variants of it in which values at some places are others. A variant is
/// the store that the file with these values would give, and so is what is said of it; but it shares with the
/// template whatever it doesn't change, meshes above all. What differs in objects of repositories is read
/// alone; for anything else the model is read anew but for its meshes.
///
/// One thread at a time may ask a template for variants; a twin serves another thread.
class mdf_Template {
public:
    /// Gives the pointers whose values variants may change, for a file with these parameters.
    using Places = std::function<std::vector<std::string>(const std::vector<mdf_Parameter>& parameters)>;
    /// Null when the file has errors.
    static std::unique_ptr<mdf_Template> OfFile(const std::string& path, const Places& places,
                                                mdf_Report& report, const mdf_ModelChoice& choice = {});
    static std::unique_ptr<mdf_Template> OfText(std::string_view text, const std::string& fileName,
                                                const Places& places, mdf_Report& report,
                                                const mdf_GivenMeshes& given = {},
                                                const mdf_ModelChoice& choice = {});
    mdf_Template(const mdf_Template&) = delete;
    mdf_Template& operator=(const mdf_Template&) = delete;
    ~mdf_Template();

    /// The same template for another thread. They have only the meshes in common, so that neither waits for
    /// the other's counts.
    std::unique_ptr<mdf_Template> Twin() const;

    const odb_Odb& Store() const { return *store_; }
    const std::vector<mdf_Parameter>& Parameters() const { return parameters_; }
    /// Why a variant can't have a value at the pointer: what was found, expected, and a hint. Nothing when it
    /// can.
    struct Problem {
        std::string found;
        std::string expected;
        std::string hint;
    };
    std::optional<Problem> ProblemOf(const std::string& pointer) const;

    /// The store with the values, each at a place without a problem; null when there are errors. The model
    /// that decks are written from stands in it, others only where they were changed.
    std::unique_ptr<odb_Odb> Variant(std::span<const mdf_Change> changes, mdf_Report& report);

private:
    struct Target;
    mdf_Template() = default;

    bool Read(mdf_Value& root, std::vector<fnd_Finding>& errors, const Places& places, mdf_Report& report);
    const Target& TargetOf(const std::string& pointer);
    std::unique_ptr<odb_Odb> VariantOfObjects(std::span<const mdf_Change> changes,
                                              std::span<const Target* const> targets, mdf_Report& report);
    std::unique_ptr<odb_Odb> VariantOfModels(std::span<const mdf_Change> changes,
                                             std::span<const Target* const> targets, mdf_Report& report);

    std::string fileName_;
    std::vector<mdf_Parameter> parameters_;
    mdf_Value root_; // without what the shelf has
    mdf_MeshShelf shelf_;
    mdf_GivenMeshes given_;
    mdf_ModelChoice choice_;
    std::unique_ptr<odb_Odb> store_;
    /// What reading the template says but for the rules of whole models, which are asked of each variant.
    std::vector<fnd_Finding> findings_;
    std::unique_ptr<kprC_Timeline> timeline_;
    std::map<std::string, std::unique_ptr<Target>, std::less<>> targets_;
};

#endif
