#include "store/PropagationRecords.h"

namespace sample {

const omu_EnumTable& omu_EnumTableOf(BoltMethodEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "APPLY_FORCE", "APPLY_FORCE"},
                                           {1, "ADJUST_LENGTH", "ADJUST_LENGTH"},
                                           {2, "FIX_LENGTH", "FIX_LENGTH"}};
    static constexpr omu_EnumTable table{"sample::BoltMethodEnm", rows};
    return table;
}

const cls_FieldTable& ConditionState::Fields() {
    using R = ConditionState;
    static const cls_FieldTable fields = cls_Describe<R>(kbcC_BCState::Fields())
                                             .Field<&R::u1>("u1", "displacement 1")
                                             .InBaseState(cls_BaseStateRule::ZeroValue)
                                             .Field<&R::u2>("u2", "displacement 2")
                                             .InBaseState(cls_BaseStateRule::ZeroValue)
                                             .Field<&R::u3>("u3", "displacement 3")
                                             .InBaseState(cls_BaseStateRule::ZeroValue)
                                             .Field<&R::typeName>("typeName", "named type")
                                             .Field<&R::buckleCase>("buckleCase", "buckling case")
                                             .Field<&R::u1Imag>("u1Imag", "imaginary part of u1")
                                             .InBaseState(cls_BaseStateRule::ZeroValue);
    return fields;
}

const cls_FieldTable& ForceState::Fields() {
    using R = ForceState;
    static const cls_FieldTable fields = cls_Describe<R>(kloC_LoadState::Fields())
                                             .Field<&R::magnitude>("magnitude", "force")
                                             .Field<&R::boltMethod>("boltMethod", "method")
                                             .Field<&R::note>("note", "plain text");
    return fields;
}

const cls_FieldTable& TemperatureState::Fields() {
    static const cls_FieldTable fields = cls_Describe<TemperatureState>(kpfC_FieldState::Fields())
                                             .Field<&TemperatureState::values>("values", "temperatures");
    return fields;
}

const cls_FieldTable& ContactState::Fields() {
    static const cls_FieldTable fields = cls_Describe<ContactState>(kinC_InteractionState::Fields())
                                             .Field<&ContactState::opDelete>("opDelete", "ends the contact")
                                             .Field<&ContactState::friction>("friction", "coefficient");
    return fields;
}

void Contact::CompleteState(cls_Record& state, mdl_PropagationStatusEnm status,
                            const mdl_GivenState* given) const {
    if (given != nullptr && given->IsGiven("opDelete")) return;
    static_cast<ContactState&>(state).opDelete = status == mdl_PropagationStatusEnm::DEACTIVATED;
}

const cls_FieldTable& RequestState::Fields() {
    static const cls_FieldTable fields = cls_Describe<RequestState>(korC_OutputState::Fields())
                                             .Field<&RequestState::variable>("variable", "what");
    return fields;
}

cls_Record* Request::NewState(unsigned procedureType) const {
    auto* state = new RequestState();
    const int frequency = procedureType == kFrequency ? 10 : procedureType == kBuckle ? 20 : 1;
    state->frequency = mdl_PropAttr<int>(frequency, State::NEVER_SET);
    return state;
}

cow_String StepName(int index) {
    return cow_String("S") + cow_String(index);
}

kprC_StepContainer StepsOf(const char* kinds) {
    kprC_StepContainer steps;
    for (const char* kind = kinds; *kind != '\0'; ++kind) {
        const cow_String name = StepName(static_cast<int>(kind - kinds));
        switch (*kind) {
        case 'I': steps.Append(name, kprC_InitialStep()); break;
        case 'P': steps.Append(name, Step<kFrequency>()); break;
        case 'B': steps.Append(name, Step<kBuckle>()); break;
        default: steps.Append(name, Step<kStatic>()); break;
        }
    }
    return steps;
}

kprC_StepContainer LoadFreqUnloadBuckle() {
    kprC_StepContainer steps;
    steps.Append("Initial", kprC_InitialStep());
    steps.Append("Load", Step<kStatic>());
    steps.Append("Freq", Step<kFrequency>());
    steps.Append("Unload", Step<kStatic>());
    steps.Append("Buckle", Step<kBuckle>());
    return steps;
}

} // namespace sample
