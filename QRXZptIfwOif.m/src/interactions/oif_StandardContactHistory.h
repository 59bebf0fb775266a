#ifndef QRX_OIF_STANDARDCONTACTHISTORY_H
#define QRX_OIF_STANDARDCONTACTHISTORY_H

#include "store_interface/records/interactions/kinC_Contact.h"

class oif_InteractionBuilder;

// Contact of the implicit solver: the pair is declared in the initial step, whatever step begins it, and
// enters and leaves by *Model Change.

void oif_SurfaceToSurfaceContactStdHistory(oif_InteractionBuilder& builder, const cow_String& name,
                                           const kinC_SurfaceToSurfaceContactStd& contact);
void oif_SelfContactStdHistory(oif_InteractionBuilder& builder, const cow_String& name,
                               const kinC_SelfContactStd& contact);

#endif
