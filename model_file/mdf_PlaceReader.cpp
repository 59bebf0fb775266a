#include "model_file/mdf_PlaceReader.h"

#include "model_file/mdf_Members.h"

bool mdf_PlaceReader::ReadDatum(dtmC_DatumRef& datum, const mdf_Value& json, const fnd_Path& path) {
    if (json.IsNull()) {
        datum = {};
        return true;
    }
    if (json.IsString()) datum = model_.FindDatum(cow_String(json.String()));
    if (json.IsString() && (!datum.IsNullRef() || references_.IsWrong(json.String()))) return true;
    const auto tryAll = [this](fnd_Nearest& nearest) {
        for (const odiK_Datum& known : model_.Datums()) nearest.Try(known.name.View());
    };
    diagnostics_.Expected(path, json, "the name of a datum, or null",
                          json.IsString() ? fnd_DidYouMean(diagnostics_, json.String(), tryAll)
                                          : std::string());
    return false;
}

void mdf_PlaceReader::ReportNoInstance(const std::string& name, const fnd_Path& path) {
    if (references_.IsWrong(name)) return;
    std::string hint = fnd_DidYouMean(diagnostics_, name, [this](fnd_Nearest& nearest) {
        for (const auto& [known, entry] : model_.Instances()) nearest.Try(known.View());
    });
    if (hint.empty() && diagnostics_.WantsHint()) {
        std::vector<std::string> known;
        for (const auto& [each, entry] : model_.Instances()) known.emplace_back(each.View());
        hint = fnd_ThereAre(known, name);
    }
    diagnostics_.Add("no-such-name", path, "found instance " + fnd_Quoted(name), "the name of an instance",
                     std::move(hint));
}

bool mdf_PlaceReader::ReadDottedNames(Names& names, const mdf_Value& text, const fnd_Path& path) {
    const std::string& given = text.String();
    const std::size_t dot = given.find('.');
    if (dot == std::string::npos) {
        names.set = given;
        return true;
    }
    if (dot == 0 || given.find('.', dot + 1) != std::string::npos) {
        diagnostics_.Expected(path, text, "{\"instance\": ..., \"set\": ...} for names with dots");
        return false;
    }
    names = {given.substr(0, dot), given.substr(dot + 1)};
    return true;
}

bool mdf_PlaceReader::ReadNames(Names& names, const mdf_Value& value, const fnd_Path& path) {
    if (value.IsString()) return ReadDottedNames(names, value, path);
    if (!value.IsObject()) {
        diagnostics_.Expected(path, value, "\"SET\", \"INSTANCE.SET\", an object of both names, or null");
        return false;
    }
    mdf_CheckMembers(diagnostics_, value, {"instance", "set"}, path);
    for (const auto& [member, target] :
         {std::pair("instance", &names.instance), std::pair("set", &names.set)}) {
        const mdf_Value* name = value.Find(member);
        if (name == nullptr) continue;
        if (!name->IsString()) {
            diagnostics_.Expected(fnd_Path(path, std::string_view(member)), *name, "a name");
            return false;
        }
        *target = name->String();
    }
    if (value.Find("set") != nullptr) return true;
    diagnostics_.Add("missing-field", fnd_Path(path, "set"), "found nothing", "the name of a set");
    return false;
}

rgnC_Region mdf_PlaceReader::ReadRegion(const mdf_Value& value, const fnd_Path& path) {
    Names names;
    if (value.IsNull() || !ReadNames(names, value, path)) return {};
    rgnC_Region region = model_.FindRegion(cow_String(names.instance), cow_String(names.set));
    if (!region.HasValue()) ReportNoSet(names, path);
    return region;
}

std::string mdf_PlaceReader::OwnerOf(const Names& names) const {
    const cow_String set(names.set);
    if (!names.instance.empty()) {
        if (model_.FindAssemblySet(set) < 0) return {};
        return "it is a set of the assembly: write " + fnd_Quoted(names.set);
    }
    for (const auto& [name, instance] : model_.Instances()) {
        const auto mesh = instance->Mesh();
        if (mesh.IsNull() || mesh->FindSet(set) < 0) continue;
        const std::string owner(name.View());
        return "it is a set of " + owner + ": write " + fnd_Quoted(owner + "." + names.set);
    }
    return {};
}

void mdf_PlaceReader::ReportNoSet(const Names& names, const fnd_Path& path) {
    const odiK_Instance* owner = model_.FindInstance(cow_String(names.instance));
    if (!names.instance.empty() && owner == nullptr) {
        ReportNoInstance(names.instance, path);
        return;
    }
    if (references_.IsWrong(names.set)) return;
    static const std::vector<cow_CountedHld<odiK_Set>> none;
    const auto mesh = owner == nullptr ? cow_CountedHld<odiK_Mesh>() : owner->Mesh();
    const auto& sets = owner == nullptr ? model_.AssemblySets() : mesh.IsNull() ? none : mesh->Sets();
    const std::string elsewhere = OwnerOf(names);
    diagnostics_.Add("no-such-set", path, "found set " + fnd_Quoted(names.set),
                     "the name of a set of " +
                         (owner == nullptr ? "the assembly" : "instance " + fnd_Quoted(names.instance)),
                     !elsewhere.empty()
                         ? elsewhere
                         : fnd_DidYouMean(diagnostics_, names.set, [&sets](fnd_Nearest& nearest) {
                               for (const auto& set : sets) nearest.Try(set->name.View());
                           }));
}

rgnC_Region mdf_PlaceReader::ReadRegions(const mdf_Value& array, const fnd_Path& path) {
    const int errorsBefore = diagnostics_.NumErrors();
    cow_List<rgnC_Region> regions;
    for (std::size_t i = 0; i < array.Size(); ++i) {
        const fnd_Path place(path, i);
        const rgnC_Region region = ReadRegion(array.Item(i), place);
        if (diagnostics_.NumErrors() != errorsBefore) continue;
        const odiK_Instance* owner = model_.FindInstance(region.InstanceName());
        if (region.FlagWord() != 1 || (owner != nullptr && !owner->isPartInstance)) {
            diagnostics_.Expected(place, array.Item(i), "a node set: only of such can several be given");
            continue;
        }
        regions.Append(region);
    }
    if (array.Empty()) diagnostics_.Expected(path, array, "one region or several");
    if (diagnostics_.NumErrors() != errorsBefore) return {};
    if (regions.Length() == 1) return regions[0];
    const rgnC_Region joined = model_.JoinNodeSets(regions);
    // A complete model takes no set that it hasn't.
    if (!joined.HasValue()) diagnostics_.Expected(path, array, "regions that the model has joined already");
    return joined;
}
