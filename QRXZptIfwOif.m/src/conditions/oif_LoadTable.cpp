#include "conditions/oif_LoadTable.h"

#include "conditions/oif_FluxLoads.h"
#include "conditions/oif_MechanicalLoads.h"

namespace {

using enum oif_RegionKind;
using Comment = oif_LoadComment;

/// Loads of class R, written as keywords of class K.
template <class R, class K>
constexpr oif_LoadRow LoadRow(const char* label, oif_LoadFamily family, oif_RegionKind region,
                              Comment comment = Comment::AHEAD) {
    return {R::Class.Id(), label,   family,
            region,        comment, oif_MakeKeyword<K, R, oif_LoadCard, oif_LoadSetting>};
}
template <class R>
constexpr oif_LoadRow WithoutKeyword(const char* label, oif_LoadFamily family, Comment comment) {
    return {R::Class.Id(), label, family, ANY, comment, nullptr};
}

constexpr oif_LoadRow kLoadRows[] = {
    LoadRow<kloC_ConcentratedForce, oif_Cload>("Concentrated force", oif_LoadFamily::CLOAD, NODES),
    LoadRow<kloC_Moment, oif_Cload>("Moment", oif_LoadFamily::CLOAD, NODES),
    LoadRow<kloC_PEGLoad, oif_Cload>("Generalized plane strain", oif_LoadFamily::CLOAD, ANY),
    LoadRow<kloC_BoltLoad, oif_Cload>("Bolt load", oif_LoadFamily::CLOAD, ANY),
    LoadRow<kloC_ConcentratedPoreFluid, oif_Cload>("Concentrated pore fluid flow", oif_LoadFamily::CLOAD,
                                                   NODES),
    LoadRow<kloC_InwardVolAccel, oif_Cload>("Inward volume acceleration", oif_LoadFamily::CLOAD, NODES),
    LoadRow<kloC_RotationalBodyForce, oif_Dload>("Rotational body force", oif_LoadFamily::DLOAD, ELEMENTS),
    LoadRow<kloC_LineLoad, oif_Dload>("Line load", oif_LoadFamily::DLOAD, ELEMENTS),
    LoadRow<kloC_PipePressure, oif_Dload>("Pipe pressure", oif_LoadFamily::DLOAD, ELEMENTS),
    LoadRow<kloC_BodyForce, oif_Dload>("Body force", oif_LoadFamily::DLOAD, ELEMENTS),
    LoadRow<kloC_Gravity, oif_Dload>("Gravity", oif_LoadFamily::DLOAD, ANY),
    LoadRow<kloC_Pressure, oif_Dsload>("Pressure", oif_LoadFamily::DSLOAD, SURFACE,
                                       Comment::ALONE_OF_A_FIELD),
    LoadRow<kloC_SurfaceTraction, oif_Dsload>("Surface traction", oif_LoadFamily::DSLOAD, SURFACE,
                                              Comment::ALONE_OF_A_FIELD),
    LoadRow<kloC_ShellEdgeLoad, oif_Dsload>("Shell edge load", oif_LoadFamily::DSLOAD, SURFACE,
                                            Comment::ALONE_OF_A_FIELD),
    LoadRow<kloC_ConnectorForce, oif_ConnectorLoad>("Connector force", oif_LoadFamily::CONNECTOR_LOAD,
                                                    ELEMENTS),
    LoadRow<kloC_ConnectorMoment, oif_ConnectorLoad>("Connector moment", oif_LoadFamily::CONNECTOR_LOAD,
                                                     ELEMENTS),
    LoadRow<kloC_ConcentratedHeatFlux, oif_Cflux>("Concentrated heat flux", oif_LoadFamily::CFLUX, NODES),
    LoadRow<kloC_ConcentratedConcentrationFlux, oif_Cflux>("Concentrated concentration flux",
                                                           oif_LoadFamily::CFLUX, NODES),
    LoadRow<kloC_BodyHeatFlux, oif_Dflux>("Body heat flux", oif_LoadFamily::DFLUX, ELEMENTS),
    LoadRow<kloC_BodyConcentrationFlux, oif_Dflux>("Body concentration flux", oif_LoadFamily::DFLUX,
                                                   ELEMENTS),
    LoadRow<kloC_SurfaceHeatFlux, oif_Dsflux>("Surface heat flux", oif_LoadFamily::DSFLUX, SURFACE),
    LoadRow<kloC_SurfaceConcentrationFlux, oif_Dsflux>("Surface concentration flux", oif_LoadFamily::DSFLUX,
                                                       SURFACE),
    LoadRow<kloC_SurfacePoreFluid, oif_Dsflow>("Surface pore fluid flow", oif_LoadFamily::DSFLOW, SURFACE),
    LoadRow<kloC_HydroFluidFlow, oif_FluidFlux>("Fluid flux", oif_LoadFamily::FLUID_FLUX, NODES),
    LoadRow<kloC_ConcentratedCharge, oif_Cecharge>("Concentrated charge", oif_LoadFamily::CECHARGE, NODES),
    LoadRow<kloC_ConcentratedCurrent, oif_Cecurrent>("Concentrated current", oif_LoadFamily::CECURRENT,
                                                     NODES),
    LoadRow<kloC_SurfaceCharge, oif_Dsecharge>("Surface charge", oif_LoadFamily::DSECHARGE, SURFACE),
    LoadRow<kloC_SurfaceCurrent, oif_Dsecurrent>("Surface current", oif_LoadFamily::DSECURRENT, SURFACE),
    LoadRow<kloC_BodyCharge, oif_Decharge>("Body charge", oif_LoadFamily::DECHARGE, ELEMENTS),
    LoadRow<kloC_BodyCurrent, oif_Decurrent>("Body current", oif_LoadFamily::DECURRENT, ELEMENTS),
    WithoutKeyword<kloC_InertiaRelief>("Inertia relief", oif_LoadFamily::INERTIA_RELIEF, Comment::ALONE),
    WithoutKeyword<kloC_UnwrittenLoad>("Unwritten load", oif_LoadFamily::UNWRITTEN, Comment::AHEAD),
};

} // namespace

std::span<const oif_LoadRow> oif_LoadRows() {
    return kLoadRows;
}

bool oif_LoadRow::IsCommentAlone(const kloC_Load& load) const {
    cow_String fieldName;
    return comment == Comment::ALONE || (comment == Comment::ALONE_OF_A_FIELD && load.UsesField(fieldName));
}
