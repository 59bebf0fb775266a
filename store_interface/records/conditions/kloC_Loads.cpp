#include "store_interface/records/conditions/kloC_Loads.h"

#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

constexpr char kComplexDoc[] =
    "true: a load of a harmonic analysis; its real and imaginary parts stand in the record, and those of the "
    "states don't count";

template <class R>
void ComplexComponents(cls_Describe<R>& describe) {
    describe.template Field<&R::complex>("complex", kComplexDoc)
        .template Field<&R::complexComponent1>("complexComponent1", "component 1 of a complex load")
        .Unit("unit of the load")
        .template Field<&R::complexComponent2>("complexComponent2", "component 2 of a complex load")
        .Unit("unit of the load")
        .template Field<&R::complexComponent3>("complexComponent3", "component 3 of a complex load")
        .Unit("unit of the load");
}

template <class R>
void ComplexMagnitude(cls_Describe<R>& describe) {
    describe.template Field<&R::complex>("complex", kComplexDoc)
        .template Field<&R::complexMagnitude>("complexMagnitude", "magnitude of a complex load")
        .Unit("unit of the load");
}

template <class R>
void Heights(cls_Describe<R>& describe) {
    describe
        .template Field<&R::zeroPressureHeight>("zeroPressureHeight",
                                                "height where a hydrostatic pressure is zero")
        .Unit("length")
        .template Field<&R::referencePressureHeight>("referencePressureHeight",
                                                     "height where a hydrostatic pressure has its magnitude")
        .Unit("length");
}

} // namespace

const omu_EnumTable& omu_EnumTableOf(kloC_Load::DistribTypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "UNIFORM", "UNIFORM"},
                                           {1, "USER_DEFINED", "USER_DEFINED"},
                                           {2, "FIELD", "FIELD"},
                                           {3, "TOTAL_FORCE", "TOTAL_FORCE"},
                                           {4, "HYDROSTATIC", "HYDROSTATIC"}};
    static constexpr omu_EnumTable table{"kloC_Load::DistribTypeEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kloC_LineLoad::SystemEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "GLOBAL", "GLOBAL"}, {1, "LOCAL", "LOCAL"}};
    static constexpr omu_EnumTable table{"kloC_LineLoad::SystemEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kloC_Traction::KindEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "NORMAL", "NORMAL"},
                                           {1, "TRANSVERSE", "TRANSVERSE"},
                                           {2, "SHEAR", "SHEAR"},
                                           {3, "MOMENT", "MOMENT"},
                                           {4, "GENERAL", "GENERAL"}};
    static constexpr omu_EnumTable table{"kloC_Traction::KindEnm", rows};
    return table;
}

bool kloC_DistributedLoad::UsesField(cow_String& name) const {
    if (distributionType != DistribTypeEnm::FIELD) return false;
    name = fieldName;
    return true;
}

const cls_FieldTable& kloC_ScalarState::Fields() {
    using R = kloC_ScalarState;
    static const cls_FieldTable fields = cls_Describe<R>(kloC_LoadState::Fields())
                                             .Field<&R::magnitude>("magnitude", "magnitude of the load")
                                             .Unit("unit of the load")
                                             .Example(R"({"magnitude": 10})");
    return fields;
}

const cls_FieldTable& kloC_DistributedState::Fields() {
    using R = kloC_DistributedState;
    static const cls_FieldTable fields = cls_Describe<R>(kloC_LoadState::Fields())
                                             .Field<&R::magnitude>("magnitude", "magnitude of the load")
                                             .Unit("unit of the load")
                                             .Example(R"({"magnitude": 0.5})");
    return fields;
}

const cls_FieldTable& kloC_VectorState::Fields() {
    using R = kloC_VectorState;
    static const cls_FieldTable fields = cls_Describe<R>(kloC_LoadState::Fields())
                                             .Field<&R::component1>("component1", "component 1 of the load")
                                             .Unit("unit of the load")
                                             .Field<&R::component2>("component2", "component 2 of the load")
                                             .Unit("unit of the load")
                                             .Field<&R::component3>("component3", "component 3 of the load")
                                             .Unit("unit of the load")
                                             .Example(R"({"component3": -1000})");
    return fields;
}

const cls_FieldTable& kloC_PressureState::Fields() {
    using R = kloC_PressureState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_DistributedState::Fields()).With(Heights<R>).Example(R"({"magnitude": 0.5})");
    return fields;
}

const cls_FieldTable& kloC_PipePressureState::Fields() {
    using R = kloC_PipePressureState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_DistributedState::Fields()).With(Heights<R>).Example(R"({"magnitude": 6.3})");
    return fields;
}

const cls_FieldTable& kloC_RotationalBodyForceState::Fields() {
    using R = kloC_RotationalBodyForceState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_LoadState::Fields())
            .Field<&R::magnitude>(
                "magnitude",
                "square of the angular velocity of a centrifugal load, else the angular acceleration")
            .Unit("radians^2/time^2 or radians/time^2")
            .Example(R"({"magnitude": 98696})");
    return fields;
}

const cls_FieldTable& kloC_SubmodelStressBasedState::Fields() {
    using R = kloC_SubmodelStressBasedState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_LoadState::Fields())
            .Field<&R::stepName>("stepName", "step of the global analysis")
            .Field<&R::scaleParameter>("scaleParameter", "factor on the global stresses")
            .Unit("no unit")
            .Example(R"({"stepName": "1"})");
    return fields;
}

const cls_FieldTable& kloC_DistributedLoad::Fields() {
    using R = kloC_DistributedLoad;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_Load::Fields())
            .Field<&R::distributionType>(
                "distributionType",
                "how the magnitude is spread; HYDROSTATIC is for pressures and pipe pressures only")
            .Field<&R::fieldName>("fieldName", "name of the field that a distribution FIELD takes; the field "
                                               "itself is not part of the model")
            .Example(R"({"region": "PART-1.TOP"})");
    return fields;
}

const cls_FieldTable& kloC_ConcentratedForce::Fields() {
    using R = kloC_ConcentratedForce;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_Load::Fields())
            .InheritedMayBeSeveral("region")
            .Field<&R::datum>("datum", "coordinate system of the components, none for the global one")
            .Field<&R::follower>("follower", "the direction follows the rotation of the node")
            .With(ComplexComponents<R>)
            .Example(R"({"region": "PART-1.SET"})");
    return fields;
}

const cls_FieldTable& kloC_Moment::Fields() {
    using R = kloC_Moment;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_Load::Fields())
            .InheritedMayBeSeveral("region")
            .Field<&R::datum>("datum", "coordinate system of the components, none for the global one")
            .Field<&R::follower>("follower", "the axis follows the rotation of the node")
            .With(ComplexComponents<R>)
            .Example(R"({"region": "PART-1.SET"})");
    return fields;
}

const cls_FieldTable& kloC_PEGLoad::Fields() {
    using R = kloC_PEGLoad;
    static const cls_FieldTable fields = cls_Describe<R>(kloC_Load::Fields())
                                             .With(ComplexComponents<R>)
                                             .Example(R"({"region": "PART-1.CENTRE"})");
    return fields;
}

const cls_FieldTable& kloC_ConcentratedPoreFluid::Fields() {
    using R = kloC_ConcentratedPoreFluid;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_Load::Fields())
            .InheritedMayBeSeveral("region")
            .Field<&R::complex>("complex", "must stay false: there is no complex flow, and writing it fails")
            .Example(R"({"region": "PART-1.SET"})");
    return fields;
}

const cls_FieldTable& kloC_InwardVolAccel::Fields() {
    using R = kloC_InwardVolAccel;
    static const cls_FieldTable fields = cls_Describe<R>(kloC_Load::Fields())
                                             .InheritedMayBeSeveral("region")
                                             .With(ComplexMagnitude<R>)
                                             .Example(R"({"region": "PART-1.SET"})");
    return fields;
}

const cls_FieldTable& kloC_ConnectorForce::Fields() {
    using R = kloC_ConnectorForce;
    static const cls_FieldTable fields = cls_Describe<R>(kloC_Load::Fields())
                                             .With(ComplexComponents<R>)
                                             .Example(R"({"region": "CONNECTORS"})");
    return fields;
}

const cls_FieldTable& kloC_ConnectorMoment::Fields() {
    using R = kloC_ConnectorMoment;
    static const cls_FieldTable fields = cls_Describe<R>(kloC_Load::Fields())
                                             .With(ComplexComponents<R>)
                                             .Example(R"({"region": "CONNECTORS"})");
    return fields;
}

const cls_FieldTable& kloC_RotationalBodyForce::Fields() {
    using R = kloC_RotationalBodyForce;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_Load::Fields())
            .Field<&R::centrifugal>("centrifugal", "the centrifugal load, label CENTRIF; looked at first")
            .Field<&R::rotaryAcceleration>("rotaryAcceleration",
                                           "the load of an angular acceleration, label ROTA")
            .Field<&R::point1>("point1", "first point of the axis: length")
            .Field<&R::point2>("point2", "second point of the axis: length")
            .Example(
                R"({"region": "PART-1.ALL", "centrifugal": true, "point1": [0, 0, 0], "point2": [0, 0, 1]})");
    return fields;
}

const cls_FieldTable& kloC_LineLoad::Fields() {
    using R = kloC_LineLoad;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_DistributedLoad::Fields())
            .Field<&R::system>("system",
                               "GLOBAL: components along the axes of the model (PX, PY, PZ); LOCAL: "
                               "components 1 and 2 along the axes of the beam section (P1, P2)")
            .With(ComplexComponents<R>)
            .Example(R"({"region": "PART-1.ALL"})");
    return fields;
}

const cls_FieldTable& kloC_PipePressure::Fields() {
    using R = kloC_PipePressure;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_DistributedLoad::Fields())
            .Field<&R::external>("external", "pressure from outside; else from inside")
            .Field<&R::effectiveDiameter>("effectiveDiameter",
                                          "effective outer or inner diameter of the pipe")
            .Unit("length")
            .With(ComplexMagnitude<R>)
            .Example(R"({"region": "PART-1.ALL"})");
    return fields;
}

const cls_FieldTable& kloC_BodyForce::Fields() {
    using R = kloC_BodyForce;
    static const cls_FieldTable fields = cls_Describe<R>(kloC_DistributedLoad::Fields())
                                             .With(ComplexComponents<R>)
                                             .Example(R"({"region": "PART-1.ALL"})");
    return fields;
}

const cls_FieldTable& kloC_Gravity::Fields() {
    using R = kloC_Gravity;
    static const cls_FieldTable fields = cls_Describe<R>(kloC_Load::Fields())
                                             .With(ComplexComponents<R>)
                                             .Example(R"({"region": "PART-1.ALL"})");
    return fields;
}

const cls_FieldTable& kloC_Pressure::Fields() {
    using R = kloC_Pressure;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_DistributedLoad::Fields())
            .Field<&R::distributionRegion>("distributionRegion", "node set of a reference node, or none")
            .With(ComplexMagnitude<R>)
            .Example(R"({"region": "PART-1.TOP"})");
    return fields;
}

const cls_FieldTable& kloC_Traction::Fields() {
    using R = kloC_Traction;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_DistributedLoad::Fields())
            .Field<&R::kind>(
                "kind",
                "a surface traction is SHEAR or general (any other kind); an edge load may be of any kind")
            .Field<&R::vectorGiven>(
                "vectorGiven", "the line goes on with the direction; follower and resultant count only then")
            .Field<&R::direction>("direction",
                                  "direction of the traction, from the first point to the second")
            .Field<&R::follower>("follower", "the direction follows the rotation of the surface or edge")
            .Field<&R::resultant>("resultant",
                                  "the traction is integrated over the surface as it was at first")
            .Field<&R::orientation>(
                "orientation",
                "name of an orientation that the deck gets elsewhere, as it stands there; goes before datum")
            .Field<&R::datum>("datum", "coordinate system of the direction, none for the global one")
            .Field<&R::angle>("angle", "additional rotation of the system")
            .Unit("degrees")
            .Field<&R::axis>("axis", "axis of the additional rotation")
            .With(ComplexMagnitude<R>)
            .Example(R"({"region": "PART-1.TOP", "vectorGiven": true, "direction": [[0, 0, 0], [1, 0, 0]]})");
    return fields;
}

const cls_FieldTable& kloC_ConcentratedHeatFlux::Fields() {
    using R = kloC_ConcentratedHeatFlux;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_Load::Fields())
            .InheritedMayBeSeveral("region")
            .Field<&R::dof>("dof",
                            "degree of freedom of the temperature: 11, or 12 and up at points of a shell")
            .Example(R"({"region": "PART-1.SET"})");
    return fields;
}

const cls_FieldTable& kloC_ConcentratedConcentrationFlux::Fields() {
    using R = kloC_ConcentratedConcentrationFlux;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_Load::Fields())
            .InheritedMayBeSeveral("region")
            .Field<&R::dof>("dof", "degree of freedom of the concentration: 11")
            .Example(R"({"region": "PART-1.SET"})");
    return fields;
}

const cls_FieldTable& kloC_ConcentratedCharge::Fields() {
    using R = kloC_ConcentratedCharge;
    static const cls_FieldTable fields = cls_Describe<R>(kloC_Load::Fields())
                                             .InheritedMayBeSeveral("region")
                                             .With(ComplexMagnitude<R>)
                                             .Example(R"({"region": "PART-1.SET"})");
    return fields;
}

const cls_FieldTable& kloC_ConcentratedCurrent::Fields() {
    using R = kloC_ConcentratedCurrent;
    static const cls_FieldTable fields = cls_Describe<R>(kloC_Load::Fields())
                                             .InheritedMayBeSeveral("region")
                                             .With(ComplexMagnitude<R>)
                                             .Example(R"({"region": "PART-1.SET"})");
    return fields;
}

const cls_FieldTable& kloC_SurfaceCharge::Fields() {
    using R = kloC_SurfaceCharge;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_Load::Fields()).With(ComplexMagnitude<R>).Example(R"({"region": "PART-1.TOP"})");
    return fields;
}

const cls_FieldTable& kloC_SurfaceCurrent::Fields() {
    using R = kloC_SurfaceCurrent;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_Load::Fields()).With(ComplexMagnitude<R>).Example(R"({"region": "PART-1.TOP"})");
    return fields;
}

const cls_FieldTable& kloC_BodyCharge::Fields() {
    using R = kloC_BodyCharge;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_Load::Fields()).With(ComplexMagnitude<R>).Example(R"({"region": "PART-1.ALL"})");
    return fields;
}

const cls_FieldTable& kloC_BodyCurrent::Fields() {
    using R = kloC_BodyCurrent;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_Load::Fields()).With(ComplexMagnitude<R>).Example(R"({"region": "PART-1.ALL"})");
    return fields;
}

const cls_FieldTable& kloC_InertiaRelief::Fields() {
    using R = kloC_InertiaRelief;
    static const cls_FieldTable fields =
        cls_Describe<R>(kloC_Load::Fields())
            .Field<&R::datum>("datum",
                              "coordinate system of the rigid body directions, none for the global one")
            .Example(R"({"region": "PART-1.ALL"})");
    return fields;
}

void cls_RegisterLoadRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kloC_ScalarState>();
    registrar.Add<kloC_DistributedState>();
    registrar.Add<kloC_VectorState>();
    registrar.Add<kloC_DistributedLoad>();
    registrar.Add<kloC_ConcentratedForceState>();
    registrar.Add<kloC_MomentState>();
    registrar.Add<kloC_PEGLoadState>();
    registrar.Add<kloC_ConnectorForceState>();
    registrar.Add<kloC_ConnectorMomentState>();
    registrar.Add<kloC_LineLoadState>();
    registrar.Add<kloC_BodyForceState>();
    registrar.Add<kloC_GravityState>();
    registrar.Add<kloC_PressureState>();
    registrar.Add<kloC_PipePressureState>();
    registrar.Add<kloC_RotationalBodyForceState>();
    registrar.Add<kloC_SubmodelStressBasedState>();
    registrar.Add<kloC_ConcentratedForce>();
    registrar.Add<kloC_Moment>();
    registrar.Add<kloC_PEGLoad>();
    registrar.Add<kloC_ConcentratedPoreFluid>();
    registrar.Add<kloC_InwardVolAccel>();
    registrar.Add<kloC_ConnectorForce>();
    registrar.Add<kloC_ConnectorMoment>();
    registrar.Add<kloC_RotationalBodyForce>();
    registrar.Add<kloC_LineLoad>();
    registrar.Add<kloC_PipePressure>();
    registrar.Add<kloC_BodyForce>();
    registrar.Add<kloC_Gravity>();
    registrar.Add<kloC_Pressure>();
    registrar.Add<kloC_Traction>();
    registrar.Add<kloC_SurfaceTraction>();
    registrar.Add<kloC_ShellEdgeLoad>();
    registrar.Add<kloC_SubmodelStressBased>();
    registrar.Add<kloC_ConcentratedHeatFlux>();
    registrar.Add<kloC_ConcentratedConcentrationFlux>();
    registrar.Add<kloC_BodyHeatFlux>();
    registrar.Add<kloC_BodyConcentrationFlux>();
    registrar.Add<kloC_SurfaceHeatFlux>();
    registrar.Add<kloC_SurfaceConcentrationFlux>();
    registrar.Add<kloC_SurfacePoreFluid>();
    registrar.Add<kloC_HydroFluidFlow>();
    registrar.Add<kloC_ConcentratedCharge>();
    registrar.Add<kloC_ConcentratedCurrent>();
    registrar.Add<kloC_SurfaceCharge>();
    registrar.Add<kloC_SurfaceCurrent>();
    registrar.Add<kloC_BodyCharge>();
    registrar.Add<kloC_BodyCurrent>();
    registrar.Add<kloC_InertiaRelief>();
    registrar.Add<kloC_UnwrittenLoad>();
}
