#include "model_file/checks/mdf_ConstraintChecks.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/constraints/kcoC_Constraints.h"

void mdf_CheckEquationSystems(odiK_Model& model, mdf_Diagnostics& diagnostics, const mdf_Path& path) {
    constexpr int nodeSet = 1;
    const mdf_Path constraints(path, "constraints");
    for (mdl_MapString2ObjCowIT<kcoC_Constraint> it(model.constraints); !it.IsDone(); it.Next()) {
        const auto* equation = nex_canDynamicCastPtr<kcoC_Equation>(&it.CurrentValue());
        if (equation == nullptr) continue;
        const mdf_Path constraint(constraints, it.CurrentKey().View());
        const mdf_Path terms(constraint, "terms");
        for (int i = 0; i < equation->terms.Length(); ++i) {
            const kcoC_EquationTerm& term = equation->terms[i];
            if (term.csys.IsNullRef()) continue;
            if (model.FindRegion(cow_String(), term.setName).FlagWord() == nodeSet) continue;
            const mdf_Path place(terms, static_cast<std::size_t>(i));
            diagnostics.Error(mdf_Path(place, "setName"),
                              "found " + mdf_Quoted(term.setName.View()) +
                                  ", expected a node set of the assembly, since the term has a csys");
        }
    }
}
