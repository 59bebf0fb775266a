#include "constraints/oif_ConstraintBuilder.h"

#include "constraints/oif_Constraints.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/cls_ClassRegistrar.h"

void oif_ConstraintBuilder::Build() {
    const ddb_ModelSectorDefinition& sector = Model().Model().modelSectorForCyclicSymmetry();
    const bool cyclicModel = sector.GetSymmetryType() == calC_SymmetryTypeEnm::CYCLIC;
    if (cyclicModel) {
        if (ModelInfo().AnalysisProduct() == kprC_AnalysisProductEnm::EXPLICIT) {
            nex_Raise("Cyclic symmetry is not valid for Explicit.");
        }
        AddModelDefinition(oif_CyclicSymmetryModel(sector.GetStartPoint(), sector.GetEndPoint(),
                                                   sector.GetNumberOfSectors()));
    }
    for (mdl_MapString2ObjCowIT<kcoC_Constraint> it(Model().Constraints()); !it.IsDone(); it.Next()) {
        const nex_Context context("constraint", it.CurrentKey());
        AddAssemblyDefinition(oif_Comment(cow_String("Constraint: ") + it.CurrentKey()));
        AddConstraint(it.CurrentKey(), it.CurrentValue(), cyclicModel);
    }
}

cow_String oif_ConstraintBuilder::RegionName(const rgnC_Region& region) const {
    return oif_RegionName(region, ModelInfo());
}

void oif_ConstraintBuilder::AddConstraint(const cow_String& name, const kcoC_Constraint& constraint,
                                          bool cyclicModel) {
    const unsigned type = constraint.DynTypeId();
    if (type == kcoC_Equation::TypeId()) {
        AddAssemblyDefinition(oif_Equation(name, constraint));
    } else if (type == odiK_Tie::TypeId()) {
        const bool cyclic = cyclicModel && Model().Model().hasCyclicSymmetry(name);
        if (cyclic && ModelInfo().AnalysisProduct() == kprC_AnalysisProductEnm::EXPLICIT) {
            nex_Raise("Cyclic symmetry - invalid parameter for *Tie for /Explicit.");
        }
        AddAssemblyDefinition(
            oif_Tie(name, nex_canDynamicCastRef<kcoC_Tie>(constraint, NEX_HERE), ModelInfo(), cyclic));
    } else if (type == kcoC_Coupling::TypeId() || type == odiK_Coupling::TypeId()) {
        const auto& coupling = nex_canDynamicCastRef<kcoC_Coupling>(constraint, NEX_HERE);
        AddAssemblyDefinition(oif_Coupling(name, coupling, ModelInfo()));
        if (coupling.distributing) {
            AddAssemblyDefinition(oif_Distributing(coupling));
        } else {
            AddAssemblyDefinition(oif_Kinematic(coupling));
        }
    } else if (type == kcoC_RigidBody::TypeId()) {
        const auto& body = nex_canDynamicCastRef<kcoC_RigidBody>(constraint, NEX_HERE);
        const cow_String surface = oif_SurfaceName(body.surface, ModelInfo());
        AddAssemblyDefinition(oif_RigidBody(RegionName(body.refNode), RegionName(body.elements),
                                            RegionName(body.pinNodes), RegionName(body.tieNodes), surface,
                                            body.refPointAtCenterOfMass, body.isothermal));
    } else if (type == kcoC_EmbeddedRegion::TypeId()) {
        AddAssemblyDefinition(oif_EmbeddedRegion(
            name, nex_canDynamicCastRef<kcoC_EmbeddedRegion>(constraint, NEX_HERE), ModelInfo()));
    } else if (type == kcoC_ShellSolidCoupling::TypeId()) {
        AddAssemblyDefinition(oif_ShellSolidCoupling(
            name, nex_canDynamicCastRef<kcoC_ShellSolidCoupling>(constraint, NEX_HERE), ModelInfo()));
    } else {
        nex_Raise("Unimplemented constraint type.");
    }
}
