#include "deck_checks/dck_Checks.h"
#include "deck_checks/dck_Text.h"
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

// As rgnC_Region::FlagWord() gives them.
constexpr int kNodeSet = 1;
constexpr int kSurface = 8;
constexpr int kEither = kNodeSet | kSurface;

/// A region of the interactions of a class and of those derived from it, and the kinds that it may be of.
struct RegionRule {
    unsigned (*typeId)();
    const char* member;
    const rgnC_Region& (*region)(const kinC_Interaction& interaction);
    int kinds;
};

#define QRX_REGION(Class, member, kinds)                                                                     \
    RegionRule {                                                                                             \
        Class::TypeId, "/" #member,                                                                          \
            [](const kinC_Interaction& interaction) -> const rgnC_Region& {                                  \
                return static_cast<const Class&>(interaction).member;                                        \
            },                                                                                               \
            kinds                                                                                            \
    }

// The rules of the first class that fits hold.
constexpr RegionRule kRegionRules[] = {
    QRX_REGION(kinC_SurfaceToSurfaceContact, master, kSurface),
    QRX_REGION(kinC_SurfaceToSurfaceContact, slave, kEither),
    QRX_REGION(kinC_SelfContact, surface, kEither),
    QRX_REGION(kinC_ConcFilmCondition, surface, kNodeSet),
    QRX_REGION(kinC_FilmCondition, surface, kSurface),
    QRX_REGION(kinC_ConcRadiationToAmbient, surface, kNodeSet),
    QRX_REGION(kinC_RadiationToAmbient, surface, kSurface),
    QRX_REGION(kinC_AcousticImpedance, surface, kSurface),
    QRX_REGION(kinC_IncidentWave, source, kNodeSet),
    QRX_REGION(kinC_IncidentWave, standoff, kNodeSet),
    QRX_REGION(kinC_IncidentWave, surface, kSurface),
};

#undef QRX_REGION

bool IsOneOf(unsigned typeId, std::initializer_list<unsigned> ids) {
    return std::find(ids.begin(), ids.end(), typeId) != ids.end();
}

/// What is found at one interaction.
class Check {
public:
    Check(const odiK_Model& model, const std::string& place, const kinC_Interaction& interaction,
          fnd_Sink& sink)
        : model_(model), place_(place), interaction_(interaction), sink_(sink) {}

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
        if (IsOneOf(interaction_.DynTypeId(),
                    {kinC_ConcFilmCondition::TypeId(), kinC_AcousticImpedance::TypeId(),
                     kinC_IncidentWave::TypeId()}) &&
            model_.steps.Size() > 1) {
            Add("cannot-be-written", "",
                "writing fails with \"\"Unimplemented interaction->statusKey conversion\" == 0\": no deck "
                "with an analysis step can have the interaction");
        }
        if (interaction_.DynTypeId() != kinC_CavityRadiation::TypeId()) return;
        ForEachAnalysisStep([&](const cow_String& step) {
            if (interaction_.GetPropStatus(step) <= Status::INSTANCE_NOT_APPLICABLE) return;
            Add("cannot-be-written", "",
                "writing fails with \"Error in cavity radiation history status.\": the cavity radiates in "
                "step " +
                    Quoted(step) + ", which builds on its base state");
        });
    }

    void CheckRegion(const std::string& member, const rgnC_Region& region, int kinds) {
        const std::string needed = kinds == kNodeSet   ? "a node set"
                                   : kinds == kSurface ? "a surface"
                                                       : "a surface or a node set";
        if (!region.HasValue()) {
            Add("no-region", member, "found nothing, needed is " + needed);
        } else if ((region.FlagWord() & kinds) == 0) {
            Add("wrong-region", member,
                "found " + Quoted(region.SetName()) + ", which is " + KindOf(region) + "; needed is " +
                    needed);
        }
    }

    void CheckRegions() {
        const RegionRule* first = nullptr;
        for (const RegionRule& rule : kRegionRules) {
            if (!cls_Classes().InheritanceCheck(interaction_.DynTypeId(), rule.typeId())) continue;
            if (first == nullptr) first = &rule;
            if (rule.typeId() == first->typeId())
                CheckRegion(rule.member, rule.region(interaction_), rule.kinds);
        }
        if (const auto* cavity = nex_canDynamicCastPtr<kinC_CavityRadiation>(&interaction_)) {
            for (int i = 0; i < cavity->surfaces.Length(); ++i) {
                CheckRegion("/surfaces/" + std::to_string(i), cavity->surfaces[i], kSurface);
            }
        }
    }

    void CheckPair(const kinC_ContactPair& pair) {
        const bool isExplicitJob =
            ddb_DdbStepContainer::AnalysisProductOf(model_.steps, model_.analysisProduct) !=
            kprC_AnalysisProductEnm::IMPLICIT;
        const bool isExplicitPair = IsOneOf(
            pair.DynTypeId(), {kinC_SurfaceToSurfaceContactXpl::TypeId(), kinC_SelfContactXpl::TypeId()});
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
};

} // namespace

void dck_CheckInteractions(const odiK_Model& model, fnd_Sink& sink) {
    for (kprC_PropagatingContainerIT<kinC_Interaction> it(model.interactions); !it.IsDone(); it.Next()) {
        if (it.CurrentValue().suppressed) continue;
        Check(model, Place("interactions", it.CurrentKey()), it.CurrentValue(), sink).Run();
    }
}
