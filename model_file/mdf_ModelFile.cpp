#include "model_file/mdf_ModelFile.h"

#include "model_file/mdf_ModelReader.h"
#include "model_file/mdf_Parser.h"

namespace {

/// Hands on what the parser found; false after an error of syntax.
bool IsDocument(const std::vector<mdf_Error>& errors, mdf_Diagnostics& diagnostics, mdf_Report& report) {
    bool syntax = false;
    for (const mdf_Error& error : errors) {
        syntax = syntax || error.line > 0;
        if (error.line > 0) {
            report.messages.push_back({true, error.pointer, error.line, error.column, error.text});
        } else {
            diagnostics.Error(error.pointer, error.text);
        }
    }
    return !syntax;
}

std::string Found(const mdf_Value* value) {
    return "found " + (value == nullptr ? std::string("nothing") : mdf_Shown(*value));
}

void ReadModels(odb_Odb& odb, mdf_Value& models, const mdf_Path& path, mdf_Diagnostics& diagnostics) {
    std::vector<std::string> names;
    for (mdf_Member& member : models.Members()) {
        const mdf_Path place(path, member.name);
        const std::string problem = mdf_NameProblem(member.name);
        if (!problem.empty()) {
            diagnostics.Error(place, "found " + problem);
            continue;
        }
        names.push_back(member.name);
        odiK_Model& model = odb.AddModel(cow_String(member.name));
        mdf_ModelReader(model, diagnostics).Read(member.value, place);
    }
    if (odb.FindModel(odb_Odb::DefaultModelName()) == nullptr) {
        diagnostics.Error(path, "found no model named " + mdf_Quoted(odb_Odb::DefaultModelName()) +
                                    ", expected one, since decks are written from it" +
                                    mdf_DidYouMean(odb_Odb::DefaultModelName(), names));
    }
}

std::unique_ptr<odb_Odb> ReadDocument(mdf_Value& root, const std::vector<mdf_Error>& errors,
                                      mdf_Report& report) {
    mdf_Diagnostics diagnostics(report);
    if (!IsDocument(errors, diagnostics, report)) return nullptr;
    const mdf_Path top;
    if (!root.IsObject()) {
        diagnostics.Expected(top, root, "an object with the members \"format\" and \"models\"");
        return nullptr;
    }
    mdf_CheckMembers(diagnostics, root, {"format", "models"}, top);
    const mdf_Value* format = root.Find("format");
    if (format == nullptr || !format->IsString() || format->String() != mdf_kFormat) {
        diagnostics.Error(mdf_Path(top, "format"), Found(format) + ", expected " + mdf_Quoted(mdf_kFormat));
    }
    mdf_Value* models = root.Find("models");
    const mdf_Path path(top, "models");
    if (models == nullptr || !models->IsObject()) {
        diagnostics.Error(path, Found(models) + ", expected an object of models");
        return nullptr;
    }
    auto odb = std::make_unique<odb_Odb>();
    ReadModels(*odb, *models, path, diagnostics);
    return diagnostics.NumErrors() > 0 ? nullptr : std::move(odb);
}

} // namespace

std::unique_ptr<odb_Odb> mdf_ReadModelFile(const std::string& path, mdf_Report& report) {
    report.fileName = path;
    std::string text;
    mdf_Error error;
    if (!mdf_ReadFile(path, text, error)) {
        report.unreadable = true;
        report.messages.push_back({true, {}, 0, 0, error.text});
        return nullptr;
    }
    mdf_Value root;
    std::vector<mdf_Error> errors;
    mdf_Parse(text, root, errors);
    // The text has gone into the document; of a large file there is no room for both beside the store.
    std::string().swap(text);
    return ReadDocument(root, errors, report);
}

std::unique_ptr<odb_Odb> mdf_ReadModelText(std::string_view text, const std::string& fileName,
                                           mdf_Report& report) {
    report.fileName = fileName;
    mdf_Value root;
    std::vector<mdf_Error> errors;
    mdf_Parse(text, root, errors);
    return ReadDocument(root, errors, report);
}
