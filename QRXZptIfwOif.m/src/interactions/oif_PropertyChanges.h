#ifndef QRX_OIF_PROPERTYCHANGES_H
#define QRX_OIF_PROPERTYCHANGES_H

#include "keyword_layer/qkw_Model.h"
#include "store_interface/records/interactions/kinC_Interaction.h"

/// The names of the properties that the contact is given in its steps, in order; a name that comes back
/// stands again. Empty for what is no contact pair or suppressed.
cow_List<cow_String> oif_PropertyChanges(const kinC_Interaction& interaction,
                                         const kprC_StepContainer& steps);
/// Whether *Change Friction has to address the contact's property under a name of its own.
inline bool oif_ChangesProperty(const kinC_Interaction& interaction, const kprC_StepContainer& steps) {
    return oif_PropertyChanges(interaction, steps).Length() > 1;
}
/// What *Change Friction calls the property of the contact.
inline cow_String oif_ChangeablePropertyName(const cow_String& contact) {
    return "_" + contact + "-Property";
}
/// Adds, in an implicit job, a copy of its first property for each contact that changes it. One takes the
/// place of a property that happens to have the name.
void oif_AddChangeableProperties(const qkw_Model& model, kprC_AnalysisProductEnm product,
                                 mdl_MapString2ObjCow<kinC_InteractionProperty>& properties);

#endif
