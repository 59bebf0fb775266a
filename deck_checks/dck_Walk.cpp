#include "deck_checks/dck_Walk.h"

namespace {

class Walk {
public:
    explicit Walk(const dck_Visit& visit) : visit_(visit) {}

    void Record(const cls_Record& record, const mdl_GivenState* given, const fnd_Path& place) {
        visit_(record, given, place);
        const auto& fields = record.DynFields().All();
        for (std::size_t i = 0; i < fields.size(); ++i) {
            if (fields[i].type->Kind() == cls_FieldKind::Tree || !dck_IsGiven(given, i)) continue;
            Value(*fields[i].type, fields[i].In(record), fnd_Path(place, fields[i].name));
        }
    }

private:
    void Value(const cls_FieldType& type, const void* value, const fnd_Path& place) {
        switch (type.Kind()) {
        case cls_FieldKind::List: {
            const auto& list = static_cast<const cls_ListType&>(type);
            if (!MayHoldRecords(list.ItemType())) return;
            for (int i = 0; i < list.Length(value); ++i) {
                Value(list.ItemType(), list.Item(value, i), fnd_Path(place, static_cast<std::size_t>(i)));
            }
            return;
        }
        case cls_FieldKind::Map: {
            const auto& map = static_cast<const cls_MapType&>(type);
            if (!MayHoldRecords(map.ItemType())) return;
            for (const cow_String& key : map.Keys(value)) {
                Value(map.ItemType(), map.Item(value, key), fnd_Path(place, key.View()));
            }
            return;
        }
        case cls_FieldKind::Record:
        case cls_FieldKind::Optional:
        case cls_FieldKind::Variant: {
            const cls_Record* record = static_cast<const cls_HolderType&>(type).Get(value);
            if (record != nullptr) Record(*record, nullptr, place);
            return;
        }
        case cls_FieldKind::Attribute: {
            const auto& attribute = static_cast<const cls_AttributeType&>(type);
            return Value(attribute.ValueType(), attribute.Value(value), place);
        }
        default: return;
        }
    }

    static bool MayHoldRecords(const cls_FieldType& type) {
        switch (type.Kind()) {
        case cls_FieldKind::List:
        case cls_FieldKind::Map:
        case cls_FieldKind::Record:
        case cls_FieldKind::Optional:
        case cls_FieldKind::Variant: return true;
        default: return false;
        }
    }

    const dck_Visit& visit_;
};

void WalkAttributes(const std::vector<odiK_AttributeInput>& inputs, std::string_view member, Walk& walk,
                    const fnd_Path& place) {
    const fnd_Path list(place, member);
    for (std::size_t i = 0; i < inputs.size(); ++i) {
        if (!inputs[i].record.IsNull()) walk.Record(inputs[i].record.ConstGet(), nullptr, fnd_Path(list, i));
    }
}

void WalkTree(const odiK_Model& model, Walk& walk, const fnd_Path& root) {
    const fnd_Path parts(root, "parts");
    for (const auto& [name, part] : model.Parts()) {
        const fnd_Path place(parts, name.View());
        WalkAttributes(part->attributes.sectionAssignments, "sectionAssignments", walk, place);
        WalkAttributes(part->attributes.materialOrientations, "materialOrientations", walk, place);
        WalkAttributes(part->attributes.beamOrientations, "beamOrientations", walk, place);
    }
    const fnd_Path assembly(root, "assembly");
    const fnd_Path instances(assembly, "instances");
    for (const auto& [name, instance] : model.Instances()) {
        const fnd_Path place(instances, name.View());
        const auto visit = [&](const odiK_Instance::OwnInputs& own, std::string_view member) {
            if (own) WalkAttributes(*own, member, walk, place);
        };
        visit(instance->ownSectionAssignments, "sectionAssignments");
        visit(instance->ownMaterialOrientations, "materialOrientations");
        visit(instance->ownBeamOrientations, "beamOrientations");
    }
    walk.Record(model.AssemblyObject(), nullptr, assembly);
}

} // namespace

bool dck_IsGiven(const mdl_GivenState* given, std::size_t field) {
    return given == nullptr || given->marks[field] == mdl_GivenEnm::VALUE ||
           given->marks[field] == mdl_GivenEnm::AS_IT_STANDS;
}

void dck_ForEachRecordOfTree(const odiK_Model& model, const dck_Visit& visit) {
    Walk walk(visit);
    const fnd_Path root;
    walk.Record(model, nullptr, root);
    WalkTree(model, walk, root);
}

void dck_ForEachRecordOf(const odiK_Repository& repository, const odiK_Model& model, const dck_Visit& visit) {
    Walk walk(visit);
    const fnd_Path root;
    const fnd_Path container(root, std::string_view(repository.member));
    if (repository.IsInOrder()) {
        for (int i = 0; i < model.steps.Size(); ++i) {
            walk.Record(model.steps.StepAt(i), nullptr, fnd_Path(container, static_cast<std::size_t>(i)));
        }
        return;
    }
    for (const auto& [name, record] : repository.In(model)) {
        const fnd_Path place(container, name.View());
        walk.Record(record, nullptr, place);
        if (!repository.IsPropagating()) continue;
        const fnd_Path states(place, "states");
        for (const mdl_GivenState& given : static_cast<const kprC_PropagatingObject&>(record).GivenStates()) {
            walk.Record(given.record.ConstGet(), &given, fnd_Path(states, given.stepName.View()));
        }
    }
}
