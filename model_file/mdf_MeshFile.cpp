#include "model_file/mdf_MeshFile.h"

#include "mesh_file/msf_MeshFile.h"
#include "model_file/mdf_DeckMesh.h"
#include "model_file/mdf_MeshImport.h"
#include "platform/plt_Files.h"
#include "store_interface/findings/fnd_TextRules.h"

#include <cmath>
#include <filesystem>

const std::vector<std::string>& mdf_MeshFileReader::Members() {
    static const std::vector<std::string> members = {
        "file",   "part",        "scale", "elementTypes", "surfaceElements",
        "groups", "groupArrays", "sets",  "controls"};
    return members;
}

bool mdf_MeshFileReader::Read(odiK_Mesh& mesh, const mdf_Value& json, const fnd_Path& path) {
    mdf_CheckMembers(diagnostics_, json, Members(), path);
    mdf_MeshFileRequest request;
    if (!ReadRequest(request, json, path)) return false;
    const fnd_Path place(path, "file");
    if (mdf_DeckMesh::IsDeck(request.path)) {
        std::error_code error;
        if (!std::filesystem::is_regular_file(plt_Path(request.path), error)) {
            diagnostics_.Add("unreadable-file", place, request.path + ": there is no such file");
            diagnostics_.SetUnreadable();
            return false;
        }
        mdf_MeshOrigin& origin = diagnostics_.AddMeshOrigin();
        origin.place = path.Text();
        origin.given = json;
        origin.path = request.path;
        fnd_Below problems(diagnostics_, path);
        return mdf_DeckMesh(request, origin, problems).Fill(mesh);
    }
    msf_Mesh source;
    msf_Problem problem;
    if (!msf_ReadMeshFile(request.path, request.options, source, problem)) {
        const std::string found =
            request.path + ": " + (problem.place.empty() ? "" : problem.place + ": ") + problem.found;
        if (problem.unreadable) {
            diagnostics_.Add("unreadable-file", place, found);
            diagnostics_.SetUnreadable();
        } else {
            diagnostics_.Add("mesh-file", place, found, problem.expected);
        }
        return false;
    }
    mdf_MeshOrigin& origin = diagnostics_.AddMeshOrigin();
    origin.place = path.Text();
    origin.given = json;
    origin.path = request.path;
    fnd_Below problems(diagnostics_, path);
    return mdf_MeshImport(std::move(source), request, origin, problems).Fill(mesh);
}

bool mdf_MeshFileReader::ReadRequest(mdf_MeshFileRequest& request, const mdf_Value& json,
                                     const fnd_Path& path) {
    const int before = diagnostics_.NumErrors();
    ReadFileName(request, *json.Find("file"), fnd_Path(path, "file"));
    if (const mdf_Value* part = json.Find("part")) {
        if (part->IsString())
            request.options.part = part->String();
        else
            diagnostics_.Expected(fnd_Path(path, "part"), *part, "the name of a mesh in the file");
    }
    if (const mdf_Value* scale = json.Find("scale")) {
        if (scale->IsNumber()) request.options.scale = scale->Real();
        if (!scale->IsNumber() || !(scale->Real() > 0.0) || !std::isfinite(scale->Real()))
            diagnostics_.Expected(fnd_Path(path, "scale"), *scale, "a positive number");
    }
    if (const mdf_Value* types = json.Find("elementTypes"))
        ReadElementTypes(request, *types, fnd_Path(path, "elementTypes"));
    if (const mdf_Value* family = json.Find("surfaceElements"))
        ReadSurfaceElements(request, *family, fnd_Path(path, "surfaceElements"));
    if (const mdf_Value* groups = json.Find("groups")) ReadGroups(request, *groups, fnd_Path(path, "groups"));
    if (const mdf_Value* arrays = json.Find("groupArrays")) {
        const fnd_Path place(path, "groupArrays");
        if (!arrays->IsArray()) diagnostics_.Expected(place, *arrays, "an array of names");
        for (std::size_t i = 0; arrays->IsArray() && i < arrays->Size(); ++i) {
            const mdf_Value name = arrays->Item(i);
            if (name.IsString())
                request.options.groupArrays.push_back(name.String());
            else
                diagnostics_.Expected(fnd_Path(place, i), name, "the name of an array of cells");
        }
    }
    if (const mdf_Value* controls = json.Find("controls"))
        ReadControls(request, *controls, fnd_Path(path, "controls"));
    return diagnostics_.NumErrors() == before;
}

void mdf_MeshFileReader::ReadFileName(mdf_MeshFileRequest& request, const mdf_Value& json,
                                      const fnd_Path& path) {
    if (!json.IsString() || json.String().empty() || json.String().find('\0') != std::string::npos) {
        diagnostics_.Expected(path, json, "the path of a mesher's file");
        return;
    }
    request.path = (plt_Path(diagnostics_.FileName()).parent_path() / plt_Path(json.String())).string();
}

void mdf_MeshFileReader::ReadElementTypes(mdf_MeshFileRequest& request, const mdf_Value& json,
                                          const fnd_Path& path) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object of element types by kind of cell");
        return;
    }
    for (const mdf_Member& member : json.Members()) {
        const fnd_Path place(path, member.name);
        const std::optional<cel_KindEnm> kind = cel_KindOfName(member.name);
        if (!kind) {
            std::vector<std::string> names;
            for (int i = 0; i < cel_kKinds; ++i)
                names.emplace_back(cel_CellOf(static_cast<cel_KindEnm>(i)).name);
            diagnostics_.Add("wrong-value", place, "found " + fnd_Quoted(member.name), fnd_OneOf(names, member.name),
                             fnd_DidYouMean(member.name, names));
        } else if (member.value.IsNull()) {
            request.elementTypes[*kind] = "";
        } else if (!member.value.IsString()) {
            diagnostics_.Expected(place, member.value,
                                  "the label of an element type, or null for no elements");
        } else {
            fnd_CheckName(member.value.String(), place, diagnostics_);
            request.elementTypes[*kind] = member.value.String();
        }
    }
}

void mdf_MeshFileReader::ReadSurfaceElements(mdf_MeshFileRequest& request, const mdf_Value& json,
                                             const fnd_Path& path) {
    const std::vector<std::string>& words = mdf_SurfaceFamilies();
    if (json.IsString() && std::find(words.begin(), words.end(), json.String()) != words.end()) {
        request.surfaceElements = json.String();
    } else {
        diagnostics_.Expected(path, json, fnd_OneOf(words));
    }
}

void mdf_MeshFileReader::ReadGroups(mdf_MeshFileRequest& request, const mdf_Value& json,
                                    const fnd_Path& path) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object of names of sets by name of group");
        return;
    }
    for (const mdf_Member& member : json.Members()) {
        const fnd_Path place(path, member.name);
        if (member.value.IsNull()) {
            request.groups.emplace_back(member.name, "");
        } else if (!member.value.IsString()) {
            diagnostics_.Expected(place, member.value, "the name of a set, or null to leave the group out");
        } else {
            fnd_CheckName(member.value.String(), place, diagnostics_);
            request.groups.emplace_back(member.name, member.value.String());
        }
    }
}

void mdf_MeshFileReader::ReadControls(mdf_MeshFileRequest& request, const mdf_Value& json,
                                      const fnd_Path& path) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object of element controls by element type");
        return;
    }
    for (const mdf_Member& member : json.Members()) {
        records_.ReadRecord(request.controls[member.name], member.value, fnd_Path(path, member.name));
    }
}
