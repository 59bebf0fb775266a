#include "model_file/mdf_ModelFile.h"

#include "model_file/mdf_Document.h"
#include "model_file/mdf_Locate.h"
#include "model_file/mdf_ModelReader.h"
#include "model_file/mdf_Parser.h"
#include "store_interface/findings/fnd_TextRules.h"

#include <algorithm>

namespace {

/// Hands on what the parser found; false after an error of syntax.
bool IsDocument(std::vector<fnd_Finding>& errors, mdf_Diagnostics& diagnostics) {
    const bool syntax =
        std::ranges::any_of(errors, [](const fnd_Finding& error) { return error.code->name == "syntax"; });
    for (fnd_Finding& error : errors) diagnostics.Take(std::move(error));
    return !syntax;
}

std::string Found(const mdf_Value* value) {
    return "found " + (value == nullptr ? std::string("nothing") : mdf_Shown(*value));
}

void ReadModels(odb_Odb& odb, mdf_Value& models, const fnd_Path& path, mdf_Diagnostics& diagnostics,
                mdf_MeshShelf* shelf, const mdf_GivenMeshes& given) {
    std::vector<std::string> names;
    for (mdf_Member& member : models.Members()) {
        const fnd_Path place(path, member.name);
        if (!fnd_CheckName(member.name, place, diagnostics)) continue;
        names.push_back(member.name);
        odiK_Model& model = odb.AddModel(cow_String(member.name));
        mdf_ModelReader reader(model, diagnostics, given);
        if (shelf != nullptr) reader.TakeFrom(*shelf);
        reader.Read(member.value, place);
    }
    if (odb.FindModel(odb_Odb::DefaultModelName()) == nullptr) {
        diagnostics.Add(
            "no-default-model", path, "found no model named " + fnd_Quoted(odb_Odb::DefaultModelName()),
            "one, since decks are written from it", fnd_DidYouMean(odb_Odb::DefaultModelName(), names));
    }
}

} // namespace

std::unique_ptr<odb_Odb> mdf_ReadDocument(mdf_Value& root, std::vector<fnd_Finding>& errors,
                                          mdf_Report& report, mdf_MeshShelf* shelf,
                                          const mdf_GivenMeshes& given) {
    mdf_Diagnostics diagnostics(report);
    if (!IsDocument(errors, diagnostics)) return nullptr;
    const fnd_Path top;
    if (!root.IsObject()) {
        diagnostics.Expected(top, root, "an object with the members \"format\" and \"models\"");
        return nullptr;
    }
    mdf_CheckMembers(diagnostics, root, {"format", "parameters", "models"}, top);
    const mdf_Value* format = root.Find("format");
    if (format == nullptr || !format->IsString() || format->String() != mdf_kFormat) {
        diagnostics.Add("wrong-format", fnd_Path(top, "format"), Found(format), fnd_Quoted(mdf_kFormat));
    }
    mdf_Value* models = root.Find("models");
    const fnd_Path path(top, "models");
    if (models == nullptr || !models->IsObject()) {
        diagnostics.Add("missing-field", path, Found(models), "an object of models");
        return nullptr;
    }
    // While the arrays that their pointers lead through are there.
    report.parameters = mdf_ReadParameters(root, diagnostics);
    auto odb = std::make_unique<odb_Odb>();
    ReadModels(*odb, *models, path, diagnostics, shelf, given);
    return diagnostics.NumErrors() > 0 ? nullptr : std::move(odb);
}

std::unique_ptr<odb_Odb> mdf_ReadModelFile(const std::string& path, mdf_Report& report) {
    report.fileName = path;
    const auto file = std::make_shared<mdf_FileText>(path);
    std::string text;
    fnd_Finding error;
    if (!mdf_ReadFile(path, text, error)) {
        report.unreadable = true;
        report.findings.push_back(std::move(error));
        return nullptr;
    }
    mdf_Value root;
    std::vector<fnd_Finding> errors;
    mdf_Parse(text, root, errors, report.progress);
    // The text has gone into the document; of a large file there is no room for both beside the store.
    if (file->CanBeReadAgain())
        std::string().swap(text);
    else
        file->Keep(std::move(text));
    std::unique_ptr<odb_Odb> odb = mdf_ReadDocument(root, errors, report);
    root = mdf_Value();
    report.text = file;
    report.Locate(report.findings);
    return odb;
}

std::unique_ptr<odb_Odb> mdf_ReadModelText(std::string_view text, const std::string& fileName,
                                           mdf_Report& report, const mdf_GivenMeshes& given) {
    report.fileName = fileName;
    mdf_Value root;
    std::vector<fnd_Finding> errors;
    mdf_Parse(text, root, errors, report.progress);
    std::unique_ptr<odb_Odb> odb = mdf_ReadDocument(root, errors, report, nullptr, given);
    mdf_Locate(text, report.findings);
    return odb;
}
