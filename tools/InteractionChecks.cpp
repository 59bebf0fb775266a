#include "tools/InteractionChecks.h"

#include "store_interface/model/ddb_Model.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/interactions/kinC_Contact.h"
#include "store_interface/records/interactions/kinC_ContactExp.h"
#include "store_interface/records/interactions/kinC_FilmAndRadiation.h"
#include "store_interface/records/interactions/kinC_WaveInteractions.h"

#include <algorithm>

namespace {

using Status = mdl_PropagationStatusEnm;

std::string Text(const cow_String& text) {
    return std::string(text.View());
}

std::string Quoted(const cow_String& name) {
    return "'" + Text(name) + "'";
}

// As rgnC_Region::FlagWord() gives them.
enum RegionKind { NODE_SET = 1, SURFACE = 8 };

bool IsOneOf(unsigned typeId, std::initializer_list<unsigned> ids) {
    return std::find(ids.begin(), ids.end(), typeId) != ids.end();
}

/// What is found at one interaction.
class Check {
public:
    Check(const odiK_Model& model, const std::string& place, const kinC_Interaction& interaction,
          std::vector<ModelFinding>& findings)
        : model_(model), place_(place), interaction_(interaction), findings_(findings) {}

    void Run() {
        if (!IsBegun()) {
            Add("", "no step begins the interaction");
            return;
        }
        CheckFailures();
        CheckRegions();
        const auto* pair = nex_canDynamicCastPtr<kinC_ContactPair>(&interaction_);
        if (pair != nullptr) CheckPair(*pair);
    }

private:
    void Add(const std::string& member, const std::string& text) {
        findings_.push_back({place_ + member, text});
    }

    template <class Visitor>
    void ForEachAnalysisStep(const Visitor& visit) const {
        for (int i = 1; i < model_.steps.Size(); ++i) visit(model_.steps.NameAt(i));
    }

    bool IsBegun() const { return !interaction_.CreateStepName().IsEmpty(); }

    void CheckFailures() {
        if (IsOneOf(interaction_.DynTypeId(),
                    {kinC_ConcFilmCondition::TypeId(), kinC_AcousticImpedance::TypeId(),
                     kinC_IncidentWave::TypeId()}) &&
            model_.steps.Size() > 1) {
            Add("", "writing fails with \"\"Unimplemented interaction->statusKey conversion\" == 0\": no deck "
                    "with an analysis step can have the interaction");
        }
        if (interaction_.DynTypeId() != kinC_CavityRadiation::TypeId()) return;
        ForEachAnalysisStep([&](const cow_String& step) {
            if (interaction_.GetPropStatus(step) <= Status::INSTANCE_NOT_APPLICABLE) return;
            Add("", "writing fails with \"Error in cavity radiation history status.\": the cavity radiates in "
                    "step " + Quoted(step) + ", which builds on its base state");
        });
    }

    void CheckRegion(const std::string& member, const rgnC_Region& region, std::initializer_list<int> kinds) {
        if (!region.HasValue()) {
            Add(member, "there is no region");
            return;
        }
        if (std::find(kinds.begin(), kinds.end(), region.FlagWord()) != kinds.end()) return;
        const bool takesNodes = *kinds.begin() == NODE_SET;
        Add(member, Quoted(region.SetName()) + " is " +
                        (region.FlagWord() == NODE_SET  ? "a node set"
                         : region.FlagWord() == SURFACE ? "a surface"
                                                        : "an element set") +
                        (takesNodes ? ", a node set is needed"
                         : kinds.size() > 1 ? ", a surface or a node set is needed"
                                            : ", a surface is needed"));
    }

    void CheckRegions() {
        const kinC_Interaction& interaction = interaction_;
        const auto as = [&]<class T>(const T*) { return nex_canDynamicCastPtr<T>(&interaction); };
        if (const auto* contact = as(static_cast<const kinC_SurfaceToSurfaceContact*>(nullptr))) {
            // A master needs faces.
            CheckRegion("/master", contact->master, {SURFACE});
            CheckRegion("/slave", contact->slave, {SURFACE, NODE_SET});
        } else if (const auto* self = as(static_cast<const kinC_SelfContact*>(nullptr))) {
            CheckRegion("/surface", self->surface, {SURFACE, NODE_SET});
        } else if (const auto* film = as(static_cast<const kinC_FilmCondition*>(nullptr))) {
            CheckRegion("/surface", film->surface,
                        {film->DynTypeId() == kinC_FilmCondition::TypeId() ? SURFACE : NODE_SET});
        } else if (const auto* radiation = as(static_cast<const kinC_RadiationToAmbient*>(nullptr))) {
            CheckRegion("/surface", radiation->surface,
                        {radiation->DynTypeId() == kinC_RadiationToAmbient::TypeId() ? SURFACE : NODE_SET});
        } else if (const auto* impedance = as(static_cast<const kinC_AcousticImpedance*>(nullptr))) {
            CheckRegion("/surface", impedance->surface, {SURFACE});
        } else if (const auto* wave = as(static_cast<const kinC_IncidentWave*>(nullptr))) {
            CheckRegion("/source", wave->source, {NODE_SET});
            CheckRegion("/standoff", wave->standoff, {NODE_SET});
            CheckRegion("/surface", wave->surface, {SURFACE});
        } else if (const auto* cavity = as(static_cast<const kinC_CavityRadiation*>(nullptr))) {
            for (int i = 0; i < cavity->surfaces.Length(); ++i) {
                CheckRegion("/surfaces/" + std::to_string(i), cavity->surfaces[i], {SURFACE});
            }
        }
    }

    void CheckPair(const kinC_ContactPair& pair) {
        const bool isExplicitJob = AnalysisProductOf(model_) != kprC_AnalysisProductEnm::IMPLICIT;
        const bool isExplicitPair = IsOneOf(pair.DynTypeId(), {kinC_SurfaceToSurfaceContactXpl::TypeId(),
                                                               kinC_SelfContactXpl::TypeId()});
        if (isExplicitJob != isExplicitPair) {
            Add("", isExplicitPair ? "contact of the explicit solver in a job for the implicit one"
                                   : "contact of the implicit solver in a job for the explicit one");
        }
        if (isExplicitPair && model_.steps.Size() < 2) {
            Add("", "without an analysis step the contact is not written");
        }
        for (int i = 0; i < model_.steps.Size(); ++i) {
            const cow_String& step = model_.steps.NameAt(i);
            const Status status = pair.GetPropStatus(step);
            const auto& property = pair.ConstGetState(step).InteractionProperty;
            if (!property.ConstGet().IsEmpty()) continue;
            if (status == Status::CREATED) {
                Add("", "step " + Quoted(step) + " begins the contact without a property");
            } else if (status == Status::MODIFIED && property.IsModified()) {
                Add("", isExplicitPair ? "step " + Quoted(step) + " takes the property away"
                                       : "writing fails: step " + Quoted(step) +
                                             " takes the property away, and no friction can take its place");
            }
        }
    }

    const odiK_Model& model_;
    std::string place_;
    const kinC_Interaction& interaction_;
    std::vector<ModelFinding>& findings_;
};

} // namespace

void FindInteractionProblems(const odiK_Model& model, std::vector<ModelFinding>& findings) {
    for (kprC_PropagatingContainerIT<kinC_Interaction> it(model.interactions); !it.IsDone(); it.Next()) {
        if (it.CurrentValue().suppressed) continue;
        Check(model, PlaceOf("interactions", it.CurrentKey()), it.CurrentValue(), findings).Run();
    }
}
