#ifndef QRX_STORE_KLOC_LOADS_H
#define QRX_STORE_KLOC_LOADS_H

#include "store_interface/records/conditions/kloC_Load.h"
#include "store_interface/records/part_attributes/ptoC_PartAttribute.h"

class cls_ClassRegistrar;

/// One magnitude, of a load at points.
class kloC_ScalarState final : public cls_RecordOf<kloC_ScalarState, kloC_LoadState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_ScalarState", "magnitude of a load at points in one step"};

    mdl_PropAttr<double> magnitude;

    static const cls_FieldTable& Fields();
};

/// One magnitude, of a load spread over a line, a surface or a volume.
class kloC_DistributedState : public cls_RecordOf<kloC_DistributedState, kloC_LoadState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_DistributedState",
                                         "magnitude of a distributed load in one step"};

    mdl_PropAttr<double> magnitude;

    static const cls_FieldTable& Fields();
};

/// Three components.
class kloC_VectorState : public cls_RecordOf<kloC_VectorState, kloC_LoadState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_VectorState", "components of a load in one step"};

    mdl_PropAttr<double> component1;
    mdl_PropAttr<double> component2;
    mdl_PropAttr<double> component3;

    static const cls_FieldTable& Fields();
};

/// Where a hydrostatic pressure is what.
struct kloC_HydrostaticHeights {
    mdl_PropAttr<double> zeroPressureHeight;
    mdl_PropAttr<double> referencePressureHeight;
};

/// The parts of a load by components in a harmonic analysis.
struct kloC_ComplexComponents {
    bool complex = false;
    omi_complex complexComponent1;
    omi_complex complexComponent2;
    omi_complex complexComponent3;
};

/// The parts of a load by its magnitude in a harmonic analysis.
struct kloC_ComplexMagnitude {
    bool complex = false;
    omi_complex complexMagnitude;
};

/// A load whose magnitude is spread over a line, a surface or a volume.
class kloC_DistributedLoad : public cls_AbstractRecordOf<kloC_DistributedLoad, kloC_Load> {
public:
    static constexpr cls_ClassInfo Class{"kloC_DistributedLoad", "a distributed load"};

    DistribTypeEnm distributionType = DistribTypeEnm::UNIFORM;
    cow_String fieldName;

    /// When the distribution is that of a named field.
    bool UsesField(cow_String& name) const override;

    static const cls_FieldTable& Fields();
};

class kloC_ConcentratedForceState final : public cls_RecordOf<kloC_ConcentratedForceState, kloC_VectorState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_ConcentratedForceState",
                                         "components of a concentrated force in one step: force"};
};

class kloC_MomentState final : public cls_RecordOf<kloC_MomentState, kloC_VectorState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_MomentState",
                                         "components of a moment in one step: force*length"};
};

class kloC_PEGLoadState final : public cls_RecordOf<kloC_PEGLoadState, kloC_VectorState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_PEGLoadState",
                                         "axial force and moments about axes 1 and 2 of a generalized plane "
                                         "strain load in one step: force, force*length, force*length"};
};

class kloC_ConnectorForceState final : public cls_RecordOf<kloC_ConnectorForceState, kloC_VectorState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_ConnectorForceState",
                                         "components of a connector force in one step: force"};
};

class kloC_ConnectorMomentState final : public cls_RecordOf<kloC_ConnectorMomentState, kloC_VectorState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_ConnectorMomentState",
                                         "components of a connector moment in one step: force*length"};
};

class kloC_LineLoadState final : public cls_RecordOf<kloC_LineLoadState, kloC_VectorState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_LineLoadState",
                                         "components of a line load in one step: force/length"};
};

class kloC_BodyForceState final : public cls_RecordOf<kloC_BodyForceState, kloC_VectorState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_BodyForceState",
                                         "components of a body force in one step: force/volume"};
};

class kloC_GravityState final : public cls_RecordOf<kloC_GravityState, kloC_VectorState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_GravityState",
                                         "components of a gravity load in one step: length/time^2"};
};

class kloC_PressureState final : public cls_RecordOf<kloC_PressureState, kloC_DistributedState>,
                                 public kloC_HydrostaticHeights {
public:
    static constexpr cls_ClassInfo Class{"kloC_PressureState", "pressure in one step: stress"};

    static const cls_FieldTable& Fields();
};

class kloC_PipePressureState final : public cls_RecordOf<kloC_PipePressureState, kloC_DistributedState>,
                                     public kloC_HydrostaticHeights {
public:
    static constexpr cls_ClassInfo Class{"kloC_PipePressureState", "pipe pressure in one step: stress"};

    static const cls_FieldTable& Fields();
};

class kloC_RotationalBodyForceState final
    : public cls_RecordOf<kloC_RotationalBodyForceState, kloC_LoadState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_RotationalBodyForceState",
                                         "magnitude of a rotational body force in one step"};

    mdl_PropAttr<double> magnitude;

    static const cls_FieldTable& Fields();
};

class kloC_SubmodelStressBasedState final
    : public cls_RecordOf<kloC_SubmodelStressBasedState, kloC_LoadState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_SubmodelStressBasedState",
                                         "source of a stress-based submodel load in one step"};

    cow_String stepName;
    mdl_PropAttr<double> scaleParameter{1.0, mdl_PropAttributeStateEnm::NEVER_SET};

    static const cls_FieldTable& Fields();
};

class kloC_ConcentratedForce final : public kloC_LoadOf<kloC_ConcentratedForce, kloC_ConcentratedForceState>,
                                     public kloC_ComplexComponents {
public:
    static constexpr cls_ClassInfo Class{"kloC_ConcentratedForce",
                                         "a force at each node of a node set: force", 0x2880047,
                                         "PointForce PointLoad"};

    dtmC_DatumRef datum;
    bool follower = false;

    static const cls_FieldTable& Fields();
};

class kloC_Moment final : public kloC_LoadOf<kloC_Moment, kloC_MomentState>, public kloC_ComplexComponents {
public:
    static constexpr cls_ClassInfo Class{"kloC_Moment", "a moment at each node of a node set: force*length",
                                         0x2880018, "ConcentratedMoment PointMoment"};

    dtmC_DatumRef datum;
    bool follower = false;

    static const cls_FieldTable& Fields();
};

class kloC_PEGLoad final : public kloC_LoadOf<kloC_PEGLoad, kloC_PEGLoadState>,
                           public kloC_ComplexComponents {
public:
    static constexpr cls_ClassInfo Class{"kloC_PEGLoad",
                                         "a load at the reference node of generalized plane strain elements: "
                                         "axial force, moments about axes 1 and 2",
                                         0x2880022, "GeneralizedPlaneStrainLoad"};

    static const cls_FieldTable& Fields();
};

class kloC_ConcentratedPoreFluid final : public kloC_LoadOf<kloC_ConcentratedPoreFluid, kloC_ScalarState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_ConcentratedPoreFluid",
                                         "flow of pore fluid at nodes: volume/time", 0x288002A};

    bool complex = false;

    static const cls_FieldTable& Fields();
};

class kloC_InwardVolAccel final : public kloC_LoadOf<kloC_InwardVolAccel, kloC_ScalarState>,
                                  public kloC_ComplexMagnitude {
public:
    static constexpr cls_ClassInfo Class{
        "kloC_InwardVolAccel", "inward volume acceleration at nodes of an acoustic medium: volume/time^2",
        0x2880042, "InwardVolumeAcceleration"};

    static const cls_FieldTable& Fields();
};

class kloC_ConnectorForce final : public kloC_LoadOf<kloC_ConnectorForce, kloC_ConnectorForceState>,
                                  public kloC_ComplexComponents {
public:
    static constexpr cls_ClassInfo Class{
        "kloC_ConnectorForce", "a force in the relative motions 1 to 3 of connectors: force", 0x288000E};

    static const cls_FieldTable& Fields();
};

class kloC_ConnectorMoment final : public kloC_LoadOf<kloC_ConnectorMoment, kloC_ConnectorMomentState>,
                                   public kloC_ComplexComponents {
public:
    static constexpr cls_ClassInfo Class{
        "kloC_ConnectorMoment", "a moment in the relative motions 4 to 6 of connectors: force*length",
        0x2880049};

    static const cls_FieldTable& Fields();
};

class kloC_RotationalBodyForce final
    : public kloC_LoadOf<kloC_RotationalBodyForce, kloC_RotationalBodyForceState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_RotationalBodyForce",
                                         "body force of a body that turns about an axis", 0x2880014,
                                         "RotationalBody"};

    bool centrifugal = true;
    bool rotaryAcceleration = false;
    gsl_Point point1;
    gsl_Point point2;

    static const cls_FieldTable& Fields();
};

class kloC_LineLoad final : public kloC_LoadOf<kloC_LineLoad, kloC_LineLoadState, kloC_DistributedLoad>,
                            public kloC_ComplexComponents {
public:
    static constexpr cls_ClassInfo Class{"kloC_LineLoad", "a load along beams or pipes: force/length",
                                         0x288001A};

    enum class SystemEnm : int { GLOBAL = 0, LOCAL = 1 };

    SystemEnm system = SystemEnm::GLOBAL;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kloC_LineLoad::SystemEnm);

class kloC_PipePressure final
    : public kloC_LoadOf<kloC_PipePressure, kloC_PipePressureState, kloC_DistributedLoad>,
      public kloC_ComplexMagnitude {
public:
    static constexpr cls_ClassInfo Class{"kloC_PipePressure", "pressure inside or outside of pipes: stress",
                                         0x288001C};

    bool external = false;
    double effectiveDiameter = 0.0;

    static const cls_FieldTable& Fields();
};

class kloC_BodyForce final : public kloC_LoadOf<kloC_BodyForce, kloC_BodyForceState, kloC_DistributedLoad>,
                             public kloC_ComplexComponents {
public:
    static constexpr cls_ClassInfo Class{
        "kloC_BodyForce", "a force on a volume along the global axes: force/volume", 0x288001E};

    static const cls_FieldTable& Fields();
};

class kloC_Gravity final : public kloC_LoadOf<kloC_Gravity, kloC_GravityState>,
                           public kloC_ComplexComponents {
public:
    static constexpr cls_ClassInfo Class{"kloC_Gravity", "uniform acceleration of a region: length/time^2",
                                         0x2880020};

    static const cls_FieldTable& Fields();
};

class kloC_Pressure final : public kloC_LoadOf<kloC_Pressure, kloC_PressureState, kloC_DistributedLoad>,
                            public kloC_ComplexMagnitude {
public:
    static constexpr cls_ClassInfo Class{"kloC_Pressure", "pressure on a surface: stress", 0x2880008};

    rgnC_Region distributionRegion;

    static const cls_FieldTable& Fields();
};

/// A traction on a surface or along a shell edge.
class kloC_Traction : public cls_AbstractRecordOf<kloC_Traction, kloC_DistributedLoad>,
                      public kloC_ComplexMagnitude {
public:
    static constexpr cls_ClassInfo Class{"kloC_Traction", "a traction on a surface or along a shell edge"};

    enum class KindEnm : int { NORMAL = 0, TRANSVERSE = 1, SHEAR = 2, MOMENT = 3, GENERAL = 4 };

    KindEnm kind = KindEnm::GENERAL;
    bool vectorGiven = false;
    gsl_ModelSegment direction;
    bool follower = true;
    bool resultant = false;
    cow_String orientation;
    dtmC_DatumRef datum;
    double angle = 0.0;
    ptoC_MaterialOrientation::axisEnm axis = ptoC_MaterialOrientation::axisEnm::AXIS_1;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kloC_Traction::KindEnm);

class kloC_SurfaceTraction final
    : public kloC_LoadOf<kloC_SurfaceTraction, kloC_DistributedState, kloC_Traction> {
public:
    static constexpr cls_ClassInfo Class{
        "kloC_SurfaceTraction", "a general or shear traction on a surface: stress", 0x2880055, "Traction"};
};

class kloC_ShellEdgeLoad final
    : public kloC_LoadOf<kloC_ShellEdgeLoad, kloC_DistributedState, kloC_Traction> {
public:
    static constexpr cls_ClassInfo Class{"kloC_ShellEdgeLoad",
                                         "a load along a shell edge: force/length, or moment/length",
                                         0x2880057, "EdgeLoad"};
};

class kloC_SubmodelStressBased final
    : public kloC_LoadOf<kloC_SubmodelStressBased, kloC_SubmodelStressBasedState> {
public:
    static constexpr cls_ClassInfo Class{
        "kloC_SubmodelStressBased",
        "surface traction of a submodel from the stresses of a global model; no deck can carry it", 0x288005C,
        "SubmodelStress"};
};

class kloC_ConcentratedHeatFlux final : public kloC_LoadOf<kloC_ConcentratedHeatFlux, kloC_ScalarState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_ConcentratedHeatFlux", "heat flux at nodes: power", 0x2880026,
                                         "PointHeatFlux"};

    int dof = 11;

    static const cls_FieldTable& Fields();
};

class kloC_ConcentratedConcentrationFlux final
    : public kloC_LoadOf<kloC_ConcentratedConcentrationFlux, kloC_ScalarState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_ConcentratedConcentrationFlux",
                                         "flux of a diffusing material at nodes", 0x288003C};

    int dof = 11;

    static const cls_FieldTable& Fields();
};

class kloC_BodyHeatFlux final
    : public kloC_LoadOf<kloC_BodyHeatFlux, kloC_DistributedState, kloC_DistributedLoad> {
public:
    static constexpr cls_ClassInfo Class{"kloC_BodyHeatFlux", "heat flux in a volume: power/volume",
                                         0x2880028};
};

class kloC_BodyConcentrationFlux final
    : public kloC_LoadOf<kloC_BodyConcentrationFlux, kloC_DistributedState, kloC_DistributedLoad> {
public:
    static constexpr cls_ClassInfo Class{"kloC_BodyConcentrationFlux",
                                         "flux of a diffusing material in a volume", 0x2880040};
};

class kloC_SurfaceHeatFlux final
    : public kloC_LoadOf<kloC_SurfaceHeatFlux, kloC_DistributedState, kloC_DistributedLoad> {
public:
    static constexpr cls_ClassInfo Class{"kloC_SurfaceHeatFlux", "heat flux into a surface: power/area",
                                         0x2880045};
};

class kloC_SurfaceConcentrationFlux final
    : public kloC_LoadOf<kloC_SurfaceConcentrationFlux, kloC_DistributedState, kloC_DistributedLoad> {
public:
    static constexpr cls_ClassInfo Class{"kloC_SurfaceConcentrationFlux",
                                         "flux of a diffusing material into a surface", 0x288003E};
};

class kloC_SurfacePoreFluid final
    : public kloC_LoadOf<kloC_SurfacePoreFluid, kloC_DistributedState, kloC_DistributedLoad> {
public:
    static constexpr cls_ClassInfo Class{"kloC_SurfacePoreFluid",
                                         "flow of pore fluid through a surface: length/time", 0x288002C};
};

class kloC_HydroFluidFlow final : public kloC_LoadOf<kloC_HydroFluidFlow, kloC_ScalarState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_HydroFluidFlow",
                                         "flow into a fluid cavity at its reference node: mass/time",
                                         0x288002E, "FluidFlow"};
};

class kloC_ConcentratedCharge final : public kloC_LoadOf<kloC_ConcentratedCharge, kloC_ScalarState>,
                                      public kloC_ComplexMagnitude {
public:
    static constexpr cls_ClassInfo Class{"kloC_ConcentratedCharge", "electric charge at nodes: charge",
                                         0x2880030};

    static const cls_FieldTable& Fields();
};

class kloC_ConcentratedCurrent final : public kloC_LoadOf<kloC_ConcentratedCurrent, kloC_ScalarState>,
                                       public kloC_ComplexMagnitude {
public:
    static constexpr cls_ClassInfo Class{"kloC_ConcentratedCurrent", "electric current at nodes: current",
                                         0x2880032};

    static const cls_FieldTable& Fields();
};

class kloC_SurfaceCharge final : public kloC_LoadOf<kloC_SurfaceCharge, kloC_DistributedState>,
                                 public kloC_ComplexMagnitude {
public:
    static constexpr cls_ClassInfo Class{"kloC_SurfaceCharge", "electric charge on a surface: charge/area",
                                         0x2880034};

    static const cls_FieldTable& Fields();
};

class kloC_SurfaceCurrent final : public kloC_LoadOf<kloC_SurfaceCurrent, kloC_DistributedState>,
                                  public kloC_ComplexMagnitude {
public:
    static constexpr cls_ClassInfo Class{"kloC_SurfaceCurrent",
                                         "electric current into a surface: current/area", 0x2880036};

    static const cls_FieldTable& Fields();
};

class kloC_BodyCharge final : public kloC_LoadOf<kloC_BodyCharge, kloC_DistributedState>,
                              public kloC_ComplexMagnitude {
public:
    static constexpr cls_ClassInfo Class{"kloC_BodyCharge", "electric charge in a volume: charge/volume",
                                         0x2880038};

    static const cls_FieldTable& Fields();
};

class kloC_BodyCurrent final : public kloC_LoadOf<kloC_BodyCurrent, kloC_DistributedState>,
                               public kloC_ComplexMagnitude {
public:
    static constexpr cls_ClassInfo Class{"kloC_BodyCurrent", "electric current in a volume: current/volume",
                                         0x288003A};

    static const cls_FieldTable& Fields();
};

class kloC_InertiaRelief final : public kloC_LoadOf<kloC_InertiaRelief, kloC_LoadState> {
public:
    static constexpr cls_ClassInfo Class{
        "kloC_InertiaRelief", "balance of rigid body motion by inertia forces; decks name it in a comment",
        0x288004B};

    dtmC_DatumRef datum;

    static const cls_FieldTable& Fields();
};

/// The one load of its family: the family has a flag of its own and no keyword.
class kloC_UnwrittenLoad final : public kloC_LoadOf<kloC_UnwrittenLoad, kloC_LoadState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_UnwrittenLoad", "a load that no deck can carry", 0x2880012};
};

void cls_RegisterLoadRecords(cls_ClassRegistrar& registrar);

#endif
