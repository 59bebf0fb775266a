#ifndef QRX_OIF_CAVITYHISTORY_H
#define QRX_OIF_CAVITYHISTORY_H

#include "store_interface/records/interactions/kinC_FilmAndRadiation.h"

class oif_InteractionBuilder;

/// Raised for a cavity in a step that builds on its base state.
inline constexpr char oif_kCavityStatusError[] = "Error in cavity radiation history status.";
/// Whether a cavity can't be told of in a step where it has the status.
bool oif_RaisesForCavity(mdl_PropagationStatusEnm status);

/// The cavity in the initial step, and in the others how it radiates where that changes.
void oif_CavityRadiationHistory(oif_InteractionBuilder& builder, const cow_String& name,
                                const kinC_CavityRadiation& cavity);

#endif
