#include "deck_checks/dck_Check.h"
#include "store_interface/findings/fnd_RecordRules.h"
#include "store_interface/findings/fnd_Text.h"
#include "store_interface/findings/fnd_TextRules.h"
#include "store_interface/model/odb_Odb.h"
#include "store_interface/model/odiK_ModelRules.h"
#include "store_interface/model/odiK_References.h"
#include "store_interface/model/odiK_Repositories.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <cmath>

namespace {

/// Walks over the fields of records and says what a model file would be refused for.
class RecordWalk {
public:
    RecordWalk(const odiK_Model& model, fnd_Sink& sink) : references_(model), sink_(sink) {}

    void Name(const cow_String& name, const fnd_Path& place) { fnd_CheckName(name.View(), place, sink_); }

    void Record(const cls_Record& record, const fnd_Path& place) {
        for (const cls_Field& field : record.DynFields().All()) {
            if (field.notModelData) continue;
            const fnd_Path path(place, field.name);
            const void* value = field.In(record);
            if (field.required && IsEmptyText(field, value)) {
                sink_.Add("missing-field", path, "found nothing", field.doc);
            }
            Value(*field.type, value, field, path);
        }
        fnd_RecordCheck check(sink_, place);
        fnd_RecordRules::All().Run(record, check);
    }

    /// The fields of a state that the user gave.
    void State(const mdl_GivenState& given, const fnd_Path& place) {
        const cls_Record& record = given.record.ConstGet();
        const auto& fields = record.DynFields().All();
        for (std::size_t i = 0; i < fields.size(); ++i) {
            const bool hasValue =
                given.marks[i] == mdl_GivenEnm::VALUE || given.marks[i] == mdl_GivenEnm::AS_IT_STANDS;
            if (hasValue)
                Value(*fields[i].type, fields[i].In(record), fields[i], fnd_Path(place, fields[i].name));
        }
        fnd_RecordCheck check(sink_, place);
        fnd_RecordRules::All().Run(record, check);
    }

private:
    static bool IsEmptyText(const cls_Field& field, const void* value) {
        return field.type->Kind() == cls_FieldKind::String &&
               static_cast<const cow_String*>(value)->IsEmpty();
    }

    void Number(double number, const fnd_Path& path) {
        if (!std::isfinite(number))
            sink_.Add("wrong-value", path, "found a number that isn't finite", "a number");
    }

    void Text(const cow_String& text, const cls_Field& field, const fnd_Path& path) {
        if (!text.IsEmpty() && !fnd_CheckText(field, text.View(), path, sink_)) return;
        references_.Check(field, std::string(text.View()), path.Text(), sink_);
    }

    void Enum(const cls_EnumType& type, const void* value, const fnd_Path& path) {
        if (type.Table().Row(type.Get(value)) != nullptr) return;
        std::vector<std::string> words;
        for (const omu_EnumRow& row : type.Table().rows) words.emplace_back(row.name);
        sink_.Add("wrong-value", path, "found " + std::to_string(type.Get(value)), fnd_OneOf(words));
    }

    void Map(const cls_MapType& type, const void* value, const cls_Field& field, const fnd_Path& path) {
        for (const cow_String& key : type.Keys(value)) {
            const fnd_Path place(path, key.View());
            if (field.refersTo != nullptr) {
                references_.Check(field, std::string(key.View()), place.Text(), sink_);
            } else {
                Name(key, place);
            }
            Value(type.ItemType(), type.Item(value, key), field, place);
        }
    }

    void List(const cls_ListType& type, const void* value, const cls_Field& field, const fnd_Path& path) {
        const int length = type.Length(value);
        if (field.length != 0 && length != field.length) {
            sink_.Add("wrong-value", path, "found " + fnd_Counted(length, "item"),
                      "an array of " + std::to_string(field.length) + " items");
        }
        for (int i = 0; i < length; ++i) {
            Value(type.ItemType(), type.Item(value, i), field, fnd_Path(path, static_cast<std::size_t>(i)));
        }
    }

    void Table(const cow_2DArray<double>& cells, const fnd_Path& path) {
        for (int i = 0; i < cells.NumRows(); ++i) {
            const fnd_Path row(path, static_cast<std::size_t>(i));
            for (int j = 0; j < cells.NumColumns(); ++j) {
                Number(cells.ConstGet(i, j), fnd_Path(row, static_cast<std::size_t>(j)));
            }
        }
    }

    void Value(const cls_FieldType& type, const void* value, const cls_Field& field, const fnd_Path& path) {
        switch (type.Kind()) {
        case cls_FieldKind::Double: return Number(*static_cast<const double*>(value), path);
        case cls_FieldKind::Float:
            return Number(static_cast<double>(*static_cast<const float*>(value)), path);
        case cls_FieldKind::String: return Text(*static_cast<const cow_String*>(value), field, path);
        case cls_FieldKind::Enum: return Enum(static_cast<const cls_EnumType&>(type), value, path);
        case cls_FieldKind::Map: return Map(static_cast<const cls_MapType&>(type), value, field, path);
        case cls_FieldKind::List: return List(static_cast<const cls_ListType&>(type), value, field, path);
        case cls_FieldKind::Table: return Table(static_cast<const cls_TableType&>(type).Get(value), path);
        case cls_FieldKind::Attribute: {
            const auto& attribute = static_cast<const cls_AttributeType&>(type);
            return Value(attribute.ValueType(), attribute.Value(value), field, path);
        }
        case cls_FieldKind::Record:
        case cls_FieldKind::Optional:
        case cls_FieldKind::Variant: {
            const cls_Record* record = static_cast<const cls_HolderType&>(type).Get(value);
            if (record != nullptr) Record(*record, path);
            return;
        }
        default: return;
        }
    }

    odiK_References references_;
    fnd_Sink& sink_;
};

void CheckAttributes(const odiK_AttributeInputs& inputs, RecordWalk& walk, const fnd_Path& place) {
    const std::pair<const char*, const std::vector<odiK_AttributeInput>*> lists[] = {
        {"sectionAssignments", &inputs.sectionAssignments},
        {"materialOrientations", &inputs.materialOrientations},
        {"beamOrientations", &inputs.beamOrientations}};
    for (const auto& [member, list] : lists) {
        const fnd_Path path(place, std::string_view(member));
        for (std::size_t i = 0; i < list->size(); ++i) {
            if (!(*list)[i].record.IsNull()) walk.Record((*list)[i].record.ConstGet(), fnd_Path(path, i));
        }
    }
}

void CheckSets(const std::vector<cow_CountedHld<odiK_Set>>& sets, RecordWalk& walk, const fnd_Path& owner) {
    const fnd_Path path(owner, "sets");
    for (std::size_t i = 0; i < sets.size(); ++i) {
        const fnd_Path set(path, i);
        walk.Name(sets[i]->name, fnd_Path(set, "name"));
    }
}

void CheckMesh(const cow_CountedHld<odiK_Mesh>& mesh, RecordWalk& walk, const fnd_Path& owner) {
    if (mesh.IsNull()) return;
    const fnd_Path path(owner, "mesh");
    const fnd_Path elements(path, "elements");
    for (std::size_t i = 0; i < mesh->Classes().size(); ++i) {
        const fnd_Path each(elements, i);
        walk.Name(mesh->Classes()[i].type, fnd_Path(each, "type"));
    }
    CheckSets(mesh->Sets(), walk, path);
}

void CheckParts(const odiK_Model& model, RecordWalk& walk, const fnd_Path& place) {
    const fnd_Path parts(place, "parts");
    for (const auto& [name, part] : model.Parts()) {
        const fnd_Path each(parts, name.View());
        walk.Name(name, each);
        CheckMesh(part->mesh, walk, each);
        CheckAttributes(part->attributes, walk, each);
    }
    const fnd_Path assembly(place, "assembly");
    const fnd_Path instances(assembly, "instances");
    for (const auto& [name, instance] : model.Instances()) {
        const fnd_Path each(instances, name.View());
        walk.Name(name, each);
        CheckMesh(instance->ownMesh, walk, each);
    }
    walk.Record(model.AssemblyObject(), assembly);
    CheckMesh(model.ConstAssemblyMesh(), walk, assembly);
    CheckSets(model.AssemblySets(), walk, assembly);
    const fnd_Path datums(place, "datums");
    for (std::size_t i = 0; i < model.Datums().size(); ++i)
        walk.Record(model.Datums()[i], fnd_Path(datums, i));
}

void CheckSteps(const odiK_Model& model, RecordWalk& walk, const fnd_Path& place, fnd_Sink& sink) {
    for (int i = 0; i < model.steps.Size(); ++i) {
        const fnd_Path step(place, static_cast<std::size_t>(i));
        const unsigned type = model.steps.StepAt(i).DynTypeId();
        const bool isInitial = type == kprC_InitialStep::TypeId();
        if (i == 0 && !isInitial) {
            sink.Add("initial-step", fnd_Path(step, "class"),
                     "found " + fnd_Quoted(cls_Classes().ShortNameOf(type).View()),
                     "InitialStep as the first step");
        } else if (i > 0 && isInitial) {
            sink.Add("initial-step", fnd_Path(step, "class"), "found a second InitialStep",
                     "it in the first place alone");
        }
        walk.Name(model.steps.NameAt(i), fnd_Path(step, "name"));
        walk.Record(model.steps.StepAt(i), step);
    }
}

void CheckRepository(const odiK_Repository& repository, const odiK_Model& model, RecordWalk& walk,
                     const fnd_Path& place) {
    for (const auto& [name, record] : repository.In(model)) {
        const fnd_Path each(place, name.View());
        walk.Name(name, each);
        walk.Record(record, each);
        if (!repository.IsPropagating()) continue;
        const fnd_Path states(each, "states");
        for (const mdl_GivenState& given : static_cast<const kprC_PropagatingObject&>(record).GivenStates()) {
            walk.State(given, fnd_Path(states, given.stepName.View()));
        }
    }
}

} // namespace

void dck_CheckStore(const odb_Odb& store, const cow_String& modelName, fnd_Sink& sink) {
    const odiK_Model& model = *store.FindModel(modelName);
    const fnd_Path root;
    const fnd_Path models(root, "models");
    const fnd_Path place(models, modelName.View());
    RecordWalk walk(model, sink);
    walk.Record(model, place);
    CheckParts(model, walk, place);
    for (const odiK_Repository& repository : odiK_Repositories()) {
        const fnd_Path container(place, std::string_view(repository.member));
        if (repository.IsInOrder()) {
            CheckSteps(model, walk, container, sink);
        } else {
            CheckRepository(repository, model, walk, container);
        }
    }
    fnd_Below below(sink, place);
    odiK_CheckModelRules(model, below);
}
