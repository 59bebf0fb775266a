#include "conditions/oif_FieldBuilder.h"

#include "conditions/oif_FieldTable.h"
#include "store_interface/records/conditions/kpfC_Fields.h"

#include <algorithm>

void oif_FieldBuilder::Build() {
    BuildFieldsHistory();
}

void oif_FieldBuilder::BuildFieldsHistory() {
    const kprC_StepContainer& steps = Model().Steps();
    oif_FieldOpStatus opStatus;
    opStatus.Configure(Model().Fields(), steps.Keys());
    const oif_FieldSetting setting{FindMaxTempSizeInModel(), FindMaxGenFieldSizeInModel()};
    const oif_ObjectsOfSteps<kpfC_Field> written(
        "field", Model().Fields(), steps, opStatus,
        [&](const kpfC_Field& field, const cow_String& step, bool) { return opStatus.Writes(field, step); });
    for (int i = 0; i < steps.Size(); ++i) {
        MakeCards(
            written, i, opStatus,
            [](const cow_String& name, const kpfC_Field& field) {
                return cow_String("Name: ") + name + "   Type: " + oif_FindFieldRow(field.DynTypeId())->label;
            },
            [&](const oif_FieldCard& card, auto& entry) {
                const oif_FieldRow& row = *oif_FindFieldRow(card.Object().DynTypeId());
                AddComment(card, entry);
                AddShared(card, entry, [&] { return (i == 0 ? row.makeInitial : row.make)(card, setting); });
            });
    }
}

template <class Field, class SizeOf>
int oif_FieldBuilder::FindMaxSize(const SizeOf& sizeOf) const {
    const kprC_StepContainer& steps = Model().Steps();
    if (steps.Size() == 0) return 0;
    int size = 0;
    for (const auto& [name, each] : Model().Fields()) {
        const auto* field = nex_canDynamicCastPtr<Field>(&each);
        if (field == nullptr || field->suppressed || !Field::IsActive(field->Status(steps.NameAt(0))))
            continue;
        size = std::max(size, sizeOf(field->StateIn(steps.NameAt(0))));
    }
    return size;
}

int oif_FieldBuilder::FindMaxGenFieldSizeInModel() const {
    return FindMaxSize<kpfC_GeneralField>([](const auto& state) { return state.NumberOfValues(); });
}

int oif_FieldBuilder::FindMaxTempSizeInModel() const {
    return FindMaxSize<kpfC_Temperature>([](const auto& state) { return state.values.Length(); });
}
