#include "deck_checks/dck_Checks.h"
#include "deck_checks/dck_Kept.h"
#include "deck_checks/dck_Text.h"
#include "deck_checks/dck_Walk.h"
#include "sections/oif_DatumCsys.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <algorithm>
#include <map>
#include <memory>
#include <set>

namespace {

/// Says of fields that no deck tells of that they have been given.
class LostFields {
public:
    explicit LostFields(fnd_Sink& sink) : sink_(sink) {}

    void Visit(const cls_Record& record, const mdl_GivenState* given, const fnd_Path& place) {
        const auto& fields = record.DynFields().All();
        for (std::size_t i = 0; i < fields.size(); ++i) {
            const cls_Field& field = fields[i];
            if (field.notInDeck == nullptr || !dck_IsGiven(given, i)) continue;
            const cls_Record* usual = UsualOf(record);
            if (usual != nullptr && field.type->Equal(field.In(record), field.In(*usual))) continue;
            sink_.Add("not-in-deck", fnd_Path(place, field.name),
                      "found a value, and no line of a deck carries it", {}, field.notInDeck);
        }
    }

private:
    /// A record of the class as it is without a word of the user.
    const cls_Record* UsualOf(const cls_Record& record) {
        if (dynamic_cast<const odiK_ModelData*>(&record) != nullptr) return &usualModel_;
        auto& usual = usual_[record.DynTypeId()];
        if (usual == nullptr) {
            const cls_ClassEntry* entry = cls_Classes().Find(record.DynTypeId());
            if (entry != nullptr && entry->create != nullptr) usual.reset(entry->create());
        }
        return usual.get();
    }

    fnd_Sink& sink_;
    odiK_ModelData usualModel_;
    std::map<unsigned, std::unique_ptr<cls_Record>> usual_;
};

constexpr char kSet[] = "set";

/// Says of datums that are no coordinate systems where one is needed.
void FindWrongDatums(const odiK_Model& model, const cls_Record& record, const fnd_Path& place,
                     fnd_Sink& sink) {
    for (const cls_Field& field : record.DynFields().All()) {
        if (field.type->Kind() != cls_FieldKind::Datum) continue;
        const int id = static_cast<const dtmC_DatumRef*>(field.In(record))->Id();
        if (id < 1 || id > static_cast<int>(model.Datums().size())) continue;
        const odiK_Datum& datum = model.Datums()[static_cast<std::size_t>(id - 1)];
        if (datum.type == dtu_DatumType::CSYS) continue;
        sink.Add("cannot-be-written", fnd_Path(place, field.name),
                 std::string("writing fails with \"") + oif_kDatumError + "\": " + Quoted(datum.name) +
                     " is no coordinate system");
    }
}

/// Which objects others refer to, by the kind that fields tell. Sets of one name count as one.
class Uses {
public:
    void Visit(const cls_Record& record, const mdl_GivenState* given) {
        const auto& fields = record.DynFields().All();
        for (std::size_t i = 0; i < fields.size(); ++i) {
            if (fields[i].type->Kind() == cls_FieldKind::Tree || !dck_IsGiven(given, i)) continue;
            if (fields[i].verbatim && fields[i].type->Kind() == cls_FieldKind::String) {
                hasVerbatim_ =
                    hasVerbatim_ || !static_cast<const cow_String*>(fields[i].In(record))->IsEmpty();
            }
            Add(*fields[i].type, fields[i].In(record), fields[i].refersTo);
        }
    }
    /// Those of a kind; null for none.
    const std::set<cow_String>* NamesOf(const char* kind) const {
        const auto found = names_.find(std::string_view(kind));
        return found == names_.end() ? nullptr : &found->second;
    }
    /// Whether some text goes into the deck as it stands, which may name anything.
    bool HasVerbatim() const { return hasVerbatim_; }

private:
    /// `kind` is null for a field that names nothing.
    void Add(const cls_FieldType& type, const void* value, const char* kind) {
        switch (type.Kind()) {
        case cls_FieldKind::String:
            if (kind != nullptr) AddName(kind, static_cast<const cow_String*>(value)->View());
            return;
        case cls_FieldKind::Region:
            names_[kSet].insert(static_cast<const rgnC_Region*>(value)->SetName());
            return;
        case cls_FieldKind::List: {
            const auto& list = static_cast<const cls_ListType&>(type);
            for (int i = 0; i < list.Length(value); ++i) Add(list.ItemType(), list.Item(value, i), kind);
            return;
        }
        case cls_FieldKind::Map: {
            const auto& map = static_cast<const cls_MapType&>(type);
            for (const cow_String& key : map.Keys(value)) {
                if (kind != nullptr) names_[std::string(kind)].insert(key);
                Add(map.ItemType(), map.Item(value, key), kind);
            }
            return;
        }
        case cls_FieldKind::Attribute: {
            const auto& attribute = static_cast<const cls_AttributeType&>(type);
            return Add(attribute.ValueType(), attribute.Value(value), kind);
        }
        default: return;
        }
    }

    /// A set may be given with its instance.
    void AddName(const char* kind, std::string_view name) {
        std::set<cow_String>& names = names_[std::string(kind)];
        names.insert(cow_String(name));
        const std::size_t dot = name.rfind('.');
        if (kind == std::string_view(kSet) && dot != std::string_view::npos) {
            names.insert(cow_String(name.substr(dot + 1)));
        }
    }

    std::map<std::string, std::set<cow_String>, std::less<>> names_;
    bool hasVerbatim_ = false;
};

/// What is found of some of the records, and what they refer to.
struct Part {
    std::vector<fnd_Finding> findings;
    Uses uses;
};
using Parts = std::vector<std::shared_ptr<const Part>>;

/// `walk` visits the records.
template <class Walk>
Part LookAt(const odiK_Model& model, const Walk& walk) {
    fnd_List list;
    LostFields lost(list);
    Uses uses;
    walk([&](const cls_Record& record, const mdl_GivenState* given, const fnd_Path& place) {
        lost.Visit(record, given, place);
        FindWrongDatums(model, record, place, list);
        uses.Visit(record, given);
    });
    return {std::move(list.findings), std::move(uses)};
}

/// The objects of a kind that records refer to.
class Used {
public:
    Used(const Parts& parts, const char* kind) {
        for (const auto& part : parts) {
            if (const auto* names = part->uses.NamesOf(kind)) names_.push_back(names);
        }
    }
    bool Has(const cow_String& name) const {
        return std::ranges::any_of(names_, [&](const auto* names) { return names->count(name) != 0; });
    }

private:
    std::vector<const std::set<cow_String>*> names_;
};

void TellUnused(const std::vector<cow_String>& names, const char* plural, const std::string& place,
                fnd_Sink& sink) {
    constexpr std::size_t kShown = 5;
    if (names.empty()) return;
    std::string shown;
    for (std::size_t i = 0; i < names.size() && i < kShown; ++i)
        shown += (i == 0 ? "" : ", ") + Text(names[i]);
    if (names.size() > kShown) shown += ", ...";
    sink.Add("unused", place,
             "nothing uses " + std::to_string(names.size()) + " of the " + plural + ": " + shown);
}

void FindUnused(const odiK_Model& model, const Parts& parts, fnd_Sink& sink) {
    for (const odiK_Repository& repository : odiK_Repositories()) {
        const bool canBeUnused =
            repository.kind != nullptr && !repository.IsInOrder() && !repository.IsPropagating();
        if (!canBeUnused || repository.kind == std::string_view("constraint")) continue;
        const Used used(parts, repository.kind);
        std::vector<cow_String> names;
        for (const auto& [name, record] : repository.In(model)) {
            if (!used.Has(name)) names.push_back(name);
        }
        TellUnused(names, repository.plural, std::string("/") + repository.member, sink);
    }
}

void FindUnusedSets(const odiK_Model& model, const Parts& parts, fnd_Sink& sink) {
    if (std::ranges::any_of(parts, [](const auto& part) { return part->uses.HasVerbatim(); })) return;
    const Used used(parts, kSet);
    std::vector<cow_String> names;
    const auto add = [&](const cow_String& owner, const std::vector<cow_CountedHld<odiK_Set>>& sets) {
        for (const auto& set : sets) {
            if (set->internal || used.Has(set->name)) continue;
            names.push_back(owner.IsEmpty() ? set->name : owner + "." + set->name);
        }
    };
    for (const auto& [name, part] : model.Parts()) {
        if (!part->mesh.IsNull()) add(name, part->mesh->Sets());
    }
    for (const auto& [name, instance] : model.Instances()) {
        if (!instance->ownMesh.IsNull()) add(name, instance->ownMesh->Sets());
    }
    add({}, model.AssemblySets());
    TellUnused(names, "sets", {}, sink);
}

void FindAssemblyNodes(const odiK_Model& model, fnd_Sink& sink) {
    const auto& mesh = model.ConstAssemblyMesh();
    const int nodes = mesh.IsNull() ? 0 : mesh->Nodes().NumNodes();
    if (nodes == 0) return;
    std::string sets;
    for (const auto& set : model.AssemblySets()) {
        for (const rgnC_SubsetData& subset : set->subsets) {
            if (set->type != res_SetTypeEnm::NODES || subset.meshIndex != 0) continue;
            sets += (sets.empty() ? "" : ", ") + Quoted(set->name);
            break;
        }
    }
    sink.Add("assembly-nodes", "/assembly/mesh/nodes",
             "the assembly's own " + std::to_string(nodes) + " nodes reach no deck" +
                 (sets.empty() ? "" : "; they stand in the sets " + sets),
             {}, "make each a part of one node, and an instance of it");
}

} // namespace

void dck_CheckLoss(const dck_Subject& subject, fnd_Sink& sink) {
    const odiK_Model& model = subject.Model();
    Parts parts;
    parts.push_back(subject.Of("loss of the tree", [&] {
        return LookAt(model, [&](const dck_Visit& visit) { dck_ForEachRecordOfTree(model, visit); });
    }));
    for (const odiK_Repository& repository : odiK_Repositories()) {
        parts.push_back(subject.Of(std::string("loss of ") + repository.member, [&] {
            return LookAt(model,
                          [&](const dck_Visit& visit) { dck_ForEachRecordOf(repository, model, visit); });
        }));
    }
    for (const auto& part : parts) {
        for (const fnd_Finding& finding : part->findings) sink.Take(finding);
    }
    FindUnused(model, parts, sink);
    FindUnusedSets(model, parts, sink);
    FindAssemblyNodes(model, sink);
}
