#ifndef QRX_MODEL_FILE_MDF_DIAGNOSTICS_H
#define QRX_MODEL_FILE_MDF_DIAGNOSTICS_H

#include "model_file/mdf_ModelFile.h"
#include "model_file/mdf_Value.h"
#include "store_interface/findings/fnd_Nearest.h"
#include "store_interface/findings/fnd_Text.h"

#include <map>

/// Collects what there is to say of a file, as much of it as the report keeps.
class mdf_Diagnostics final : public fnd_Sink {
public:
    explicit mdf_Diagnostics(mdf_Report& report) : report_(&report) {}
    void Take(fnd_Finding finding) override;
    bool WantsHint() override;
    /// "found <value>, expected <expected>".
    void Expected(const fnd_Path& path, const mdf_Value& found, const std::string& expected,
                  const std::string& hint = {});
    int NumErrors() const { return numErrors_; }

    const mdf_Report& Report() const { return *report_; }
    const std::string& FileName() const { return report_->fileName; }
    void SetUnreadable() { report_->unreadable = true; }
    void NoteMeshFile(const std::string& file) { report_->variantMeshFiles.push_back(file); }
    mdf_MeshOrigin& AddMeshOrigin() { return report_->meshOrigins.emplace_back(); }

private:
    mdf_Report* report_;
    int numErrors_ = 0;
    int numWarnings_ = 0;
};

/// The text of a string, for lists of what is near it; empty for any other value.
std::string_view mdf_GivenWord(const mdf_Value& value);
/// A value as messages show it: short texts and numbers as they stand, else what kind of thing it is.
std::string mdf_Shown(const mdf_Value& value);

/// Finds names of one kind that differ only in capitals.
class mdf_CapitalsCheck {
public:
    /// Warns at the path if an earlier name equals this one but for capitals.
    void Enter(const std::string& name, const fnd_Path& path, const char* kind, mdf_Diagnostics& diagnostics);

private:
    std::map<std::string, std::string> byLowerCase_;
};

#endif
