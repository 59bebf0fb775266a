#include "conditions/oif_BCTable.h"

#include "conditions/oif_Boundary.h"
#include "store_interface/records/conditions/kbcC_MotionBCs.h"
#include "store_interface/records/conditions/kbcC_ScalarBCs.h"
#include "store_interface/records/conditions/kbcC_SupportBCs.h"

namespace {

/// Conditions of class R in keywords of class K; `Form` writes them.
template <class R, class K, class Form>
void Write(const oif_ConditionKeyword& keyword, utl_Stream& stream) {
    Form()(static_cast<const K&>(keyword), stream, static_cast<const R&>(keyword.Condition()));
}
template <class R, class Form>
constexpr oif_BCRow Boundary(const char* label, Form) {
    return {R::Class.Id(), label, oif_BCFamily::BOUNDARY, oif_RegionKind::NODES,
            Write<R, oif_Boundary, Form>};
}
template <class R, class Form>
constexpr oif_BCRow Motion(const char* label, Form) {
    return {R::Class.Id(), label, oif_BCFamily::CONNECTOR_MOTION, oif_RegionKind::ELEMENTS,
            Write<R, oif_ConnectorMotion, Form>};
}

constexpr auto kDisplacements = [](const auto& keyword, auto& stream, const auto& bc) {
    keyword.WriteDisplacements(stream, bc.fixed);
};
/// Only those of connectors can be held.
constexpr auto kVelocities = [](const auto& keyword, auto& stream, const auto& bc) {
    bool held = false;
    if constexpr (requires { bc.fixed; }) held = bc.fixed;
    keyword.WriteRates(stream, "type=VELOCITY", held);
};
constexpr auto kAccelerations = [](const auto& keyword, auto& stream, const auto& bc) {
    bool held = false;
    if constexpr (requires { bc.fixed; }) held = bc.fixed;
    keyword.WriteRates(stream, "type=ACCELERATION", held);
};
constexpr auto kSupport = [](const auto& keyword, auto& stream, const auto&) { keyword.WriteType(stream); };
/// No keyword: the text goes out with its four stars and its last blank.
constexpr auto kSymmetry = [](const auto&, auto& stream, const auto&) {
    stream << "**** symm BC output ";
    stream.LineBreak();
};
constexpr auto kTemperature = [](const auto& keyword, auto& stream, const auto& bc) {
    keyword.WriteTemperature(stream, bc);
};
template <int DegreeOfFreedom>
constexpr auto kScalar = [](const auto& keyword, auto& stream, const auto& bc) {
    keyword.WriteDistributed(stream, bc, DegreeOfFreedom);
};
template <int DegreeOfFreedom>
constexpr auto kComplexScalar = [](const auto& keyword, auto& stream, const auto& bc) {
    keyword.WriteComplexDistributed(stream, bc, DegreeOfFreedom);
};
constexpr auto kSubmodel = [](const auto& keyword, auto& stream, const auto& bc) {
    keyword.WriteSubmodel(stream, bc);
};

constexpr oif_BCRow kBCRows[] = {
    Boundary<kbcC_DisplacementBC>("Displacement/Rotation", kDisplacements),
    Boundary<kbcC_VelocityBC>("Velocity/Angular velocity", kVelocities),
    Boundary<kbcC_AccelerationBC>("Acceleration/Angular acceleration", kAccelerations),
    Boundary<kbcC_TypeBC>("Symmetry/Antisymmetry/Encastre", kSupport),
    Boundary<kbcC_SymmetryBC>("Symmetry", kSymmetry),
    Boundary<kbcC_TemperatureBC>("Temperature", kTemperature),
    Boundary<kbcC_PorePressureBC>("Pore pressure", kScalar<8>),
    Boundary<kbcC_AcousticPressureBC>("Acoustic pressure", kComplexScalar<8>),
    Boundary<kbcC_FluidPressureBC>("Fluid pressure", kScalar<8>),
    Boundary<kbcC_FluidCavityPressureBC>("Fluid cavity pressure", kScalar<8>),
    Boundary<kbcC_ElectricPotentialBC>("Electric potential", kComplexScalar<9>),
    Boundary<kbcC_ConcentrationBC>("Mass concentration", kScalar<11>),
    Boundary<kbcC_SubmodelBC>("Submodel", kSubmodel),
    Motion<kbcC_ConnDisplacementBC>("Connector displacement", kDisplacements),
    Motion<kbcC_ConnVelocityBC>("Connector velocity", kVelocities),
    Motion<kbcC_ConnAccelerationBC>("Connector acceleration", kAccelerations),
};

} // namespace

std::span<const oif_BCRow> oif_BCRows() {
    return kBCRows;
}
