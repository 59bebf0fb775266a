#include "model_file/mdf_ModelFile.h"

#include "model_file/mdf_Document.h"
#include "model_file/mdf_Locate.h"
#include "model_file/mdf_ModelReader.h"
#include "model_file/mdf_Parser.h"
#include "model_file/mdf_Placement.h"
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

/// The nearest of the names, and all of them.
std::string HintOf(const std::string& wanted, const std::vector<std::string>& names) {
    const std::string nearest = fnd_DidYouMean(wanted, names);
    const std::string all = fnd_ThereAre(names, wanted);
    return nearest.empty() ? all : nearest + " " + all;
}

void ChooseModel(odb_Odb& odb, const mdf_ModelChoice& choice, const std::vector<std::string>& names,
                 const fnd_Path& path, mdf_Diagnostics& diagnostics) {
    const std::string wanted = !choice.name.empty() ? choice.name
                               : names.size() == 1  ? names.front()
                                                    : odb_Odb::DefaultModelName();
    if (odb.FindModel(wanted) != nullptr) {
        odb.SetDeckModelName(wanted);
    } else if (!choice.name.empty()) {
        diagnostics.Add("no-such-name", path, "found no model named " + fnd_Quoted(wanted),
                        "the name of a model", HintOf(wanted, names));
    } else if (choice.needed && names.empty()) {
        diagnostics.Add("no-default-model", path, "found no model", "one, since decks are written from it");
    } else if (choice.needed) {
        diagnostics.Add("no-default-model", path,
                        "found " + fnd_Counted(static_cast<long long>(names.size()), "model") +
                            ", none of them " + fnd_Quoted(wanted),
                        "one to write the deck from, by that name or chosen by its own",
                        HintOf(wanted, names));
    }
}

void ReadModels(odb_Odb& odb, mdf_Value& models, const fnd_Path& path, mdf_Diagnostics& diagnostics,
                mdf_MeshShelf* shelf, const mdf_GivenMeshes& given, const mdf_ModelChoice& choice) {
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
    ChooseModel(odb, choice, names, path, diagnostics);
}

std::unique_ptr<odb_Odb> ReadRoot(mdf_Value& root, mdf_Diagnostics& diagnostics, mdf_Report& report,
                                  mdf_MeshShelf* shelf, const mdf_GivenMeshes& given,
                                  const mdf_ModelChoice& choice) {
    const fnd_Path top;
    if (!root.IsObject()) {
        diagnostics.Expected(top, root, "an object with the members \"format\" and \"models\"");
        return nullptr;
    }
    mdf_CheckMembers(diagnostics, root, {"$schema", "format", "parameters", "models"}, top);
    if (const mdf_Value* schema = root.Find("$schema")) {
        if (schema->IsString())
            report.schema = schema->String();
        else
            diagnostics.Expected(fnd_Path(top, "$schema"), *schema, "the place of a schema, a string");
    }
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
    ReadModels(*odb, *models, path, diagnostics, shelf, given, choice);
    return diagnostics.NumErrors() > 0 ? nullptr : std::move(odb);
}

} // namespace

std::unique_ptr<odb_Odb> mdf_ReadDocument(mdf_Value& root, std::vector<fnd_Finding>& errors,
                                          mdf_Report& report, mdf_MeshShelf* shelf,
                                          const mdf_GivenMeshes& given, const mdf_ModelChoice& choice) {
    mdf_Diagnostics diagnostics(report);
    if (!IsDocument(errors, diagnostics)) return nullptr;
    std::unique_ptr<odb_Odb> odb = ReadRoot(root, diagnostics, report, shelf, given, choice);
    mdf_HintPlaces(root, report.findings);
    return odb;
}

bool mdf_ReadTold(const std::string& path, std::string& text, mdf_Report& report) {
    report.fileName = path;
    fnd_Finding error;
    if (mdf_ReadFile(path, text, error)) return true;
    report.unreadable = true;
    report.findings.push_back(std::move(error));
    return false;
}

std::unique_ptr<odb_Odb> mdf_ReadModelFile(const std::string& path, mdf_Report& report,
                                           const mdf_ModelChoice& choice) {
    const auto file = std::make_shared<mdf_FileText>(path);
    std::string text;
    if (!mdf_ReadTold(path, text, report)) return nullptr;
    mdf_Value root;
    std::vector<fnd_Finding> errors;
    mdf_Parse(text, root, errors, report.progress);
    // The text has gone into the document; of a large file there is no room for both beside the store.
    if (file->CanBeReadAgain())
        std::string().swap(text);
    else
        file->Keep(std::move(text));
    std::unique_ptr<odb_Odb> odb = mdf_ReadDocument(root, errors, report, nullptr, {}, choice);
    root = mdf_Value();
    report.text = file;
    report.Locate(report.findings);
    return odb;
}

std::unique_ptr<odb_Odb> mdf_ReadModelText(std::string_view text, const std::string& fileName,
                                           mdf_Report& report, const mdf_GivenMeshes& given,
                                           const mdf_ModelChoice& choice) {
    report.fileName = fileName;
    mdf_Value root;
    std::vector<fnd_Finding> errors;
    mdf_Parse(text, root, errors, report.progress);
    std::unique_ptr<odb_Odb> odb = mdf_ReadDocument(root, errors, report, nullptr, given, choice);
    mdf_Locate(text, report.findings);
    return odb;
}
