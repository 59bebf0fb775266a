#include "constraints/oif_ConstraintBuilder.h"

#include "base/oif_Comment.h"
#include "constraints/oif_ConstraintRow.h"
#include "constraints/oif_Constraints.h"

void oif_ConstraintBuilder::Build() {
    if (oif_IsCyclicModel(Model())) {
        if (ModelInfo().AnalysisProduct() == kprC_AnalysisProductEnm::EXPLICIT) {
            nex_Raise(oif_kCyclicModelError);
        }
        const ddb_ModelSectorDefinition& sector = Model().Model().modelSectorForCyclicSymmetry();
        AddModelDefinition(oif_CyclicSymmetryModel(sector.GetStartPoint(), sector.GetEndPoint(),
                                                   sector.GetNumberOfSectors()));
    }
    for (const auto& [name, constraint] : Model().Constraints()) {
        const Making making(*this, "constraint", name);
        AddAssemblyDefinition(oif_Comment(cow_String("Constraint: ") + name));
        const oif_ConstraintRow* row = oif_FindConstraintRow(constraint.DynTypeId());
        if (row == nullptr) nex_Raise(oif_kConstraintError);
        for (const qkw_KeywordHandle& keyword : row->make(ModelInfo(), name, constraint)) {
            AddAssemblyDefinition(keyword);
        }
    }
}
