#include "conditions/oif_LoadTable.h"

#include "conditions/oif_FluxLoads.h"
#include "conditions/oif_MechanicalLoads.h"

namespace {

using enum oif_RegionKind;
using Family = oif_LoadFamily;
using Comment = oif_LoadComment;

/// Loads of class R, written as keywords of class K.
template <class R, class K>
constexpr oif_LoadRow Row(const char* label, Family family, oif_RegionKind region,
                          Comment comment = Comment::AHEAD) {
    return {R::Class.Id(), label,   family,
            region,        comment, oif_MakeKeyword<K, R, oif_LoadCard, oif_LoadSetting>};
}
template <class R>
constexpr oif_LoadRow WithoutKeyword(const char* label, Family family, Comment comment) {
    return {R::Class.Id(), label, family, ANY, comment, nullptr};
}

constexpr oif_LoadRow kRows[] = {
    Row<kloC_ConcentratedForce, oif_Cload>("Concentrated force", Family::CLOAD, NODES),
    Row<kloC_Moment, oif_Cload>("Moment", Family::CLOAD, NODES),
    Row<kloC_PEGLoad, oif_Cload>("Generalized plane strain", Family::CLOAD, ANY),
    Row<kloC_BoltLoad, oif_Cload>("Bolt load", Family::CLOAD, ANY),
    Row<kloC_ConcentratedPoreFluid, oif_Cload>("Concentrated pore fluid flow", Family::CLOAD, NODES),
    Row<kloC_InwardVolAccel, oif_Cload>("Inward volume acceleration", Family::CLOAD, NODES),
    Row<kloC_RotationalBodyForce, oif_Dload>("Rotational body force", Family::DLOAD, ELEMENTS),
    Row<kloC_LineLoad, oif_Dload>("Line load", Family::DLOAD, ELEMENTS),
    Row<kloC_PipePressure, oif_Dload>("Pipe pressure", Family::DLOAD, ELEMENTS),
    Row<kloC_BodyForce, oif_Dload>("Body force", Family::DLOAD, ELEMENTS),
    Row<kloC_Gravity, oif_Dload>("Gravity", Family::DLOAD, ANY),
    Row<kloC_Pressure, oif_Dsload>("Pressure", Family::DSLOAD, SURFACE, Comment::ALONE_OF_A_FIELD),
    Row<kloC_SurfaceTraction, oif_Dsload>("Surface traction", Family::DSLOAD, SURFACE,
                                          Comment::ALONE_OF_A_FIELD),
    Row<kloC_ShellEdgeLoad, oif_Dsload>("Shell edge load", Family::DSLOAD, SURFACE,
                                        Comment::ALONE_OF_A_FIELD),
    Row<kloC_ConnectorForce, oif_ConnectorLoad>("Connector force", Family::CONNECTOR_LOAD, ELEMENTS),
    Row<kloC_ConnectorMoment, oif_ConnectorLoad>("Connector moment", Family::CONNECTOR_LOAD, ELEMENTS),
    Row<kloC_ConcentratedHeatFlux, oif_Cflux>("Concentrated heat flux", Family::CFLUX, NODES),
    Row<kloC_ConcentratedConcentrationFlux, oif_Cflux>("Concentrated concentration flux", Family::CFLUX,
                                                       NODES),
    Row<kloC_BodyHeatFlux, oif_Dflux>("Body heat flux", Family::DFLUX, ELEMENTS),
    Row<kloC_BodyConcentrationFlux, oif_Dflux>("Body concentration flux", Family::DFLUX, ELEMENTS),
    Row<kloC_SurfaceHeatFlux, oif_Dsflux>("Surface heat flux", Family::DSFLUX, SURFACE),
    Row<kloC_SurfaceConcentrationFlux, oif_Dsflux>("Surface concentration flux", Family::DSFLUX, SURFACE),
    Row<kloC_SurfacePoreFluid, oif_Dsflow>("Surface pore fluid flow", Family::DSFLOW, SURFACE),
    Row<kloC_HydroFluidFlow, oif_FluidFlux>("Fluid flux", Family::FLUID_FLUX, NODES),
    Row<kloC_ConcentratedCharge, oif_Cecharge>("Concentrated charge", Family::CECHARGE, NODES),
    Row<kloC_ConcentratedCurrent, oif_Cecurrent>("Concentrated current", Family::CECURRENT, NODES),
    Row<kloC_SurfaceCharge, oif_Dsecharge>("Surface charge", Family::DSECHARGE, SURFACE),
    Row<kloC_SurfaceCurrent, oif_Dsecurrent>("Surface current", Family::DSECURRENT, SURFACE),
    Row<kloC_BodyCharge, oif_Decharge>("Body charge", Family::DECHARGE, ELEMENTS),
    Row<kloC_BodyCurrent, oif_Decurrent>("Body current", Family::DECURRENT, ELEMENTS),
    WithoutKeyword<kloC_InertiaRelief>("Inertia relief", Family::INERTIA_RELIEF, Comment::ALONE),
    WithoutKeyword<kloC_UnwrittenLoad>("Unwritten load", Family::UNWRITTEN, Comment::AHEAD),
};

} // namespace

std::span<const oif_LoadRow> oif_LoadRows() {
    return kRows;
}

bool oif_LoadRow::IsCommentAlone(const kloC_Load& load) const {
    cow_String fieldName;
    return comment == Comment::ALONE || (comment == Comment::ALONE_OF_A_FIELD && load.UsesField(fieldName));
}
