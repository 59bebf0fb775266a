#include "conditions/oif_WrittenSteps.h"

#include "store_interface/records/cls_ClassRegistrar.h"

oif_WrittenSteps::oif_WrittenSteps(const kprC_StepContainer& steps, const oif_OpStatus& status)
    : steps_(steps), status_(status) {
    for (const auto& [name, step] : steps) {
        const auto* analysis = nex_canDynamicCastPtr<kprC_AnalysisStep>(&step);
        hasLoadCases_.push_back(analysis != nullptr && !analysis->loadCases.IsEmpty());
    }
}

const oif_WrittenSteps::Groups& oif_WrittenSteps::GroupsOf(unsigned typeId) {
    const auto [place, isNew] = groups_.try_emplace(typeId);
    if (!isNew) return place->second;
    const cow_List<int>& flags = status_.Flags(typeId);
    for (int i = 1; i < steps_.Size(); ++i) {
        const std::size_t group =
            (flags.ConstGet(i) != 0 ? 1U : 0U) + (hasLoadCases_[static_cast<std::size_t>(i)] ? 2U : 0U);
        place->second.ofKind[steps_.StepAt(i).Perturbation() ? 1 : 0][group].push_back(i);
    }
    return place->second;
}
