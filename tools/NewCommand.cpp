#include "platform/plt_Files.h"
#include "store_interface/findings/fnd_Text.h"
#include "store_interface/model/ddb_ElementTypes.h"
#include "tools/CommandParts.h"
#include "tools/Commands.h"

#include <algorithm>
#include <filesystem>

namespace {

namespace fs = std::filesystem;

constexpr const char* kMaterial = "PLACEHOLDER";

std::string Json(std::string_view text) {
    return nlohmann::json(text).dump(-1, ' ', false, nlohmann::json::error_handler_t::replace);
}

/// A name of a part of letters and digits, from the mesh file's.
std::string PartNameOf(const fs::path& mesh) {
    std::string name;
    for (const char c : mesh.stem().string()) {
        const bool isLower = c >= 'a' && c <= 'z';
        const bool isGood = isLower || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') || c == '-';
        name += isLower ? static_cast<char>(c - 'a' + 'A') : isGood ? c : '_';
    }
    name.resize(std::min<std::size_t>(name.size(), 60));
    return name.empty() ? "PART" : name;
}

/// What `new` writes of a mesh: text of a model file, first with the mesh alone, to see what it brings.
class NewModel {
public:
    NewModel(const fs::path& mesh, const fs::path& output)
        : file_(Relative(mesh, output).generic_string()), part_(PartNameOf(mesh)) {}

    std::string MeshAlone() const {
        return "{ \"format\": \"qrx-model/1\", \"models\": { \"Default Model\": { \"parts\": { " +
               Json(part_) + ": { \"mesh\": { \"file\": " + Json(file_) + " } } } } } }\n";
    }

    std::string Text(const mdf_MeshOrigin& origin, const odiK_Mesh& mesh) const {
        const std::vector<const mdf_MeshOrigin::Set*> regions = RegionsOfSections(origin, mesh);
        std::string text = "// Made for " + Json(file_) + " (" + origin.format +
                           "). Lengths are those of the file;\n"
                           "// \"scale\" beside \"file\" turns them into others.\n"
                           "{ \"format\": \"qrx-model/1\",\n"
                           "  \"models\": { \"Default Model\": {\n"
                           "    \"topLevelSolverInput\": [\"*Heading\", " +
                           Json(part_) +
                           "],\n"
                           "    \"parts\": { " +
                           Json(part_) +
                           ": {\n"
                           "      \"mesh\": { \"file\": " +
                           Json(file_) +
                           " },\n"
                           "      \"sectionAssignments\": [";
        const char* separator = "\n";
        for (const mdf_MeshOrigin::Set* region : regions) {
            text += separator + ("        { \"region\": " + Json(region->name) +
                                 ", \"sectionName\": " + Json(region->name) + " }");
            separator = ",\n";
        }
        text += "\n      ] } },\n" + SetComments(origin);
        text += "    \"assembly\": { \"instances\": { " + Json(part_ + "-1") +
                ": { \"part\": " + Json(part_) + " } } },\n";
        text += "    \"sections\": {";
        separator = "\n";
        for (const mdf_MeshOrigin::Set* region : regions) {
            text += separator + ("      " + Json(region->name) + ": " + SectionOf(mesh, region->name));
            separator = ",\n";
        }
        return text +
               "\n    },\n"
               "    \"materials\": {\n"
               "      // A PLACEHOLDER: steel in N, mm and t. Put the real material here, in the mesh's "
               "units.\n"
               "      \"" +
               kMaterial +
               "\": { \"elastic\": { \"table\": [[210000, 0.3]] }, \"density\": { \"table\": [[7.85e-09]] } "
               "}\n"
               "    },\n"
               "    \"steps\": [ { \"name\": \"Initial\", \"class\": \"InitialStep\" },\n"
               "               { \"name\": \"Step-1\", \"class\": \"StaticStep\" } ],\n"
               "    // Supports and loads go here, such as\n"
               "    // \"boundaryConditions\": { \"Held\": { \"class\": \"DisplacementBC\", \"region\": "
               "\"" +
               part_ +
               "-1.A NODE SET\",\n"
               "    //   \"states\": { \"Initial\": { \"u1\": 0, \"u2\": 0, \"u3\": 0 } } } },\n"
               "    // \"loads\": { \"Pressure\": { \"class\": \"Pressure\", \"region\": \"" +
               part_ +
               "-1.A SURFACE\",\n"
               "    //   \"states\": { \"Step-1\": { \"magnitude\": 1.0 } } } },\n"
               "    \"fieldOutputRequests\": { \"Usual\": { \"class\": \"FieldOutput\", \"states\": { "
               "\"Step-1\": {} } } }\n"
               "  } } }\n";
    }

private:
    static fs::path Relative(const fs::path& mesh, const fs::path& output) {
        if (mesh.is_absolute()) return mesh;
        const fs::path folder = output.parent_path();
        return fs::proximate(mesh, folder.empty() ? fs::path(".") : folder);
    }

    static std::vector<char> MembersOf(const odiK_Mesh& mesh, const std::string& setName) {
        std::vector<char> members(static_cast<std::size_t>(mesh.NumElements()));
        const int place = mesh.FindSet(cow_String(setName));
        for (const rgnC_SubsetData& subset : mesh.Sets()[static_cast<std::size_t>(place)]->subsets) {
            const int first = mesh.Classes()[static_cast<std::size_t>(subset.classIndex)].firstElementIndex;
            for (const int entry : subset.subset) members[static_cast<std::size_t>(first + entry)] = 1;
        }
        return members;
    }

    /// Sets of elements that split them among them, the smaller of overlapping ones; else the set of all.
    static std::vector<const mdf_MeshOrigin::Set*> RegionsOfSections(const mdf_MeshOrigin& origin,
                                                                     const odiK_Mesh& mesh) {
        std::vector<const mdf_MeshOrigin::Set*> sets;
        std::vector<const mdf_MeshOrigin::Set*> all;
        for (const mdf_MeshOrigin::Set& set : origin.sets) {
            if (std::string_view(set.kind) == "element") (set.group.empty() ? all : sets).push_back(&set);
        }
        std::stable_sort(sets.begin(), sets.end(),
                         [](const auto* a, const auto* b) { return a->members < b->members; });
        std::vector<const mdf_MeshOrigin::Set*> regions;
        std::vector<char> covered(static_cast<std::size_t>(mesh.NumElements()));
        long long count = 0;
        for (const mdf_MeshOrigin::Set* set : sets) {
            const std::vector<char> members = MembersOf(mesh, set->name);
            bool overlaps = false;
            for (std::size_t i = 0; i < members.size(); ++i)
                overlaps = overlaps || (members[i] != 0 && covered[i] != 0);
            if (overlaps) continue;
            for (std::size_t i = 0; i < members.size(); ++i)
                covered[i] = static_cast<char>(covered[i] | members[i]);
            count += set->members;
            regions.push_back(set);
        }
        // All are entries of one list: its order.
        std::sort(regions.begin(), regions.end());
        return count == mesh.NumElements() ? regions : all;
    }

    static std::string SectionOf(const odiK_Mesh& mesh, const std::string& setName) {
        const int place = mesh.FindSet(cow_String(setName));
        const auto& subsets = mesh.Sets()[static_cast<std::size_t>(place)]->subsets;
        const auto& elements = mesh.Classes()[static_cast<std::size_t>(subsets.front().classIndex)];
        const ddb_ElementFamily* family = ddb_FamilyOf(elements.type.View());
        std::string section = R"({ "class": "HomogenousSolidSection")";
        if (family != nullptr && family->section == ddb_SectionNeedEnm::SHELL)
            section = R"({ "class": "HomogenousShellSection", "thickness": 1.0)";
        return section + ", \"materialName\": \"" + kMaterial + "\" }";
    }

    std::string SetComments(const mdf_MeshOrigin& origin) const {
        std::string text = "    // What the mesh brings; conditions name it " + part_ + "-1.NAME:\n";
        for (const mdf_MeshOrigin::Set& set : origin.sets) {
            const std::string kind = set.kind;
            text += "    //   " + (kind == "surface" ? kind : kind + " set") + " " + Json(set.name) + ", " +
                    std::to_string(set.members) +
                    (kind == "surface" ? " faces\n"
                     : kind == "node"  ? " nodes\n"
                                       : " elements\n");
        }
        for (const std::string& note : origin.notes) text += "    // Note: " + fnd_Visible(note) + "\n";
        return text;
    }

    std::string file_;
    std::string part_;
};

} // namespace

ExitCode RunNew(const NewRequest& request, RunReport& report) {
    const fs::path mesh = plt_Path(request.mesh);
    const fs::path output =
        plt_Path(request.output.empty() ? mesh.stem().string() + ".json" : request.output);
    std::error_code ignored;
    if (!request.force && fs::exists(fs::symlink_status(output, ignored))) {
        report.Error(output.string(), "the file is there already; --force overwrites it");
        return ExitCode::FILE_SYSTEM_REFUSED;
    }
    const NewModel model(mesh, output);
    mdf_Report found;
    // The parent of the text's name is where its paths begin.
    const auto store = mdf_ReadModelText(model.MeshAlone(), output.string(), found);
    for (const fnd_Finding& finding : found.findings)
        report.Add(request.mesh, {finding.code, {}, finding.found, finding.expected, finding.hint});
    if (store == nullptr) return found.unreadable ? ExitCode::FILE_SYSTEM_REFUSED : ExitCode::MODEL_IS_WRONG;
    const mdf_MeshOrigin& origin = found.meshOrigins.front();
    const std::string text = model.Text(origin, *origin.mesh);
    mdf_Report again;
    if (mdf_ReadModelText(text, output.string(), again) == nullptr) {
        report.AddAll(again);
        return ExitCode::INTERNAL_FAILURE;
    }
    const ExitCode code = WriteWholeFile(output.string(), "model file", text, report);
    if (code != ExitCode::DONE) return code;
    report.Member("new") = {{"file", output.string()}, {"sets", origin.sets.size()}};
    report.Print(output.string() + ": a model of " + request.mesh + " with " +
                 std::to_string(origin.sets.size()) + " sets; \"qrxdeck write " + output.string() +
                 "\" writes its deck\n");
    return ExitCode::DONE;
}
