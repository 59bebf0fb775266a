#include "model_file/mdf_References.h"

#include "store_interface/model/odiK_Repositories.h"
#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

std::string Text(const cow_String& text) {
    return std::string(text.View());
}

const odiK_Repository* RepositoryOfKind(const std::string& kind) {
    for (const odiK_Repository& repository : odiK_Repositories()) {
        if (repository.kind != nullptr && kind == repository.kind) return &repository;
    }
    return nullptr;
}

} // namespace

std::vector<std::string> mdf_Names(const cow_List<cow_String>& names) {
    std::vector<std::string> copies;
    copies.reserve(static_cast<std::size_t>(names.Length()));
    for (const cow_String& name : names) copies.push_back(Text(name));
    return copies;
}

void mdf_References::Note(const cls_Field& field, const std::string& name, const mdf_Path& path) {
    if (field.refersTo != nullptr && !name.empty())
        references_.push_back({field.refersTo, name, path.Text(), field.refersToClass});
}

std::vector<std::string> mdf_References::NamesOfKind(const std::string& kind) const {
    if (const odiK_Repository* repository = RepositoryOfKind(kind)) {
        return mdf_Names(repository->IsInOrder() ? model_.steps.Keys() : repository->In(model_).Keys());
    }
    std::vector<std::string> names;
    if (kind != "set") return names;
    for (const auto& set : model_.AssemblySets()) names.push_back(Text(set->name));
    for (const auto& [instanceName, instance] : model_.Instances()) {
        const auto mesh = instance->Mesh();
        if (mesh.IsNull()) continue;
        for (const auto& set : mesh->Sets()) names.push_back(Text(instanceName) + "." + Text(set->name));
    }
    return names;
}

void mdf_References::CheckClass(const Reference& reference) {
    if (reference.expectedClass == nullptr) return;
    const odiK_Repository* repository = RepositoryOfKind(reference.kind);
    const cls_Record* record = repository == nullptr || repository->IsInOrder()
                                   ? nullptr
                                   : repository->In(model_).FindRecord(cow_String(reference.name));
    if (record == nullptr ||
        cls_Classes().InheritanceCheck(record->DynTypeId(), reference.expectedClass->Id())) {
        return;
    }
    diagnostics_.Error(reference.pointer, "found " + mdf_Quoted(reference.name) + ", a " +
                                              Text(cls_Classes().NameOf(record->DynTypeId())) +
                                              ", expected the name of a " + reference.expectedClass->name);
}

void mdf_References::ReportUnknown(const Reference& reference, const std::vector<std::string>& names) {
    // Orientations and filters may be defined elsewhere in the deck.
    if (reference.kind == "orientation" || reference.kind == "filter") {
        diagnostics_.Warning(reference.pointer,
                             "found " + mdf_Quoted(reference.name) + ", which the model doesn't define");
        return;
    }
    const bool startsWithVowel =
        std::string_view("aeiou").find(reference.kind.front()) != std::string_view::npos;
    diagnostics_.Error(reference.pointer, "found " + mdf_Quoted(reference.name) + ", expected the name of " +
                                              (startsWithVowel ? "an " : "a ") + reference.kind +
                                              mdf_DidYouMean(reference.name, names));
}

void mdf_References::Check() {
    std::map<std::string, std::pair<std::vector<std::string>, std::set<std::string>>> known;
    for (const Reference& reference : references_) {
        const auto [place, isNew] = known.try_emplace(reference.kind);
        auto& [names, lookup] = place->second;
        if (isNew) {
            names = NamesOfKind(reference.kind);
            lookup.insert(names.begin(), names.end());
        }
        if (IsWrong(reference.name)) continue;
        if (lookup.count(reference.name) != 0) {
            CheckClass(reference);
        } else {
            ReportUnknown(reference, names);
        }
    }
}
