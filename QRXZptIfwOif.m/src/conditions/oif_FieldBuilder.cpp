#include "conditions/oif_FieldBuilder.h"

#include "conditions/oif_InitialConditions.h"
#include "conditions/oif_PredefinedFields.h"
#include "foundation/omi_Singleton.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/conditions/uti_TranslationMap.h"

#include <algorithm>

void oif_FieldBuilder::Build() {
    BuildFieldsHistory();
}

void oif_FieldBuilder::BuildFieldsHistory() {
    ConfigureOpStatus();
    const int maxGeneralFieldSize = FindMaxGenFieldSizeInModel();
    const int maxTemperatureSize = FindMaxTempSizeInModel();
    const kprC_StepContainer& steps = Model().Steps();
    const oif_ObjectsOfSteps<kpfC_Field> written(
        "field", Model().Fields(), steps,
        [this](const kpfC_Field& field, const cow_String& step) { return opStatus_.Writes(field, step); });
    for (int i = 0; i < steps.Size(); ++i) {
        const nex_Context stepContext("step", steps.NameAt(i));
        for (const auto& [name, field] : written.In(i)) {
            const nex_Context context("field", *name);
            CreateFieldCard(*name, *field, steps.NameAt(i), maxTemperatureSize, maxGeneralFieldSize);
        }
    }
}

void oif_FieldBuilder::ConfigureOpStatus() {
    opStatus_.Configure(Model().Fields(), Model().Steps().Keys());
}

void oif_FieldBuilder::CreateFieldCard(const cow_String& name, const kpfC_Field& field,
                                       const cow_String& stepName, int maxTemperatureSize,
                                       int maxGeneralFieldSize) {
    if (field.suppressed) return;
    for (const oif_ConditionPlace& place :
         oif_FieldOpStatus::Places(Model().Steps().ConstGet(stepName), name)) {
        FieldCardDetails(name, field, stepName, maxTemperatureSize, maxGeneralFieldSize, place.loadCase,
                         place.scale);
    }
}

void oif_FieldBuilder::FieldCardDetails(const cow_String& name, const kpfC_Field& field,
                                        const cow_String& stepName, int maxTemperatureSize,
                                        int maxGeneralFieldSize, const cow_String& loadCaseName,
                                        const float& scale) {
    if (field.suppressed) return;
    const unsigned typeId = field.DynTypeId();
    const auto add = [&](const qkw_Keyword& keyword) { AddStepDefinition(stepName, keyword, loadCaseName); };
    if (loadCaseName.IsEmpty()) AddStepDefinition(stepName, blockHeader_.StepHeader(stepName));
    cow_String text = cow_String("Name: ") + name +
                      "   Type: " + omi_Singleton<kpfC_FieldTypeLabelMap>::Instance().LabelString(typeId, 1);
    if (!loadCaseName.IsEmpty()) text.Append("   Scale factor: ").Append(cow_String(scale));
    add(oif_Comment(text));

    const cow_String setName = oif_RegionName(field.region, ModelInfo());
    const bool opMod = !opStatus_.OpNew(typeId, stepName);
    const auto addInitialConditions = [&] {
        add(oif_InitialConditions(field, Model().Steps().NameAt(0), stepName, opMod, setName,
                                  maxTemperatureSize, maxGeneralFieldSize));
    };
    switch (typeId) {
    case kpfC_Temperature::Class.Id():
        if (IsInitialStep(stepName)) return addInitialConditions();
        return add(oif_FieldTemperature(field, stepName, opMod, setName, maxTemperatureSize,
                                        static_cast<double>(scale)));
    case kpfC_GeneralField::Class.Id():
        if (IsInitialStep(stepName)) return addInitialConditions();
        return add(oif_GeneralField(field, stepName, opMod, setName));
    case kpfC_PressureStress::Class.Id(): return add(oif_PressureStress(field, stepName, opMod, setName));
    case kpfC_MassFlowRate::Class.Id(): return add(oif_MassFlowRate(field, stepName, opMod, setName));
    case kpfC_Velocity::Class.Id():
    case kpfC_Stress::Class.Id():
    case kpfC_Hardening::Class.Id(): return addInitialConditions();
    default: return;
    }
}

template <class Field, class SizeOf>
int oif_FieldBuilder::FindMaxSize(const SizeOf& sizeOf) const {
    const kprC_StepContainer& steps = Model().Steps();
    if (steps.Size() == 0) return 0;
    int size = 0;
    for (kprC_PropagatingContainerIT<kpfC_Field> it(Model().Fields()); !it.IsDone(); it.Next()) {
        const auto* field = nex_canDynamicCastPtr<Field>(&it.CurrentValue());
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

bool oif_FieldBuilder::IsInitialStep(const cow_String& stepName) const {
    return stepName == Model().Steps().NameAt(0);
}
