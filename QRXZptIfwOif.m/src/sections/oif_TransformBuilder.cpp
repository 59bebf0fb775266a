#include "sections/oif_TransformBuilder.h"

#include "mesh/oif_Set.h"
#include "mesh/oif_SetName.h"
#include "sections/oif_Orientation.h"
#include "store_interface/model/odiK_Assembly.h"
#include "store_interface/records/conditions/kbcC_SupportBCs.h"
#include "store_interface/records/conditions/kloC_Loads.h"
#include "store_interface/records/constraints/kcoC_Constraints.h"

#include <map>
#include <set>
#include <vector>

void oif_TransformBuilder::Build() {
    CollectCsysRegionsList();
    WriteTransforms();
    WriteConnectorOrientations();
    WriteCouplingOrientations();
    WriteInertiaReliefOrientations();
}

void oif_TransformBuilder::CollectCsysRegionsList() {
    const auto append = [this](const dtmC_DatumRef& datum, const rgnC_Region& region) {
        datums_.Append(datum);
        regions_.Append(region);
    };
    for (const auto& [key, condition] : Model().BCs()) {
        if (condition.suppressed) continue;
        // A symmetry condition counts also without a system.
        if (condition.datum.IsNullRef() && condition.DynTypeId() != kbcC_SymmetryBC::TypeId()) continue;
        append(condition.datum, condition.region);
    }
    for (const auto& [key, load] : Model().Loads()) {
        if (load.suppressed) continue;
        const auto appendSystemOf = [&append, &region = load.region](const auto* typed) {
            if (typed != nullptr && !typed->datum.IsNullRef()) append(typed->datum, region);
        };
        appendSystemOf(nex_canDynamicCastPtr<kloC_ConcentratedForce>(&load));
        appendSystemOf(nex_canDynamicCastPtr<kloC_Moment>(&load));
    }
    for (const auto& [name, constraint] : Model().Constraints()) {
        const auto* equation = nex_canDynamicCastPtr<kcoC_Equation>(&constraint);
        if (equation == nullptr) continue;
        const nex_Context context("constraint", name);
        for (int i = 0; i < equation->terms.Length(); ++i) {
            const kcoC_EquationTerm& term = equation->terms[i];
            if (term.csys.Id() <= 0) continue;
            append(dtmC_DatumRef(term.csys.Id()), Model().RootAssembly().nset(term.setName).Region());
        }
    }
}

void oif_TransformBuilder::WriteTransforms() {
    struct System {
        dtmC_DatumRef datum;
        cow_List<cow_String> members;
        std::set<cow_String> known;
    };
    std::vector<System> systems; // in the order of their first region
    std::map<int, std::size_t> placeOf;
    for (int i = 0; i < regions_.Length(); ++i) {
        const cow_String member = oif_RegionName(regions_[i], ModelInfo());
        const auto [place, isNew] = placeOf.emplace(datums_[i].Id(), systems.size());
        if (isNew) systems.push_back({datums_[i], {}, {}});
        System& system = systems[place->second];
        if (system.known.insert(member).second) system.members.Append(member);
    }
    for (const System& system : systems) {
        const cow_String name = ConstGetDatumName(system.datum);
        const nex_Context context("transform", name);
        AddAssemblyDefinition(oif_Nset(name, system.members));
        AddAssemblyDefinition(oif_Transform(Model().Model(), system.datum, name));
    }
}

void oif_TransformBuilder::WriteConnectorOrientations() {
    const ptoC_PartAttributeList& orientations = Model().Assembly().ConstGetConnectorOrientation();
    for (int i = 0; i < orientations.Size(); ++i) {
        const auto& ends =
            nex_canDynamicCastRef<ptoC_ConnectorOrientation>(orientations.ConstGet(i), NEX_HERE);
        // The place in the list counts here, whatever the record's own name is.
        const cow_String name = odiK_Assembly::ConnectorOrientationName(i);
        WriteOrientation(ends.ConstGetCsys1(), ends.ConstGetAngle1(), name + "-1", ends.ConstGetAxis1());
        WriteOrientation(ends.ConstGetCsys2(), ends.ConstGetAngle2(), name + "-2", ends.ConstGetAxis2());
    }
}

void oif_TransformBuilder::WriteCouplingOrientations() {
    for (const auto& [key, constraint] : Model().Constraints()) {
        const auto* coupling = nex_canDynamicCastPtr<kcoC_Coupling>(&constraint);
        if (coupling == nullptr) continue;
        WriteOrientation(coupling->orientation, 0.0, cow_String(), ptoC_MaterialOrientation::axisEnm::AXIS_1);
    }
}

void oif_TransformBuilder::WriteInertiaReliefOrientations() {
    for (const auto& [key, load] : Model().Loads()) {
        const auto* relief = nex_canDynamicCastPtr<kloC_InertiaRelief>(&load);
        if (relief == nullptr || relief->suppressed) continue;
        WriteOrientation(relief->datum, 0.0, {}, ptoC_MaterialOrientation::axisEnm::AXIS_1);
    }
}

void oif_TransformBuilder::WriteOrientation(const dtmC_DatumRef& datum, double angle,
                                            const cow_String& suffix,
                                            ptoC_MaterialOrientation::axisEnm axis) {
    if (datum.IsNullRef()) return;
    const cow_String name = ModelInfo().GetOrientationName(datum, angle, suffix);
    for (int i = 0; i < orientationNames_.Length(); ++i) {
        if (orientationNames_[i] == name) return;
    }
    orientationNames_.Append(name);
    const nex_Context context("orientation", name);
    AddAssemblyDefinition(oif_Orientation(Model().Model(), datum, name, true, angle, axis));
}

cow_String oif_TransformBuilder::ConstGetDatumName(const dtmC_DatumRef& datum) const {
    return cow_String("_T-") + oif_SetName::Unquote(ModelInfo().GetOrientationName(datum, 0.0, cow_String()));
}
