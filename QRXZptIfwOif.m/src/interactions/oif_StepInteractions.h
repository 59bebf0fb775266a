#ifndef QRX_OIF_STEPINTERACTIONS_H
#define QRX_OIF_STEPINTERACTIONS_H

class oif_InteractionBuilder;

/// Films, radiation and waves, which are said again in each step that changes them, or all of a family where
/// one of it ends; and the end of general contact. A concentrated film, an impedance or an incident wave
/// raises as soon as there is an analysis step, since their families can't be ended.
void oif_CreateOpInteractions(oif_InteractionBuilder& builder);

#endif
