#include "store_interface/model/odiK_Repositories.h"

namespace {

using M = odiK_Model;

template <auto Member>
constexpr odiK_Repository Row(const char* member, const char* singular, const char* plural,
                              const char* kind = nullptr, const char* whyNotInDeck = nullptr) {
    using T = typename std::remove_reference_t<decltype(std::declval<M&>().*Member)>::ItemRecord;
    return {member,
            singular,
            plural,
            kind,
            whyNotInDeck,
            [] { return T::TypeId(); },
            std::is_base_of_v<kprC_PropagatingObject, T>,
            [](odiK_Model& model) -> mdl_Repository& { return model.*Member; }};
}

constexpr odiK_Repository kRepositories[] = {
    Row<&M::materials>("materials", "a material", "materials", "material"),
    Row<&M::sections>("sections", "a section", "sections", "section"),
    Row<&M::beamProfiles>("beamProfiles", "a beam profile", "beam profiles", "profile"),
    Row<&M::amplitudes>("amplitudes", "an amplitude", "amplitudes", "amplitude"),
    Row<&M::constraints>("constraints", "a constraint", "constraints", "constraint"),
    Row<&M::contactControls>("contactControls", "contact controls", "contact controls", "contactControls"),
    Row<&M::contactInitializations>("contactInitializations", "a contact initialization",
                                    "contact initializations", nullptr, "they are not written"),
    Row<&M::interactionProperties>("interactionProperties", "an interaction property",
                                   "interaction properties", "interactionProperty"),
    Row<&M::timePoints>("timePoints", "time points", "time points", "timePoints",
                        "their points are not written"),
    Row<&M::adaptiveMeshControls>("adaptiveMeshControls", "adaptive mesh controls", "adaptive mesh controls",
                                  nullptr, "they are not written"),
    {"steps", "a step", "steps", "step", nullptr, [] { return kprC_Step::TypeId(); }, false, nullptr},
    Row<&M::boundaryConditions>("boundaryConditions", "a boundary condition", "boundary conditions",
                                "boundaryCondition"),
    Row<&M::loads>("loads", "a load", "loads", "load"),
    Row<&M::fields>("fields", "a predefined field", "fields", "field"),
    Row<&M::interactions>("interactions", "an interaction", "interactions", "interaction"),
    Row<&M::fieldOutputRequests>("fieldOutputRequests", "a field output request", "field output requests"),
    Row<&M::historyOutputRequests>("historyOutputRequests", "a history output request",
                                   "history output requests"),
    Row<&M::adaptiveMeshConstraints>("adaptiveMeshConstraints", "an adaptive mesh constraint",
                                     "adaptive mesh constraints", nullptr, "they are not written"),
};

constexpr std::size_t kNoRepository = std::size(kRepositories);
static_assert(kNoRepository < odiK_Extent().size());

} // namespace

std::span<const odiK_Repository> odiK_Repositories() {
    return kRepositories;
}

odiK_Extent odiK_ReadOf(const mdl_ReadNotes& notes) {
    odiK_Extent read;
    read.set(kNoRepository);
    for (std::size_t i = 0; i < kNoRepository; ++i) read.set(i, notes.HasRead(kRepositories[i].ItemTypeId()));
    return read;
}

odiK_Extent odiK_Differences(const odiK_Model& a, const odiK_Model& b) {
    odiK_Extent differences;
    differences.set(kNoRepository, !a.SharesWith(b));
    for (std::size_t i = 0; i < kNoRepository; ++i) {
        const odiK_Repository& each = kRepositories[i];
        // The steps are shared with all that is no repository.
        if (!each.IsInOrder()) differences.set(i, !each.In(a).IsSharedWith(each.In(b)));
    }
    return differences;
}
