#include "model_file/mdf_ModelReader.h"

#include "foundation/thr_Poll.h"
#include "store_interface/findings/fnd_TextRules.h"
#include "store_interface/model/odiK_ModelRules.h"
#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

std::vector<std::string> ModelMembers(const odiK_Model& model) {
    std::vector<std::string> members = mdf_MembersOf(model.DynFields());
    for (const odiK_Repository& repository : odiK_Repositories()) members.emplace_back(repository.member);
    return members;
}

} // namespace

void mdf_ModelReader::Read(mdf_Value& json, const fnd_Path& path) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object");
        return;
    }
    mdf_CheckMembers(diagnostics_, json, ModelMembers(model_), path);
    tree_.ReadFields(model_, json, path);
    // What refers to sets of a mesh that isn't there would only be reported too.
    if (tree_.LacksMesh()) return;
    model_.SealInstances();
    for (const odiK_Repository& repository : odiK_Repositories()) {
        const mdf_Value* value = json.Find(repository.member);
        const fnd_Path place(path, std::string_view(repository.member));
        if (value == nullptr) continue;
        if (repository.IsInOrder()) {
            ReadSteps(*value, place);
        } else {
            ReadRepository(repository, *value, place);
        }
    }
    records_.References().Check();
    fnd_Below problems(diagnostics_, path);
    odiK_CheckModelRules(model_, problems);
    tree_.CheckAttributes();
    Propagate(path);
    if (diagnostics_.NumErrors() > 0) return;

    model_.CompleteTree(problems);
    model_.SetComplete();
}

void mdf_ModelReader::ReadRepository(const odiK_Repository& info, const mdf_Value& json,
                                     const fnd_Path& path) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, std::string("an object, each member ") + info.singular);
        return;
    }
    mdl_Repository& repository = info.In(model_);
    mdf_CapitalsCheck capitals;
    for (const mdf_Member& member : json.Members()) {
        thr_Poll::Now();
        const fnd_Path place(path, member.name);
        if (!fnd_CheckName(member.name, place, diagnostics_)) continue;
        capitals.Enter(member.name, place, "name", diagnostics_);
        const std::unique_ptr<cls_Record> record = ReadObject(info, member.value, place);
        if (record == nullptr) {
            records_.References().NoteWrong(member.name);
            continue;
        }
        repository.InsertRecord(cow_String(member.name), *record);
    }
}

std::unique_ptr<cls_Record> mdf_ModelReader::ReadObject(const odiK_Repository& info, const mdf_Value& json,
                                                        const fnd_Path& place) {
    std::vector<std::string> others;
    if (info.IsPropagating()) others.emplace_back("states");
    std::unique_ptr<cls_Record> record = records_.ReadVariant(info.ItemTypeId(), json, place, others);
    const mdf_Value* states = record != nullptr && info.IsPropagating() ? json.Find("states") : nullptr;
    if (states != nullptr) {
        records_.ReadStates(static_cast<kprC_PropagatingObject&>(*record), *states,
                            fnd_Path(place, "states"));
    }
    return record;
}

void mdf_ModelReader::ReadAnew(const odiK_Repository& info, const std::string& name, const mdf_Value& json,
                               const fnd_Path& place, const kprC_Timeline& timeline) {
    const std::unique_ptr<cls_Record> record = ReadObject(info, json, place);
    if (record == nullptr) return;
    records_.References().Check();
    if (info.IsPropagating()) PropagateObject(static_cast<kprC_PropagatingObject&>(*record), timeline, place);
    info.In(model_).InsertRecord(cow_String(name), *record);
}

void mdf_ModelReader::PropagateObject(kprC_PropagatingObject& object, const kprC_Timeline& timeline,
                                      const fnd_Path& place) {
    fnd_Below below(diagnostics_, place);
    for (fnd_Finding& problem : object.Propagate(timeline)) below.Take(std::move(problem));
}

void mdf_ModelReader::ReadSteps(const mdf_Value& json, const fnd_Path& path) {
    if (!json.IsArray()) {
        diagnostics_.Expected(path, json, "an array of steps");
        return;
    }
    mdf_CapitalsCheck capitals;
    for (std::size_t i = 0; i < json.Size(); ++i) ReadStep(json.Item(i), i == 0, fnd_Path(path, i), capitals);
}

void mdf_ModelReader::ReadStep(const mdf_Value& json, bool isFirst, const fnd_Path& path,
                               mdf_CapitalsCheck& capitals) {
    const fnd_Path namePath(path, "name");
    const fnd_Path classPath(path, "class");
    std::unique_ptr<cls_Record> record;
    if (json.IsObject() && json.Find("class") == nullptr) {
        diagnostics_.Add("missing-field", classPath, "found nothing", "the class of the step");
    } else {
        record = records_.NewVariant(kprC_Step::TypeId(), json, path);
    }
    if (!json.IsObject()) return;
    const mdf_Value* given = json.Find("name");
    if (given == nullptr || !given->IsString()) {
        diagnostics_.Add("missing-field", namePath,
                         "found " + (given == nullptr ? std::string("nothing") : mdf_Shown(*given)),
                         "the name of the step");
        return;
    }
    const std::string& name = given->String();
    if (record == nullptr) {
        records_.References().NoteWrong(name);
        return;
    }
    records_.ReadRecord(*record, json, path, {"name", "class"});
    if (!fnd_CheckName(name, namePath, diagnostics_)) return;
    capitals.Enter(name, namePath, "step", diagnostics_);
    if (model_.steps.IsMember(cow_String(name))) {
        diagnostics_.Add("duplicate-name", namePath, "found a second step named " + fnd_Quoted(name),
                         "names that are unique");
        return;
    }
    const bool isInitial = record->DynTypeId() == kprC_InitialStep::TypeId();
    if (isInitial && !isFirst) {
        diagnostics_.Add("initial-step", classPath, "found a second InitialStep",
                         "it in the first place alone");
    } else if (isFirst && !isInitial) {
        diagnostics_.Add("initial-step", classPath,
                         "found " + fnd_Quoted(cls_Classes().ShortNameOf(record->DynTypeId()).View()),
                         "InitialStep as the first step");
    }
    model_.steps.Append(cow_String(name), static_cast<const kprC_Step&>(*record));
}

void mdf_ModelReader::Propagate(const fnd_Path& path) {
    const kprC_Timeline timeline(model_.steps);
    for (const odiK_Repository& info : odiK_Repositories()) {
        if (!info.IsPropagating()) continue;
        mdl_Repository& repository = info.In(model_);
        const fnd_Path container(path, std::string_view(info.member));
        for (const cow_String& name : repository.Keys()) {
            thr_Poll::Now();
            PropagateObject(static_cast<kprC_PropagatingObject&>(repository.WritableRecord(name)), timeline,
                            fnd_Path(container, name.View()));
        }
    }
}
