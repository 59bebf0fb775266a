#include "store_interface/model/odiK_References.h"

#include "store_interface/findings/fnd_Nearest.h"
#include "store_interface/findings/fnd_Text.h"
#include "store_interface/model/odiK_Repositories.h"
#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

std::string Text(const cow_String& text) {
    return std::string(text.View());
}

const odiK_Repository* RepositoryOfKind(std::string_view kind) {
    for (const odiK_Repository& repository : odiK_Repositories()) {
        if (repository.kind != nullptr && kind == repository.kind) return &repository;
    }
    return nullptr;
}

/// Whether the text names a set of an instance whose name stands in double quotes: "A.B".x is set x of
/// instance A.B.
bool IsQuotedSet(const odiK_Model& model, std::string_view text) {
    const std::size_t end = text.starts_with('"') ? text.find("\".", 1) : std::string_view::npos;
    if (end == std::string_view::npos) return false;
    const odiK_Instance* instance = model.FindInstance(cow_String(text.substr(1, end - 1)));
    const auto mesh = instance == nullptr ? cow_CountedHld<odiK_Mesh>() : instance->Mesh();
    return !mesh.IsNull() && mesh->FindSet(cow_String(text.substr(end + 2))) >= 0;
}

void AppendSets(const odiK_Model& model, std::vector<std::string>& names) {
    for (const auto& set : model.AssemblySets()) names.push_back(Text(set->name));
    for (const auto& [instanceName, instance] : model.Instances()) {
        const auto mesh = instance->Mesh();
        if (mesh.IsNull()) continue;
        for (const auto& set : mesh->Sets()) names.push_back(Text(instanceName) + "." + Text(set->name));
    }
}

} // namespace

const odiK_References::Names& odiK_References::NamesOfKind(const std::string& kind) {
    const auto [place, isNew] = known_.try_emplace(kind);
    Names& names = place->second;
    if (!isNew) return names;
    if (const odiK_Repository* repository = RepositoryOfKind(kind)) {
        const cow_List<cow_String> keys =
            repository->IsInOrder() ? model_.steps.Keys() : repository->In(model_).Keys();
        for (const cow_String& key : keys) names.inOrder.push_back(Text(key));
    } else if (kind == "set") {
        AppendSets(model_, names.inOrder);
    }
    names.lookup.insert(names.inOrder.begin(), names.inOrder.end());
    return names;
}

void odiK_References::Check(const cls_Field& field, const std::string& name, const std::string& place,
                            fnd_Sink& sink) {
    if (field.refersTo == nullptr || name.empty()) return;
    const std::string kind = field.refersTo;
    const Names& names = NamesOfKind(kind);
    if (names.lookup.count(name) != 0) return CheckClass(field, name, place, sink);
    if (kind == "set" && IsQuotedSet(model_, name)) return;
    // Orientations and filters may be defined elsewhere in the deck.
    if (kind == "orientation" || kind == "filter") {
        sink.Add("not-defined", place, "found " + fnd_Quoted(name) + ", which the model doesn't define");
        return;
    }
    const bool startsWithVowel = std::string_view("aeiou").find(kind.front()) != std::string_view::npos;
    sink.Add("no-such-name", place, "found " + fnd_Quoted(name),
             std::string("the name of ") + (startsWithVowel ? "an " : "a ") + kind, Hint(names, name, sink));
}

std::string odiK_References::Hint(const Names& names, const std::string& name, fnd_Sink& sink) {
    if (!sink.WantsHint()) return {};
    const std::string nearest = fnd_DidYouMean(sink, name, [&names](fnd_Nearest& known) {
        for (const std::string& each : names.inOrder) known.Try(each);
    });
    return nearest.empty() ? fnd_ThereAre(names.inOrder, name) : nearest;
}

void odiK_References::CheckClass(const cls_Field& field, const std::string& name, const std::string& place,
                                 fnd_Sink& sink) const {
    const odiK_Repository* repository = RepositoryOfKind(field.refersTo);
    if (field.refersToClass == nullptr || repository == nullptr || repository->IsInOrder()) return;
    const cls_Record* record = repository->In(model_).FindRecord(cow_String(name));
    if (record == nullptr || cls_Classes().InheritanceCheck(record->DynTypeId(), field.refersToClass->Id())) {
        return;
    }
    sink.Add("wrong-class", place,
             "found " + fnd_Quoted(name) + ", a " + Text(cls_Classes().ShortNameOf(record->DynTypeId())),
             "the name of a " + std::string(field.refersToClass->Word()));
}
