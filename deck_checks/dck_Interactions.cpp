#include "conditions/oif_OpStatus.h"
#include "deck_checks/dck_Checks.h"
#include "deck_checks/dck_Text.h"
#include "interactions/oif_CavityHistory.h"
#include "interactions/oif_InteractionRow.h"
#include "store_interface/model/ddb_Model.h"
#include "store_interface/model/odiK_Model.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/interactions/kinC_Contact.h"
#include "store_interface/records/interactions/kinC_ContactExp.h"
#include "store_interface/records/interactions/kinC_FilmAndRadiation.h"
#include "store_interface/records/interactions/kinC_WaveInteractions.h"

#include <algorithm>

namespace {

using Status = mdl_PropagationStatusEnm;

/// What is found at one interaction.
class InteractionCheck {
public:
    InteractionCheck(const odiK_Model& model, const std::string& place, const kinC_Interaction& interaction,
                     fnd_Sink& sink)
        : model_(model), place_(place), interaction_(interaction), sink_(sink),
          row_(oif_FindInteractionRow(interaction.DynTypeId())) {}

    void Run() {
        CheckFailures();
        if (!IsBegun()) {
            Add("never-begun", "", "no step begins the interaction");
            return;
        }
        CheckRegions();
        const auto* pair = nex_canDynamicCastPtr<kinC_ContactPair>(&interaction_);
        if (pair != nullptr) CheckPair(*pair);
    }

private:
    void Add(fnd_CodeName code, const std::string& member, const std::string& text) {
        sink_.Add(code, place_ + member, text);
    }

    template <class Visitor>
    void ForEachAnalysisStep(const Visitor& visit) const {
        for (int i = 1; i < model_.steps.Size(); ++i) visit(model_.steps.NameAt(i));
    }

    bool IsBegun() const { return !interaction_.CreateStepName().IsEmpty(); }

    void CheckFailures() {
        if (model_.steps.Size() > 1 && row_ != nullptr && row_->saying != oif_Saying::NEVER &&
            oif_FindInteractionFamily(interaction_.DynTypeId()) == nullptr) {
            Add("cannot-be-written", "",
                std::string("writing fails with \"") + oif_InteractionOpStatus::NoFamily +
                    "\": no deck with an analysis step can have the interaction");
        }
        if (interaction_.DynTypeId() != kinC_CavityRadiation::TypeId()) return;
        ForEachAnalysisStep([&](const cow_String& step) {
            if (!oif_RaisesForCavity(interaction_.GetPropStatus(step))) return;
            Add("cannot-be-written", "",
                std::string("writing fails with \"") + oif_kCavityStatusError +
                    "\": the cavity radiates in step " + Quoted(step) + ", which builds on its base state");
        });
    }

    void CheckRegion(const std::string& member, const rgnC_Region& region, oif_RegionKind kind) {
        const std::string needed = kind == oif_RegionKind::NODES     ? "a node set"
                                   : kind == oif_RegionKind::SURFACE ? "a surface"
                                                                     : "a surface or a node set";
        if (!region.HasValue()) {
            Add("no-region", member, "found nothing, needed is " + needed);
        } else if (!oif_IsOfKind(region, kind)) {
            Add("wrong-region", member,
                "found " + Quoted(region.SetName()) + ", which is " + KindOf(region) + "; needed is " +
                    needed);
        }
    }

    void CheckRegions() {
        if (row_ != nullptr) {
            for (const auto& rule : row_->regions) {
                CheckRegion(std::string("/") + rule.member, rule.region(interaction_), rule.kind);
            }
        }
        if (const auto* cavity = nex_canDynamicCastPtr<kinC_CavityRadiation>(&interaction_)) {
            for (int i = 0; i < cavity->surfaces.Length(); ++i) {
                CheckRegion("/surfaces/" + std::to_string(i), cavity->surfaces[i], oif_RegionKind::SURFACE);
            }
        }
    }

    void CheckPair(const kinC_ContactPair& pair) {
        const bool isExplicitJob =
            ddb_DdbStepContainer::AnalysisProductOf(model_.steps, model_.analysisProduct) !=
            kprC_AnalysisProductEnm::IMPLICIT;
        const bool isExplicitPair = row_->solver == oif_ContactSolver::EXPLICIT;
        if (isExplicitJob != isExplicitPair) {
            Add("wrong-solver", "",
                isExplicitPair ? "contact of the explicit solver in a job for the implicit one"
                               : "contact of the implicit solver in a job for the explicit one");
        }
        if (isExplicitPair && model_.steps.Size() < 2) {
            Add("never-written", "", "without an analysis step the contact is not written");
        }
        int changes = 0;
        bool beginsWithNone = false;
        for (int i = 0; i < model_.steps.Size(); ++i) {
            const cow_String& step = model_.steps.NameAt(i);
            const Status status = pair.GetPropStatus(step);
            const auto& property = pair.ConstGetState(step).InteractionProperty;
            if (pair.HasStep(step) && !kinC_Interaction::IsBuiltIn(status) && property.IsModified() &&
                ++changes == 1) {
                beginsWithNone = property.ConstGet().IsEmpty();
            }
            if (!property.ConstGet().IsEmpty()) continue;
            if (status == Status::CREATED) {
                Add("contact-without-property", "",
                    "step " + Quoted(step) + " begins the contact without a property");
            } else if (status == Status::MODIFIED && property.IsModified()) {
                Add("contact-without-property", "",
                    isExplicitPair ? "step " + Quoted(step) + " takes the property away"
                                   : "writing fails: step " + Quoted(step) +
                                         " takes the property away, and no friction can take its place");
            }
        }
        if (!isExplicitJob && changes > 1 && beginsWithNone) {
            Add("cannot-be-written", "",
                "writing fails: the property changes, but begins as none, of which there can be no copy");
        }
    }

    const odiK_Model& model_;
    std::string place_;
    const kinC_Interaction& interaction_;
    fnd_Sink& sink_;
    const oif_InteractionRow* row_; // null for a class that decks don't know
};

} // namespace

void dck_CheckInteractions(const odiK_Model& model, fnd_Sink& sink) {
    for (const auto& [name, interaction] : model.interactions) {
        if (interaction.suppressed) continue;
        InteractionCheck(model, Place("interactions", name), interaction, sink).Run();
    }
}
