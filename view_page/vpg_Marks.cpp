#include "view_page/vpg_Marks.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/conditions/kbcC_MotionBCs.h"
#include "store_interface/records/conditions/kbcC_ScalarBCs.h"
#include "store_interface/records/conditions/kbcC_SupportBCs.h"
#include "store_interface/records/conditions/kloC_BoltLoad.h"
#include "store_interface/records/conditions/kloC_Loads.h"
#include "store_interface/records/conditions/kpfC_Fields.h"
#include "store_interface/records/constraints/kcoC_Constraints.h"
#include "store_interface/records/interactions/kinC_ActuatorSensor.h"
#include "store_interface/records/interactions/kinC_Contact.h"
#include "store_interface/records/interactions/kinC_ContactExp.h"
#include "store_interface/records/interactions/kinC_CyclicSymmetry.h"
#include "store_interface/records/interactions/kinC_FilmAndRadiation.h"
#include "store_interface/records/interactions/kinC_WaveInteractions.h"

#include <algorithm>

using nlohmann::ordered_json;

namespace {

template <class T>
constexpr vpg_MarkRow Row(const char* mark) {
    return {T::Class.Id(), mark};
}

constexpr vpg_MarkRow kRows[] = {
    Row<kbcC_TypeBC>("support"),
    Row<kbcC_SymmetryBC>("none"),
    Row<kbcC_SubmodelBC>("nodes"),
    Row<kbcC_DisplacementBC>("support"),
    Row<kbcC_VelocityBC>("support"),
    Row<kbcC_AccelerationBC>("support"),
    Row<kbcC_ConnDisplacementBC>("connector"),
    Row<kbcC_ConnVelocityBC>("connector"),
    Row<kbcC_ConnAccelerationBC>("connector"),
    Row<kbcC_TemperatureBC>("nodes"),
    Row<kbcC_PorePressureBC>("nodes"),
    Row<kbcC_AcousticPressureBC>("nodes"),
    Row<kbcC_FluidPressureBC>("nodes"),
    Row<kbcC_ElectricPotentialBC>("nodes"),
    Row<kbcC_ConcentrationBC>("nodes"),
    Row<kbcC_FluidCavityPressureBC>("nodes"),
    Row<kloC_ConcentratedForce>("force"),
    Row<kloC_Moment>("moment"),
    Row<kloC_PEGLoad>("nodes"),
    Row<kloC_ConcentratedPoreFluid>("nodes"),
    Row<kloC_InwardVolAccel>("nodes"),
    Row<kloC_ConnectorForce>("connector"),
    Row<kloC_ConnectorMoment>("connector"),
    Row<kloC_RotationalBodyForce>("rotation"),
    Row<kloC_LineLoad>("spread"),
    Row<kloC_PipePressure>("tint"),
    Row<kloC_BodyForce>("spread"),
    Row<kloC_Gravity>("gravity"),
    Row<kloC_Pressure>("pressure"),
    Row<kloC_SurfaceTraction>("traction"),
    Row<kloC_ShellEdgeLoad>("traction"),
    Row<kloC_SubmodelStressBased>("tint"),
    Row<kloC_ConcentratedHeatFlux>("nodes"),
    Row<kloC_ConcentratedConcentrationFlux>("nodes"),
    Row<kloC_BodyHeatFlux>("tint"),
    Row<kloC_BodyConcentrationFlux>("tint"),
    Row<kloC_SurfaceHeatFlux>("tint"),
    Row<kloC_SurfaceConcentrationFlux>("tint"),
    Row<kloC_SurfacePoreFluid>("tint"),
    Row<kloC_HydroFluidFlow>("nodes"),
    Row<kloC_ConcentratedCharge>("nodes"),
    Row<kloC_ConcentratedCurrent>("nodes"),
    Row<kloC_SurfaceCharge>("tint"),
    Row<kloC_SurfaceCurrent>("tint"),
    Row<kloC_BodyCharge>("tint"),
    Row<kloC_BodyCurrent>("tint"),
    Row<kloC_InertiaRelief>("none"),
    Row<kloC_UnwrittenLoad>("none"),
    Row<kloC_BoltLoad>("bolt"),
    Row<kpfC_Temperature>("tint"),
    Row<kpfC_PressureStress>("tint"),
    Row<kpfC_MassFlowRate>("tint"),
    Row<kpfC_GeneralField>("tint"),
    Row<kpfC_Velocity>("tint"),
    Row<kpfC_Stress>("tint"),
    Row<kpfC_Hardening>("tint"),
    Row<kinC_SurfaceToSurfaceContactStd>("pair"),
    Row<kinC_SurfaceToSurfaceContactXpl>("pair"),
    Row<kinC_SelfContactStd>("tint"),
    Row<kinC_SelfContactXpl>("tint"),
    Row<kinC_ContactExp>("pair"),
    Row<kinC_FilmCondition>("tint"),
    Row<kinC_ConcFilmCondition>("tint"),
    Row<kinC_RadiationToAmbient>("tint"),
    Row<kinC_ConcRadiationToAmbient>("tint"),
    Row<kinC_CavityRadiation>("tint"),
    Row<kinC_ActuatorSensor>("nodes"),
    Row<kinC_CyclicSymmetry>("none"),
    Row<kinC_ElasticFoundation>("tint"),
    Row<kinC_AcousticImpedance>("tint"),
    Row<kinC_IncidentWave>("tint"),
    Row<kcoC_Tie>("pair"),
    Row<odiK_Tie>("pair"),
    Row<kcoC_Coupling>("couple"),
    Row<odiK_Coupling>("couple"),
    Row<kcoC_RigidBody>("couple"),
    Row<kcoC_EmbeddedRegion>("pair"),
    Row<kcoC_Equation>("couple"),
    Row<kcoC_ShellSolidCoupling>("pair"),
};

/// The degrees of freedom that a named support holds.
std::span<const int> HeldBy(kbcC_TypeBC::TypeNameEnm support) {
    using Type = kbcC_TypeBC::TypeNameEnm;
    static constexpr int xSymmetry[] = {1, 5, 6};
    static constexpr int ySymmetry[] = {2, 4, 6};
    static constexpr int zSymmetry[] = {3, 4, 5};
    static constexpr int xAntisymmetry[] = {2, 3, 4};
    static constexpr int yAntisymmetry[] = {1, 3, 5};
    static constexpr int zAntisymmetry[] = {1, 2, 6};
    static constexpr int all[] = {1, 2, 3, 4, 5, 6};
    switch (support) {
    case Type::XSYMM: return xSymmetry;
    case Type::YSYMM: return ySymmetry;
    case Type::ZSYMM: return zSymmetry;
    case Type::XASYMM: return xAntisymmetry;
    case Type::YASYMM: return yAntisymmetry;
    case Type::ZASYMM: return zAntisymmetry;
    case Type::PINNED: return std::span(all).first(3);
    case Type::ENCASTRE: return all;
    default: return {}; // what pipes' cross-sections do
    }
}

ordered_json Triple(double x, double y, double z) {
    return {x, y, z};
}

} // namespace

std::span<const vpg_MarkRow> vpg_MarkRows() {
    return kRows;
}

const char* vpg_MarkOf(unsigned typeId) {
    const auto* row = std::ranges::find(kRows, typeId, &vpg_MarkRow::typeId);
    return row == std::end(kRows) ? "none" : row->mark;
}

ordered_json vpg_MarkStateOf(const kbcC_BC& bc, const cow_String& step) {
    const kbcC_BCState& state = bc.ConstGetStateQuad(step).state.ConstGet();
    ordered_json components = ordered_json::array();
    if (const auto* support = nex_canDynamicCastPtr<kbcC_TypeBCState>(&state)) {
        for (int i = 0; i < 6; ++i) components.push_back(nullptr);
        if (!support->typeName.IsActive()) return {};
        for (const int dof : HeldBy(support->typeName.ConstGet())) {
            components[static_cast<std::size_t>(dof - 1)] = 0.0;
        }
        return {{"components", components}};
    }
    if (std::string_view(vpg_MarkOf(bc.DynTypeId())) == "nodes") {
        const kbcC_Component magnitude = state.Component(0);
        return {{"magnitude", magnitude.real}};
    }
    bool any = false;
    for (int i = 0; i < 6; ++i) {
        const kbcC_Component component = state.Component(i);
        const bool held = component.state == mdl_PropAttributeStateEnm::SET ||
                          component.state == mdl_PropAttributeStateEnm::CARRIED;
        components.push_back(held ? ordered_json(component.real) : ordered_json());
        any = any || held;
    }
    return any ? ordered_json{{"components", components}} : ordered_json();
}

ordered_json vpg_MarkStateOf(const kloC_Load& load, const cow_String& step) {
    if (const auto* bolt = nex_canDynamicCastPtr<kloC_BoltLoad>(&load)) {
        const kloC_BoltLoadState& state = bolt->BoltState(step);
        return {
            {"magnitude", bolt->IsByForce(step) ? state.magnitude.ConstGet() : state.adjustment.ConstGet()}};
    }
    const std::vector<kloC_LoadValue> values = load.Values(step);
    const auto real = [](const kloC_LoadValue& value) {
        return value.state == mdl_PropAttributeStateEnm::CLEARED ? 0.0 : value.real;
    };
    if (values.size() == 1) return {{"magnitude", real(values[0])}};
    if (values.size() != 3) return {};
    return {{"components", Triple(real(values[0]), real(values[1]), real(values[2]))}};
}

ordered_json vpg_MarkFrameOf(const cls_Record& object) {
    ordered_json frame = ordered_json::object();
    const auto datum = [&](const dtmC_DatumRef& ref) {
        if (!ref.IsNullRef()) frame["datum"] = ref.Id();
    };
    if (const auto* rotation = nex_canDynamicCastPtr<kloC_RotationalBodyForce>(&object)) {
        const gsl_Point& a = rotation->point1;
        const gsl_Point& b = rotation->point2;
        frame["axis"] = {Triple(a.X(), a.Y(), a.Z()), Triple(b.X(), b.Y(), b.Z())};
    }
    if (const auto* traction = nex_canDynamicCastPtr<kloC_Traction>(&object)) {
        const gsl_Vector direction = traction->direction.Direction();
        frame["direction"] = Triple(direction.X(), direction.Y(), direction.Z());
        datum(traction->datum);
    }
    if (const auto* bc = nex_canDynamicCastPtr<kbcC_BC>(&object)) datum(bc->datum);
    if (const auto* force = nex_canDynamicCastPtr<kloC_ConcentratedForce>(&object)) datum(force->datum);
    if (const auto* moment = nex_canDynamicCastPtr<kloC_Moment>(&object)) datum(moment->datum);
    if (const auto* coupling = nex_canDynamicCastPtr<kcoC_Coupling>(&object)) datum(coupling->orientation);
    return frame;
}
