#include "model_file/mdf_PairLists.h"

#include "model_file/mdf_RecordReader.h"
#include "store_interface/records/interactions/kinC_ContactExp.h"

namespace {

constexpr mdf_PairList kRows[] = {
    {"inclusions", "inclusionPairs", nullptr},
    {"exclusions", "exclusionPairs", nullptr},
    {"propertyAssignments", "propertyAssignmentPairs", "property"},
    {"surfacePropertyAssignments", "surfacePropertyAssignmentPairs", ""},
    {"formulationAssignments", "formulationAssignmentPairs", ""},
};

using Pairs = cow_List<kinC_SurfacePair>;

int PlaceOf(Pairs& pairs, const kinC_SurfacePair& pair) {
    for (int i = 0; i < pairs.Length(); ++i) {
        if (pairs[i].first == pair.first && pairs[i].second == pair.second) return i;
    }
    pairs.Append(pair);
    return pairs.Length() - 1;
}

} // namespace

const mdf_PairList* mdf_PairListOf(const cls_Field& field) {
    for (const mdf_PairList& row : kRows) {
        const cls_Field* known = kinC_ContactExpState::Fields().Find(row.list);
        if (known->access == field.access) return &row;
    }
    return nullptr;
}

bool mdf_IsOfPairs(const mdf_PairList& row, const mdf_Value& json) {
    if (!json.IsArray()) return false;
    for (std::size_t i = 0; i < json.Size(); ++i) {
        const mdf_Value item = json.Item(i);
        if (!item.IsObject()) continue;
        const bool isNamed = row.value != nullptr && *row.value != '\0' && item.Find(row.value) != nullptr;
        if (isNamed || item.Find("first") != nullptr || item.Find("second") != nullptr) return true;
    }
    return false;
}

bool mdf_UsesPairs(const kprC_PropagatingObject& object, const mdf_Value& states) {
    if (object.DynTypeId() != kinC_ContactExp::TypeId()) return false;
    for (const mdf_Member& state : states.Members()) {
        if (!state.value.IsObject()) continue;
        for (const mdf_PairList& row : kRows) {
            const mdf_Value* list = state.value.Find(row.list);
            if (list != nullptr && mdf_IsOfPairs(row, *list)) return true;
        }
    }
    return false;
}

bool mdf_RecordReader::ReadPairs(kprC_PropagatingObject& object, const mdf_PairList& row,
                                 const cls_Field& field, void* list, const mdf_Value& json,
                                 const fnd_Path& path) {
    auto& contact = static_cast<kinC_ContactExp&>(object);
    auto& pairs = *static_cast<Pairs*>(kinC_ContactExp::Fields().Find(row.pairs)->In(contact));
    const auto& type = static_cast<const cls_ListType&>(*field.type);
    const auto& attribute = static_cast<const cls_AttributeType&>(type.ItemType());
    const int errorsBefore = diagnostics_.NumErrors();
    type.Clear(list);
    for (std::size_t i = 0; i < json.Size(); ++i) {
        const mdf_Value item = json.Item(i);
        const fnd_Path place(path, i);
        if (!item.IsObject()) {
            diagnostics_.Expected(place, item, "an object with a pair, as the others of this list");
            continue;
        }
        const bool hasMembers = row.value != nullptr && *row.value == '\0';
        std::vector<std::string> others;
        if (row.value != nullptr && !hasMembers) others.emplace_back(row.value);
        const cls_HolderType* holder =
            hasMembers ? static_cast<const cls_HolderType*>(&attribute.ValueType()) : nullptr;
        if (hasMembers) others = mdf_MembersOf(cls_Classes().Find(holder->ClassId())->fields());
        kinC_SurfacePair pair;
        ReadRecord(pair, item, place, others);
        const int index = PlaceOf(pairs, pair);
        while (type.Length(list) <= index) type.Append(list);
        void* entry = type.WritableItem(list, index);
        attribute.SetState(entry, static_cast<int>(mdl_PropAttributeStateEnm::SET));
        if (hasMembers) {
            ReadRecord(*holder->Writable(attribute.WritableValue(entry)), item, place,
                       mdf_MembersOf(kinC_SurfacePair::Fields()));
        } else if (row.value == nullptr) {
            *static_cast<bool*>(attribute.WritableValue(entry)) = true;
        } else if (const mdf_Value* value = item.Find(row.value)) {
            ReadAttribute(attribute, entry, *value, fnd_Path(place, std::string_view(row.value)), field);
        } else {
            diagnostics_.Add("missing-field", fnd_Path(place, std::string_view(row.value)), "found nothing",
                             field.doc);
        }
    }
    return diagnostics_.NumErrors() == errorsBefore;
}
