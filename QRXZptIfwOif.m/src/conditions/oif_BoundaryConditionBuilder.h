#ifndef QRX_OIF_BOUNDARYCONDITIONBUILDER_H
#define QRX_OIF_BOUNDARYCONDITIONBUILDER_H

#include "base/oif_BlockHeader.h"
#include "base/oif_Component.h"
#include "conditions/oif_OpStatus.h"
#include "conditions/oif_Submodel.h"
#include "store_interface/records/conditions/kloC_BoltLoad.h"

#include <unordered_map>

/// Boundary conditions of the steps, the comments of bolt loads, and in the assembly the element sets of
/// connector conditions and what drives submodels.
class oif_BoundaryConditionBuilder final : public oif_ComponentOf<oif_BoundaryConditionBuilder> {
public:
    explicit oif_BoundaryConditionBuilder(oif_ModelInfo& modelInfo)
        : oif_ComponentOf(modelInfo), blockHeader_("BOUNDARY CONDITIONS") {}
    void Build() override;

    /// The flags of the model's conditions. A buckling step says all of them anew.
    static oif_BCOpStatus OpStatusOf(const kprC_PropagatingContainer<kbcC_BC>& bcs,
                                     const kprC_PropagatingContainer<kloC_Load>& loads,
                                     const kprC_StepContainer& steps);
    /// The comment above the keyword of a condition, or of a bolt load. Without a load case there is no
    /// scale factor.
    static cow_String Comment(const cow_String& name, unsigned typeId, const cow_String& loadCaseName,
                              float scale);

private:
    void ConfigureOpStatus();
    void BuildElementSets();
    void CreateAllBCs(const cow_String& stepName);
    void AllBCDetails(const kbcC_BC& bc, const cow_String& name, const cow_String& stepName,
                      const cow_String& loadCaseName, const float& scale);
    void CreateBCCard(const cow_String& name, const kbcC_BC& bc, const cow_String& stepName, bool opMod,
                      const cow_String& loadCaseName, const float& scale);
    /// Gives the load cases that took a bolt load.
    cow_List<cow_String> CreateBoltLoadBCs(const cow_String& stepName);
    /// Whether it wrote.
    bool BoltLoadBCDetails(const kloC_BoltLoad& load, const cow_String& name, const cow_String& stepName,
                           const cow_String& loadCaseName, const float& scale);
    void CreateBCCard(const cow_String& name, const kloC_BoltLoad& boltLoad, const cow_String& stepName,
                      bool opMod, const cow_String& loadCaseName, const float& scale);
    /// Load cases that take no condition do without those of the step.
    void CreateEmptyBCs(const cow_String& stepName, const cow_List<cow_String>& loadCasesWithBolts);
    void CreateSubmodelKwds();

    /// The banner, unless in a load case.
    void AddHeader(const cow_String& stepName, const cow_String& loadCaseName);
    cow_String RegionName(const rgnC_Region& region) const;
    /// Null if the step is none of the analysis.
    const kprC_AnalysisStep* AnalysisStep(const cow_String& stepName) const;

    /// What is the same in all steps; their keywords share it.
    struct Shared {
        mdl_ObjCow<kbcC_BC> record;
        cow_String setName;
        qkw_KeywordHandle comment; // outside load cases
    };
    const Shared& SharedOf(const cow_String& name, const kbcC_BC& bc);

    cow_List<cow_String> stepNames_;
    // These while it builds:
    oif_ObjectsOfSteps<kbcC_BC> written_;
    oif_ObjectsOfSteps<kloC_Load> bolts_;
    std::unordered_map<const kbcC_BC*, Shared> shared_;

    oif_BoundarySubmodelList submodelList_;
    oif_BlockHeader blockHeader_;
    oif_BCOpStatus opStatus_;
};

#endif
