#ifndef QRX_TESTS_CONDITIONS_CONDITIONTESTING_H
#define QRX_TESTS_CONDITIONS_CONDITIONTESTING_H

#include "conditions/oif_BoundaryConditionBuilder.h"
#include "model_file/mdf_ModelFile.h"
#include "support/DeckTest.h"

/// Steps "S0", "S1", ... of a model file by one letter each: I initial, G static, F frequency, B buckling,
/// L static perturbation, D harmonic direct, M modal dynamics, S harmonic modal. Text behind a letter in
/// braces is the step's own: "IL{\"loadCases\": {}}".
std::string StepsJson(std::string_view kinds);

/// A model read from the text of its members: an instance A with the node sets N, N2, N3, the element set E
/// and the surface F, the steps, and what `members` adds.
class ConditionModel {
public:
    ConditionModel(std::string_view steps, const std::string& members);

    const odiK_Model& Store() const { return *odb_->FindModel(odb_Odb::DefaultModelName()); }
    const kbcC_BC& Condition(const char* name) const { return Store().boundaryConditions.ConstGet(name); }
    const kloC_BoltLoad& Bolt(const char* name) const {
        return static_cast<const kloC_BoltLoad&>(Store().loads.ConstGet(name));
    }
    oif_ModelInfo& Info() { return *info_; }
    cow_List<cow_String> StepNames() const { return Store().steps.Keys(); }

    /// What the builder of boundary conditions files for a step or one of its load cases.
    std::string StepText(const char* step, const char* loadCase = "");
    std::string AssemblyText();

private:
    qkw_BuilderComponent& Builder();

    std::unique_ptr<odb_Odb> odb_;
    std::unique_ptr<oif_ModelInfo> info_;
    std::unique_ptr<oif_BoundaryConditionBuilder> builder_;
};

#endif
