#include "interactions/oif_InteractionRow.h"

#include "base/oif_ClassRows.h"
#include "interactions/oif_CavityHistory.h"
#include "interactions/oif_ContactPair.h"
#include "interactions/oif_ExplicitContactHistory.h"
#include "interactions/oif_FilmAndRadiation.h"
#include "interactions/oif_StandardContactHistory.h"
#include "interactions/oif_WaveInteractions.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/interactions/kinC_ActuatorSensor.h"
#include "store_interface/records/interactions/kinC_CyclicSymmetry.h"

namespace {

using Rule = oif_RegionRule<kinC_Interaction>;

template <auto Member>
constexpr Rule RuleOf(const char* member, oif_RegionKind kinds) {
    return oif_RegionRuleOf<kinC_Interaction, Member>(member, kinds);
}

constexpr Rule kPairRegions[] = {
    RuleOf<&kinC_SurfaceToSurfaceContact::master>("master", oif_RegionKind::SURFACE),
    RuleOf<&kinC_SurfaceToSurfaceContact::slave>("slave", oif_RegionKind::SURFACE_OR_NODES),
};
constexpr Rule kSelfRegions[] = {
    RuleOf<&kinC_SelfContact::surface>("surface", oif_RegionKind::SURFACE_OR_NODES)};
constexpr Rule kWaveRegions[] = {
    RuleOf<&kinC_IncidentWave::source>("source", oif_RegionKind::NODES),
    RuleOf<&kinC_IncidentWave::standoff>("standoff", oif_RegionKind::NODES),
    RuleOf<&kinC_IncidentWave::surface>("surface", oif_RegionKind::SURFACE),
};
template <class R, oif_RegionKind kinds>
constexpr Rule kSurfaceOf[] = {RuleOf<&R::surface>("surface", kinds)};

template <class R, void (*add)(oif_InteractionBuilder&, const cow_String&, const R&)>
void HistoryOf(oif_InteractionBuilder& builder, const cow_String& name, const kinC_Interaction& interaction) {
    add(builder, name, static_cast<const R&>(interaction));
}

template <class R, void (*add)(oif_InteractionBuilder&, const cow_String&, const R&)>
constexpr oif_InteractionRow History(std::span<const Rule> regions = {}) {
    return {R::Class.Id(), oif_ContactSolver::NONE, oif_Saying::NEVER, regions, HistoryOf<R, add>};
}

template <class R, void (*add)(oif_InteractionBuilder&, const cow_String&, const R&)>
constexpr oif_InteractionRow ContactPair(oif_ContactSolver solver, std::span<const Rule> regions) {
    return {
        R::Class.Id(), solver, oif_Saying::NEVER, regions, HistoryOf<R, add>, oif_ContactPair::WriteAs<R>};
}

/// A keyword on the one region of the interaction.
template <class Keyword, class R>
qkw_KeywordHandle MakeOnSurface(const qkw_ModelInfo& modelInfo, const oif_InteractionRow::Held& held,
                                const cow_String& step, oif_Op op) {
    const R& record = static_cast<const R&>(held.ConstGet());
    return qkw_KeywordHandle(Keyword(held, step, op, oif_RegionName(record.surface, modelInfo)));
}

qkw_KeywordHandle MakeIncidentWave(const qkw_ModelInfo& modelInfo, const oif_InteractionRow::Held& held,
                                   const cow_String& step, oif_Op) {
    const auto& wave = static_cast<const kinC_IncidentWave&>(held.ConstGet());
    return qkw_KeywordHandle(oif_IncidentWave(wave, step, oif_RegionName(wave.source, modelInfo),
                                              oif_RegionName(wave.standoff, modelInfo),
                                              oif_RegionName(wave.surface, modelInfo)));
}

template <class R, class Keyword, oif_RegionKind kinds>
constexpr oif_InteractionRow SaidOnSurface(oif_Saying saying = oif_Saying::CHANGES) {
    oif_InteractionRow row{R::Class.Id(), oif_ContactSolver::NONE, saying, kSurfaceOf<R, kinds>};
    row.make = MakeOnSurface<Keyword, R>;
    return row;
}

constexpr oif_InteractionRow IncidentWave() {
    oif_InteractionRow row{kinC_IncidentWave::Class.Id(), oif_ContactSolver::NONE, oif_Saying::CREATION,
                           kWaveRegions};
    row.make = MakeIncidentWave;
    return row;
}

/// A class that no deck tells of.
template <class R>
constexpr oif_InteractionRow Silent() {
    return {R::Class.Id()};
}

/// An elastic foundation counts among the pairs, without a line.
constexpr oif_InteractionRow ElasticFoundation() {
    oif_InteractionRow row = Silent<kinC_ElasticFoundation>();
    row.pair = [](utl_Stream&, const oif_ContactPair&, const kinC_Interaction&) {};
    return row;
}

using enum oif_ContactSolver;

constexpr oif_InteractionRow kInteractionRows[] = {
    ContactPair<kinC_SurfaceToSurfaceContactStd, oif_SurfaceToSurfaceContactStdHistory>(IMPLICIT,
                                                                                        kPairRegions),
    ContactPair<kinC_SurfaceToSurfaceContactXpl, oif_SurfaceToSurfaceContactXplHistory>(EXPLICIT,
                                                                                        kPairRegions),
    ContactPair<kinC_SelfContactStd, oif_SelfContactStdHistory>(IMPLICIT, kSelfRegions),
    ContactPair<kinC_SelfContactXpl, oif_SelfContactXplHistory>(EXPLICIT, kSelfRegions),
    History<kinC_ContactExp, oif_ContactExpHistory>(),
    History<kinC_CavityRadiation, oif_CavityRadiationHistory>(),
    SaidOnSurface<kinC_FilmCondition, oif_Sfilm, oif_RegionKind::SURFACE>(),
    SaidOnSurface<kinC_RadiationToAmbient, oif_Sradiate, oif_RegionKind::SURFACE>(),
    SaidOnSurface<kinC_ConcFilmCondition, oif_Cfilm, oif_RegionKind::NODES>(),
    SaidOnSurface<kinC_ConcRadiationToAmbient, oif_Cradiate, oif_RegionKind::NODES>(),
    SaidOnSurface<kinC_AcousticImpedance, oif_AcousticImpedance, oif_RegionKind::SURFACE>(
        oif_Saying::UNTIL_IN_FORCE_TOO),
    IncidentWave(),
    ElasticFoundation(),
    Silent<kinC_ActuatorSensor>(),
    Silent<kinC_CyclicSymmetry>(),
};

} // namespace

std::span<const oif_InteractionRow> oif_InteractionRows() {
    return kInteractionRows;
}

const oif_InteractionRow* oif_FindInteractionRow(unsigned typeId) {
    return oif_FindRow(kInteractionRows, typeId);
}

oif_ContactSolver oif_SolverOf(const kinC_Interaction& interaction) {
    const oif_InteractionRow* row = oif_FindInteractionRow(interaction.DynTypeId());
    return row == nullptr ? oif_ContactSolver::NONE : row->solver;
}
