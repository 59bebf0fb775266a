#ifndef QRX_OIF_EXPLICITCONTACTHISTORY_H
#define QRX_OIF_EXPLICITCONTACTHISTORY_H

#include "store_interface/records/interactions/kinC_Contact.h"
#include "store_interface/records/interactions/kinC_ContactExp.h"

class oif_InteractionBuilder;

// Contact of the explicit solver is declared and deleted step by step; general contact is said anew in the
// steps that begin or change it.

void oif_SurfaceToSurfaceContactXplHistory(oif_InteractionBuilder& builder, const cow_String& name,
                                           const kinC_SurfaceToSurfaceContactXpl& contact);
void oif_SelfContactXplHistory(oif_InteractionBuilder& builder, const cow_String& name,
                               const kinC_SelfContactXpl& contact);
void oif_ContactExpHistory(oif_InteractionBuilder& builder, const cow_String& name,
                           const kinC_ContactExp& contact);
/// Whether general contact says anything in the step.
bool oif_SaysGeneralContact(const kinC_ContactExp& contact, const cow_String& step);

#endif
