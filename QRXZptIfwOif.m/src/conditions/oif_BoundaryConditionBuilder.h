#ifndef QRX_OIF_BOUNDARYCONDITIONBUILDER_H
#define QRX_OIF_BOUNDARYCONDITIONBUILDER_H

#include "conditions/oif_ConditionBuilder.h"
#include "conditions/oif_Submodel.h"

#include <set>

/// Boundary conditions of the steps, the comments of bolt loads, and in the assembly the element sets of
/// connector conditions and what drives submodels.
class oif_BoundaryConditionBuilder final : public oif_ConditionBuilder<oif_BoundaryConditionBuilder> {
public:
    explicit oif_BoundaryConditionBuilder(oif_ModelInfo& modelInfo)
        : oif_ConditionBuilder(modelInfo, "BOUNDARY CONDITIONS") {}
    void Build() override;

    /// The flags of the model's conditions. A buckling step says all of them anew.
    static oif_BCOpStatus OpStatusOf(const kprC_PropagatingContainer<kbcC_BC>& bcs,
                                     const kprC_PropagatingContainer<kloC_Load>& loads,
                                     const kprC_StepContainer& steps);
    /// The comment above the keyword of a condition, or of a bolt load, by what people call its class.
    static cow_String Comment(const cow_String& name, const char* label);

private:
    void BuildElementSets();
    void CreateAllBCs(const oif_ObjectsOfSteps<kbcC_BC>& written, const oif_BCOpStatus& opStatus, int step,
                      oif_BoundarySubmodelList& submodels);
    void CreateBCCard(const oif_BCCard& card, oif_ObjectsOfSteps<kbcC_BC>::Entry& entry,
                      oif_BoundarySubmodelList& submodels);
    /// The comments alone: the force of a bolt is told among the concentrated loads. Gives the load cases
    /// that took a bolt load.
    std::set<cow_String> CreateBoltLoadBCs(const oif_ObjectsOfSteps<kloC_Load>& bolts,
                                           const oif_BCOpStatus& opStatus, int step);
    /// Load cases that take no condition do without those of the step.
    void CreateEmptyBCs(int step, const std::set<cow_String>& loadCasesWithBolts);
    void CreateSubmodelKwds(const oif_BoundarySubmodelList& submodels);
};

#endif
