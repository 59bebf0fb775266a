#include "constraints/oif_ConstraintRow.h"

#include "base/oif_ClassRows.h"
#include "constraints/oif_Constraints.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

using Rule = oif_RegionRule<kcoC_Constraint>;

template <auto Member>
constexpr Rule Needed(const char* member, oif_RegionKind kinds) {
    return oif_RegionRuleOf<kcoC_Constraint, Member>(member, kinds);
}
template <auto Member>
constexpr Rule Optional(const char* member, oif_RegionKind kinds) {
    return oif_RegionRuleOf<kcoC_Constraint, Member>(member, kinds, false);
}

constexpr Rule kTieRegions[] = {
    Needed<&kcoC_Tie::master>("master", oif_RegionKind::SURFACE_OR_NODES),
    Needed<&kcoC_Tie::slave>("slave", oif_RegionKind::SURFACE_OR_NODES),
};
constexpr Rule kCouplingRegions[] = {
    Needed<&kcoC_Coupling::surface>("surface", oif_RegionKind::SURFACE_OR_NODES),
    Needed<&kcoC_Coupling::refNode>("refNode", oif_RegionKind::NODES),
};
constexpr Rule kBodyRegions[] = {
    Needed<&kcoC_RigidBody::refNode>("refNode", oif_RegionKind::NODES),
    Optional<&kcoC_RigidBody::elements>("elements", oif_RegionKind::ELEMENTS),
    Optional<&kcoC_RigidBody::tieNodes>("tieNodes", oif_RegionKind::NODES),
    Optional<&kcoC_RigidBody::pinNodes>("pinNodes", oif_RegionKind::NODES),
    Optional<&kcoC_RigidBody::surface>("surface", oif_RegionKind::SURFACE),
};
constexpr Rule kEmbeddedRegions[] = {
    Needed<&kcoC_EmbeddedRegion::host>("host", oif_RegionKind::ELEMENTS),
    Needed<&kcoC_EmbeddedRegion::embedded>("embedded", oif_RegionKind::ELEMENTS),
};
constexpr Rule kShellSolidRegions[] = {
    Needed<&kcoC_ShellSolidCoupling::shellEdge>("shellEdge", oif_RegionKind::SURFACE),
    Needed<&kcoC_ShellSolidCoupling::solidFace>("solidFace", oif_RegionKind::SURFACE),
};

template <class... Keywords>
qkw_KeywordList ListOf(const Keywords&... keywords) {
    qkw_KeywordList list;
    (list.Append(keywords), ...);
    return list;
}

qkw_KeywordList Keywords(const oif_ModelInfo&, const cow_String& name, const kcoC_Equation& equation) {
    return ListOf(oif_Equation(name, equation));
}

qkw_KeywordList Keywords(const oif_ModelInfo& modelInfo, const cow_String& name, const kcoC_Tie& tie) {
    const bool cyclic =
        oif_IsCyclicModel(modelInfo.Model()) && modelInfo.Model().Model().hasCyclicSymmetry(name);
    if (cyclic && modelInfo.AnalysisProduct() == kprC_AnalysisProductEnm::EXPLICIT) {
        nex_Raise(oif_kCyclicTieError);
    }
    return ListOf(oif_Tie(name, tie, modelInfo, cyclic));
}

qkw_KeywordList Keywords(const oif_ModelInfo& modelInfo, const cow_String& name,
                         const kcoC_Coupling& coupling) {
    const oif_Coupling head(name, coupling, modelInfo);
    return coupling.distributing ? ListOf(head, oif_Distributing(coupling))
                                 : ListOf(head, oif_Kinematic(coupling));
}

qkw_KeywordList Keywords(const oif_ModelInfo& modelInfo, const cow_String&, const kcoC_RigidBody& body) {
    const auto name = [&](const rgnC_Region& region) { return oif_RegionName(region, modelInfo); };
    return ListOf(oif_RigidBody(name(body.refNode), name(body.elements), name(body.pinNodes),
                                name(body.tieNodes), oif_SurfaceName(body.surface, modelInfo),
                                body.refPointAtCenterOfMass, body.isothermal));
}

qkw_KeywordList Keywords(const oif_ModelInfo& modelInfo, const cow_String& name,
                         const kcoC_EmbeddedRegion& region) {
    return ListOf(oif_EmbeddedRegion(name, region, modelInfo));
}

qkw_KeywordList Keywords(const oif_ModelInfo& modelInfo, const cow_String& name,
                         const kcoC_ShellSolidCoupling& coupling) {
    return ListOf(oif_ShellSolidCoupling(name, coupling, modelInfo));
}

/// A row of the objects that answer with the class R and are at least a Kind.
template <class R, class Kind = R>
constexpr oif_ConstraintRow RowOf(std::span<const Rule> regions) {
    return {R::Class.Id(), regions,
            [](const oif_ModelInfo& modelInfo, const cow_String& name, const kcoC_Constraint& constraint) {
                return Keywords(modelInfo, name, static_cast<const Kind&>(constraint));
            }};
}

constexpr oif_ConstraintRow kConstraintRows[] = {
    RowOf<kcoC_Equation>({}),
    RowOf<odiK_Tie, kcoC_Tie>(kTieRegions),
    RowOf<kcoC_Coupling>(kCouplingRegions),
    RowOf<odiK_Coupling>(kCouplingRegions),
    RowOf<kcoC_RigidBody>(kBodyRegions),
    RowOf<kcoC_EmbeddedRegion>(kEmbeddedRegions),
    RowOf<kcoC_ShellSolidCoupling>(kShellSolidRegions),
};

} // namespace

bool oif_IsCyclicModel(const oif_Model& model) {
    return model.Model().modelSectorForCyclicSymmetry().GetSymmetryType() == calC_SymmetryTypeEnm::CYCLIC;
}

std::span<const oif_ConstraintRow> oif_ConstraintRows() {
    return kConstraintRows;
}

const oif_ConstraintRow* oif_FindConstraintRow(unsigned typeId) {
    return oif_FindRow(kConstraintRows, typeId);
}
