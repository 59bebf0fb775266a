#include "study/sty_Identity.h"

#include "model_file/mdf_Parser.h"
#include "store_interface/findings/fnd_Text.h"
#include "study/sty_Json.h"

#include <charconv>

namespace {

constexpr const char* kStudyFormat = "qrx-study/1";

std::string FileText(const std::string& path, const std::string& sum) {
    return "{\"file\": " + sty_Quoted(path) + ", \"sha256\": " + sty_Quoted(sum) + "}";
}

std::string TextAt(const mdf_Value& object, const char* name) {
    const mdf_Value* value = object.IsObject() ? object.Find(name) : nullptr;
    return value != nullptr && value->IsString() ? value->String() : std::string();
}

} // namespace

std::string sty_Identity::Text() const {
    std::string text = "{\n  \"format\": " + sty_Quoted(kStudyFormat) +
                       ",\n  \"template\": " + FileText(templatePath, templateSha256) +
                       ",\n  \"model\": " + sty_Quoted(model) +
                       ",\n  \"table\": " + FileText(tablePath, tableSha256) + ",\n  \"rows\": \"" +
                       std::to_string(rows) + "\",\n  \"meshes\": [";
    for (const auto& [path, sum] : meshes)
        text += (&path == &meshes.front().first ? "\n    " : ",\n    ") + FileText(path, sum);
    return text + (meshes.empty() ? "]\n}\n" : "\n  ]\n}\n");
}

std::optional<sty_Identity> sty_Identity::Of(const std::string& text) {
    mdf_Value root;
    std::vector<fnd_Finding> errors;
    if (!mdf_Parse(text, root, errors) || TextAt(root, "format") != kStudyFormat) return std::nullopt;
    const mdf_Value* model = root.Find("template");
    const mdf_Value* table = root.Find("table");
    const mdf_Value* meshes = root.Find("meshes");
    if (model == nullptr || table == nullptr || meshes == nullptr || !meshes->IsArray()) return std::nullopt;
    sty_Identity identity;
    identity.templatePath = TextAt(*model, "file");
    identity.templateSha256 = TextAt(*model, "sha256");
    identity.model = TextAt(root, "model");
    identity.tablePath = TextAt(*table, "file");
    identity.tableSha256 = TextAt(*table, "sha256");
    const std::string rows = TextAt(root, "rows");
    std::from_chars(rows.data(), rows.data() + rows.size(), identity.rows);
    for (std::size_t i = 0; i < meshes->Size(); ++i) {
        const mdf_Value mesh = meshes->Item(i);
        identity.meshes.emplace_back(TextAt(mesh, "file"), TextAt(mesh, "sha256"));
    }
    if (identity.rows <= 0) return std::nullopt;
    return identity;
}

std::string sty_Identity::DifferenceFrom(const sty_Identity& held) const {
    const auto changed = [](const char* thing, const std::string& path, const std::string& other) {
        const std::string what = std::string("the ") + thing + " " + fnd_Quoted(path);
        return path == other ? what + " has changed since"
                             : what + " is another one than " + fnd_Quoted(other);
    };
    if (templateSha256 != held.templateSha256) return changed("template", templatePath, held.templatePath);
    if (!held.model.empty() && model != held.model)
        return "the model " + fnd_Quoted(model) + " is another one than " + fnd_Quoted(held.model);
    if (tableSha256 != held.tableSha256) return changed("table", tablePath, held.tablePath);
    for (std::size_t i = 0; i < meshes.size() && i < held.meshes.size(); ++i) {
        if (meshes[i].second != held.meshes[i].second)
            return changed("mesh file", meshes[i].first, held.meshes[i].first);
    }
    return {};
}
