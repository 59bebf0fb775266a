#ifndef QRX_OIF_WRITTENSTEPS_H
#define QRX_OIF_WRITTENSTEPS_H

#include "conditions/oif_OpStatus.h"

#include <algorithm>
#include <unordered_map>

/// Finds the steps that write an object. Besides its status and state that rests on the step being the
/// initial one, on op=NEW and on load cases: steps that agree in these are asked once for all that an object
/// carries on through.
class oif_WrittenSteps {
public:
    oif_WrittenSteps(const kprC_StepContainer& steps, const oif_OpStatus& status);

    /// The steps in ascending order for which `test(object, stepName, hasLoadCases)` holds; none for a
    /// suppressed object. `kind` and `name` are what messages call it.
    template <class T, class Test>
    std::vector<int> Of(const char* kind, const cow_String& name, const T& object, const Test& test) {
        std::vector<int> found;
        if (object.suppressed) return found;
        const auto holds = [&](int step) {
            const nex_Context stepContext("step", steps_.NameAt(step));
            const nex_Context context(kind, name);
            return test(object, steps_.NameAt(step), hasLoadCases_[static_cast<std::size_t>(step)]);
        };
        if (object.Timeline().Size() != steps_.Size()) {
            for (int i = 0; i < steps_.Size(); ++i) {
                if (holds(i)) found.push_back(i);
            }
            return found;
        }
        if (steps_.Size() > 0 && holds(0)) found.push_back(0);
        const Groups& groups = GroupsOf(object.DynTypeId());
        for (const auto& [first, end, perturbation] : object.Runs()) {
            for (const std::vector<int>& group : groups.ofKind[perturbation ? 1 : 0]) {
                const auto from = std::ranges::lower_bound(group, first);
                const auto to = std::lower_bound(from, group.end(), end);
                if (from != to && holds(*from)) found.insert(found.end(), from, to);
            }
        }
        std::ranges::sort(found);
        return found;
    }

private:
    /// The steps behind the initial one that are general, and those that are perturbations, by flag and load
    /// cases.
    struct Groups {
        std::vector<int> ofKind[2][4];
    };
    const Groups& GroupsOf(unsigned typeId);

    const kprC_StepContainer& steps_;
    const oif_OpStatus& status_;
    std::vector<bool> hasLoadCases_;
    std::unordered_map<unsigned, Groups> groups_;
};

#endif
